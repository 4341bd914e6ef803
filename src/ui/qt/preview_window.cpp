// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/preview_window.h"

#include "controls/canvas.h"
#include "controls/messages.h"
#include "platform/automation_object.h"
#include "platform/file_bytes.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/services.h"
#include "ui/qt/choice_box.h"
#include "ui/qt/grid_style_dialog.h"
#include "ui/qt/icon_set.h"
#include "ui/qt/notice_strip.h"
#include "ui/qt/page_files.h"
#include "ui/qt/page_setup_dialog.h"
#include "ui/qt/preview_toolbar.h"
#include "ui/qt/print_options_dialog.h"
#include "ui/qt/reader_tools.h"
#include "ui/qt/reading_input.h"
#include "ui/qt/report_tools.h"
#include "ui/tool_table.h"
#include <pelloric/sorvane.h>

#include <QCloseEvent>
#include <QContextMenuEvent>
#include <QCursor>
#include <QEventLoopLocker>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QMenu>
#include <QPointer>
#include <QProgressDialog>
#include <QScreen>
#include <QSettings>
#include <QTimer>
#include <QVBoxLayout>

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr QSize FirstSize { 1180, 860 }; ///< before the user has chosen another: pixels

constexpr short RightButtonNumber = 2;

constexpr int CloseAgainMs = 20;

/// A window that saves for longer shows how far it is, and lives only from then on.
constexpr int ProgressAfterMs = 200;

/// Where size and place of the window are kept.
QSettings placeSettings()
{
    return QSettings(QSettings::IniFormat, QSettings::UserScope, QStringLiteral("pelloric"),
        QStringLiteral("PreviewWindow"));
}

const QString PlaceKey = QStringLiteral("geometry");

} // namespace

/// A command that runs; a window that was closed meanwhile closes when the last one ends.
class PreviewWindow::Command {
public:
    explicit Command(PreviewWindow& window)
        : window_(window)
    {
        ++window_.running_;
        setMessageSubject(&window_);
    }

    ~Command()
    {
        if (--window_.running_ > 0)
            return;
        window_.keepEscapeFromLeaving();
        window_.tools_->viewChanged();
        window_.services_.loop().forgetCancel();
        if (window_.closesAfterwards_)
            window_.close();
    }

    Command(const Command&) = delete;
    Command& operator=(const Command&) = delete;

private:
    PreviewWindow& window_;
};

PreviewWindow::PreviewWindow(QtPlatform& platform, QWidget* parent)
    : QMainWindow(parent, Qt::Window)
    , services_(platform)
    , platform_(platform.record())
    , prompts_(standardPrompts())
    , folders_(std::make_shared<UsedFolders>())
    , toolbar_(new PreviewToolbar(this))
    , strip_(new NoticeStrip(this))
    , canvas_(new Sorvane(platform, this))
    , contextMenu_(new QMenu(this))
{
    setObjectName(QStringLiteral("frmPrintPreview"));
    setAttribute(Qt::WA_DeleteOnClose);
    setWindowTitle(toQString(PreviewTitle));
    setWindowIcon(libraryIcon(QStringLiteral("print"), palette()));
    setContextMenuPolicy(Qt::DefaultContextMenu);
    addToolBar(toolbar_);
    canvas_->setObjectName(QStringLiteral("Sorvane1"));
    setCentralWidget(makeCentre());
    contextMenu_->setObjectName(QStringLiteral("PopMenu"));
    for (QAction* const action : toolbar_->contextActions())
        contextMenu_->addAction(action);
    connectTools();
    connectStrip();
    session_.emplace(canvas_->canvas(), static_cast<PreviewHost&>(*this));
    reading_ = std::make_unique<ReadingInput>(*canvas_, *session_, [this] { return isBusy(); });
    reports_ = new ReportTools({ *this, *canvas_, platform_.messages, [this] { rebuildKeptGrid(); },
        [this] { return isBusy(); } });
    tools_ = new ReaderTools(
        { *this, *contextMenu_, *canvas_, *session_, platform.fonts(), [this] { return isBusy(); },
            [this] { savePages(); }, [this] { reports_->togglePanel(); } });
    navigationChanged();
    restorePlace();
    canvas_->setFocus();
}

PreviewWindow::~PreviewWindow() { delete tools_; }

/// The canvas, with the strip above it when there is something to say.
QWidget* PreviewWindow::makeCentre()
{
    auto* const centre = new QWidget(this);
    auto* const layout = new QVBoxLayout(centre);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(strip_);
    layout->addWidget(canvas_, 1);
    return centre;
}

void PreviewWindow::connectStrip()
{
    connect(strip_, &NoticeStrip::pageSetupAsked, this,
        [this] { click(toolOf(ToolAction::ShowPageSetup).id); });
    connect(strip_, &NoticeStrip::gridStyleAsked, this,
        [this] { click(toolOf(ToolAction::ShowGridStyle).id); });
    connect(strip_, &NoticeStrip::defaultsAsked, this, [this] {
        const Command command(*this);
        session_->restoreDefaults();
    });
    connect(strip_, &NoticeStrip::dismissed, this, [this] {
        if (!session_->notice())
            fontsTold_ = services_.fonts().notes().size();
        session_->showNotice(std::nullopt);
        canvas_->setFocus();
    });
}

void PreviewWindow::connectTools()
{
    connect(toolbar_, &PreviewToolbar::clicked, this, &PreviewWindow::click);
    connect(toolbar_, &PreviewToolbar::scaleChosen, this, [this](const QString& text) {
        const Command command(*this);
        session_->chooseScale(viewOf(text));
        navigationChanged();
    });
    connect(toolbar_, &PreviewToolbar::pageChosen, this, [this](const QString& text) {
        const Command command(*this);
        session_->choosePage(viewOf(text));
        navigationChanged();
    });
    const auto focusCanvas = [this] { canvas_->setFocus(); };
    connect(&toolbar_->scaleBox(), &ChoiceBox::left, this, focusCanvas);
    connect(&toolbar_->pageBox(), &ChoiceBox::left, this, focusCanvas);
    connect(canvas_, &Sorvane::MouseUp, this, [this](short button) {
        if (button == RightButtonNumber)
            showContextMenu(QCursor::pos());
    });
}

void PreviewWindow::setPrompts(PreviewPrompts prompts)
{
    const PreviewPrompts standard = standardPrompts();
    prompts_ = std::move(prompts);
    if (!prompts_.chooseFile)
        prompts_.chooseFile = standard.chooseFile;
    if (!prompts_.showAbout)
        prompts_.showAbout = standard.showAbout;
    if (!prompts_.mayReplace)
        prompts_.mayReplace = standard.mayReplace;
}

bool PreviewWindow::isBusy() const { return running_ > 0 || canvas_->canvas().isBusy(); }

void PreviewWindow::preview(std::unique_ptr<AutomationObject> grid)
{
    if (isBusy())
        return;
    const Command command(*this);
    session_->forgetGrid();
    grid_ = std::move(grid);
    try {
        session_->open(*grid_);
    } catch (const RunTimeError& error) {
        if (error.number() != ErrorNumber::Cancelled)
            throw;
    }
}

void PreviewWindow::openDocument(const std::filesystem::path& path)
{
    if (isBusy())
        return;
    const Command command(*this);
    session_->askForCentring();
    try {
        canvas_->canvas().OpenFile(path);
    } catch (const RunTimeError&) {
        session_->documentOpened();
        throw;
    }
    session_->documentOpened();
}

void PreviewWindow::setReportOptions(const ReportOptions& options)
{
    if (!isBusy())
        reports_->setOptions(options);
}

void PreviewWindow::rebuildKeptGrid()
{
    if (grid_)
        refresh(true);
}

void PreviewWindow::refresh(bool rebuild)
{
    if (isBusy())
        return;
    const Command command(*this);
    session_->refresh(rebuild);
}

void PreviewWindow::reZoom()
{
    if (isBusy())
        return;
    const Command command(*this);
    session_->reZoom();
}

void PreviewWindow::print(bool allPages, TextView pageList, std::int16_t copies)
{
    printPages({ .allPages = allPages, .pageList = Text(pageList), .copies = copies });
}

/// @return  false: the user has ended it
bool PreviewWindow::printPages(const PrintArguments& arguments)
{
    const Command command(*this);
    services_.loop().forgetCancel();
    try {
        session_->print(arguments.allPages, arguments.pageList, arguments.copies);
    } catch (const RunTimeError& error) {
        if (error.number() == ErrorNumber::Cancelled)
            return false;
        platform_.messages.show(messageOf(error));
    }
    return true;
}

void PreviewWindow::click(int id)
{
    const Command command(*this);
    session_->click(id);
}

/// Does the smallest thing first: lists and boxes take the key themselves, then the toolbar's
/// further row goes, then what runs is ended, and only then the preview.
void PreviewWindow::escape()
{
    if (toolbar_->closeFurtherRow() || reports_->escape() || tools_->escape())
        return;
    if (isBusy())
        services_.loop().cancel();
    else if (mayLeave_)
        click(toolOf(ToolAction::Exit).id);
}

/// A key that was pressed while a command ran may arrive after it: it is no wish to leave. Input
/// that waits is delivered before a timer of the second turn.
void PreviewWindow::keepEscapeFromLeaving()
{
    mayLeave_ = false;
    QTimer::singleShot(
        0, this, [this] { QTimer::singleShot(0, this, [this] { mayLeave_ = running_ == 0; }); });
}

void PreviewWindow::keyPressEvent(QKeyEvent* event)
{
    if (event->matches(QKeySequence::Cancel))
        escape();
    else
        QMainWindow::keyPressEvent(event);
}

void PreviewWindow::closeEvent(QCloseEvent* event)
{
    if (!isBusy()) {
        savePlace();
        isClosed_ = true;
        canvas_->canvas().clear();
        // A hidden window counts for nothing: one that was the last leaves the program running.
        std::optional<QEventLoopLocker> lastWindow;
        if (!isVisible() && QGuiApplication::quitOnLastWindowClosed())
            lastWindow.emplace();
        return QMainWindow::closeEvent(event);
    }
    closesAfterwards_ = true;
    if (canvas_->canvas().isBusy())
        services_.loop().cancel();
    for (QDialog* const dialog : findChildren<QDialog*>())
        dialog->reject();
    // A build that a host has begun on the canvas is no command, and nobody tells when it ends.
    if (running_ == 0)
        QTimer::singleShot(CloseAgainMs, this, &QWidget::close);
    event->ignore();
    savePlace();
    hide();
}

/// The window is still shown when the command that unloads it ends, and then closes like any other.
void PreviewWindow::unload() { closesAfterwards_ = true; }

void PreviewWindow::beforeBuild(AutomationObject& grid)
{
    if (prompts_.beforeBuild)
        prompts_.beforeBuild(grid);
}

/// Which faces were taken for fonts that are not installed, until the person hides it.
std::optional<PreviewNotice> PreviewWindow::fontNotice() const
{
    const std::vector<FontNote>& notes = services_.fonts().notes();
    QStringList sentences;
    for (std::size_t at = fontsTold_; at < notes.size(); ++at) {
        if (!notes[at].taken.empty())
            sentences.append(tr("The font %1 is not installed; %2 is taken instead.")
                                 .arg(toQString(notes[at].asked), toQString(notes[at].taken)));
    }
    if (sentences.isEmpty())
        return std::nullopt;
    return PreviewNotice { .text = toText(sentences.join(QLatin1Char(' '))),
        .offersGridStyle = true };
}

void PreviewWindow::navigationChanged()
{
    if (!session_)
        return;
    toolbar_->showNavigation(session_->state(), canvas_->canvas().document().currentPage);
    strip_->showNotice(session_->notice() ? session_->notice() : fontNotice());
    if (tools_)
        tools_->viewChanged();
    if (reports_)
        reports_->viewChanged();
}

void PreviewWindow::documentSaved() { reports_->documentSaved(); }

DialogEnd PreviewWindow::showGridStyle()
{
    GridStyleDialog dialog(platform_, this, canvas_->canvas().ownSettings());
    return dialog.exec() == QDialog::Accepted ? DialogEnd::Accepted : DialogEnd::Cancelled;
}

DialogEnd PreviewWindow::showPageSetup()
{
    PageSetupDialog dialog(platform_, this, canvas_->canvas().ownSettings());
    return dialog.exec() == QDialog::Accepted ? DialogEnd::Accepted : DialogEnd::Cancelled;
}

void PreviewWindow::showPrintOptions()
{
    PrintOptionsDialog* shown = nullptr;
    PrintOptionsDialog dialog(
        platform_, [&](const PrintArguments& arguments) { return printFrom(*shown, arguments); },
        pagesToPrint(), this);
    shown = &dialog;
    dialog.onStop([this] { services_.loop().cancel(); });
    dialog.exec();
    // The command that shows the dialog has to end first.
    if (dialog.wantsFile())
        QMetaObject::invokeMethod(this, &PreviewWindow::savePages, Qt::QueuedConnection);
}

PrintPages PreviewWindow::pagesToPrint() const
{
    const Canvas& canvas = canvas_->canvas();
    return { .count = canvas.Totalpages(),
        .paper = { .code = canvas.style().PagerSizeValue,
            .orientation = canvas.style().PagerOrientation,
            .width = canvas.page.myWidth,
            .height = canvas.page.myHeight } };
}

/// @return  why the dialog stays open; empty: it closes
QString PreviewWindow::printFrom(PrintOptionsDialog& dialog, const PrintArguments& arguments)
{
    Canvas& canvas = canvas_->canvas();
    canvas.pageSent = [&dialog](std::int64_t sent, std::int64_t wanted) {
        dialog.showSent(sent, wanted);
        return true;
    };
    const bool isThrough = printPages(arguments);
    canvas.pageSent = {};
    if (isThrough)
        return {};
    const ProgressBar& progress = canvas.progress();
    return tr("Printing was ended: %1 of %2 pages were sent.")
        .arg(progress.value)
        .arg(progress.maximum);
}

void PreviewWindow::showAbout() { prompts_.showAbout(*this); }

std::filesystem::path PreviewWindow::chooseFileToOpen() { return choose(openFileQuestion()); }

std::filesystem::path PreviewWindow::chooseFileToSave() { return choose(saveFileQuestion()); }

std::filesystem::path PreviewWindow::choose(const FileQuestion& question)
{
    FileQuestion asked = question;
    asked.places = folders_->folders();
    const QString path = prompts_.chooseFile(*this, asked);
    if (path.isEmpty())
        throw RunTimeError(ErrorNumber::Cancelled);
    folders_->use(path);
    return toText(path);
}

void PreviewWindow::savePages()
{
    if (isBusy())
        return;
    const Command command(*this);
    const QString title = toQString(canvas_->canvas().documentTitle());
    try {
        const std::filesystem::path path = choose(savePagesQuestion(title, folders_->last()));
        if (mayWritePages(path))
            writePages(path);
    } catch (const RunTimeError& error) {
        if (error.number() != ErrorNumber::Cancelled)
            platform_.messages.show(messageOf(error));
    }
}

/// Numbered files beside the chosen name are replaced only when the person says so.
bool PreviewWindow::mayWritePages(const std::filesystem::path& path)
{
    QStringList files;
    for (const std::filesystem::path& file : filesInTheWay(canvas_->canvas(), path))
        files.append(toQString(pathText(file)));
    return files.isEmpty() || prompts_.mayReplace(*this, files);
}

/// The dialog comes up when it takes a while.
void PreviewWindow::writePages(const std::filesystem::path& path)
{
    QProgressDialog progress(tr("Saving the pages…"), tr("Cancel"), 0, 1, this);
    progress.setWindowModality(Qt::WindowModal);
    progress.setObjectName(QStringLiteral("SavingPages"));
    progress.setMinimumDuration(ProgressAfterMs);
    qt::savePages(canvas_->canvas(), services_.fonts(), path, [&](int done, int total) {
        progress.setMaximum(std::max(1, total));
        progress.setValue(done);
        return !progress.wasCanceled();
    });
}

void PreviewWindow::showContextMenu(QPoint at)
{
    if (!isBusy())
        contextMenu_->popup(at);
}

/// The menu key; the right mouse button opens the menu when the canvas tells of it.
void PreviewWindow::contextMenuEvent(QContextMenuEvent* event)
{
    event->accept();
    if (event->reason() == QContextMenuEvent::Keyboard)
        showContextMenu(canvas_->mapToGlobal(canvas_->rect().center()));
}

void PreviewWindow::restorePlace()
{
    const QByteArray place = placeSettings().value(PlaceKey).toByteArray();
    if (!place.isEmpty() && restoreGeometry(place))
        return;
    const QSize room = screen()->availableSize();
    resize(FirstSize.boundedTo(room * 9 / 10));
}

void PreviewWindow::savePlace() const { placeSettings().setValue(PlaceKey, saveGeometry()); }

} // namespace pelloric::qt
