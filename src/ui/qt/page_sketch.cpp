// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/page_sketch.h"

#include "ui/page_setup.h"
#include "ui/qt/dialog_parts.h"

#include <QMouseEvent>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace pelloric::qt {

namespace {

constexpr int LineReach = 3; ///< how far from a margin line it can be taken: pixels
constexpr QRgb LineColor = 0xFF3A62C8;
constexpr int MostSteps = 1000000; ///< of one move: far more than any sketch is wide
constexpr int SheetShadow = 2; ///< pixels
constexpr int UsualHeight = 400; ///< pixels of a plain screen
constexpr int LeastHeight = 240; ///< pixels of a plain screen

QSize frameOfHeight(int height)
{
    return { static_cast<int>(std::ceil(height * SketchFrameWidth / SketchFrameHeight)), height };
}

Qt::CursorShape shapeOf(SketchPointer pointer)
{
    switch (pointer) {
    case SketchPointer::NorthSouth:
        return Qt::SizeVerCursor;
    case SketchPointer::WestEast:
        return Qt::SizeHorCursor;
    case SketchPointer::Default:
        break;
    }
    return Qt::ArrowCursor;
}

} // namespace

/// A thin picture over the sketch: a line with some room around it for the pointer.
class MarginLine final : public QWidget {
public:
    MarginLine(PageSketch& sketch, Margin margin, QWidget* parent)
        : QWidget(parent)
        , sketch_(sketch)
        , margin_(margin)
    {
        setObjectName(elementName("PicTop", static_cast<int>(margin)));
        setMouseTracking(true);
    }

    bool isHorizontal() const { return isHorizontalLine(margin_); }

protected:
    void paintEvent(QPaintEvent*) override
    {
        // Equally thick wherever it stands, on screens of broken scales too.
        QPen pen(QColor(LineColor), std::floor(devicePixelRatioF()));
        pen.setCosmetic(true);
        QPainter painter(this);
        painter.setPen(pen);
        constexpr double Middle = LineReach + 0.5;
        if (isHorizontal())
            painter.drawLine(QPointF(0, Middle), QPointF(width(), Middle));
        else
            painter.drawLine(QPointF(Middle, 0), QPointF(Middle, height()));
    }

    void mousePressEvent(QMouseEvent* event) override
    {
        if (event->button() == Qt::LeftButton)
            sketch_.pressLine(margin_, event->globalPosition());
    }

    void mouseMoveEvent(QMouseEvent* event) override
    {
        sketch_.moveOverLine(margin_, event->globalPosition());
    }

    void mouseReleaseEvent(QMouseEvent* event) override
    {
        if (event->button() == Qt::LeftButton)
            sketch_.releaseLine();
    }

private:
    PageSketch& sketch_;
    Margin margin_;
};

PageSketch::PageSketch(PageSetupState& state, QWidget* parent)
    : QWidget(parent)
    , state_(state)
    , picture_(new QWidget(this))
{
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
    picture_->setObjectName(QStringLiteral("PicPreview"));
    picture_->setAccessibleName(tr("Sketch of the page with its margins"));
    picture_->installEventFilter(this);
    for (const Margin margin : AllMargins)
        lines_[static_cast<std::size_t>(margin)] = new MarginLine(*this, margin, picture_);
}

void PageSketch::refresh()
{
    const double pixels = pixelsPerUnit();
    const SketchRect& place = state_.picture();
    const double left = (width() - pixels * SketchFrameWidth) / 2 + pixels * place.left;
    const double top = (height() - pixels * SketchFrameHeight) / 2 + pixels * place.top;
    picture_->setGeometry(QRectF(left, top, pixels * place.width, pixels * place.height).toRect());
    for (const Margin margin : AllMargins)
        placeLine(margin);
    picture_->update();
    update();
}

QSize PageSketch::sizeHint() const { return frameOfHeight(UsualHeight); }

QSize PageSketch::minimumSizeHint() const { return frameOfHeight(LeastHeight); }

double PageSketch::pixelsPerUnit() const
{
    return std::min(width() / SketchFrameWidth, height() / SketchFrameHeight);
}

void PageSketch::placeLine(Margin margin)
{
    MarginLine& line = *lines_[static_cast<std::size_t>(margin)];
    const int position
        = static_cast<int>(std::lround(pixelsPerUnit() * state_.sketch().linePosition(margin)));
    constexpr int Thickness = 2 * LineReach + 1;
    if (line.isHorizontal())
        line.setGeometry(0, position - LineReach, picture_->width(), Thickness);
    else
        line.setGeometry(position - LineReach, 0, Thickness, picture_->height());
}

bool PageSketch::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == picture_ && event->type() == QEvent::Paint)
        paintPicture();
    return QWidget::eventFilter(watched, event);
}

void PageSketch::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    const QRect sheet = picture_->geometry();
    painter.fillRect(sheet.translated(SheetShadow, SheetShadow), QColor(0, 0, 0, 70));
    painter.setPen(QColor(0, 0, 0, 110));
    painter.drawRect(sheet.adjusted(-1, -1, 0, 0));
}

void PageSketch::paintPicture()
{
    QPainter painter(picture_);
    painter.fillRect(picture_->rect(), Qt::white);
    painter.scale(pixelsPerUnit(), pixelsPerUnit());
    QPen pen(colorOf(SketchColor), 1);
    pen.setCosmetic(true);
    painter.setPen(pen);
    for (const SketchLine& line : state_.sketch().ruledLines())
        painter.drawLine(QPointF(line.x1, line.y1), QPointF(line.x2, line.y2));
}

void PageSketch::resizeEvent(QResizeEvent*) { refresh(); }

/// A place of the screen measured from a line's exact position: sketch units.
QPointF PageSketch::unitsInside(Margin margin, QPointF globalPosition) const
{
    QPointF place = picture_->mapFromGlobal(globalPosition) / pixelsPerUnit();
    const double line = state_.sketch().linePosition(margin);
    if (isHorizontalLine(margin))
        place.ry() -= line;
    else
        place.rx() -= line;
    return place;
}

void PageSketch::pressLine(Margin margin, QPointF globalPosition)
{
    const QPointF inside = unitsInside(margin, globalPosition);
    state_.sketch().mouseDown(margin, inside.x(), inside.y());
    placeLine(margin);
}

/// A line that is dragged follows in steps that are short enough to stay over it, so that a quick
/// pointer does not leave it behind.
void PageSketch::moveOverLine(Margin margin, QPointF globalPosition)
{
    MarginSketch& sketch = state_.sketch();
    QPointF inside = unitsInside(margin, globalPosition);
    int steps = 1;
    if (sketch.isDragging()) {
        const double way = std::abs(isHorizontalLine(margin) ? inside.y() : inside.x());
        const double step = std::max(sketch.margin(margin), HoverTolerance) / 2;
        steps = std::clamp(static_cast<int>(std::ceil(way / step)), 1, MostSteps);
        inside /= steps;
    }
    for (int step = 0; step < steps; ++step)
        sketch.mouseMove(margin, inside.x(), inside.y());
    lines_[static_cast<std::size_t>(margin)]->setCursor(shapeOf(sketch.pointer()));
    placeLine(margin);
}

void PageSketch::releaseLine()
{
    state_.releaseLine();
    refresh();
    Q_EMIT lineReleased();
}

} // namespace pelloric::qt
