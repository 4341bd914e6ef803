// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "platform/units.h"

#include <optional>

namespace pelloric {

class DrawingSurface;
struct Font;
class PageDocument;
struct LinePen;
struct LineRecord;
struct TextRecord;
struct TextStyle;

/// A rectangle of a page: twips; left and top belong to it, right and bottom too.
struct PageRect {
    Twips left = 0;
    Twips top = 0;
    Twips right = 0;
    Twips bottom = 0;

    bool operator==(const PageRect&) const = default;
};

/// What differs between the screen, a page window, an image and paper.
struct ReplayOptions {
    float divisor = 1; ///< page twips per screen twip, > 0; divides font sizes (points)
    bool fillPageCount = true; ///< replace "[Pages]" by the page count; false in a page window
    Text reportFontName = u"宋体"; ///< the surface's font before the first record
    float reportFontSize = 20; ///< points, divided like every size
    std::optional<PageRect> visible
        = std::nullopt; ///< the only part that is seen; nothing: all of the page
    bool isCleared = true; ///< the surface is made blank first
    bool hasPicture = true; ///< the page's placed picture is painted
    bool resetsFill = false; ///< the fill style is transparent again behind the lines
    bool makesTextsTransparent = false; ///< every text is told to leave what is behind it visible
};

/// What a printer's page is replayed with: its paper is blank, and placed pictures are not printed.
/// @param font  of the printer before the first record
ReplayOptions paperReplay(const Font& font);

/// Replays the records of a page on a drawing surface: every line, then every text; the pictures of
/// a report behind, between and above them.
///
/// Keeps no picture of a page: each call draws the records again, so screen and paper agree.
class PageRenderer {
public:
    /// @param document  the pages to replay; borrowed, must outlive the renderer
    explicit PageRenderer(const PageDocument& document);

    /// Draws one page.
    ///
    /// Records that lie outside the visible part altogether may be left out.
    /// @param page     zero-based index
    /// @param options  see there; positions (twips) and pen widths (pixels) are never scaled
    /// @param surface  scaled to the page's size in twips; font, pen and point are left changed
    /// @throws RunTimeError SubscriptOutOfRange: no such page; nothing has been drawn
    void replay(int page, const ReplayOptions& options, DrawingSurface& surface) const;

private:
    void drawLine(const LineRecord& line, const LinePen& pen, DrawingSurface& surface) const;
    void drawText(const TextRecord& text, const ReplayOptions& options, DrawingSurface& surface,
        Text& buffer) const;

    const PageDocument& document_;
};

} // namespace pelloric
