// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/run_time_error.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

#include <optional>
#include <vector>

namespace pelloric {

struct Platform;

/// Where settings came from, for texts about them.
struct SettingsSource {
    Text file; ///< its path
    const SettingsSnapshot& snapshot; ///< what it holds
};

/// Something in the settings that keeps pages from being built, or from being readable.
struct SettingProblem {
    Text text; ///< one sentence or more for a person: key, value, file and limit
    std::optional<SettingKey> key; ///< whose value it is; nothing: it is about the file
    bool isInPageSetup = false; ///< the page setup dialog can mend it
    bool isInGridStyle = false; ///< the grid style dialog can mend it
    bool isRefused = false; ///< no page can be built by it

    bool operator==(const SettingProblem&) const = default;
};

/// Everything in the settings file that a person should know of, in the order of the keys; empty
/// when there is nothing.
///
/// A missing file, missing keys, values that no style takes, font sizes and papers of 0 or less,
/// and margins between which nothing of the paper is left. Nothing is written.
std::vector<SettingProblem> settingProblems(const Platform& platform);

/// The same of settings that are held as a value.
/// @param source  named in the texts; null: the settings come from nowhere
std::vector<SettingProblem> settingProblems(
    const ReportSettings& settings, const SettingsSource* source = nullptr);

/// The error of a setting that no style takes: key, value, file, limit and remedy.
/// @param number  of the error that the value caused
RunTimeError settingError(ErrorNumber number, SettingKey key, const ReportSettings& settings,
    const SettingsSource* source);

/// The error of a settings file that is missing or cannot be read, with the remedy.
RunTimeError missingSettings(const RunTimeError& cause, const Platform& platform);

/// The settings that a text holds, each the value of the first line that begins with its key, in
/// the order of the keys.
/// @return  borrows from the text
std::vector<SettingChange> settingsIn(TextView text);

/// Makes every setting of the file usable again: what `settingProblems` names takes its default
/// value, the rest keeps its own. The old file is kept beside, as `deployDefaultSettings` does.
/// @throws RunTimeError WriteFailed, DiskFull or PermissionDenied, with the path; nothing is lost
void restoreDefaultSettings(const Platform& platform);

/// The same for settings that are held as a value.
void restoreDefaultSettings(ReportSettings& settings);

} // namespace pelloric
