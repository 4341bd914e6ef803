// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/page_marks.h"

#include "controls/canvas.h"
#include "platform/platform.h"
#include "platform/qt/qt_text.h"

#include <pelloric/sorvane.h>

#include <QMouseEvent>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace pelloric::qt {

namespace {

constexpr QColor MatchColor(0xFF, 0xE0, 0x66);
constexpr QColor CurrentColor(0xFF, 0x9A, 0x1F);
constexpr QColor SelectionColor(0x8F, 0xC1, 0xFF);

constexpr double Edge = 15; ///< of a mark around its text: twips

QRectF rectOf(const PageRect& area)
{
    return { QPointF(area.left - Edge, area.top), QPointF(area.right + Edge, area.bottom) };
}

Twips twips(double value) { return static_cast<Twips>(std::clamp(value, -1e9, 1e9)); }

/// Colours multiply, so that the text stays black.
void mark(QPainter& painter, const PageRect& area, const QRectF& visible, const QColor& color)
{
    const QRectF rect = rectOf(area);
    if (rect.intersects(visible))
        painter.fillRect(rect, color);
}

} // namespace

PageMarks::PageMarks(Sorvane& canvas, QObject* parent)
    : QObject(parent)
    , canvas_(canvas)
{
    canvas_.setPageGuest(this);
}

PageMarks::~PageMarks() { canvas_.setPageGuest(nullptr); }

void PageMarks::showSearch(const TextSearch* search)
{
    search_ = search;
    currentPage_.reset();
    repaint();
}

void PageMarks::showCurrent(std::optional<int> page, const TextMatch& match)
{
    currentPage_ = page;
    current_ = match;
    repaint();
}

void PageMarks::selectPage(int page)
{
    selection_ = Selection { .page = page, .from = {}, .to = {}, .isWhole = true };
    repaint();
    emit selectionChanged();
}

bool PageMarks::clearSelection()
{
    if (!selection_)
        return false;
    selection_.reset();
    repaint();
    emit selectionChanged();
    return true;
}

void PageMarks::documentChanged()
{
    search_ = nullptr;
    currentPage_.reset();
    clearSelection();
}

PageRect PageMarks::area(const Selection& selection) const
{
    if (selection.isWhole) {
        constexpr Twips Far = 1'000'000'000;
        return { -Far, -Far, Far, Far };
    }
    const QRectF drawn = QRectF(selection.from, selection.to).normalized();
    return { twips(drawn.left()), twips(drawn.top()), twips(drawn.right()), twips(drawn.bottom()) };
}

std::vector<PlacedText> PageMarks::selectedTexts() const
{
    if (!selection_)
        return {};
    const Canvas& canvas = canvas_.canvas();
    std::vector<PlacedText> texts
        = placedTexts(canvas.document(), selection_->page, canvas_.canvas().platform().metrics);
    const PageRect drawn = area(*selection_);
    std::erase_if(texts, [&](const PlacedText& text) { return !overlap(text.area, drawn); });
    return texts;
}

QString PageMarks::selectedText() const { return toQString(asTable(selectedTexts())); }

void PageMarks::paintOver(int page, QPainter& painter, const QRectF& visible)
{
    painter.save();
    painter.setCompositionMode(QPainter::CompositionMode_Multiply);
    paintMatches(page, painter, visible);
    if (selection_ && selection_->page == page) {
        for (const PlacedText& text : selectedTexts())
            mark(painter, text.area, visible, SelectionColor);
        if (isDragging_) {
            QPen pen(SelectionColor.darker(), 0);
            pen.setStyle(Qt::DashLine);
            painter.setPen(pen);
            painter.setBrush(Qt::NoBrush);
            painter.drawRect(QRectF(selection_->from, selection_->to).normalized());
        }
    }
    painter.restore();
}

void PageMarks::paintMatches(int page, QPainter& painter, const QRectF& visible)
{
    if (!search_ || search_->countOn(page) == 0)
        return;
    const PageDocument& document = canvas_.canvas().document();
    TextMetrics& metrics = canvas_.canvas().platform().metrics;
    for (const TextMatch& match : search_->matches(page)) {
        const bool isCurrent = currentPage_ == page && match == current_;
        mark(painter, areaOf(document, page, match, metrics), visible,
            isCurrent ? CurrentColor : MatchColor);
    }
}

bool PageMarks::takesMouse(int page, const QMouseEvent& event, QPointF at)
{
    if (event.type() == QEvent::MouseButtonPress && event.button() == Qt::LeftButton) {
        if (!(event.modifiers() & Qt::ShiftModifier)) {
            clearSelection();
            return false;
        }
        isDragging_ = true;
        selection_ = Selection { .page = page, .from = at, .to = at };
    } else if (!isDragging_) {
        return false;
    } else if (event.type() == QEvent::MouseButtonRelease) {
        isDragging_ = false;
        selection_->to = at;
    } else {
        selection_->to = at;
    }
    repaint();
    emit selectionChanged();
    return true;
}

void PageMarks::repaint() { canvas_.repaintPages(); }

} // namespace pelloric::qt
