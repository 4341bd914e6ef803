// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"
#include "platform/text.h"
#include "ui/page_reading.h"
#include "ui/preview_notice.h"

#include <array>
#include <cstdint>
#include <filesystem>
#include <functional>
#include <optional>

namespace pelloric {

class AutomationObject;
enum class PrintObjKind : std::int16_t;
enum class ToolAction;

/// How far a dialog that rewrites settings was taken.
enum class DialogEnd { Accepted, Cancelled };

/// What a preview window does for its session: everything that needs a window of its own.
class PreviewHost {
public:
    virtual ~PreviewHost() = default;

    /// Shows the grid style dialog modally; OK has rewritten the settings file by then.
    virtual DialogEnd showGridStyle() = 0;
    /// Shows the page setup dialog modally; OK has rewritten the settings file by then.
    virtual DialogEnd showPageSetup() = 0;
    /// Shows the print options dialog modally; it prints through `PreviewSession::print`.
    virtual void showPrintOptions() = 0;
    /// Shows the about box modally.
    virtual void showAbout() = 0;

    /// Asks for a file to open.
    /// @throws RunTimeError Cancelled
    virtual std::filesystem::path chooseFileToOpen() = 0;
    /// Asks for a file to save to.
    /// @throws RunTimeError Cancelled
    virtual std::filesystem::path chooseFileToSave() = 0;

    /// Releases the toolbar and closes the window; the canvas is cleared by then.
    virtual void unload() = 0;

    /// A kept grid is about to be read: its owner may bring it up to date.
    virtual void beforeBuild(AutomationObject&) { }

    /// The document was written to a document file.
    virtual void documentSaved() { }

    /// The session's `state()` or `notice()` is another now: the window applies it without raising
    /// changes.
    virtual void navigationChanged() = 0;
};

/// What the toolbar shows of a document.
struct NavigationState {
    bool first = false; ///< "The First Page" is enabled
    bool previous = false;
    bool next = false;
    bool last = false;
    Text pageBox; ///< text of the page combo
    int pageEntries = 0; ///< the page combo lists pages 1 to this
    Text scale; ///< text of the scale combo
    Text countLabel; ///< beside the page combo
    bool rebuild = true; ///< "ReFresh", "Maximum " and "Minimum" are enabled

    bool operator==(const NavigationState&) const = default;
};

/// The kind of grid that an object is, found by asking for its members.
PrintObjKind gridKindOf(AutomationObject& grid);

/// What the preview window's tools do with its canvas, and what its boxes show of it.
///
/// The state follows every change of the view, the canvas's own and a host's among them: page box
/// and tools tell of the page or window in view, the scale box of the scale in force.
///
/// Commands and combo changes run under one error trap: an error ends the command quietly. While
/// the canvas builds pages, which lets messages run, every command is refused without a word.
class PreviewSession : private CanvasObserver {
public:
    /// Lets the canvas paint from now on.
    /// @param canvas  outlives the session
    /// @param host    outlives the session
    PreviewSession(Canvas& canvas, PreviewHost& host);
    ~PreviewSession() override;
    PreviewSession(const PreviewSession&) = delete;
    PreviewSession& operator=(const PreviewSession&) = delete;

    const NavigationState& state() const { return state_; }

    /// What is to be said above the pages; nothing when all is well.
    const std::optional<PreviewNotice>& notice() const { return notice_; }

    /// Says something above the pages, or no more.
    void showNotice(std::optional<PreviewNotice> notice);

    /// Makes every setting usable again, see `restoreDefaultSettings`, and builds again.
    ///
    /// What keeps the file from being written is said above the pages.
    void restoreDefaults();

    /// Keeps a grid, previews it and refreshes the navigation.
    /// @param grid  borrowed until the next grid or `forgetGrid`
    /// @throws RunTimeError of the build; the grid is kept
    void open(AutomationObject& grid);

    /// The kept grid is about to go.
    void forgetGrid() { grid_ = nullptr; }

    /// The kept grid, or null.
    AutomationObject* grid() const { return grid_; }

    /// A tool was clicked; an unknown number does nothing but end pan mode.
    void click(int id);

    /// The scale combo has a text that was picked or entered: "   150 %".
    ///
    /// A scale is held between 1 % and 6400 %, and the pages are centred; 0 changes nothing.
    void chooseScale(TextView text);

    /// The page combo has a text that was picked or entered: "   NO. 5"; one that begins with "【"
    /// is ignored.
    void choosePage(TextView text);

    /// Brings the bars to their start and has what is shown next centred.
    void askForCentring();

    /// Reads on or back by what the viewport shows; at the end of what is shown the page turns, or
    /// the window of pages, and shows its beginning, or its end.
    void read(ReadingWay way);

    /// Shows one page, all of its width.
    void fitPageWidth();
    /// Shows one page, all of it.
    void fitPage();

    /// The viewport has another size: pages that were fitted are fitted again, and bars and pages
    /// are brought into step.
    void viewportChanged();

    /// Shows a page: alone, or in the window or among the pages that are shown at present.
    /// @param page  zero-based
    /// @return      the surface that shows it, or nothing where there is no such page
    std::optional<int> showPage(int page);

    /// The canvas has opened a document, or has lost its pages in the attempt: shows what it holds.
    ///
    /// What builds pages again is disabled while there is no grid to build them from.
    void documentOpened();

    /// Builds again from the kept grid, or else takes the layout anew; then the navigation.
    /// @throws RunTimeError ObjectMissing: no grid is kept; or of the build
    void refresh(bool rebuild);

    /// Builds again with column widths and style as the canvas holds them.
    /// @throws RunTimeError ObjectMissing: no grid is kept; or of the build
    void reZoom();

    /// Prints; see `Canvas::doPrint`.
    /// @throws RunTimeError the printer's
    void print(bool allPages, TextView pageList, std::int16_t copies);

private:
    /// Which scale the pages follow while the viewport's size changes.
    enum class Fit { None, LargerRatio, Width, Both };

    void viewChanged() override;
    void progressChanged() override { }

    void build(const std::function<void()>& step);
    void quietly(const std::function<void()>& command);
    void dispatch(ToolAction action);
    AutomationObject& keptGrid() const;

    void centre();
    void existingCurrentPage();
    void showFirst();
    void showPrevious();
    void showNext();
    void showLast();
    void showManyPages();
    void showWindow(std::int16_t pages, int firstPage, int lastPage);
    void leaveWindow();
    void turn(ReadingWay way);
    void showAlone(int page);
    void showFitted(Fit fit);
    void setFittingScale(Fit fit);
    void noteFit(Fit fit);
    void afterDialog(DialogEnd end);
    void openFile();

    void takePosition(bool isWindow);
    void updatePosition();
    void takeScale();
    void showScale();
    void showView();
    void takeEntries();
    void refreshNavigation();

    Canvas& canvas_;
    PreviewHost& host_;
    AutomationObject* grid_ = nullptr;
    NavigationState state_;
    std::optional<PreviewNotice> notice_;
    float scaleDivisor_ = 1; ///< that the text of the scale combo stands for
    Fit fit_ = Fit::None;
    float fitDivisor_ = 1; ///< that the fit gave: another one has ended it
    int commands_ = 0; ///< that have not ended
    bool standsAsOnPageOne_ = false; ///< the four tools do, until the view changes
};

} // namespace pelloric
