// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/preview_navigation.h"

#include "controls/canvas.h"
#include "platform/automation_object.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "report/settings_check.h"
#include "ui/tool_table.h"

#include <algorithm>
#include <utility>

namespace pelloric {

namespace {

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

/// Counts a command for as long as it lives.
class CommandCount {
public:
    explicit CommandCount(int& count)
        : count_(++count)
    {
    }

    ~CommandCount() { --count_; }
    CommandCount(const CommandCount&) = delete;
    CommandCount& operator=(const CommandCount&) = delete;

private:
    int& count_;
};

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
    takePosition(canvas_.WindowPages() > 0);
    takeEntries();
    state_.scale = InitialScaleText;
    canvas_.observe(*this);
}

PreviewSession::~PreviewSession() { canvas_.forget(*this); }

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
    const CommandCount counted(commands_);
    standsAsOnPageOne_ = false;
    try {
        command();
        keepPageInSight(canvas_);
    } catch (const std::exception&) {
        showView(); // the window stays usable; a cancelled file dialog ends here too
        return;
    }
    if (!standsAsOnPageOne_)
        showView();
}

void PreviewSession::click(int id)
{
    quietly([&] {
        canvas_.setMouse();
        askForCentring();
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
        canvas_.showWholePage();
        return noteFit(Fit::LargerRatio);
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
        if (canvas_.SaveFile(host_.chooseFileToSave()))
            host_.documentSaved();
        return;
    case ToolAction::ClearPages:
        canvas_.clear();
        notice_.reset();
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
        documentOpened();
        throw;
    }
    documentOpened();
}

void PreviewSession::documentOpened()
{
    state_.rebuild = grid_ != nullptr;
    notice_.reset();
    refresh(false);
}

void PreviewSession::showNotice(std::optional<PreviewNotice> notice)
{
    notice_ = std::move(notice);
    host_.navigationChanged();
}

void PreviewSession::restoreDefaults()
{
    quietly([this] {
        try {
            if (ReportSettings* const own = canvas_.ownSettings())
                restoreDefaultSettings(*own);
            else
                restoreDefaultSettings(canvas_.platform());
        } catch (const RunTimeError& error) {
            return showNotice(noticeOfError(error));
        }
        showNotice(std::nullopt);
        refresh(grid_ != nullptr);
    });
}

/// Lets the canvas build pages; what keeps it from that is said above those that are shown.
void PreviewSession::build(const std::function<void()>& step)
{
    try {
        step();
    } catch (const RunTimeError& error) {
        if (error.number() != ErrorNumber::Cancelled)
            showNotice(noticeOfFailure(error, canvas_.platform(), canvas_.ownSettings()));
        throw;
    }
    state_.rebuild = true;
    showNotice(noticeOfSettings(canvas_.platform(), canvas_.ownSettings()));
}

void PreviewSession::askForCentring()
{
    barsToStart(canvas_);
    canvas_.setReSetLeftTop(true);
}

/// A paint while messages ran has used the demand up for a page that stood alone.
void PreviewSession::centre()
{
    askForCentring();
    canvas_.OnDraw();
}

void PreviewSession::refresh(bool rebuild)
{
    if (!rebuild) {
        canvas_.OnDraw();
        return refreshNavigation();
    }
    AutomationObject& grid = keptGrid();
    askForCentring();
    build([&] {
        host_.beforeBuild(grid);
        canvas_.doPreview(grid);
    });
    centre();
    refreshNavigation();
}

void PreviewSession::reZoom()
{
    AutomationObject& grid = keptGrid();
    build([&] { canvas_.ReDrawZoom(grid); });
}

void PreviewSession::print(bool allPages, TextView pageList, std::int16_t copies)
{
    canvas_.doPrint(allPages, pageList, copies);
}

AutomationObject& PreviewSession::keptGrid() const
{
    if (grid_ == nullptr)
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"no grid is previewed"));
    return *grid_;
}

/// First and previous are enabled behind page 1, next and last before the last page; in a window of
/// pages its first and last page count.
void PreviewSession::takePosition(bool isWindow)
{
    const int total = canvas_.Totalpages();
    const int current
        = pageInView(canvas_.view(), canvas_.facts()).value_or(canvas_.document().currentPage);
    state_.first = state_.previous = (isWindow ? canvas_.WindowMinPage() : current) > 0;
    state_.next = state_.last = (isWindow ? canvas_.WindowMaxPage() : current) < total - 1;
    if (isWindow) {
        const int first = std::max<int>(0, canvas_.WindowMinPage());
        const int last = std::max(first, std::min(total, first + canvas_.WindowPages()) - 1);
        state_.pageBox = pageBoxText(first + 1, last + 1);
    } else {
        state_.pageBox = pageBoxText(current + 1);
    }
}

/// Before an arrangement is shown: a window of pages that was set counts as shown already.
void PreviewSession::updatePosition()
{
    takePosition(canvas_.WindowPages() > 0);
    host_.navigationChanged();
}

/// A text that was picked stays as long as its scale is in force.
void PreviewSession::takeScale()
{
    if (scaleDivisor_ == canvas_.DispScale())
        return;
    scaleDivisor_ = canvas_.DispScale();
    state_.scale = scaleText(scaleDivisor_);
}

void PreviewSession::showScale()
{
    scaleDivisor_ = canvas_.DispScale();
    state_.scale = scaleText(scaleDivisor_);
    host_.navigationChanged();
}

void PreviewSession::takeEntries()
{
    state_.pageEntries = canvas_.Totalpages();
    state_.countLabel = pageCountLabel(canvas_.Totalpages());
}

/// Shows what is in view, when that is not shown already.
void PreviewSession::showView()
{
    const NavigationState before = state_;
    takePosition(showsPageWindow(canvas_.view()));
    takeScale();
    takeEntries();
    if (state_ != before)
        host_.navigationChanged();
}

/// A command shows its end itself, and a build shows nothing of what it makes.
void PreviewSession::viewChanged()
{
    if (commands_ > 0 || canvas_.isBuilding())
        return;
    standsAsOnPageOne_ = false;
    showView();
}

/// The four tools stand as on page 1, whatever page is current.
void PreviewSession::refreshNavigation()
{
    takePosition(showsPageWindow(canvas_.view()));
    takeEntries();
    state_.first = state_.previous = false;
    state_.next = state_.last = canvas_.Totalpages() >= 2;
    standsAsOnPageOne_ = true;
    showScale();
}

} // namespace pelloric
