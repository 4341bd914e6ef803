// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"
#include "platform/progress.h"

#include <QElapsedTimer>
#include <QString>

namespace pelloric::app {

/// One line on a terminal that tells how far a long work is; elsewhere nothing is written.
///
/// The line is gone when the object ends.
class ProgressLine {
public:
    ProgressLine();
    ~ProgressLine();
    ProgressLine(const ProgressLine&) = delete;
    ProgressLine& operator=(const ProgressLine&) = delete;

    /// @param work   a phrase
    /// @param total  steps of the whole work; 0: nobody knows
    void show(TextView work, std::int64_t done, std::int64_t total);

    /// Shows a work that can be interrupted at each of its steps; borrows this line.
    Progress of(TextView work);

    /// Takes the line away until something is shown again.
    void clear();

private:
    bool isTerminal_;
    bool isShown_ = false;
    QElapsedTimer sinceShown_;
};

/// Shows how far the pages of a canvas are.
class LayoutProgress final : public CanvasObserver {
public:
    /// @param canvas  both are borrowed; the canvas stops being observed when the object ends
    LayoutProgress(Canvas& canvas, ProgressLine& line);
    ~LayoutProgress() override;
    LayoutProgress(const LayoutProgress&) = delete;
    LayoutProgress& operator=(const LayoutProgress&) = delete;

    void viewChanged() override { }
    void progressChanged() override;

private:
    Canvas& canvas_;
    ProgressLine& line_;
};

} // namespace pelloric::app
