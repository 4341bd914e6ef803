// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/page_document.h"
#include "view/page_arrangement.h"

#include <optional>
#include <vector>

namespace pelloric {

struct ReportStyle;

/// What one step of a scroll bar moves: page twips.
inline constexpr Twips ScrollStep = 100;

/// A scroll bar; its minimum is always 0 and one step is a `ScrollStep`.
struct ScrollBar {
    bool enabled = false;
    std::int16_t maximum = 0;
    std::int16_t value = 0;
    std::int16_t largeChange = 1;
    std::int16_t smallChange = 1;

    bool operator==(const ScrollBar&) const = default;
};

/// Where surface 0 stands before anything has moved it, and after a bar is not needed any more.
inline constexpr Twips StartOffset = 100;

/// What is seen of a document: mode, scale, scroll bars, and where each page surface stands.
///
/// The operations below change it; a window reads it afterwards and places its areas accordingly.
struct ViewState {
    float divisor = 1; ///< page twips per screen twip; below 0 when a host asked for that
    Twips viewportWidth = 15000; ///< screen twips
    Twips viewportHeight = 9000; ///< screen twips
    double innerWidth = 15000; ///< of the viewport, as last laid out: page twips
    double innerHeight = 9000; ///< of the viewport, as last laid out: page twips
    OrderStyle style = OrderStyle::One;
    PageGrid grid; ///< as last taken
    MuliPageType window;
    bool multiPage = false; ///< an arrangement of several surfaces is shown
    Tpoint offset { StartOffset, StartOffset }; ///< of surface 0 in the viewport: page twips
    bool ReSetLeftTop = false; ///< centre the pages once, the next time
    bool pan = false; ///< pan mode: hand cursor, a drag moves the pages
    bool dragging = false;
    Tpoint dragStart; ///< page twips
    std::int16_t previousHbar = 0; ///< the value that the offset stands for
    std::int16_t previousVbar = 0; ///< the value that the offset stands for
    ScrollBar Hbar;
    ScrollBar Vbar;
    std::vector<Tpoint> surfaces { { StartOffset, StartOffset } }; ///< page twips; never empty
    bool baseVisible = false; ///< surface 0 is shown and the start-up icon is hidden
    bool portrait = true; ///< orientation flag
    int shownPage = 0; ///< zero-based; the page that was shown alone last
};

/// Whether pages have a size at all: a host may set a divisor without a meaning.
bool hasScale(const ViewState& view);

/// A large step of a bar, but never more than is seen at once; the bar's own is rounded.
/// @param inner  of the viewport along the bar: page twips
/// @return       steps, at least 1
std::int16_t seenStep(const ScrollBar& bar, double inner);

/// The page that a paint of a surface shows.
///
/// Without an arrangement it is the current page; in a page window the first page and so many on;
/// else the page of the surface's own number.
/// @param surface  from 0
/// @return         zero-based, or nothing where the surface stays blank
std::optional<int> pageOnSurface(const ViewState& view, const PageFacts& facts, int surface);

/// The page that stands alone in the viewport, or would without an arrangement: the current one,
/// and where that names no page the one that was shown last.
/// @return  zero-based, or nothing where neither exists
std::optional<int> pageInView(const ViewState& view, const PageFacts& facts);

/// Whether a paint shows texts as stored, "[Pages]" included: true in a page window.
bool showsPageWindow(const ViewState& view);

/// The surfaces of which some part lies in the viewport, in ascending order.
std::vector<int> surfacesInView(const ViewState& view, const PageFacts& facts);

/// Takes sizes, grid, scroll ranges and positions anew.
///
/// An extent counts 400 twips a row but 200 a column, and a bar that is not needed resets the left
/// offset but not the top one; both are kept on purpose. A previous value above the new maximum
/// lowers the bar only, so that the next scroll brings page and bar into step again.
/// @throws RunTimeError Overflow: a scroll range past 16 bits; what precedes it has been changed
void layOutAgain(ViewState& view, const PageFacts& facts);

/// Fits one whole page into the viewport; the multi-page flag stays.
/// @throws RunTimeError as `fittingDivisor` and `layOutAgain`
void showWholePage(ViewState& view, const PageFacts& facts);

/// Shows the current page alone at the present scale, and nothing new when it is -1.
///
/// Lays out again only when it leaves a mode with another grid.
/// @throws RunTimeError SubscriptOutOfRange: no such page, only the mode has changed; Overflow
void showPage(ViewState& view, const PageFacts& facts);

/// Shows all pages, as many beside each other as fit across.
/// @throws RunTimeError as `fittingDivisor` and `layOutAgain`
void showAllPage(ViewState& view, const PageFacts& facts);

/// Takes the mode of a page window and fits its grid into the viewport; `placeMuliPage` follows,
/// and messages may run in between.
/// @param pages  2, 4 or 6; any other number keeps the mode in force. How many surfaces there are
///               is the window's affair.
/// @return       the mode, for `placeMuliPage`
/// @throws RunTimeError as `fittingDivisor`
OrderStyle fitMuliPage(ViewState& view, const PageFacts& facts, std::int16_t pages);

/// Shows the page window at the scale in force.
/// @param facts  as they are now
/// @param style  the mode; a paint since `fitMuliPage` has ended it
/// @throws RunTimeError as `layOutAgain`
void placeMuliPage(ViewState& view, const PageFacts& facts, OrderStyle style);

/// Stores the page window as it is given; shows nothing by itself.
void setShowStyle(
    ViewState& view, std::int16_t pages, std::int16_t firstPage, std::int16_t lastPage);

/// What a build and an opened document end with: no window, mode `One`, a fresh layout, `showPage`.
/// @throws RunTimeError as `layOutAgain` and `showPage`
void showNewDocument(ViewState& view, const PageFacts& facts);

/// Unloads every surface but surface 0, as a new page does.
void unloadSurfaces(ViewState& view);

/// Unloads the surfaces and ends the arrangement, as clearing the document does.
void endArrangement(ViewState& view);

/// Makes the pages half as large (the name is the interface's own).
/// @throws RunTimeError Overflow: the divisor would be infinite; nothing has changed. Or as
///                      `layOutAgain`
void zoomIn(ViewState& view, const PageFacts& facts);

/// Makes the pages twice as large (the name is the interface's own).
/// @throws RunTimeError as `layOutAgain`
void zoomOut(ViewState& view, const PageFacts& facts);

/// Sets the scale; what is read back is the divisor, its reciprocal.
/// @throws RunTimeError DivisionByZero: the scale is 0, Overflow: its reciprocal is infinite;
///                      nothing has changed. Or as `layOutAgain`
void setDispScale(ViewState& view, const PageFacts& facts, float scale);

/// The horizontal bar was moved: the pages follow by a `ScrollStep` for each step.
/// @param value  not clamped to the bar's range
/// @throws RunTimeError Overflow: value past 16 bits or position past 32; nothing has changed
void setHbar(ViewState& view, const PageFacts& facts, std::int32_t value);

/// The vertical bar was moved: the pages follow by a `ScrollStep` for each step.
/// @param value  not clamped to the bar's range
/// @throws RunTimeError Overflow: value past 16 bits or position past 32; nothing has changed
void setVbar(ViewState& view, const PageFacts& facts, std::int32_t value);

/// Moves the pages to a position where bars are enabled, as far as these reach.
///
/// Each bar takes its nearest step, so that page and bar are at most half a step apart.
/// @param first  of surface 0: page twips
void movePages(ViewState& view, const PageFacts& facts, Tpoint first);

/// Brings pages and bars into step after a drag, or after the viewport has become another.
///
/// Where no bar is needed the pages are centred, elsewhere they stay as far as the bar reaches.
/// @throws RunTimeError as `layOutAgain`
void bringIntoStep(ViewState& view, const PageFacts& facts);

/// Shows another scale; the part of a page under a point of the viewport stays there as far as the
/// bars reach, and where no bar is needed the pages are centred.
/// @param scale  not 0
/// @param x, y   screen twips from the viewport's corner
/// @throws RunTimeError as `setDispScale`
void zoomAbout(ViewState& view, const PageFacts& facts, float scale, double x, double y);

/// Enters pan mode.
void pan(ViewState& view);

/// Leaves pan mode until the mouse moves over a page.
void setMouse(ViewState& view);

/// The mouse moves over a page surface: pan mode is entered, whatever `setMouse` said.
void mouseMove(ViewState& view);

/// A button goes down on a page surface: in pan mode a drag begins.
/// @throws RunTimeError Overflow: outside 32 bits
void mouseDown(ViewState& view, double x, double y);

/// A button is released: the pages jump once, by the whole drag.
/// @throws RunTimeError Overflow: outside 32 bits; the drag is over, nothing has moved
void mouseUp(ViewState& view, const PageFacts& facts, double x, double y);

/// Sets the orientation; another one exchanges width and height of the paper. The printable size
/// in tenths is taken anew either way.
///
/// @param facts     as they are before
/// @param portrait  false: landscape
/// @throws RunTimeError Overflow: the old height, which passes through 16 bits, is above them, or
///                      a tenth is; nothing has changed. Or as `layOutAgain`
void setVerticalDir(
    ViewState& view, ReportStyle& style, PageSetup& setup, PageFacts facts, bool portrait);

} // namespace pelloric
