// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/page_strip.h"

#include "controls/canvas.h"
#include "platform/qt/qt_drawing_surface.h"
#include "platform/units.h"
#include "view/page_renderer.h"

#include <QAbstractListModel>
#include <QPainter>
#include <QScrollBar>
#include <QStyledItemDelegate>

#include <algorithm>
#include <cmath>

namespace pelloric::qt {

namespace {

constexpr int LongSide = 150; ///< of a picture: pixels
constexpr int Margin = 10; ///< around it: pixels
constexpr double TwipsPerPixel = TwipsPerInch / 96;

/// The size of every picture: the paper's shape, with its longer side as given.
QSize pictureSize(const Canvas& canvas)
{
    const double width = std::max<double>(1, canvas.page.myWidth);
    const double height = std::max<double>(1, canvas.page.myHeight);
    const double scale = LongSide / std::max(width, height);
    return { std::max(8, static_cast<int>(std::lrint(width * scale))),
        std::max(8, static_cast<int>(std::lrint(height * scale))) };
}

} // namespace

class PageStrip::Model final : public QAbstractListModel {
public:
    Model(const Canvas& canvas, QObject* parent)
        : QAbstractListModel(parent)
        , canvas_(canvas)
    {
        takePages();
    }

    void takePages()
    {
        const int pages = canvas_.isBuilding() ? 0 : canvas_.document().pageCount();
        const QSize size = pictureSize(canvas_);
        if (pages == pages_ && size == size_)
            return;
        beginResetModel();
        pages_ = pages;
        size_ = size;
        endResetModel();
    }

    int rowCount(const QModelIndex& parent) const override { return parent.isValid() ? 0 : pages_; }

    QVariant data(const QModelIndex& index, int role) const override
    {
        if (role == Qt::DisplayRole)
            return QString::number(index.row() + 1);
        if (role == Qt::AccessibleTextRole || role == Qt::ToolTipRole)
            return PageStrip::tr("Page %1").arg(index.row() + 1);
        return {};
    }

    QSize size() const { return size_; }

private:
    const Canvas& canvas_;
    int pages_ = -1;
    QSize size_;
};

class PageStrip::Picture final : public QStyledItemDelegate {
public:
    Picture(const Canvas& canvas, QtFonts& fonts, const Model& model, QObject* parent)
        : QStyledItemDelegate(parent)
        , canvas_(canvas)
        , fonts_(fonts)
        , model_(model)
    {
    }

    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex&) const override
    {
        return { model_.size().width() + 2 * Margin,
            model_.size().height() + 2 * Margin + option.fontMetrics.height() };
    }

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
        const QModelIndex& index) const override
    {
        const bool isCurrent = option.state & QStyle::State_Selected;
        if (isCurrent)
            painter->fillRect(option.rect, option.palette.color(QPalette::Highlight));
        const QSize size = model_.size();
        const QRect sheet(option.rect.left() + (option.rect.width() - size.width()) / 2,
            option.rect.top() + Margin / 2, size.width(), size.height());
        painter->fillRect(sheet, Qt::white);
        if (!canvas_.isBuilding() && canvas_.document().hasPage(index.row()))
            paintPage(index.row(), sheet, *painter);
        painter->setPen(option.palette.color(QPalette::Mid));
        painter->setBrush(Qt::NoBrush);
        painter->drawRect(sheet.adjusted(0, 0, -1, -1));
        painter->setPen(
            option.palette.color(isCurrent ? QPalette::HighlightedText : QPalette::WindowText));
        painter->drawText(option.rect.adjusted(0, sheet.bottom() - option.rect.top(), 0, 0),
            Qt::AlignCenter, index.data().toString());
    }

private:
    void paintPage(int page, const QRect& sheet, QPainter& painter) const
    {
        const double scale = sheet.width() / static_cast<double>(canvas_.page.myWidth);
        const auto divisor = static_cast<float>(1 / (scale * TwipsPerPixel));
        const QRectF paper(0, 0, canvas_.page.myWidth, canvas_.page.myHeight);
        painter.save();
        painter.setClipRect(sheet);
        painter.translate(sheet.topLeft());
        painter.scale(scale, scale);
        QtDrawingSurface target(painter, fonts_,
            { .divisor = divisor, .page = {}, .visible = paper, .isScreen = true });
        PageRenderer(canvas_.document()).replay(page, { .divisor = divisor }, target);
        painter.restore();
    }

    const Canvas& canvas_;
    QtFonts& fonts_;
    const Model& model_;
};

PageStrip::PageStrip(const Canvas& canvas, QtFonts& fonts, QWidget* parent)
    : QListView(parent)
    , canvas_(canvas)
    , model_(new Model(canvas, this))
{
    setObjectName(QStringLiteral("PageStrip"));
    setAccessibleName(tr("Pictures of the pages"));
    setFrameShape(NoFrame);
    setUniformItemSizes(true);
    setVerticalScrollMode(ScrollPerPixel);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
    setSelectionMode(SingleSelection);
    setEditTriggers(NoEditTriggers);
    QPalette grey = palette();
    grey.setColor(QPalette::Base, palette().color(QPalette::Window));
    setPalette(grey);
    setModel(model_);
    setItemDelegate(new Picture(canvas, fonts, *model_, this));
}

QSize PageStrip::sizeHint() const
{
    return { LongSide + 2 * Margin + verticalScrollBar()->sizeHint().width(), 2 * LongSide };
}

void PageStrip::showPosition()
{
    if (!isVisible())
        return;
    isShowing_ = true;
    model_->takePages();
    const int page = pageInView(canvas_.view(), canvas_.facts()).value_or(0);
    const ViewState& view = canvas_.view();
    const int shown = showsPageWindow(view) ? std::max<int>(0, view.window.MinPage) : page;
    const int now = currentIndex().row();
    const bool isInWindow
        = showsPageWindow(view) && now >= shown && now < shown + view.window.nPages;
    if (now != shown && !isInWindow)
        setCurrentIndex(model_->index(shown));
    viewport()->update();
    isShowing_ = false;
}

void PageStrip::showEvent(QShowEvent* event)
{
    QListView::showEvent(event);
    showPosition();
}

void PageStrip::currentChanged(const QModelIndex& current, const QModelIndex& previous)
{
    QListView::currentChanged(current, previous);
    if (current.isValid())
        scrollTo(current);
    if (current.isValid() && !isShowing_)
        emit pageChosen(current.row());
}

} // namespace pelloric::qt
