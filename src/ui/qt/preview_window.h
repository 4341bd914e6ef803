// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/platform.h"
#include "ui/preview_navigation.h"
#include "ui/qt/preview_prompts.h"

#include <QMainWindow>

#include <cstddef>
#include <memory>
#include <optional>

class QMenu;

namespace pelloric {
struct PrintArguments;
struct ReportOptions;
}

namespace pelloric::qt {

class NoticeStrip;
class PreviewToolbar;
class PrintOptionsDialog;
class QtPlatform;
class ReaderTools;
class ReadingInput;
class ReportTools;
class Sorvane;
class UsedFolders;
struct PrintPages;

/// The preview window `frmPrintPreview`: a canvas, `Sorvane1`, and the toolbar that drives it.
///
/// It closes itself only between commands: a window that is closed while pages are built ends the
/// build, and goes when the build has ended. A closed window deletes itself.
class PreviewWindow final : public QMainWindow, private PreviewHost {
    Q_OBJECT

public:
    /// @param platform  outlives the window
    explicit PreviewWindow(QtPlatform& platform, QWidget* parent = nullptr);
    ~PreviewWindow() override;

    /// Puts other questions and another about box in; an empty function means the standard one.
    void setPrompts(PreviewPrompts prompts);

    /// Previews a grid, which the window keeps until the next one.
    ///
    /// While a command runs it is refused without a word. A build that the user ends leaves the
    /// earlier pages, without a word too.
    /// @throws RunTimeError of the build; the grid is kept
    void preview(std::unique_ptr<AutomationObject> grid);

    /// Opens a document file and shows its first page.
    /// @throws RunTimeError as `Canvas::OpenFile`
    void openDocument(const std::filesystem::path& path);

    /// What builds from now on do beyond the plain page; while a command runs it is refused without
    /// a word.
    void setReportOptions(const ReportOptions& options);

    /// Builds again from the kept grid, or only takes the layout anew.
    /// @throws RunTimeError ObjectMissing: no grid is kept; or of the build
    void refresh(bool rebuild);

    /// Builds again with column widths and style as the canvas holds them.
    /// @throws RunTimeError ObjectMissing: no grid is kept; or of the build
    void reZoom();

    /// Prints all pages or a page list; a printer's error is told in a message box. Escape ends it
    /// after the page in work.
    void print(bool allPages, TextView pageList, std::int16_t copies);

    /// Asks for a file and saves the pages there as PDF, or as pictures by the name's ending; what
    /// fails is told in a message box. Escape ends it.
    void savePages();

    /// Keeps the folders of the session elsewhere, for several windows one after the other.
    void useFolders(std::shared_ptr<UsedFolders> folders) { folders_ = std::move(folders); }

    /// Whether a command, a build among them, runs at the moment.
    bool isBusy() const;

    /// Whether the window is closed and only waits to be deleted.
    bool isClosed() const { return isClosed_; }

    Sorvane& canvas() { return *canvas_; }
    const PreviewSession& session() const { return *session_; }

protected:
    void closeEvent(QCloseEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    class Command;

    DialogEnd showGridStyle() override;
    DialogEnd showPageSetup() override;
    void showPrintOptions() override;
    void showAbout() override;
    std::filesystem::path chooseFileToOpen() override;
    std::filesystem::path chooseFileToSave() override;
    void unload() override;
    void beforeBuild(AutomationObject& grid) override;
    void documentSaved() override;
    void navigationChanged() override;

    bool printPages(const PrintArguments& arguments);
    PrintPages pagesToPrint() const;
    QString printFrom(PrintOptionsDialog& dialog, const PrintArguments& arguments);
    std::optional<PreviewNotice> fontNotice() const;
    QWidget* makeCentre();
    void connectTools();
    void connectStrip();
    void rebuildKeptGrid();
    bool mayWritePages(const std::filesystem::path& path);
    void writePages(const std::filesystem::path& path);
    void click(int id);
    void escape();
    void keepEscapeFromLeaving();
    void showContextMenu(QPoint at);
    std::filesystem::path choose(const FileQuestion& question);
    void restorePlace();
    void savePlace() const;

    QtPlatform& services_;
    Platform platform_;
    PreviewPrompts prompts_;
    std::shared_ptr<UsedFolders> folders_;
    std::unique_ptr<AutomationObject> grid_;
    PreviewToolbar* toolbar_;
    NoticeStrip* strip_;
    std::size_t fontsTold_ = 0; ///< notes on fonts that the person has hidden
    Sorvane* canvas_;
    QMenu* contextMenu_;
    std::optional<PreviewSession> session_;
    std::unique_ptr<ReadingInput> reading_; ///< works on the session
    ReaderTools* tools_ = nullptr; ///< works on the session
    ReportTools* reports_ = nullptr;
    int running_ = 0; ///< commands that have not ended
    bool closesAfterwards_ = false;
    bool isClosed_ = false;
    bool mayLeave_ = true; ///< false: an Escape may still be meant for what has just ended
};

} // namespace pelloric::qt
