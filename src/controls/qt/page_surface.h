// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPointF>
#include <QRect>
#include <QWidget>

namespace pelloric::qt {

/// Where a page becomes pixels.
struct PagePlace {
    QRect area; ///< pixels of the viewport
    QPointF origin; ///< of the page in the area: pixels

    bool operator==(const PagePlace&) const = default;
};

/// The pixels of a page.
///
/// Of a page that reaches far past the viewport only what is near it becomes the area.
/// @param page  pixels of the viewport; the corner is a whole one
PagePlace placeOf(const QRectF& page);

/// What page surfaces tell of, and who paints them.
class SurfaceHost {
public:
    virtual ~SurfaceHost() = default;

    /// Paints the part of a surface that is exposed.
    /// @param origin   where the page's corner lies in the surface: pixels
    /// @param exposed  pixels of the surface
    virtual void paintSurface(int surface, QPainter& painter, QPointF origin, const QRect& exposed)
        = 0;

    /// The texts of the page that a surface shows, as rows of a table.
    virtual QString surfaceText(int surface) const = 0;

    /// Asked first when the mouse moves or a button goes.
    /// @param at  from the page's corner: pixels
    /// @return    true: that was all
    virtual bool takesMouse(int surface, const QMouseEvent& event, QPointF at) = 0;

    /// The mouse moves over a surface.
    virtual void mouseMoved() = 0;

    /// @param at  from the page's corner: pixels
    virtual void mousePressed(Qt::MouseButton button, QPointF at) = 0;

    /// @param at  from the page's corner: pixels; may lie outside the page
    virtual void mouseReleased(Qt::MouseButton button, QPointF at) = 0;
};

/// One page surface, `paper(n)`: white, and as light as a widget can be.
class PageSurface final : public QWidget {
    Q_OBJECT

public:
    /// @param host  borrowed
    PageSurface(SurfaceHost& host, QWidget* parent);

    /// Makes this the surface of that number.
    void setIndex(int index);

    /// The texts of the page that it shows, as rows of a table.
    QString pageText() const { return host_.surfaceText(index_); }

    /// Puts the surface where a page lies; what it shows stays.
    void place(const PagePlace& place);

protected:
    void paintEvent(QPaintEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;

private:
    SurfaceHost& host_;
    QPointF origin_; ///< of the page in the widget: pixels
    int index_ = 0;
};

} // namespace pelloric::qt
