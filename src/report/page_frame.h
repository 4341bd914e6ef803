// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/records.h"
#include "platform/numbers.h"
#include "report/report_style.h"

#include <algorithm>

namespace pelloric {

/// Between header line and titles, and between the last row and the footer: twips.
inline constexpr Twips LineGap = 144;

/// A position further down.
/// @throws RunTimeError Overflow: beyond 32 bits of twips
inline Twips below(Twips y, double distance)
{
    return roundToInt32(static_cast<double>(y) + distance);
}

/// Whether a header or footer line has anything to show.
inline bool hasText(const SlotTexts& slots)
{
    return std::any_of(slots.begin(), slots.end(), [](const Text& text) { return !text.empty(); });
}

/// What grid lines and the boxes of titles are drawn with.
inline LinePen gridPen(const ReportStyle& style)
{
    return { .LineColor = style.GridLineColor, .FillColor = style.HeaderColor };
}

} // namespace pelloric
