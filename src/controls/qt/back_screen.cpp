// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/back_screen.h"

#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr int ShadowReach = 7; ///< of a large page: pixels
constexpr int ShadowDrop = 2; ///< how much lower than the page it lies: pixels
constexpr int ShadowPart = 10; ///< a small page's shadow reaches so small a part of its width
constexpr int ShadowAlpha = 14; ///< of each of its rings

constexpr int MiddleLightness = 128; ///< below this a palette is a dark one

/// Rings of the same faint black, one within the other, add up to a soft edge.
void drawShadow(QPainter& painter, const QRect& page)
{
    const int reach = std::min(ShadowReach, page.width() / ShadowPart);
    const QRect area = page.translated(0, std::min(ShadowDrop, reach));
    const QColor faint(0, 0, 0, ShadowAlpha);
    if (reach == 1) { // too small for a round corner
        painter.fillRect(area.adjusted(-1, -1, 1, 1), faint);
        return;
    }
    painter.setBrush(faint);
    for (int ring = reach; ring > 0; --ring)
        painter.drawRoundedRect(area.adjusted(-ring, -ring, ring, ring), ring, ring);
}

} // namespace

BackScreen::BackScreen(SurfaceHost& host, QWidget* parent)
    : QWidget(parent)
    , host_(host)
{
    setObjectName(QStringLiteral("Backscreen"));
    setAccessibleName(tr("Pages"));
    setAttribute(Qt::WA_OpaquePaintEvent);
    setMouseTracking(true);
}

void BackScreen::setPages(std::vector<Page> pages)
{
    const bool isPainter
        = std::ranges::any_of(pages, [](const Page& page) { return !page.isWidget; });
    if (!isPainter && pages_ == pages)
        return;
    pages_ = std::move(pages);
    update();
}

void BackScreen::movePages(QPoint moved)
{
    if (!moved.isNull())
        scroll(moved.x(), moved.y());
}

QColor BackScreen::grey(const QPalette& palette)
{
    const bool isDark = palette.color(QPalette::Window).lightness() < MiddleLightness;
    return isDark ? QColor(0x3C, 0x3F, 0x43) : QColor(0xA9, 0xAD, 0xB2);
}

void BackScreen::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    painter.fillRect(event->rect(), grey(palette()));
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    const QRect near = event->rect().adjusted(
        -2 * ShadowReach, -2 * ShadowReach, 2 * ShadowReach, 2 * ShadowReach);
    for (const Page& page : pages_) {
        if (page.place.area.intersects(near))
            drawShadow(painter, page.place.area);
    }
    for (const Page& page : pages_) {
        if (!page.isWidget && event->region().intersects(page.place.area))
            paintPage(page, painter, event->rect() & page.place.area);
    }
}

void BackScreen::paintPage(const Page& page, QPainter& painter, const QRect& exposed)
{
    painter.save();
    painter.setClipRect(exposed);
    painter.fillRect(exposed, Qt::white);
    host_.paintSurface(
        page.surface, painter, page.place.area.topLeft() + page.place.origin, exposed);
    painter.restore();
}

/// The page that the viewport stands in for at a position, or null.
const BackScreen::Page* BackScreen::pageAt(QPoint position) const
{
    const auto found = std::ranges::find_if(pages_,
        [&](const Page& page) { return !page.isWidget && page.place.area.contains(position); });
    return found == pages_.end() ? nullptr : &*found;
}

void BackScreen::mouseMoveEvent(QMouseEvent* event)
{
    const QPointF at = event->position();
    if (pressed_) {
        if (!host_.takesMouse(pressedSurface_, *event, at - *pressed_))
            host_.mouseMoved();
    } else if (const Page* const page = pageAt(at.toPoint())) {
        if (!host_.takesMouse(page->surface, *event, at - cornerOf(*page)))
            host_.mouseMoved();
    } else {
        event->ignore();
    }
}

QPointF BackScreen::cornerOf(const Page& page)
{
    return page.place.area.topLeft() + page.place.origin;
}

void BackScreen::mousePressEvent(QMouseEvent* event)
{
    const Page* const page = pageAt(event->position().toPoint());
    if (!page) {
        event->ignore();
        return;
    }
    pressed_ = cornerOf(*page);
    pressedSurface_ = page->surface;
    const QPointF at = event->position() - *pressed_;
    if (!host_.takesMouse(pressedSurface_, *event, at))
        host_.mousePressed(event->button(), at);
}

/// Belongs to the page of the press, wherever the pointer is by then.
void BackScreen::mouseReleaseEvent(QMouseEvent* event)
{
    if (!pressed_) {
        event->ignore();
        return;
    }
    const QPointF at = event->position() - *pressed_;
    if (event->buttons() == Qt::NoButton)
        pressed_.reset();
    if (!host_.takesMouse(pressedSurface_, *event, at))
        host_.mouseReleased(event->button(), at);
}

} // namespace pelloric::qt
