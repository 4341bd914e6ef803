// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// How a preview goes from page to page, and from window of pages to window.

#include "ui/preview_navigation.h"

#include "platform/numbers.h"

#include <algorithm>

namespace pelloric {

namespace {

/// From this many pages on, the many-page view shows a window of pages instead of all.
constexpr std::int16_t ManyPagesWindowed = 21;
constexpr std::int16_t ManyPagesWindow = 6;

constexpr char16_t WindowMark = u'【';

} // namespace

/// A number that names no page leaves the page in view, from which the next one counts.
void PreviewSession::existingCurrentPage()
{
    if (canvas_.document().hasPage(canvas_.document().currentPage))
        return;
    const auto page = showsPageWindow(canvas_.view())
        ? std::optional<int>(std::max<int>(0, canvas_.WindowMinPage()))
        : pageInView(canvas_.view(), canvas_.facts());
    if (page)
        canvas_.setCurrentpage(narrowToInt16(*page + 1));
}

void PreviewSession::showFirst()
{
    canvas_.setCurrentpage(1);
    updatePosition();
    const std::int16_t pages = canvas_.WindowPages();
    if (pages <= 0)
        return canvas_.showPage();
    showWindow(pages, 0, pages - 1);
}

void PreviewSession::showPrevious()
{
    existingCurrentPage();
    if (canvas_.Currentpage() == 1)
        return;
    canvas_.setCurrentpage(narrowToInt16(std::int64_t { canvas_.Currentpage() } - 1));
    updatePosition();
    const std::int16_t pages = canvas_.WindowPages();
    if (pages <= 0)
        return canvas_.showPage();
    const int last = canvas_.WindowMinPage() - 1;
    showWindow(pages, last - pages + 1, last);
}

void PreviewSession::showNext()
{
    existingCurrentPage();
    canvas_.setCurrentpage(narrowToInt16(std::int64_t { canvas_.Currentpage() } + 1));
    updatePosition();
    const std::int16_t pages = canvas_.WindowPages();
    if (pages <= 0)
        return canvas_.showPage();
    const int first = canvas_.WindowMaxPage() + 1;
    showWindow(pages, first, first + pages - 1);
}

void PreviewSession::showLast()
{
    const std::int16_t total = canvas_.Totalpages();
    if (canvas_.Currentpage() == total)
        return;
    canvas_.setCurrentpage(total);
    updatePosition();
    const std::int16_t pages = canvas_.WindowPages();
    if (pages <= 0)
        return canvas_.showPage();
    showWindow(pages, std::max(0, total - pages), total - 1);
}

void PreviewSession::showManyPages()
{
    if (canvas_.Totalpages() >= ManyPagesWindowed) {
        const int first = canvas_.Currentpage() - 1;
        return showWindow(ManyPagesWindow, first, first + ManyPagesWindow - 1);
    }
    canvas_.setCurrentpage(1);
    leaveWindow();
    canvas_.setMouse();
    canvas_.showAllPage();
    centre();
    noteFit(Fit::LargerRatio);
}

void PreviewSession::showWindow(std::int16_t pages, int firstPage, int lastPage)
{
    canvas_.SetShowStyle(pages, narrowToInt16(firstPage), narrowToInt16(lastPage));
    updatePosition();
    canvas_.showMuliPage(pages);
    centre();
    noteFit(Fit::LargerRatio);
}

void PreviewSession::leaveWindow()
{
    canvas_.SetShowStyle(0, 0, 0);
    updatePosition();
}

void PreviewSession::choosePage(TextView text)
{
    const TextView entry = trimmed(text);
    if (entry.starts_with(WindowMark))
        return;
    quietly([&] {
        const std::size_t point = entry.find(u'.');
        const TextView number = point == TextView::npos ? entry : entry.substr(point + 1);
        const std::int16_t page = roundToInt16(leadingNumber(number));
        if (page > 0 && page <= canvas_.Totalpages())
            askForCentring();
        canvas_.setCurrentpage(page);
        canvas_.showPage();
        showView();
    });
}

void PreviewSession::read(ReadingWay way)
{
    quietly([&] {
        if (!readWithinPages(canvas_, way))
            turn(way);
    });
}

/// Turns what is in view: the window of pages, or the page that stands alone. All pages at once
/// have nothing behind them.
void PreviewSession::turn(ReadingWay way)
{
    const bool isOn = way == ReadingWay::On;
    const bool isWindow = showsPageWindow(canvas_.view());
    takePosition(isWindow);
    if (!(isOn ? state_.next : state_.previous) || (canvas_.view().multiPage && !isWindow))
        return;
    canvas_.setMouse();
    askForCentring();
    if (!isWindow) {
        existingCurrentPage();
        showAlone(canvas_.Currentpage() - 1 + (isOn ? 1 : -1));
    } else {
        // The window turns whatever page is current; one at the end would only raise a message.
        const int current = canvas_.Currentpage();
        canvas_.setCurrentpage(narrowToInt16(
            std::clamp<int>(current, isOn ? 1 : 2, canvas_.Totalpages() - (isOn ? 1 : 0))));
        isOn ? showNext() : showPrevious();
    }
    if (!isOn)
        barsToEnd(canvas_);
}

void PreviewSession::showAlone(int page)
{
    canvas_.setCurrentpage(narrowToInt16(page + 1));
    canvas_.showPage();
    showView();
}

std::optional<int> PreviewSession::showPage(int page)
{
    std::optional<int> surface;
    quietly([&] {
        const ViewState& view = canvas_.view();
        if (page < 0 || page >= canvas_.Totalpages() || !canvas_.document().hasPage(page))
            return;
        surface = 0;
        if (view.multiPage && !showsPageWindow(view)) {
            surface = page;
        } else if (showsPageWindow(view)) {
            const int first = std::max<int>(0, view.window.MinPage);
            const int pages = view.window.nPages;
            surface = (page - first) % pages;
            if (page >= first && page < first + pages)
                return;
            surface = page % pages;
            askForCentring();
            canvas_.setCurrentpage(narrowToInt16(page + 1));
            showWindow(view.window.nPages, page - *surface, page - *surface + pages - 1);
        } else if (pageInView(view, canvas_.facts()) != page) {
            askForCentring();
            showAlone(page);
        }
    });
    return surface;
}

} // namespace pelloric
