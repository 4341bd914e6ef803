// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// The published records and enumerations: what pages are made of, and how they are arranged.
///
/// @code
/// const pelloric::Tpoint corner { .x = 567, .y = 567 }; // a centimetre from either edge
/// @endcode

#include <cstdint>
#include <string>

namespace pelloric {

/// A length or position on paper: 1440 twips are an inch.
using Twips = std::int32_t;

/// A colour as 0x00BBGGRR.
using Color = std::int32_t;

/// A position on a page, from the paper's top-left corner.
struct Tpoint {
    Twips x = 0; ///< to the right
    Twips y = 0; ///< downwards

    bool operator==(const Tpoint&) const = default;
};

/// A font as settings and texts describe it.
struct Font {
    std::u16string name = u"宋体"; ///< of the face; one that is not installed is substituted
    float size = 11; ///< points
    bool bold = false; ///< heavy strokes
    bool italic = false; ///< slanted strokes
    bool strikethrough = false; ///< kept in settings only, never in a page's text
    bool underline = false; ///< kept in settings only, never in a page's text

    bool operator==(const Font&) const = default;
};

/// One straight line, or one filled rectangle.
struct Lineobj {
    Tpoint pt1; ///< start, or a corner
    Tpoint pt2; ///< end, or the opposite corner
    std::int16_t LineStyle = 0; ///< 0 solid, 1 dash, 2 dot, 3 dash-dot, 4 dash-dot-dot, 5 none
    Color LineColor = 0; ///< of a line
    std::int16_t LineWidth = 1; ///< device pixels
    std::int16_t FillStyle = 1; ///< 1 a line, anything else a filled rectangle
    Color FillColor = 0; ///< of a rectangle

    bool operator==(const Lineobj&) const = default;
};

/// One run of text printed at a point.
struct Textobj {
    Tpoint pt; ///< top-left corner
    std::u16string Str; ///< may hold "[Pages]", which stands for the number of pages
    Font prnFont; ///< name, size, bold and italic only
    Color ForeColor = 0; ///< of the text

    bool operator==(const Textobj&) const = default;
};

/// The one picture that a page may carry.
struct MapLocation {
    std::int16_t nLeft = 0; ///< twips
    std::int16_t nTop = 0; ///< twips
    std::int16_t nWidth = 0; ///< twips
    std::int16_t nHeight = 0; ///< twips
    std::u16string nFJBH; ///< identifier of the picture
    std::u16string strFilePath; ///< image file that is painted into the rectangle

    bool operator==(const MapLocation&) const = default;
};

/// A band of printed columns, both ends included; columns count from 1.
struct ColPos {
    std::int16_t StartCol = 1; ///< the first column
    std::int16_t EndCol = 1; ///< the last column

    bool operator==(const ColPos&) const = default;
};

/// How pages are arranged in the viewport; any other value shows one page.
enum class OrderStyle : std::int32_t {
    Whole = 0, ///< one page, fitted to the viewport
    One = 1, ///< one page at the present scale
    Two = 2, ///< side by side, landscape pages one above the other
    Four = 3, ///< two rows of two
    Multiple = 4, ///< as many as fit across, in as many rows as it takes
    UserCustom = 5, ///< one page; never set by the canvas itself
    Six = 6, ///< two rows of three
};

/// The page window: which pages a multi-page arrangement shows.
struct MuliPageType {
    std::int16_t nPages = 0; ///< pages shown; 0 means no window
    std::int16_t MinPage = 0; ///< first page, zero-based
    std::int16_t MaxPage = 0; ///< last page, zero-based

    bool operator==(const MuliPageType&) const = default;
};

/// The kinds of grids; decides which members a reader uses.
enum class PrintObjKind : std::int16_t {
    MSHFlexGrid = 0, ///< a hierarchical flex grid
    MSFlexGrid = 1, ///< a flex grid
    ListView = 2, ///< a list view in report mode
    datagrid = 3, ///< a data grid on a record set
};

} // namespace pelloric
