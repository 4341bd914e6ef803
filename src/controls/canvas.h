// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/page_document.h"
#include "document/recorder.h"
#include "platform/progress.h"
#include "report/grid_reader.h"
#include "report/layout_engine.h"
#include "report/report_style.h"
#include "view/view_state.h"

#include <pelloric/options.h>

#include <filesystem>
#include <functional>
#include <optional>
#include <vector>

namespace pelloric {

class AutomationObject;
struct Platform;

/// The progress bar of a canvas.
struct ProgressBar {
    bool visible = false;
    std::int64_t maximum = 0;
    std::int64_t value = 0;

    bool operator==(const ProgressBar&) const = default;
};

/// Is told what a canvas changed of what people see.
class CanvasObserver {
public:
    virtual ~CanvasObserver() = default;

    /// Surfaces, bars, mode or pages are others now.
    virtual void viewChanged() = 0;

    /// Nothing but where the surfaces stand in the viewport, the bars and the pan mode are others
    /// now; each page looks as before.
    virtual void viewScrolled() { viewChanged(); }

    /// The progress bar has moved, appeared or gone.
    virtual void progressChanged() = 0;
};

/// What `Sorvane` publishes, without a window: every member hands on to the rooms that do the work.
///
/// Members throw `RunTimeError`; the control that publishes them turns it into a message box. What
/// a member had changed by then stays, and the observer is told of it all the same. While a build
/// or a print job runs, messages may run; members that would change, save or print the document
/// then are refused without a word.
class Canvas {
public:
    /// @param platform  outlives the canvas
    explicit Canvas(Platform& platform);

    PageSetup page; ///< paper and margins: `intTop` to `myWidth`
    bool bGetText = false; ///< for the host; the canvas only gives it its first value
    PrintObjKind m_PrintObj = PrintObjKind::MSHFlexGrid; ///< which reader a build uses
    Text strSCliectRect = u"small"; ///< while it is "small" no page is painted
    Text PageHeader; ///< kept for the host; the layout does not read it

    /// What builds do beyond the plain page; everything is off at first.
    ReportOptions options;

    /// What was done to bring the table of the pages onto the sheet.
    const FitResult& fit() const { return fit_; }

    /// How many rows of the grid the pages show.
    std::int64_t printedRows() const { return printedRows_; }

    /// What the totals of the pages leave out.
    const std::vector<LeftOut>& leftOut() const { return leftOut_; }

    /// Tells an observer, too, from now on.
    /// @param observer  borrowed until `forget`
    void observe(CanvasObserver& observer) { observers_.push_back(&observer); }
    void forget(CanvasObserver& observer) { std::erase(observers_, &observer); }

    /// The number of pages as it is published; a host may write it.
    std::int16_t Totalpages() const { return document_.Totalpages; }
    void setTotalpages(std::int16_t pages);

    /// The current page, from 1.
    std::int16_t Currentpage() const;
    /// Makes a page the current one; a number above `Totalpages` shows a message and changes
    /// nothing, one below 1 is stored and fails at the next use of the page.
    /// @throws RunTimeError Overflow: -32768
    void setCurrentpage(std::int16_t page);

    Twips CurrentX() const { return recorder_.currentX(); }
    Twips CurrentY() const { return recorder_.currentY(); }
    void setCurrentX(Twips x);
    void setCurrentY(Twips y);

    /// Empties the document.
    void clear();
    /// Adds a page and makes it the current one.
    /// @throws RunTimeError Overflow: there are 32767 pages
    void newPage();

    /// Gives reports settings of their own, which the dialogs change: the settings file is neither
    /// read nor written for them. Nothing: the file's hold again.
    void useSettings(std::optional<ReportSettings> settings) { settings_ = std::move(settings); }

    /// The settings of its own, or null.
    ReportSettings* ownSettings() { return settings_ ? &*settings_ : nullptr; }

    /// Loads paper, margins and style from its own settings or the settings file.
    /// @throws RunTimeError see `pelloric::loadReportStyle`
    void loadReportStyle();

    /// Builds the pages from a grid with the settings as they are now, and shows page 1.
    ///
    /// A build that ends early leaves the document as it was. One that the user ends, or whose
    /// layout fails, gives paper, margins and style back, too.
    /// @throws RunTimeError of the settings file, the grid, the layout, or Cancelled
    void doPreview(AutomationObject& grid);

    /// Builds again from the same grid with style and column widths as the canvas holds them.
    /// @throws RunTimeError ObjectMissing: nothing was built yet; SubscriptOutOfRange: the grid has
    ///         another number of printed columns now; or as `doPreview`
    void ReDrawZoom(AutomationObject& grid);

    /// Makes column widths and body font a tenth smaller; the caller rebuilds the pages.
    /// @throws RunTimeError ObjectMissing: nothing was built yet; Overflow: as `Maximum`
    void Minimum() { scaleReport(0.9); }
    /// Makes column widths and body font a tenth larger; the caller rebuilds the pages.
    /// @throws RunTimeError ObjectMissing: nothing was built yet; Overflow: a line of the font
    ///         would be higher than 32 bits of twips, and nothing has changed
    void Maximum() { scaleReport(1.1); }

    /// Writes the document to a file; what fails is skipped, and what was there stays then.
    /// @return  whether the file was written; false also while a build or a print job runs
    bool SaveFile(const std::filesystem::path& path);
    /// Replaces the document by a file's content and shows page 1; a file of another form shows a
    /// message and leaves the canvas cleared.
    /// @throws RunTimeError FileNotFound: it cannot be opened; the canvas is cleared
    void OpenFile(const std::filesystem::path& path);

    /// Prints all pages or a page list; see `pelloric::doPrint`.
    ///
    /// Windows live on between the pages. `progress` says afterwards how many were sent.
    /// @throws RunTimeError Cancelled: the user ended it; or the printer's
    void doPrint(bool bAllPrint, TextView strPrintRange, std::int16_t nPrintPageNum);
    /// Sends one page to the printer. @param number  from 1
    void printPage(std::int16_t number);
    Progress pageSent; ///< told after each page how many are sent
    /// What the documents are called in the printer's queue; one that was opened has its file's
    /// name.
    Text documentName;
    /// What the document is called: its file's name, or else `documentName`.
    const Text& documentTitle() const { return openedName_.empty() ? documentName : openedName_; }

    /// Does something with the document that lets messages run; what would change it meanwhile is
    /// refused.
    void keepDocument(const std::function<void()>& work);

    /// Gives the page the size of a named paper; an unknown name shows a message.
    ///
    /// For hosts that record pages of their own: a build takes the size that the settings hold.
    void setPaper(TextView name);

    void showWholePage();
    void showPage();
    void showAllPage();
    void showMuliPage(std::int16_t nPages);
    void SetShowStyle(std::int16_t nPages, std::int16_t nStartPage, std::int16_t nEndPage);
    std::int16_t WindowMinPage() const { return view_.window.MinPage; }
    std::int16_t WindowMaxPage() const { return view_.window.MaxPage; }
    std::int16_t WindowPages() const { return view_.window.nPages; }
    OrderStyle WindowOrderStyle() const { return view_.style; }
    bool ReSetLeftTop() const { return view_.ReSetLeftTop; }
    void setReSetLeftTop(bool centre) { view_.ReSetLeftTop = centre; }

    void zoomIn();
    void zoomOut();
    /// The divisor, not the scale that was written.
    float DispScale() const { return view_.divisor; }
    void setDispScale(float scale);
    void setVerticalDir(bool portrait);
    void OnDraw();
    void setMouse();
    void Pan();

    void setViewport(Twips width, Twips height);
    void setHbar(std::int32_t value);
    void setVbar(std::int32_t value);
    void mouseMove();
    void mouseDown(double x, double y);
    void mouseUp(double x, double y);
    /// See `pelloric::movePages`.
    void movePages(Tpoint first);
    /// See `pelloric::bringIntoStep`.
    void bringIntoStep();
    /// See `pelloric::zoomAbout`.
    void zoomAbout(float scale, double x, double y);

    const PageDocument& document() const { return document_; }
    /// For hosts that place a picture on a page.
    PageDocument& document() { return document_; }
    Recorder& recorder() { return recorder_; }
    const ReportStyle& style() const { return style_; }
    const ViewState& view() const { return view_; }
    const ProgressBar& progress() const { return progress_; }
    /// Another number tells that the pages are others: built, opened, cleared or more of them.
    std::uint32_t documentNumber() const { return documentNumber_; }
    /// What the last build read of its grid, or null.
    const GridTable* table() const { return table_ ? &*table_ : nullptr; }
    PageFacts facts() const { return pageFactsOf(page, document_); }
    bool isBuilding() const { return building_; }
    bool isPrinting() const { return printing_; }
    /// Whether the document is being built or printed.
    bool isBusy() const { return building_ || printing_; }
    /// Where the titles of the last page were asked for under a page header: twips.
    double titleTop() const { return titleTop_; }
    Platform& platform() { return platform_; }

private:
    /// What shapes a report, as it was before a build.
    struct Shape {
        PageSetup page;
        ReportStyle style;
    };

    /// A sheet that fitting a report has turned, and how the paper lay before.
    struct TurnedSheet {
        std::int32_t width = 0; ///< twips, as turned
        std::int32_t height = 0;
        std::int16_t orientation = 0; ///< of the paper before
    };

    void showProgress(std::int64_t done, std::int64_t total);
    void endProgress();

    void build(AutomationObject& grid, bool takeWidths, const Shape& earlier);
    bool rebuild(AutomationObject& grid, bool takeWidths, const Shape& earlier);
    void giveBack(const Shape& shape);
    void giveBack(const ViewState& view);
    void layOut(GridTable& table, bool isNew);
    void showFirstPage();
    void scaleReport(double factor);
    using Notification = void (CanvasObserver::*)();
    void changeView(const std::function<void()>& change,
        Notification notification = &CanvasObserver::viewChanged);
    void notify(Notification notification);
    void notifyView() { notify(&CanvasObserver::viewChanged); }

    Platform& platform_;
    PageDocument document_;
    Recorder recorder_;
    std::optional<ReportSettings> settings_;
    ReportStyle style_;
    ViewState view_;
    std::optional<GridTable> table_;
    ProgressBar progress_;
    std::vector<CanvasObserver*> observers_;
    Text openedName_; ///< of the file that the document was opened from
    double titleTop_ = 0;
    FitResult fit_;
    std::optional<TurnedSheet> turned_; ///< nothing: the paper lies as it was chosen
    std::int64_t printedRows_ = 0;
    std::vector<LeftOut> leftOut_;
    std::uint32_t documentNumber_ = 0;
    bool building_ = false;
    bool printing_ = false;
};

} // namespace pelloric
