// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <pelloric/options.h>

#include <cstdint>
#include <memory>

namespace pelloric {

class AutomationObject;
enum class SettingKey;
struct Platform;
struct ReportOptions;

/// Opens the window that previews a grid.
class PreviewOpener {
public:
    virtual ~PreviewOpener() = default;

    /// Shows the preview window, which there is once, and has it preview the grid.
    /// @param grid  the window keeps it until the next one, to build the pages anew
    virtual void openPreview(std::unique_ptr<AutomationObject> grid) = 0;

    /// Says what the window's reports do beyond the plain page from now on. A window that is open
    /// builds its pages anew only for the next grid.
    virtual void setReportOptions(const ReportOptions&) { }
};

/// What `Kestrane` publishes, without a window.
///
/// It keeps nothing but what its own properties answer; everything else is written to the settings
/// file at once, where the next preview reads it. A save that fails is passed over.
class Facade {
public:
    /// Sets the library-wide `MarvenStartRow` back to 1.
    /// @param platform  outlives the facade
    /// @param opener    outlives the facade
    Facade(Platform& platform, PreviewOpener& opener);

    /// Lets the message loop run once, then previews the grid in the preview window.
    void doPreview(std::unique_ptr<AutomationObject> grid);

    /// Stores a page-header text.
    /// @param strHeader  may hold fields; line breaks become blanks, for a setting is one line
    /// @param Location   `AlignmentType`; any value but 0 and 1 is the right slot
    void AddHeader(TextView strHeader, std::int32_t Location);

    /// Stores a page-footer text, like `AddHeader`.
    void AddFooter(TextView strFooter, std::int32_t Location);

    /// What was set last on this control; false at first.
    bool ShowHeader() const { return showHeader_; }
    void setShowHeader(bool show);

    /// The first row of a flex grid that is printed, shared by all facades.
    std::int32_t MarvenStartRow() const;
    void setMarvenStartRow(std::int32_t row);

    /// What was set last on this control; false at first.
    bool MergeGrid() const { return mergeGrid_; }
    void setMergeGrid(bool merge);

private:
    void writeSlot(SettingKey key, TextView text);

    Platform& platform_;
    PreviewOpener& opener_;
    bool showHeader_ = false;
    bool mergeGrid_ = false;
};

} // namespace pelloric
