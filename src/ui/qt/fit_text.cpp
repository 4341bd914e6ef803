// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/fit_text.h"

#include "ui/qt/options_panel.h"

#include <cmath>

namespace pelloric::qt {

namespace {

QString ruleText(const FitResult& fit)
{
    const auto percent = static_cast<int>(std::floor(fit.scale * 100));
    switch (fit.rule) {
    case FitRule::NotAsked:
        break;
    case FitRule::AsItIs:
        return OptionsPanel::tr("The table fits as it is.");
    case FitRule::Landscape:
        return fit.isTurned ? OptionsPanel::tr("The table fits on turned paper.")
                            : OptionsPanel::tr("The table fits as it is.");
    case FitRule::Shrunk:
        return fit.isTurned ? OptionsPanel::tr("Shrunk to %1 % on turned paper.").arg(percent)
                            : OptionsPanel::tr("Shrunk to %1 %.").arg(percent);
    case FitRule::Bands:
        return fit.pagesAcross > 1
            ? OptionsPanel::tr("Too wide to be shrunk: printed in bands.")
            : OptionsPanel::tr("Too wide to be shrunk: its columns are narrowed.");
    }
    return {};
}

} // namespace

QString fitText(const FitResult& fit)
{
    const QString rule = ruleText(fit);
    if (rule.isEmpty() || fit.pagesAcross < 2)
        return rule;
    return rule + QLatin1Char(' ') + OptionsPanel::tr("Pages across: %1.").arg(fit.pagesAcross);
}

} // namespace pelloric::qt
