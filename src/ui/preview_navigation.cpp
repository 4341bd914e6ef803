// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/preview_navigation.h"

#include "controls/canvas.h"
#include "platform/automation_object.h"
#include "platform/numbers.h"
#include "platform/run_time_error.h"
#include "ui/tool_table.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace pelloric {

namespace {

/// From this many pages on, the many-page view shows a window of pages instead of all.
constexpr std::int16_t ManyPagesWindowed = 21;
constexpr std::int16_t ManyPagesWindow = 6;

constexpr char16_t WindowMark = u'【';

bool answers(AutomationObject& object, TextView member)
{
    return object.findMember(member).has_value();
}

bool hasListItems(AutomationObject& grid)
{
    try {
        return answers(grid, u"ListItems")
            && answers(getMember(grid, u"ListItems").toObject(), u"Count");
    } catch (const RunTimeError&) {
        return false;
    }
}

/// @throws RunTimeError Overflow: past single precision
float toSingle(double value)
{
    if (!(std::fabs(value) <= std::numeric_limits<float>::max()))
        throw RunTimeError(ErrorNumber::Overflow);
    return static_cast<float>(value);
}

} // namespace

PrintObjKind gridKindOf(AutomationObject& grid)
{
    if (answers(grid, u"TextMatrix"))
        return PrintObjKind::MSHFlexGrid;
    return hasListItems(grid) ? PrintObjKind::ListView : PrintObjKind::datagrid;
}

PreviewSession::PreviewSession(Canvas& canvas, PreviewHost& host)
    : canvas_(canvas)
    , host_(host)
{
    canvas_.strSCliectRect = u"full";
    takePosition();
    state_.pageEntries = canvas_.Totalpages();
    state_.countLabel = pageCountLabel(canvas_.Totalpages());
    state_.scale = InitialScaleText;
}

void PreviewSession::open(AutomationObject& grid)
{
    if (canvas_.isBusy())
        return;
    grid_ = &grid;
    canvas_.m_PrintObj = gridKindOf(grid);
    refresh(true);
}

void PreviewSession::quietly(const std::function<void()>& command)
{
    if (canvas_.isBusy())
        return;
    try {
        command();
    } catch (const std::exception&) {
        return; // the window stays usable; a cancelled file dialog ends here too
    }
}

void PreviewSession::click(int id)
{
    quietly([&] {
        canvas_.setMouse();
        canvas_.setReSetLeftTop(true);
        if (const PreviewTool* const tool = clickedTool(id))
            dispatch(tool->action);
    });
}

void PreviewSession::dispatch(ToolAction action)
{
    switch (action) {
    case ToolAction::ShowGridStyle:
        return afterDialog(host_.showGridStyle());
    case ToolAction::Refresh:
        return refresh(true);
    case ToolAction::ZoomOut:
        canvas_.zoomOut();
        return showScale();
    case ToolAction::ZoomIn:
        canvas_.zoomIn();
        return showScale();
    case ToolAction::FirstPage:
        return showFirst();
    case ToolAction::PreviousPage:
        return showPrevious();
    case ToolAction::NextPage:
        return showNext();
    case ToolAction::LastPage:
        return showLast();
    case ToolAction::ManyPages:
        return showManyPages();
    case ToolAction::OnePage:
        leaveWindow();
        return canvas_.showPage();
    case ToolAction::Pan:
        return canvas_.Pan();
    case ToolAction::ShowPrintOptions:
        return host_.showPrintOptions();
    case ToolAction::ShowPageSetup:
        return afterDialog(host_.showPageSetup());
    case ToolAction::WholePage:
        leaveWindow();
        return canvas_.showWholePage();
    case ToolAction::TwoPages:
        return showWindow(2, canvas_.Currentpage() - 1, canvas_.Currentpage());
    case ToolAction::Exit:
        canvas_.clear();
        return host_.unload();
    case ToolAction::FourPages:
        return showWindow(4, canvas_.Currentpage() - 1, canvas_.Currentpage() + 2);
    case ToolAction::ShowAbout:
        return host_.showAbout();
    case ToolAction::OpenFile:
        return openFile();
    case ToolAction::SaveFile:
        canvas_.SaveFile(host_.chooseFileToSave());
        return;
    case ToolAction::ClearPages:
        canvas_.clear();
        return refreshNavigation();
    case ToolAction::Enlarge:
        canvas_.Maximum();
        reZoom();
        return refreshNavigation();
    case ToolAction::Shrink:
        canvas_.Minimum();
        reZoom();
        return refreshNavigation();
    case ToolAction::ChooseScale:
    case ToolAction::ChoosePage:
        return; // combos raise changes instead of clicks
    }
}

void PreviewSession::afterDialog(DialogEnd end)
{
    if (end == DialogEnd::Accepted)
        refresh(grid_ != nullptr);
}

void PreviewSession::openFile()
{
    const std::filesystem::path path = host_.chooseFileToOpen();
    try {
        canvas_.OpenFile(path);
    } catch (const RunTimeError&) {
        refreshNavigation(); // the canvas holds other pages than before
        throw;
    }
    refreshNavigation();
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
}

void PreviewSession::showWindow(std::int16_t pages, int firstPage, int lastPage)
{
    canvas_.SetShowStyle(pages, narrowToInt16(firstPage), narrowToInt16(lastPage));
    updatePosition();
    canvas_.showMuliPage(pages);
}

void PreviewSession::leaveWindow()
{
    canvas_.SetShowStyle(0, 0, 0);
    updatePosition();
}

void PreviewSession::chooseScale(TextView text)
{
    quietly([&] {
        canvas_.setDispScale(toSingle(leadingNumber(text) / 100));
        state_.scale = text; // a scale that is refused leaves the one in force
    });
}

void PreviewSession::choosePage(TextView text)
{
    const TextView entry = trimmed(text);
    if (entry.starts_with(WindowMark))
        return;
    quietly([&] {
        const std::size_t point = entry.find(u'.');
        const TextView number = point == TextView::npos ? entry : entry.substr(point + 1);
        canvas_.setCurrentpage(roundToInt16(leadingNumber(number)));
        updatePosition();
        canvas_.showPage();
    });
}

void PreviewSession::refresh(bool rebuild)
{
    if (rebuild)
        canvas_.doPreview(keptGrid());
    else
        canvas_.OnDraw();
    refreshNavigation();
}

void PreviewSession::reZoom() { canvas_.ReDrawZoom(keptGrid()); }

void PreviewSession::print(bool allPages, TextView pageList, std::int16_t copies)
{
    canvas_.doPrint(allPages, pageList, copies);
}

AutomationObject& PreviewSession::keptGrid() const
{
    if (grid_ == nullptr)
        throw RunTimeError(ErrorNumber::ObjectMissing, u"no grid is previewed");
    return *grid_;
}

/// First and previous are enabled behind page 1, next and last before the last page; in a window of
/// pages its first and last page count.
void PreviewSession::takePosition()
{
    const int total = canvas_.Totalpages();
    const int current = canvas_.Currentpage() - 1;
    const int pages = canvas_.WindowPages();
    const bool window = pages > 0;
    state_.first = state_.previous = (window ? canvas_.WindowMinPage() : current) > 0;
    state_.next = state_.last = (window ? canvas_.WindowMaxPage() : current) < total - 1;
    if (window) {
        const int first = std::max<int>(0, canvas_.WindowMinPage());
        const int last = std::max(first, std::min(total, first + pages) - 1);
        state_.pageBox = pageBoxText(first + 1, last + 1);
    } else {
        state_.pageBox = pageBoxText(current + 1);
    }
}

void PreviewSession::updatePosition()
{
    takePosition();
    host_.navigationChanged();
}

void PreviewSession::showScale()
{
    state_.scale = scaleText(canvas_.DispScale());
    host_.navigationChanged();
}

/// The four tools stand as on page 1, whatever page is current.
void PreviewSession::refreshNavigation()
{
    takePosition();
    const int total = canvas_.Totalpages();
    state_.first = state_.previous = false;
    state_.next = state_.last = total >= 2;
    state_.pageEntries = total;
    state_.countLabel = pageCountLabel(total);
    showScale();
}

} // namespace pelloric
