// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/preview.h>

#include "controls/qt/default_platform.h"
#include "host/qt/host_canvas.h"
#include "platform/platform.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_window.h"

#include <QCoreApplication>

namespace pelloric::qt {

namespace {

QtPreviewOpener*& openerInUse()
{
    static QtPreviewOpener* opener = nullptr;
    return opener;
}

/// The opener goes with the application object.
QtPreviewOpener& opener()
{
    if (openerInUse() == nullptr) {
        openerInUse() = &installPreviewWindow();
        qAddPostRoutine([] { openerInUse() = nullptr; });
    }
    return *openerInUse();
}

} // namespace

void usePreviewWindow() { opener(); }

void setSettingsFolder(const QString& folder)
{
    QtPlatform& platform = defaultPlatform();
    platform.folders().setSystemDirectory(pathOf(folder));
    deployDefaultSettings(platform.record());
}

void setPreviewSettings(std::optional<ReportSettings> settings)
{
    opener().setSettings(std::move(settings));
}

void openInPreview(const QString& path) { opener().showWindow().openDocument(pathOf(path)); }

Sorvane* previewCanvas()
{
    PreviewWindow* const window = opener().window();
    return window == nullptr ? nullptr : &window->canvas();
}

} // namespace pelloric::qt
