// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/view_state.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "report/report_style.h"

#include <algorithm>
#include <cmath>

namespace pelloric {

namespace {

/// What a scroll range counts beside each page: the two differ, and are kept.
constexpr Twips GapPerRow = 400;
constexpr Twips GapPerColumn = 200;

/// The pages along one direction.
struct Extent {
    double inner = 0; ///< of the viewport: page twips
    double pages = 0; ///< without gaps: page twips
    double range = 0; ///< with the gaps that the scroll range counts: page twips
};

void enableBar(ScrollBar& bar, const Extent& extent, std::int16_t previous)
{
    bar.enabled = true;
    bar.maximum = roundToInt16((extent.range - extent.inner) / ScrollStep);
    bar.value = std::max<std::int16_t>(0, std::min(previous, bar.maximum));
    const double large = bar.maximum * extent.inner / extent.range;
    bar.largeChange = std::max<std::int16_t>(1, roundToInt16(large));
    const double small = bar.maximum < 10 ? 1.0 : bar.largeChange / 10.0;
    bar.smallChange = std::max<std::int16_t>(1, roundToInt16(small));
}

void disableBar(ScrollBar& bar, std::int16_t& previous)
{
    bar.enabled = false;
    bar.value = 0;
    previous = 0;
}

void layOutVbar(ViewState& view, const PageFacts& facts)
{
    const double height = facts.myHeight;
    const double rows = view.grid.rows;
    const Extent extent { view.innerHeight, height * rows, (height + GapPerRow) * rows };
    if (extent.inner < extent.pages)
        enableBar(view.Vbar, extent, view.previousVbar);
    else
        disableBar(view.Vbar, view.previousVbar);
}

/// Unlike the vertical bar, one that is not needed puts the pages back to the start.
void layOutHbar(ViewState& view, const PageFacts& facts)
{
    const double width = facts.myWidth;
    const double columns = view.grid.columns;
    const Extent extent { view.innerWidth, width * columns, (width + GapPerColumn) * columns };
    if (extent.inner < extent.pages) {
        enableBar(view.Hbar, extent, view.previousHbar);
        return;
    }
    disableBar(view.Hbar, view.previousHbar);
    view.offset.x = StartOffset;
}

/// A divisor below 0, or one that is no number any more, leaves the viewport without extent.
void takeInnerSize(ViewState& view)
{
    const double divisor = view.divisor;
    view.innerHeight = std::max(0.0, view.viewportHeight * divisor);
    view.innerWidth = std::max(0.0, view.viewportWidth * divisor);
}

void takeGrid(ViewState& view, const PageFacts& facts)
{
    view.grid = gridOf(view.style, view.innerWidth, facts);
}

void fitGrid(ViewState& view, const PageFacts& facts)
{
    view.divisor = fittingDivisor(view.viewportWidth, view.viewportHeight, view.grid, facts);
}

void placeSurfaces(ViewState& view, const PageFacts& facts)
{
    int index = 0;
    for (Tpoint& surface : view.surfaces)
        surface = surfacePosition(view.offset, index++, view.grid, facts);
}

void centreWhenAsked(ViewState& view, const PageFacts& facts)
{
    if (!view.ReSetLeftTop)
        return;
    view.offset = centredPosition(view.innerWidth, view.innerHeight, view.grid, facts);
    view.ReSetLeftTop = false;
}

/// Shows an arrangement of so many surfaces; surface 0 is always there.
void loadSurfaces(ViewState& view, const PageFacts& facts, int count)
{
    view.multiPage = true;
    unloadSurfaces(view);
    view.surfaces.resize(static_cast<std::size_t>(std::max(1, count)));
    view.baseVisible = true;
    placeSurfaces(view, facts);
}

void scroll(Twips& offset, std::int16_t& previous, ScrollBar& bar, std::int32_t value)
{
    const std::int16_t now = narrowToInt16(value);
    const std::int32_t moved = (std::int32_t { now } - previous) * ScrollStep;
    offset = roundToInt32(static_cast<double>(offset) - moved);
    previous = now;
    bar.value = now;
}

/// Unlike a scroll it takes a position between two steps, too.
void moveAlong(Twips& offset, std::int16_t& previous, ScrollBar& bar, Twips wanted)
{
    const Twips farthest = StartOffset - Twips { bar.maximum } * ScrollStep;
    offset = std::clamp(wanted, farthest, StartOffset);
    previous = roundToInt16(static_cast<double>(StartOffset - offset) / ScrollStep);
    bar.value = previous;
}

std::optional<int> existing(const PageFacts& facts, int page)
{
    if (page < 0 || page >= facts.pageCount)
        return std::nullopt;
    return page;
}

/// The mode that a number of pages stands for; any other number keeps the one in force.
OrderStyle styleOf(std::int16_t pages, OrderStyle present)
{
    switch (pages) {
    case 2:
        return OrderStyle::Two;
    case 4:
        return OrderStyle::Four;
    case 6:
        return OrderStyle::Six;
    default:
        return present;
    }
}

} // namespace

bool showsPageWindow(const ViewState& view) { return view.multiPage && view.window.nPages != 0; }

bool hasScale(const ViewState& view)
{
    const double divisor = view.divisor;
    return divisor > 0 && std::isfinite(1 / divisor);
}

std::int16_t seenStep(const ScrollBar& bar, double inner)
{
    const double seen = std::max(1.0, inner / ScrollStep);
    return seen < bar.largeChange ? static_cast<std::int16_t>(seen) : bar.largeChange;
}

std::optional<int> pageOnSurface(const ViewState& view, const PageFacts& facts, int surface)
{
    if (showsPageWindow(view)) {
        const int page = std::max<int>(0, view.window.MinPage) + surface;
        return page < facts.Totalpages ? existing(facts, page) : std::nullopt;
    }
    const bool alone = !view.multiPage || view.surfaces.size() == 1;
    return existing(facts, alone ? facts.currentPage : surface);
}

std::optional<int> pageInView(const ViewState& view, const PageFacts& facts)
{
    const std::optional<int> current = existing(facts, facts.currentPage);
    return current ? current : existing(facts, view.shownPage);
}

std::vector<int> surfacesInView(const ViewState& view, const PageFacts& facts)
{
    std::vector<int> indexes;
    int index = 0;
    for (const Tpoint& surface : view.surfaces) {
        const double right = static_cast<double>(surface.x) + facts.myWidth;
        const double bottom = static_cast<double>(surface.y) + facts.myHeight;
        if (surface.x < view.innerWidth && surface.y < view.innerHeight && right > 0 && bottom > 0)
            indexes.push_back(index);
        ++index;
    }
    return indexes;
}

void layOutAgain(ViewState& view, const PageFacts& facts)
{
    takeInnerSize(view);
    takeGrid(view, facts);
    layOutVbar(view, facts);
    layOutHbar(view, facts);
    centreWhenAsked(view, facts);
    placeSurfaces(view, facts);
}

void showWholePage(ViewState& view, const PageFacts& facts)
{
    view.style = OrderStyle::Whole;
    view.divisor = fittingDivisor(view.viewportWidth, view.viewportHeight, { 1, 1 }, facts);
    unloadSurfaces(view);
    view.baseVisible = true;
    layOutAgain(view, facts);
}

void showPage(ViewState& view, const PageFacts& facts)
{
    if (facts.currentPage == -1)
        return;
    view.style = OrderStyle::One;
    if (!existing(facts, facts.currentPage))
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"page"), std::int64_t { facts.currentPage } + 1, facts.Totalpages));
    view.shownPage = facts.currentPage;
    endArrangement(view);
    view.baseVisible = true;
    if (view.grid != PageGrid {})
        layOutAgain(view, facts);
    centreWhenAsked(view, facts);
    placeSurfaces(view, facts);
}

void showAllPage(ViewState& view, const PageFacts& facts)
{
    view.style = OrderStyle::Multiple;
    takeGrid(view, facts);
    fitGrid(view, facts);
    takeInnerSize(view);
    takeGrid(view, facts);
    loadSurfaces(view, facts, facts.Totalpages);
    layOutAgain(view, facts);
}

OrderStyle fitMuliPage(ViewState& view, const PageFacts& facts, std::int16_t pages)
{
    view.style = styleOf(pages, view.style);
    takeGrid(view, facts);
    fitGrid(view, facts);
    return view.style;
}

void placeMuliPage(ViewState& view, const PageFacts& facts, OrderStyle style)
{
    view.style = style;
    takeInnerSize(view);
    takeGrid(view, facts);
    loadSurfaces(view, facts, view.window.nPages);
    layOutAgain(view, facts);
}

void setShowStyle(
    ViewState& view, std::int16_t pages, std::int16_t firstPage, std::int16_t lastPage)
{
    view.window = { pages, firstPage, lastPage };
}

void showNewDocument(ViewState& view, const PageFacts& facts)
{
    const auto lastPage = static_cast<std::int16_t>(std::max(0, facts.Totalpages - 1));
    setShowStyle(view, 0, 0, lastPage);
    view.style = OrderStyle::One;
    layOutAgain(view, facts);
    showPage(view, facts);
}

void unloadSurfaces(ViewState& view) { view.surfaces.resize(1); }

void endArrangement(ViewState& view)
{
    view.multiPage = false;
    unloadSurfaces(view);
}

void zoomIn(ViewState& view, const PageFacts& facts)
{
    const float divisor = view.divisor + view.divisor;
    if (!std::isfinite(divisor))
        throw RunTimeError(ErrorNumber::Overflow, phrase(u"the pages cannot be shown any smaller"));
    view.divisor = divisor;
    layOutAgain(view, facts);
}

void zoomOut(ViewState& view, const PageFacts& facts)
{
    view.divisor *= 0.5F;
    layOutAgain(view, facts);
}

void setDispScale(ViewState& view, const PageFacts& facts, float scale)
{
    if (scale == 0)
        throw RunTimeError(ErrorNumber::DivisionByZero, phrase(u"a scale of 0 shows nothing"));
    const float divisor = 1 / scale;
    if (!std::isfinite(divisor))
        throw RunTimeError(
            ErrorNumber::Overflow, phrase(u"a scale of %1 is too small", { formatSingle(scale) }));
    view.divisor = divisor;
    layOutAgain(view, facts);
}

void setHbar(ViewState& view, const PageFacts& facts, std::int32_t value)
{
    scroll(view.offset.x, view.previousHbar, view.Hbar, value);
    placeSurfaces(view, facts);
}

void setVbar(ViewState& view, const PageFacts& facts, std::int32_t value)
{
    scroll(view.offset.y, view.previousVbar, view.Vbar, value);
    placeSurfaces(view, facts);
}

void movePages(ViewState& view, const PageFacts& facts, Tpoint first)
{
    if (view.Hbar.enabled)
        moveAlong(view.offset.x, view.previousHbar, view.Hbar, first.x);
    if (view.Vbar.enabled)
        moveAlong(view.offset.y, view.previousVbar, view.Vbar, first.y);
    placeSurfaces(view, facts);
}

void bringIntoStep(ViewState& view, const PageFacts& facts)
{
    const Tpoint wanted = view.offset;
    view.previousHbar = view.previousVbar = 0;
    view.ReSetLeftTop = true;
    layOutAgain(view, facts);
    movePages(view, facts, wanted);
}

void zoomAbout(ViewState& view, const PageFacts& facts, float scale, double x, double y)
{
    const double before = view.divisor;
    const double pageX = x * before - view.offset.x;
    const double pageY = y * before - view.offset.y;
    view.previousHbar = view.previousVbar = 0;
    view.ReSetLeftTop = true;
    setDispScale(view, facts, scale);
    const double divisor = view.divisor;
    movePages(
        view, facts, { roundToInt32(x * divisor - pageX), roundToInt32(y * divisor - pageY) });
}

void pan(ViewState& view) { view.pan = true; }

void setMouse(ViewState& view) { view.pan = false; }

void mouseMove(ViewState& view) { pan(view); }

void mouseDown(ViewState& view, double x, double y)
{
    if (!view.pan)
        return;
    view.dragStart = { roundToInt32(x), roundToInt32(y) };
    view.dragging = true;
}

void mouseUp(ViewState& view, const PageFacts& facts, double x, double y)
{
    if (!view.dragging)
        return;
    view.dragging = false;
    view.offset = { roundToInt32(x - view.dragStart.x + view.offset.x),
        roundToInt32(y - view.dragStart.y + view.offset.y) };
    placeSurfaces(view, facts);
}

void setVerticalDir(
    ViewState& view, ReportStyle& style, PageSetup& setup, PageFacts facts, bool portrait)
{
    PageSetup turned = setup;
    if (portrait != view.portrait) {
        turned.myHeight = setup.myWidth;
        turned.myWidth = narrowToInt16(setup.myHeight);
    }
    setPrintableTenths(style, turned);
    setup = turned;
    view.portrait = portrait;
    facts.myWidth = setup.myWidth;
    facts.myHeight = setup.myHeight;
    layOutAgain(view, facts);
}

} // namespace pelloric
