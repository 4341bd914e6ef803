// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// At which scale a preview shows its pages, and when they follow the viewport.

#include "ui/preview_navigation.h"

#include "platform/numbers.h"
#include "ui/tool_table.h"

#include <algorithm>

namespace pelloric {

namespace {

/// The scale that a text names, held between 1 % and 6400 %; 0 stays 0.
float scaleOf(TextView text)
{
    const double scale = leadingNumber(text) / 100;
    return static_cast<float>(scale == 0 ? 0 : std::clamp(scale, SmallestScale, LargestScale));
}

/// Whether a text stands in the list of scales as it is.
bool isScaleEntry(TextView text) { return std::ranges::count(ScaleEntries, text) > 0; }

/// The divisor at which a length fills another: a trace more, so that rounding hides no edge.
float divisorFor(double length, Twips viewport)
{
    constexpr double Trace = 1.000001;
    return static_cast<float>(length / std::max(viewport, 1) * Trace);
}

} // namespace

void PreviewSession::chooseScale(TextView text)
{
    quietly([&] {
        const float scale = scaleOf(text);
        if (scale != 0)
            askForCentring();
        canvas_.setDispScale(scale);
        showView();
        if (isScaleEntry(text))
            state_.scale = text;
    });
}

void PreviewSession::fitPageWidth() { showFitted(Fit::Width); }

void PreviewSession::fitPage() { showFitted(Fit::Both); }

void PreviewSession::showFitted(Fit fit)
{
    quietly([&] {
        askForCentring();
        existingCurrentPage();
        canvas_.SetShowStyle(0, 0, 0);
        canvas_.showPage();
        setFittingScale(fit);
        showView();
    });
}

/// The larger ratio is the one that the arrangement in force is fitted by.
void PreviewSession::setFittingScale(Fit fit)
{
    const ViewState& view = canvas_.view();
    const PageFacts facts = canvas_.facts();
    float divisor = 0;
    if (fit == Fit::LargerRatio) {
        divisor = fittingDivisor(view.viewportWidth, view.viewportHeight, view.grid, facts);
        if (divisor < 0)
            return; // the viewport has no room at all
    } else {
        divisor = divisorFor(static_cast<double>(facts.myWidth) + PageGap, view.viewportWidth);
        if (fit == Fit::Both)
            divisor = std::max(divisor,
                divisorFor(static_cast<double>(facts.myHeight) + PageGap, view.viewportHeight));
        divisor = std::clamp(
            divisor, static_cast<float>(1 / LargestScale), static_cast<float>(1 / SmallestScale));
    }
    canvas_.setReSetLeftTop(true);
    canvas_.setDispScale(1 / divisor);
    noteFit(fit);
}

void PreviewSession::noteFit(Fit fit)
{
    fit_ = fit;
    fitDivisor_ = canvas_.DispScale();
}

void PreviewSession::viewportChanged()
{
    quietly([&] {
        if (fit_ != Fit::None && fitDivisor_ == canvas_.DispScale()) {
            barsToStart(canvas_);
            setFittingScale(fit_);
        } else {
            canvas_.bringIntoStep();
        }
        showView();
    });
}

} // namespace pelloric
