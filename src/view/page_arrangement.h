// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/units.h"

#include <pelloric/records.h>

namespace pelloric {

struct PageSetup;
class PageDocument;

/// Columns and rows of pages.
struct PageGrid {
    std::int16_t columns = 1;
    std::int16_t rows = 1;

    bool operator==(const PageGrid&) const = default;
};

/// What an arrangement needs to know about the document.
struct PageFacts {
    Twips myWidth = 0; ///< paper
    Twips myHeight = 0; ///< paper
    std::int16_t Totalpages = 1; ///< as published; a host may have written it
    std::int16_t currentPage = 0; ///< zero-based; may name no page
    int pageCount = 1; ///< pages that exist

    bool operator==(const PageFacts&) const = default;
};

/// The facts of a document on its paper.
PageFacts pageFactsOf(const PageSetup& setup, const PageDocument& document);

/// What the grey edge of a viewport takes off its width and its height when pages are fitted, and
/// what lies between neighbouring pages: twips.
inline constexpr Twips FittingEdge = 200;
inline constexpr Twips PageGap = 200;

/// The grid of a mode.
///
/// For `Multiple` both widths are rounded to whole twips before they are divided.
/// @param innerWidth  of the viewport: page twips
/// @throws RunTimeError Overflow: more columns than 16 bits hold; DivisionByZero: paper of width 0
PageGrid gridOf(OrderStyle style, double innerWidth, const PageFacts& facts);

/// The display divisor at which a grid of pages fills the viewport.
///
/// The larger of the two ratios wins on purpose: the pages fill the viewport in the direction in
/// which they have more room and may run past it in the other.
/// @param viewportWidth   screen twips
/// @param viewportHeight  screen twips
/// @return                below 0 when the viewport has no room at all
/// @throws RunTimeError DivisionByZero: paper or room without extent
float fittingDivisor(
    Twips viewportWidth, Twips viewportHeight, const PageGrid& grid, const PageFacts& facts);

/// Where a page surface stands.
///
/// @param first    position of surface 0: page twips
/// @param surface  index of the surface, from 0
/// @throws RunTimeError Overflow: outside 32 bits
Tpoint surfacePosition(Tpoint first, int surface, const PageGrid& grid, const PageFacts& facts);

/// Where surface 0 stands so that the grid is centred, 100 twips from the edge at least.
///
/// @throws RunTimeError Overflow: outside 32 bits
Tpoint centredPosition(
    double innerWidth, double innerHeight, const PageGrid& grid, const PageFacts& facts);

} // namespace pelloric
