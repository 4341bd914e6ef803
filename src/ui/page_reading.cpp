// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/page_reading.h"

#include "controls/canvas.h"
#include "view/page_renderer.h"

#include <algorithm>
#include <cmath>

namespace pelloric {

namespace {

/// How much of the viewport stays free around a part that was scrolled to: a fifth.
constexpr double SightEdge = 0.2;

bool isAtEnd(const ScrollBar& bar, ReadingWay way)
{
    return !bar.enabled || bar.value == (way == ReadingWay::On ? bar.maximum : 0);
}

int nextValue(const ScrollBar& bar, double inner, ReadingWay way)
{
    const int step = seenStep(bar, inner);
    return std::clamp<int>(bar.value + (way == ReadingWay::On ? step : -step), 0, bar.maximum);
}

/// Whether a drag has taken the pages from where their bar says.
bool isDragged(const ScrollBar& bar, Twips offset, std::int16_t previous)
{
    const double step = (static_cast<double>(StartOffset) - offset) / ScrollStep;
    return bar.enabled && std::abs(step - previous) > 1;
}

/// Where the pages have to stand along one direction so that a part of them is seen.
Twips sightOffset(Twips offset, double inner, double from, double to)
{
    const double edge = inner * SightEdge;
    const double first = offset + from;
    const double last = offset + to;
    if (first >= 0 && last <= inner)
        return offset;
    const bool fits = to - from + 2 * edge <= inner;
    const double wanted = first < 0 || !fits ? edge - from : inner - edge - to;
    return static_cast<Twips>(std::clamp(wanted, -1e9, 1e9));
}

} // namespace

void barsToStart(Canvas& canvas)
{
    const ViewState& view = canvas.view();
    if (view.Hbar.value != 0 || view.previousHbar != 0)
        canvas.setHbar(0);
    if (view.Vbar.value != 0 || view.previousVbar != 0)
        canvas.setVbar(0);
}

void barsToEnd(Canvas& canvas)
{
    const ViewState& view = canvas.view();
    if (view.Hbar.enabled)
        canvas.setHbar(view.Hbar.maximum);
    if (view.Vbar.enabled)
        canvas.setVbar(view.Vbar.maximum);
}

bool readWithinPages(Canvas& canvas, ReadingWay way)
{
    const ViewState& view = canvas.view();
    if (isDragged(view.Vbar, view.offset.y, view.previousVbar)
        || isDragged(view.Hbar, view.offset.x, view.previousHbar)) {
        const Tpoint before = view.offset;
        canvas.bringIntoStep();
        if (view.offset != before)
            return true; // going on from here would pass what the drag has hidden
    }
    if (!isAtEnd(view.Vbar, way)) {
        canvas.setVbar(nextValue(view.Vbar, view.innerHeight, way));
        return true;
    }
    if (isAtEnd(view.Hbar, way))
        return false;
    canvas.setHbar(nextValue(view.Hbar, view.innerWidth, way));
    if (view.Vbar.enabled)
        canvas.setVbar(way == ReadingWay::On ? 0 : view.Vbar.maximum);
    return true;
}

bool rests(const Canvas& canvas, ReadingWay way) { return isAtEnd(canvas.view().Vbar, way); }

void keepPageInSight(Canvas& canvas)
{
    const ViewState& view = canvas.view();
    if (!view.baseVisible || !surfacesInView(view, canvas.facts()).empty())
        return;
    canvas.bringIntoStep();
    if (!surfacesInView(view, canvas.facts()).empty())
        return;
    if (view.Hbar.enabled && view.Hbar.value == 0)
        canvas.setHbar(1);
    if (view.Vbar.enabled && view.Vbar.value == 0)
        canvas.setVbar(1);
}

void bringToTop(Canvas& canvas, int surface)
{
    const ViewState& view = canvas.view();
    if (surface < 0 || static_cast<std::size_t>(surface) >= view.surfaces.size())
        return;
    const Tpoint at = view.surfaces[static_cast<std::size_t>(surface)];
    canvas.movePages({ view.offset.x - at.x + StartOffset, view.offset.y - at.y + StartOffset });
}

void bringIntoSight(Canvas& canvas, int surface, const PageRect& part)
{
    const ViewState& view = canvas.view();
    if (surface < 0 || static_cast<std::size_t>(surface) >= view.surfaces.size())
        return;
    const Tpoint at = view.surfaces[static_cast<std::size_t>(surface)];
    const double x = static_cast<double>(at.x) - view.offset.x;
    const double y = static_cast<double>(at.y) - view.offset.y;
    const Tpoint wanted { sightOffset(
                              view.offset.x, view.innerWidth, x + part.left, x + part.right),
        sightOffset(view.offset.y, view.innerHeight, y + part.top, y + part.bottom) };
    if (wanted != view.offset)
        canvas.movePages(wanted);
}

} // namespace pelloric
