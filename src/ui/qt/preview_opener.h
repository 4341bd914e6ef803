// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/facade.h"
#include "ui/qt/preview_prompts.h"
#include <pelloric/options.h>

#include <QPointer>

namespace pelloric::qt {

class PreviewWindow;
class UsedFolders;
class QtPlatform;

/// Opens the one preview window; a window that is open already is used again and raised.
class QtPreviewOpener final : public PreviewOpener {
public:
    /// @param platform  outlives the opener
    explicit QtPreviewOpener(QtPlatform& platform);
    /// Closes the window.
    ~QtPreviewOpener() override;
    QtPreviewOpener(const QtPreviewOpener&) = delete;
    QtPreviewOpener& operator=(const QtPreviewOpener&) = delete;

    /// What windows that are made from now on ask people.
    void setPrompts(PreviewPrompts prompts) { prompts_ = std::move(prompts); }

    /// Whether windows come to the screen, as they do at first; else pages are built unseen.
    void setShowing(bool showing) { showing_ = showing; }
    /// The settings of the reports in windows that are made from now on; nothing: those of the
    /// settings file.
    void setSettings(std::optional<ReportSettings> settings) { settings_ = std::move(settings); }

    /// Shows the window, then has it preview the grid.
    /// @throws RunTimeError as `PreviewWindow::preview`
    void openPreview(std::unique_ptr<AutomationObject> grid) override;

    /// What the window's reports do beyond the plain page from the next one on.
    void setReportOptions(const ReportOptions& options) override;

    /// Shows the window, which is made if need be, and raises it.
    PreviewWindow& showWindow();

    /// The window, or null when none is open.
    PreviewWindow* window() const;

private:
    QtPlatform& platform_;
    PreviewPrompts prompts_;
    ReportOptions options_;
    bool showing_ = true;
    std::shared_ptr<UsedFolders> folders_;
    std::optional<ReportSettings> settings_;
    QPointer<PreviewWindow> window_;
};

/// From now on the facades of the program preview in the preview window on these services.
///
/// Where there is no settings file the default one is put in place, see `deployDefaultSettings`;
/// a folder that cannot be written is told by the first preview.
///
/// @param platform  outlives the application object, or is given up by installing another
/// @return          the opener; gone with the application object
QtPreviewOpener& installPreviewWindow(QtPlatform& platform);

/// The same on the default services, to which the system's printers are given.
QtPreviewOpener& installPreviewWindow();

} // namespace pelloric::qt
