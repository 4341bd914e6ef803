// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/reading_input.h"

#include "controls/canvas.h"
#include "ui/preview_navigation.h"

#include <pelloric/sorvane.h>

#include <QKeyEvent>
#include <QWheelEvent>

#include <cmath>

namespace pelloric::qt {

namespace {

/// Which way a key reads; false: it does not read.
bool readingWay(const QKeyEvent& event, ReadingWay& way)
{
    const auto modifiers = event.modifiers() & ~Qt::KeypadModifier;
    const bool isPlain = modifiers == Qt::NoModifier;
    switch (event.key()) {
    case Qt::Key_PageDown:
        way = ReadingWay::On;
        return isPlain;
    case Qt::Key_PageUp:
        way = ReadingWay::Back;
        return isPlain;
    case Qt::Key_Space:
        way = isPlain ? ReadingWay::On : ReadingWay::Back;
        return isPlain || modifiers == Qt::ShiftModifier;
    default:
        return false;
    }
}

} // namespace

ReadingInput::ReadingInput(Sorvane& canvas, PreviewSession& session, std::function<bool()> isBusy)
    : canvas_(canvas)
    , session_(session)
    , isBusy_(std::move(isBusy))
{
    canvas_.installEventFilter(this);
}

bool ReadingInput::eventFilter(QObject* watched, QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
        return !isBusy_() && key(static_cast<const QKeyEvent&>(*event));
    case QEvent::Wheel:
        return !isBusy_() && wheel(static_cast<const QWheelEvent&>(*event));
    case QEvent::Resize: {
        if (isResizing_)
            return false;
        isResizing_ = true;
        watched->event(event); // the areas first, so that nothing is painted in between
        isResizing_ = false;
        session_.viewportChanged();
        return true;
    }
    default:
        return false;
    }
}

bool ReadingInput::key(const QKeyEvent& event)
{
    ReadingWay way {};
    if (!readingWay(event, way))
        return false;
    session_.read(way);
    return true;
}

/// A whole click past the end turns; a touch pad that glides on does not.
bool ReadingInput::wheel(const QWheelEvent& event)
{
    const QPoint angle = event.angleDelta();
    if ((event.modifiers() & (Qt::ControlModifier | Qt::ShiftModifier))
        || std::abs(angle.x()) > std::abs(angle.y()) || angle.y() == 0)
        return false;
    const ReadingWay way = angle.y() < 0 ? ReadingWay::On : ReadingWay::Back;
    if (!rests(canvas_.canvas(), way)) {
        wheelPastEnd_ = 0;
        return false;
    }
    if (event.phase() == Qt::ScrollMomentum)
        return true;
    if ((wheelPastEnd_ < 0) != (angle.y() < 0))
        wheelPastEnd_ = 0;
    wheelPastEnd_ += angle.y();
    if (std::abs(wheelPastEnd_) < QWheelEvent::DefaultDeltasPerStep)
        return true;
    wheelPastEnd_ = 0;
    session_.read(way);
    return true;
}

} // namespace pelloric::qt
