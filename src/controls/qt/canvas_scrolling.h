// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPointF>
#include <QtGlobal>

class QNativeGestureEvent;
class QRect;
class QScrollBar;
class QString;
class QWheelEvent;
class QWidget;

namespace pelloric {

class Canvas;
struct ScrollBar;
struct ViewState;

} // namespace pelloric

namespace pelloric::qt {

/// The scroll bars of a canvas, and what wheel, pinch and keys do to them and to the scale.
class CanvasScrolling final {
public:
    /// @param control   the bars become its children; borrowed
    /// @param viewport  the area that they scroll, a child of the control; borrowed
    /// @param canvas    borrowed
    CanvasScrolling(QWidget& control, const QWidget& viewport, Canvas& canvas);

    /// How wide a bar is: pixels.
    int extent() const;

    /// Puts the bars to the right of the viewport and below it.
    /// @param viewport  pixels of the control
    void placeAround(const QRect& viewport);

    /// Shows the bars as a view has them; nobody is told of their values.
    void show(const ViewState& view);

    /// Shows bars with nothing to scroll.
    void showNothing();

    /// Scrolls; with the control key zooms about the pointer.
    void wheel(QWheelEvent& event);

    /// Zooms by a pinch on a touch pad. @return whether the gesture has a meaning
    bool gesture(QNativeGestureEvent& event);

    /// Scrolls by a key. @return whether the key has a meaning
    bool key(int key);

private:
    QScrollBar* makeBar(Qt::Orientation orientation, const char* name, const QString& meaning);
    QPointF inViewport(QPointF position) const;
    void zoomAbout(double factor, QPointF at);

    QWidget& control_;
    const QWidget& viewport_;
    Canvas& canvas_;
    QScrollBar* Hbar_;
    QScrollBar* Vbar_;
    int wheelRest_ = 0; ///< eighths of a degree that are no zoom step yet
};

} // namespace pelloric::qt
