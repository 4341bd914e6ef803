// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"

#include "controls/messages.h"
#include "document/ostl_reader.h"
#include "document/ostl_writer.h"
#include "platform/automation_object.h"
#include "platform/file_bytes.h"
#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "platform/services.h"
#include "print/paper_names.h"
#include "print/print_job.h"

#include <algorithm>
#include <utility>

namespace pelloric {

namespace {

/// Gives a flag another value for as long as it lives.
class FlagChange {
public:
    FlagChange(bool& flag, bool value)
        : flag_(flag)
        , before_(std::exchange(flag, value))
    {
    }

    ~FlagChange() { flag_ = before_; }
    FlagChange(const FlagChange&) = delete;
    FlagChange& operator=(const FlagChange&) = delete;

private:
    bool& flag_;
    bool before_;
};

/// Puts the cursor of a row set back where the host had it.
class CursorKeeper {
public:
    explicit CursorKeeper(RowSet& rows)
        : rows_(rows)
        , position_(rows.position())
    {
    }

    ~CursorKeeper()
    {
        try {
            rows_.setPosition(position_);
        } catch (const RunTimeError&) {
            // A row set that has gone cannot be put back anywhere.
        }
    }

    CursorKeeper(const CursorKeeper&) = delete;
    CursorKeeper& operator=(const CursorKeeper&) = delete;

private:
    RowSet& rows_;
    std::int64_t position_;
};

} // namespace

Canvas::Canvas(Platform& platform)
    : platform_(platform)
    , recorder_(document_, platform.metrics)
{
}

void Canvas::setTotalpages(std::int16_t pages)
{
    document_.Totalpages = pages;
    notifyView();
}

std::int16_t Canvas::Currentpage() const
{
    return narrowToInt16(std::int64_t { document_.currentPage } + 1);
}

void Canvas::setCurrentpage(std::int16_t page)
{
    if (page > document_.Totalpages) {
        platform_.messages.show(messageOf(Notice::NoNextPage));
        return;
    }
    document_.currentPage = narrowToInt16(std::int64_t { page } - 1);
    notifyView();
}

void Canvas::clear()
{
    if (building_)
        return;
    recorder_.clear();
    endArrangement(view_);
    if (table_)
        table_->dropRows();
    notifyView();
}

void Canvas::newPage()
{
    if (building_)
        return;
    recorder_.newPage();
    unloadSurfaces(view_);
    notifyView();
}

void Canvas::loadReportStyle() { pelloric::loadReportStyle(style_, page, platform_); }

void Canvas::doPreview(AutomationObject& grid)
{
    if (building_)
        return;
    loadReportStyle();
    build(grid, true);
}

void Canvas::ReDrawZoom(AutomationObject& grid)
{
    if (building_)
        return;
    if (!table_)
        throw RunTimeError(ErrorNumber::ObjectMissing, u"no report was built yet");
    build(grid, false);
}

void Canvas::build(AutomationObject& grid, bool takeWidths)
{
    const FlagChange building(building_, true);
    bool isBuilt = false;
    try {
        const FlagChange hidden(view_.baseVisible, false);
        notifyView();
        platform_.loop.runOnce();
        isBuilt = rebuild(grid, takeWidths);
    } catch (...) {
        notifyView(); // the paper is visible again
        throw;
    }
    if (isBuilt)
        showFirstPage();
    else
        notifyView();
}

/// Reads the grid and lays it out.
/// @return  false: no column is printed, and nothing has changed
bool Canvas::rebuild(AutomationObject& grid, bool takeWidths)
{
    GridRequest request { .kind = m_PrintObj,
        .startRow = platform_.library.MarvenStartRow,
        .paperWidth = page.myWidth,
        .leftMargin = page.intLeft,
        .keptWidths = {},
        .store = std::make_shared<TextStore>(),
        .decimalSeparator = platform_.decimalSeparator };
    if (!takeWidths)
        request.keptWidths = table_->ColumnWidths;
    GridTable table = readGrid(grid, request);
    if (table.rows == nullptr)
        return false;
    PageDocument earlier = std::exchange(document_, document_.cleared());
    document_.shareStore(request.store);
    const ViewState earlierView = view_;
    try {
        layOut(table);
    } catch (...) {
        document_ = std::move(earlier);
        recorder_.documentReplaced();
        view_ = earlierView;
        end();
        throw;
    }
    table.dropBorrowedRows();
    table_ = std::move(table);
    openedName_.clear();
    return true;
}

void Canvas::layOut(GridTable& table)
{
    const CursorKeeper cursor(*table.rows);
    endArrangement(view_);
    recorder_.moveTo({});
    recorder_.documentReplaced();
    LayoutEngine engine({ style_, page, *table.rows, table.ColumnWidths, table.ColumnBands },
        platform_, document_, recorder_);
    engine.build(*this);
    titleTop_ = engine.titleTop();
}

void Canvas::scaleReport(double factor)
{
    if (building_)
        return;
    if (!table_)
        throw RunTimeError(ErrorNumber::ObjectMissing, u"no report was built yet");
    for (double& width : table_->ColumnWidths)
        width *= factor;
    float& size = style_.body.font.size;
    size = static_cast<float>(static_cast<double>(size) * factor);
    recorder_.setTextFont(style_.body.font, roundToInt32(style_.body.color));
}

bool Canvas::SaveFile(const std::filesystem::path& path)
{
    platform_.loop.runOnce();
    const auto report = [this](int step, int last) {
        progress_ = { true, std::max(1, last), step };
        if (observer_ != nullptr)
            observer_->progressChanged();
    };
    bool written = true;
    try {
        writeOstl(document_, page, { platform_.codec, platform_.decimalSeparator }, report, path);
    } catch (const RunTimeError&) {
        written = false; // saving is silent; the file that was there is still whole
    }
    end();
    return written;
}

void Canvas::OpenFile(const std::filesystem::path& path)
{
    if (building_)
        return;
    clear();
    openedName_ = pathText(path.stem());
    try {
        if (readOstl(platform_.codec, path, document_, page) == OstlResult::BadHeader) {
            platform_.messages.show(messageOf(Notice::BadDocumentFile));
            return;
        }
    } catch (const RunTimeError& error) {
        if (error.number() != ErrorNumber::FileNotFound)
            showFirstPage(); // what was read before stays
        throw;
    }
    showFirstPage();
}

void Canvas::showFirstPage()
{
    document_.currentPage = 0;
    changeView([this] { showNewDocument(view_, facts()); });
}

void Canvas::doPrint(bool bAllPrint, TextView strPrintRange, std::int16_t nPrintPageNum)
{
    PrintJob job { .allPages = bAllPrint,
        .pageList = Text(strPrintRange),
        .copies = nPrintPageNum,
        .paperSize = style_.PagerSizeValue,
        .orientation = style_.PagerOrientation,
        .documentName = openedName_.empty() ? documentName : openedName_,
        .pageSent = {} };
    progress_ = { true, std::max<std::int64_t>(1, pagesToSend(document_, job)), 0 };
    job.pageSent = [this](std::int64_t sent) {
        progress_.value = sent;
        if (observer_ != nullptr)
            observer_->progressChanged();
    };
    try {
        pelloric::doPrint(document_, job, recorder_.textFont(), platform_.printer);
    } catch (...) {
        end();
        throw;
    }
    end();
}

void Canvas::printPage(std::int16_t number)
{
    pelloric::printPage(document_, number - 1, recorder_.textFont(), platform_.printer);
}

void Canvas::setPaper(TextView name)
{
    if (!applyPaperName(name, page, view_.portrait)) {
        platform_.messages.show(messageOf(Notice::UnknownPaper));
        return;
    }
    OnDraw();
}

void Canvas::showWholePage()
{
    changeView([&] { pelloric::showWholePage(view_, facts()); });
}

void Canvas::showPage()
{
    changeView([&] { pelloric::showPage(view_, facts()); });
}

void Canvas::showAllPage()
{
    changeView([&] { pelloric::showAllPage(view_, facts(), platform_.loop); });
}

void Canvas::showMuliPage(std::int16_t nPages)
{
    changeView([&] { pelloric::showMuliPage(view_, facts(), nPages, platform_.loop); });
}

void Canvas::SetShowStyle(std::int16_t nPages, std::int16_t nStartPage, std::int16_t nEndPage)
{
    setShowStyle(view_, nPages, nStartPage, nEndPage);
}

void Canvas::zoomIn()
{
    changeView([&] { pelloric::zoomIn(view_, facts()); });
}

void Canvas::zoomOut()
{
    changeView([&] { pelloric::zoomOut(view_, facts()); });
}

void Canvas::setDispScale(float scale)
{
    changeView([&] { pelloric::setDispScale(view_, facts(), scale); });
}

void Canvas::setVerticalDir(bool portrait)
{
    changeView([&] { pelloric::setVerticalDir(view_, style_, page, facts(), portrait); });
}

void Canvas::OnDraw()
{
    changeView([&] { layOutAgain(view_, facts()); });
}

void Canvas::setMouse()
{
    changeView([this] { pelloric::setMouse(view_); }, &CanvasObserver::viewScrolled);
}

void Canvas::Pan()
{
    changeView([this] { pan(view_); }, &CanvasObserver::viewScrolled);
}

void Canvas::setViewport(Twips width, Twips height)
{
    view_.viewportWidth = width;
    view_.viewportHeight = height;
}

void Canvas::setHbar(std::int32_t value)
{
    changeView([&] { pelloric::setHbar(view_, facts(), value); }, &CanvasObserver::viewScrolled);
}

void Canvas::setVbar(std::int32_t value)
{
    changeView([&] { pelloric::setVbar(view_, facts(), value); }, &CanvasObserver::viewScrolled);
}

void Canvas::mouseMove()
{
    changeView([this] { pelloric::mouseMove(view_); }, &CanvasObserver::viewScrolled);
}

void Canvas::mouseDown(double x, double y) { pelloric::mouseDown(view_, x, y); }

void Canvas::mouseUp(double x, double y)
{
    changeView([&] { pelloric::mouseUp(view_, facts(), x, y); }, &CanvasObserver::viewScrolled);
}

void Canvas::begin(std::int64_t maximum)
{
    progress_ = { true, maximum, 0 };
    buildProgress_ = progress_;
    if (observer_ != nullptr)
        observer_->progressChanged();
}

void Canvas::advance()
{
    ++progress_.value;
    buildProgress_.value = progress_.value;
    if (observer_ != nullptr)
        observer_->progressChanged();
}

void Canvas::end()
{
    progress_.visible = false;
    if (observer_ != nullptr)
        observer_->progressChanged();
}

/// Tells the observer after a change, also of what an error left behind.
void Canvas::changeView(const std::function<void()>& change, Notification notification)
{
    try {
        change();
    } catch (...) {
        notifyView();
        throw;
    }
    if (observer_ != nullptr)
        (observer_->*notification)();
}

void Canvas::notifyView()
{
    if (observer_ != nullptr)
        observer_->viewChanged();
}

} // namespace pelloric
