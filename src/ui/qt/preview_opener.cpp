// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/preview_opener.h"

#include "controls/qt/default_platform.h"
#include "controls/qt/kestrane.h"
#include "platform/automation_object.h"
#include "print/qt/qt_printing.h"
#include "ui/qt/page_files.h"
#include "ui/qt/preview_window.h"

#include <QCoreApplication>

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
    showWindow().preview(std::move(grid));
}

PreviewWindow& QtPreviewOpener::showWindow()
{
    if (!window()) {
        window_ = new PreviewWindow(platform_);
        window_->setPrompts(prompts_);
        window_->useFolders(folders_);
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
