// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "platform/units.h"

namespace pelloric {

/// Pen and fill styles in the numbering of drawing surfaces.
inline constexpr std::int16_t SolidPen = 0;
inline constexpr std::int16_t SolidFill = 0;
inline constexpr std::int16_t TransparentFill = 1;

/// What a page is replayed on: a page surface on screen, a printer's page, an image.
///
/// Positions are twips of the page. Attributes stay as they were set until they are set again.
class DrawingSurface {
public:
    virtual ~DrawingSurface() = default;

    /// Makes the surface blank and puts the current point at (0, 0).
    virtual void clear() = 0;

    virtual void setFontName(TextView name) = 0;
    /// @param size  points on this surface, already divided by the display divisor
    virtual void setFontSize(float size) = 0;
    virtual void setFontBold(bool bold) = 0;
    virtual void setFontItalic(bool italic) = 0;
    /// Whether texts leave what is behind them visible.
    virtual void setFontTransparent(bool transparent) = 0;
    /// Colour of texts and plain lines.
    virtual void setForeColor(Color color) = 0;
    /// @param width  device pixels, never scaled
    virtual void setDrawWidth(std::int16_t width) = 0;
    /// @param style  0 solid, 1 dash, 2 dot, 3 dash-dot, 4 dash-dot-dot, 5 none, 6 inside solid
    virtual void setDrawStyle(std::int16_t style) = 0;
    /// @param style  0 solid, 1 none, 2 to 7 hatched
    virtual void setFillStyle(std::int16_t style) = 0;
    virtual void setFillColor(Color color) = 0;
    virtual void setCurrentX(Twips x) = 0;
    virtual void setCurrentY(Twips y) = 0;

    /// A line in the fore colour; leaves the current point at its end.
    virtual void line(Tpoint from, Tpoint to) = 0;

    /// A rectangle filled with fill style and fill colour.
    /// @param outline  colour of its outline
    virtual void box(Tpoint corner, Tpoint opposite, Color outline) = 0;

    /// Prints a text with its top-left corner at the current point, then breaks the line.
    virtual void print(TextView text) = 0;

    /// Paints an image file into a rectangle; one that cannot be read leaves the surface alone.
    virtual void picture(TextView filePath, Tpoint topLeft, Tpoint size) = 0;
};

} // namespace pelloric
