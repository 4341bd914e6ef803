// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/page_surface.h"

#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace pelloric::qt {

namespace {

/// How far a surface may reach past the viewport's corner: pixels. Past this the toolkit's own
/// coordinates get near their limit.
constexpr double FarthestEdge = 200'000;

double withinReach(double position) { return std::clamp(position, -FarthestEdge, FarthestEdge); }

int wholePixel(double position) { return static_cast<int>(std::nearbyint(withinReach(position))); }

/// One direction of a page: whole pixels, and always as many of them wherever the page stands.
struct Span {
    int begin = 0;
    int length = 1;
    double origin = 0; ///< where the page's own edge lies from the beginning
};

Span spanOf(double begin, double length)
{
    Span span { .begin = wholePixel(begin) };
    if (begin < -FarthestEdge)
        span.origin = begin + FarthestEdge;
    const double end = span.begin + span.origin + std::nearbyint(length);
    span.length = std::max(1, wholePixel(end) - span.begin);
    return span;
}

} // namespace

PagePlace placeOf(const QRectF& page)
{
    const Span across = spanOf(page.left(), page.width());
    const Span down = spanOf(page.top(), page.height());
    return { { across.begin, down.begin, across.length, down.length },
        { across.origin, down.origin } };
}

PageSurface::PageSurface(SurfaceHost& host, QWidget* parent)
    : QWidget(parent)
    , host_(host)
{
    QPalette white = palette();
    white.setColor(QPalette::Window, Qt::white);
    setPalette(white);
    setAutoFillBackground(true);
    setMouseTracking(true);
    setIndex(0);
}

void PageSurface::setIndex(int index)
{
    index_ = index;
    update();
    setObjectName(QStringLiteral("paper(%1)").arg(index));
    setAccessibleName(tr("Page surface %1").arg(index + 1));
}

void PageSurface::place(const PagePlace& place)
{
    if (origin_ != place.origin)
        update();
    origin_ = place.origin;
    setGeometry(place.area);
}

void PageSurface::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    host_.paintSurface(index_, painter, origin_, event->rect());
}

void PageSurface::mouseMoveEvent(QMouseEvent* event)
{
    if (!host_.takesMouse(index_, *event, event->position() - origin_))
        host_.mouseMoved();
}

void PageSurface::mousePressEvent(QMouseEvent* event)
{
    if (host_.takesMouse(index_, *event, event->position() - origin_))
        return;
    host_.mousePressed(event->button(), event->position() - origin_);
}

void PageSurface::mouseReleaseEvent(QMouseEvent* event)
{
    if (host_.takesMouse(index_, *event, event->position() - origin_))
        return;
    host_.mouseReleased(event->button(), event->position() - origin_);
}

/// Does nothing; the second press of a double click is no press.
void PageSurface::mouseDoubleClickEvent(QMouseEvent*) { }

} // namespace pelloric::qt
