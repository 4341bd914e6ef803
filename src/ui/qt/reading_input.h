// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "ui/page_reading.h"

#include <QObject>

#include <functional>

class QKeyEvent;
class QWheelEvent;
class QWidget;

namespace pelloric {

class PreviewSession;

} // namespace pelloric

namespace pelloric::qt {

class Sorvane;

/// Reads a report with keys and wheel: takes the events of a canvas that turn pages, and those that
/// change its size.
///
/// Page Down and Space show the next part, at the end the next page; Page Up and Shift+Space the
/// other way round. The wheel scrolls as ever, and where it can scroll no more it turns.
class ReadingInput final : public QObject {
    Q_OBJECT

public:
    /// @param canvas   borrowed
    /// @param session  of the same window; borrowed
    /// @param isBusy   whether the canvas is to be left alone
    ReadingInput(Sorvane& canvas, PreviewSession& session, std::function<bool()> isBusy);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    bool key(const QKeyEvent& event);
    bool wheel(const QWheelEvent& event);

    Sorvane& canvas_;
    PreviewSession& session_;
    std::function<bool()> isBusy_;
    int wheelPastEnd_ = 0; ///< eighths of a degree that the wheel was turned past the end
    bool isResizing_ = false;
};

} // namespace pelloric::qt
