// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/page_arrangement.h"

#include "document/page_document.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <algorithm>

namespace pelloric {

namespace {

/// The least distance between the viewport's edge and a centred page: twips.
constexpr std::int32_t CentringEdge = 100;

/// As many columns as fit across, in as many rows as all pages take.
PageGrid gridOfAllPages(double innerWidth, const PageFacts& facts)
{
    if (facts.myWidth == 0)
        throw RunTimeError(ErrorNumber::DivisionByZero, phrase(u"the paper has no width"));
    const std::int64_t fitting = std::int64_t { roundToInt32(innerWidth) } / facts.myWidth;
    const std::int64_t columns = std::max<std::int64_t>(1, fitting);
    const std::int64_t rows = (std::int64_t { facts.Totalpages } - 1) / columns + 1;
    return { narrowToInt16(columns), narrowToInt16(std::max<std::int64_t>(1, rows)) };
}

double ratio(Twips viewport, std::int16_t pages, Twips paper)
{
    const double extent = static_cast<double>(pages) * paper;
    const double room = static_cast<double>(viewport) - FittingEdge;
    if (extent == 0)
        throw RunTimeError(
            ErrorNumber::DivisionByZero, phrase(u"the paper has no width or no height"));
    return room / extent;
}

Twips centred(double inner, Twips paper, std::int16_t pages)
{
    const double extent = (static_cast<double>(paper) + PageGap) * pages;
    return std::max(CentringEdge, roundToInt32((inner - extent) / 2));
}

Twips placed(Twips first, Twips paper, int place)
{
    return roundToInt32(first + (static_cast<double>(paper) + PageGap) * place);
}

} // namespace

PageFacts pageFactsOf(const PageSetup& setup, const PageDocument& document)
{
    return { setup.myWidth, setup.myHeight, document.Totalpages, document.currentPage,
        document.pageCount() };
}

PageGrid gridOf(OrderStyle style, double innerWidth, const PageFacts& facts)
{
    switch (style) {
    case OrderStyle::Two:
        return facts.myWidth <= facts.myHeight ? PageGrid { 2, 1 } : PageGrid { 1, 2 };
    case OrderStyle::Four:
        return { 2, 2 };
    case OrderStyle::Six:
        return { 3, 2 };
    case OrderStyle::Multiple:
        return gridOfAllPages(innerWidth, facts);
    case OrderStyle::Whole:
    case OrderStyle::One:
    case OrderStyle::UserCustom:
    default:
        return { 1, 1 };
    }
}

float fittingDivisor(
    Twips viewportWidth, Twips viewportHeight, const PageGrid& grid, const PageFacts& facts)
{
    const double across = ratio(viewportWidth, grid.columns, facts.myWidth);
    const double down = ratio(viewportHeight, grid.rows, facts.myHeight);
    const double larger = std::max(across, down);
    if (larger == 0)
        throw RunTimeError(
            ErrorNumber::DivisionByZero, phrase(u"the window has no room for a page"));
    return static_cast<float>(1 / larger);
}

Tpoint surfacePosition(Tpoint first, int surface, const PageGrid& grid, const PageFacts& facts)
{
    const int columns = grid.columns;
    return { placed(first.x, facts.myWidth, surface % columns),
        placed(first.y, facts.myHeight, surface / columns) };
}

Tpoint centredPosition(
    double innerWidth, double innerHeight, const PageGrid& grid, const PageFacts& facts)
{
    return { centred(innerWidth, facts.myWidth, grid.columns),
        centred(innerHeight, facts.myHeight, grid.rows) };
}

} // namespace pelloric
