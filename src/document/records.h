// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_surface.h"
#include "platform/text.h"
#include "platform/units.h"

#include <pelloric/records.h>

#include <cstdint>

namespace pelloric {

/// Pen and fill of a line or rectangle.
struct LinePen {
    std::int16_t LineStyle
        = SolidPen; ///< 0 solid, 1 dash, 2 dot, 3 dash-dot, 4 dash-dot-dot, 5 none
    Color LineColor = 0;
    std::int16_t LineWidth = 1; ///< device pixels, not scaled by zoom
    std::int16_t FillStyle = TransparentFill; ///< anything else makes the line a filled rectangle
    Color FillColor = rgb(224, 224, 224);

    bool operator==(const LinePen&) const = default;
};

/// Stands in recorded texts for the number of pages, which is known only when the layout ends.
inline constexpr TextView PageCountToken = u"[Pages]";

/// Face, size and colour that a text is recorded with.
struct TextStyle {
    Font font;
    Color color = 0;

    bool operator==(const TextStyle&) const = default;
};

} // namespace pelloric
