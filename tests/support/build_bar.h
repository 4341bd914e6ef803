// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"

namespace pelloric {

/// Keeps the progress bar as the last build of a canvas left it; saving and printing do not count.
class BuildBar final : public CanvasObserver {
public:
    /// @param canvas  borrowed; goes together with this
    explicit BuildBar(Canvas& canvas)
        : canvas_(canvas)
    {
        canvas.observe(*this);
    }

    BuildBar(const BuildBar&) = delete;
    BuildBar& operator=(const BuildBar&) = delete;

    /// All zero and invisible before any build.
    const ProgressBar& bar() const { return bar_; }

    void viewChanged() override { }

    void progressChanged() override
    {
        if (canvas_.isBuilding() && canvas_.progress().visible)
            bar_ = canvas_.progress();
    }

private:
    Canvas& canvas_;
    ProgressBar bar_;
};

} // namespace pelloric
