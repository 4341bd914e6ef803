// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"

#include "controls/messages.h"
#include "document/ostl_reader.h"
#include "document/ostl_writer.h"
#include "platform/automation_object.h"
#include "platform/file_bytes.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "platform/safe_file.h"
#include "platform/services.h"
#include "print/page_list.h"
#include "print/paper_names.h"
#include "print/print_job.h"
#include "report/page_limit.h"
#include "report/shaped_report.h"

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
    if (isBusy())
        return;
    document_.Totalpages = pages;
    notifyView();
}

std::int16_t Canvas::Currentpage() const
{
    return narrowToInt16(std::int64_t { document_.currentPage } + 1);
}

void Canvas::setCurrentpage(std::int16_t page)
{
    if (isBusy())
        return;
    if (page > document_.Totalpages) {
        platform_.messages.show(messageOf(Notice::NoNextPage));
        return;
    }
    document_.currentPage = narrowToInt16(std::int64_t { page } - 1);
    notifyView();
}

void Canvas::setCurrentX(Twips x)
{
    if (!isBusy())
        recorder_.setCurrentX(x);
}

void Canvas::setCurrentY(Twips y)
{
    if (!isBusy())
        recorder_.setCurrentY(y);
}

void Canvas::clear()
{
    if (isBusy())
        return;
    recorder_.clear();
    fit_ = {};
    printedRows_ = 0;
    leftOut_.clear();
    ++documentNumber_;
    endArrangement(view_);
    if (table_)
        table_->dropRows();
    notifyView();
}

void Canvas::newPage()
{
    if (isBusy())
        return;
    recorder_.newPage();
    ++documentNumber_;
    unloadSurfaces(view_);
    notifyView();
}

void Canvas::loadReportStyle()
{
    if (settings_)
        applySettings(*settings_, style_, page);
    else
        pelloric::loadReportStyle(style_, page, platform_);
}

void Canvas::doPreview(AutomationObject& grid)
{
    if (isBusy())
        return;
    const Shape earlier { page, style_ };
    loadReportStyle();
    build(grid, true, earlier);
}

void Canvas::ReDrawZoom(AutomationObject& grid)
{
    if (isBusy())
        return;
    if (!table_)
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"no report was built yet"));
    build(grid, false, { page, style_ });
}

void Canvas::build(AutomationObject& grid, bool takeWidths, const Shape& earlier)
{
    bool isBuilt = false;
    try {
        const FlagChange building(building_, true);
        const FlagChange hidden(view_.baseVisible, false);
        notifyView();
        platform_.loop.runOnce();
        isBuilt = rebuild(grid, takeWidths, earlier);
    } catch (const RunTimeError& error) {
        if (error.number() == ErrorNumber::Cancelled)
            giveBack(earlier);
        notifyView(); // the paper is visible again
        throw;
    } catch (...) {
        notifyView();
        throw;
    }
    if (isBuilt)
        showFirstPage();
    else
        notifyView();
}

/// Reads the grid and lays it out.
/// @return  false: no column is printed, and nothing has changed
bool Canvas::rebuild(AutomationObject& grid, bool takeWidths, const Shape& earlier)
{
    GridRequest request { .kind = m_PrintObj,
        .startRow = platform_.library.MarvenStartRow,
        .paperWidth = page.myWidth,
        .leftMargin = page.intLeft,
        .keptWidths = {},
        .store = std::make_shared<TextStore>(),
        .decimalSeparator = platform_.decimalSeparator,
        .loop = &platform_.loop };
    // Which rows are chosen is known only when they were read.
    if (!options.choosesCells())
        request.mostRows = mostRowsOnPages(
            page, options.shapesPages(grid.cellLooks() != nullptr) ? 1 : CellPadding);
    if (!takeWidths)
        request.keptWidths = table_->ColumnWidths;
    GridTable table = readGrid(grid, request);
    if (table.rows == nullptr)
        return false;
    PageDocument earlierDocument = std::exchange(document_, document_.cleared());
    document_.shareStore(request.store);
    document_.keepTexts(table.lentTexts);
    const ViewState earlierView = view_;
    const RecorderState earlierState = recorder_.state();
    try {
        layOut(table, takeWidths);
    } catch (...) {
        document_ = std::move(earlierDocument);
        recorder_.restore(earlierState);
        giveBack(earlier);
        giveBack(earlierView);
        endProgress();
        throw;
    }
    table.dropBorrowedRows();
    table_ = std::move(table);
    openedName_.clear();
    return true;
}

void Canvas::giveBack(const Shape& shape)
{
    page = shape.page;
    style_ = shape.style;
}

/// The viewport may have got another size meanwhile.
void Canvas::giveBack(const ViewState& view)
{
    const ViewState present = std::exchange(view_, view);
    view_.viewportWidth = present.viewportWidth;
    view_.viewportHeight = present.viewportHeight;
}

/// Style and paper are those of the beginning, whatever a host writes while messages run.
///
/// A report that is laid out again starts from the paper as it lay before it was turned to fit, as
/// the report may fit in another way by now.
void Canvas::layOut(GridTable& table, bool isNew)
{
    ReportStyle style = style_;
    PageSetup setup = page;
    if (!isNew && turned_ && turned_->width == setup.myWidth && turned_->height == setup.myHeight) {
        std::swap(setup.myWidth, setup.myHeight);
        style.PagerOrientation = turned_->orientation;
        setPrintableTenths(style, setup);
    }
    const std::int16_t orientation = style.PagerOrientation;
    const ReportOptions wanted = options;
    const CursorKeeper cursor(*table.rows);
    endArrangement(view_);
    recorder_.moveTo({});
    recorder_.documentReplaced();
    const auto step = [this](std::int64_t done, std::int64_t total) {
        showProgress(done, total);
        return true;
    };
    ReportOutcome outcome
        = layOutReport(table, wanted, { style, setup, platform_, document_, recorder_ }, step);
    endProgress();
    titleTop_ = outcome.titleTop;
    fit_ = outcome.fit;
    printedRows_ = outcome.records;
    leftOut_ = std::move(outcome.leftOut);
    const bool wasTurned = setup.myWidth != page.myWidth || setup.myHeight != page.myHeight;
    turned_.reset();
    if (fit_.isTurned)
        turned_ = { setup.myWidth, setup.myHeight, orientation };
    if (!fit_.isTurned && !wasTurned)
        return;
    page.myWidth = setup.myWidth;
    page.myHeight = setup.myHeight;
    style_.PagerOrientation = style.PagerOrientation;
    setPrintableTenths(style_, page);
}

void Canvas::scaleReport(double factor)
{
    if (isBusy())
        return;
    if (!table_)
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"no report was built yet"));
    ColoredFont body = style_.body;
    body.font.size = static_cast<float>(static_cast<double>(body.font.size) * factor);
    recorder_.setTextFont(body.font, roundToInt32(body.color));
    style_.body = std::move(body);
    for (double& width : table_->ColumnWidths)
        width *= factor;
}

bool Canvas::SaveFile(const std::filesystem::path& path)
{
    if (isBusy())
        return false;
    platform_.loop.runOnce();
    // The bar is full when the last page is begun.
    const auto step = [this](std::int64_t done, std::int64_t total) {
        showProgress(done, total - 1);
        return true;
    };
    bool written = true;
    try {
        writeOstl(document_, page, { platform_.codec, platform_.decimalSeparator }, step,
            SafeFile(platform_.files, path));
    } catch (const RunTimeError&) {
        written = false; // saving is silent; the file that was there is still whole
    }
    endProgress();
    return written;
}

void Canvas::OpenFile(const std::filesystem::path& path)
{
    if (isBusy())
        return;
    clear();
    openedName_ = pathText(path.stem());
    try {
        if (readOstl(platform_.codec, path, document_, page) == OstlResult::BadHeader) {
            platform_.messages.show(messageOf(Notice::BadDocumentFile));
            return;
        }
    } catch (const RunTimeError& error) {
        if (error.number() == ErrorNumber::FileNotFound)
            throw;
        showFirstPage(); // what was read before stays
        if (!document_.hasRecords())
            throw;
        throw RunTimeError(
            error.number(), phrase(u"%1; what stands before it is shown", { error.detail() }));
    }
    showFirstPage();
}

void Canvas::showFirstPage()
{
    ++documentNumber_;
    document_.currentPage = 0;
    changeView([this] { showNewDocument(view_, facts()); });
}

void Canvas::doPrint(bool bAllPrint, TextView strPrintRange, std::int16_t nPrintPageNum)
{
    if (isBusy())
        return;
    const FlagChange printing(printing_, true);
    PrintJob job { .allPages = bAllPrint,
        .pages = pageNumbersOf(strPrintRange),
        .copies = nPrintPageNum,
        .paperSize = style_.PagerSizeValue,
        .orientation = style_.PagerOrientation,
        .pageWidth = page.myWidth,
        .pageHeight = page.myHeight,
        .documentName = documentTitle(),
        .progress = {} };
    progress_ = { true, std::max<std::int64_t>(1, pagesToSend(document_, job)), 0 };
    job.progress = [this](std::int64_t sent, std::int64_t wanted) {
        showProgress(sent, wanted);
        tell(pageSent, sent, wanted);
        if (sent < wanted)
            platform_.loop.keepAlive();
        return true;
    };
    try {
        pelloric::doPrint(document_, job, recorder_.textFont(), platform_.printer);
    } catch (...) {
        endProgress();
        throw;
    }
    endProgress();
}

void Canvas::keepDocument(const std::function<void()>& work)
{
    const FlagChange kept(printing_, true);
    work();
}

void Canvas::printPage(std::int16_t number)
{
    if (isBusy())
        return;
    pelloric::printPage(document_, number - 1, recorder_.textFont(), platform_.printer);
}

void Canvas::setPaper(TextView name)
{
    if (isBusy())
        return;
    if (!applyPaperName(name, page, view_.portrait)) {
        platform_.messages.show(messageOf(Notice::UnknownPaper));
        return;
    }
    OnDraw();
}

void Canvas::showProgress(std::int64_t done, std::int64_t total)
{
    progress_ = { true, std::max<std::int64_t>(1, total), done };
    notify(&CanvasObserver::progressChanged);
}

void Canvas::endProgress()
{
    progress_.visible = false;
    notify(&CanvasObserver::progressChanged);
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
    notify(notification);
}

void Canvas::notify(Notification notification)
{
    // An observer may go while it is told. NOLINTNEXTLINE(modernize-loop-convert)
    for (std::size_t next = 0; next < observers_.size(); ++next)
        (observers_[next]->*notification)();
}

} // namespace pelloric
