// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/preview_opener.h"

#include "controls/canvas.h"
#include "controls/qt/default_platform.h"
#include "platform/automation_object.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_platform.h"
#include "platform/run_time_error.h"
#include "print/qt/qt_printing.h"
#include "settings/default_settings.h"
#include "ui/qt/page_files.h"
#include "ui/qt/preview_window.h"
#include <pelloric/kestrane.h>
#include <pelloric/sorvane.h>

#include <QCoreApplication>
#include <QtGlobal>

#include <memory>

namespace pelloric::qt {

namespace {

/// What the facades of the program use.
struct Installed {
    std::unique_ptr<QtPrinting> printing;
    std::unique_ptr<QtPreviewOpener> opener;
};

Installed& installed()
{
    static Installed instance;
    return instance;
}

/// Where there are no settings yet, the first preview finds the default ones.
void deploySettings(const Platform& platform)
{
    try {
        deployDefaultSettings(platform);
    } catch (const RunTimeError&) {
        // A folder that cannot be written is no reason to end a host; the preview tells of it.
    }
}

/// A window without letters cannot say why, so the host's log does.
void tellMissingFonts()
{
    if (!QtFonts::hasAny())
        qWarning("Pelloric: no font is installed, so no text can be drawn; on Debian install "
                 "fonts-dejavu-core, and fonts-arphic-uming for Chinese texts");
}

/// Windows and printers must not outlive the application.
void uninstall()
{
    Kestrane::setDefaultPreviewOpener(nullptr);
    installed().opener.reset();
    installed().printing.reset();
}

} // namespace

QtPreviewOpener::QtPreviewOpener(QtPlatform& platform)
    : platform_(platform)
    , folders_(std::make_shared<UsedFolders>())
{
}

QtPreviewOpener::~QtPreviewOpener() { delete window_; }

void QtPreviewOpener::openPreview(std::unique_ptr<AutomationObject> grid)
{
    PreviewWindow& window = showWindow();
    setMessageSubject(&window);
    window.preview(std::move(grid));
}

void QtPreviewOpener::setReportOptions(const ReportOptions& options)
{
    options_ = options;
    if (PreviewWindow* const open = window())
        open->setReportOptions(options);
}

PreviewWindow& QtPreviewOpener::showWindow()
{
    if (!window()) {
        window_ = new PreviewWindow(platform_);
        window_->setPrompts(prompts_);
        window_->useFolders(folders_);
        window_->canvas().canvas().useSettings(settings_);
        window_->setReportOptions(options_);
    }
    if (!showing_)
        return *window_;
    window_->setWindowState(window_->windowState() & ~Qt::WindowMinimized);
    window_->show();
    window_->raise();
    window_->activateWindow();
    return *window_;
}

PreviewWindow* QtPreviewOpener::window() const
{
    return window_ && !window_->isClosed() ? window_.data() : nullptr;
}

QtPreviewOpener& installPreviewWindow(QtPlatform& platform)
{
    deploySettings(platform.record());
    tellMissingFonts();
    Installed& now = installed();
    if (!now.opener)
        qAddPostRoutine(uninstall);
    now.opener = std::make_unique<QtPreviewOpener>(platform);
    Kestrane::setDefaultPreviewOpener(now.opener.get());
    return *now.opener;
}

QtPreviewOpener& installPreviewWindow()
{
    QtPlatform& platform = defaultPlatform();
    if (!installed().printing)
        installed().printing = std::make_unique<QtPrinting>(platform);
    return installPreviewWindow(platform);
}

} // namespace pelloric::qt
