// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_surface.h"
#include "platform/text.h"
#include "platform/units.h"

#include <cstdint>

namespace pelloric {

/// A font as settings and texts describe it.
struct Font {
    Text name = u"宋体"; ///< face name; a face that is not installed is drawn in its substitute
    float size = 11; ///< points
    bool bold = false;
    bool italic = false;
    bool strikethrough = false; ///< kept in settings only, never in a page's text
    bool underline = false; ///< kept in settings only, never in a page's text

    bool operator==(const Font&) const = default;
};

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

/// One straight line, or one filled rectangle.
struct Lineobj {
    Tpoint pt1; ///< start, or a corner
    Tpoint pt2; ///< end, or the opposite corner
    std::int16_t LineStyle = SolidPen;
    Color LineColor = 0;
    std::int16_t LineWidth = 1; ///< device pixels
    std::int16_t FillStyle = TransparentFill;
    Color FillColor = 0;

    bool operator==(const Lineobj&) const = default;
};

/// One run of text printed at a point.
struct Textobj {
    Tpoint pt; ///< top-left corner
    Text Str; ///< may hold `PageCountToken`
    Font prnFont; ///< name, size, bold and italic only
    Color ForeColor = 0;

    bool operator==(const Textobj&) const = default;
};

/// The one picture that a page may carry.
struct MapLocation {
    std::int16_t nLeft = 0; ///< twips
    std::int16_t nTop = 0; ///< twips
    std::int16_t nWidth = 0; ///< twips
    std::int16_t nHeight = 0; ///< twips
    Text nFJBH; ///< identifier of the picture
    Text strFilePath; ///< image file that is painted into the rectangle

    bool operator==(const MapLocation&) const = default;
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
