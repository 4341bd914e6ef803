// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/page_surface.h"

#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>

#include <cmath>

namespace pelloric::qt {

namespace {

/// How far a surface may reach past the viewport's corner: pixels. Past this the toolkit's own
/// coordinates get near their limit.
constexpr double FarthestEdge = 200'000;

int wholePixel(double position)
{
    return static_cast<int>(std::nearbyint(std::clamp(position, -FarthestEdge, FarthestEdge)));
}

} // namespace

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
    setObjectName(QStringLiteral("paper(%1)").arg(index));
    setAccessibleName(tr("Page surface %1").arg(index + 1));
}

void PageSurface::place(const QRectF& page)
{
    const QPoint corner(wholePixel(page.left()), wholePixel(page.top()));
    const QPoint opposite(wholePixel(page.right()), wholePixel(page.bottom()));
    // A page's own corner is a whole pixel, so that its lines do not blur while it moves.
    const QPointF at(page.left() < -FarthestEdge ? page.left() : corner.x(),
        page.top() < -FarthestEdge ? page.top() : corner.y());
    origin_ = at - corner;
    setGeometry(QRect(corner, QSize(std::max(1, opposite.x() - corner.x()),
                                  std::max(1, opposite.y() - corner.y()))));
}

void PageSurface::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    host_.paintSurface(index_, painter, origin_, event->rect());
}

void PageSurface::mouseMoveEvent(QMouseEvent*) { host_.mouseMoved(); }

void PageSurface::mousePressEvent(QMouseEvent* event)
{
    host_.mousePressed(event->button(), event->position() - origin_);
}

void PageSurface::mouseReleaseEvent(QMouseEvent* event)
{
    host_.mouseReleased(event->button(), event->position() - origin_);
}

/// Does nothing; the second press of a double click is no press.
void PageSurface::mouseDoubleClickEvent(QMouseEvent*) { }

} // namespace pelloric::qt
