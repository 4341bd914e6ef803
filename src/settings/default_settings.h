// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "settings/settings_file.h"

namespace pelloric {

struct Platform;

/// The default file's text, in the form in which the program saves a settings file.
Text defaultSettingsText();

/// The same with other values for some keys.
Text settingsTextWith(std::span<const SettingChange> values);

/// Puts the default file into the system directory, which is created if need be, where there is
/// no settings file.
///
/// A file in which no line begins with a key is no settings file: it is kept beside as
/// "OstlConfig.ini.bak", or ".bak1" and so on where that name is taken, and the default file takes
/// its place. Any other file, and one that cannot be read, is never touched.
///
/// @return  whether the default file was put in place
/// @throws RunTimeError WriteFailed, DiskFull or PermissionDenied, with the path: the folder or a
///         file cannot be written; nothing is lost
bool deployDefaultSettings(const Platform& platform);

/// Puts the default file in place, with other values for some keys; a file that was there is kept
/// beside as `deployDefaultSettings` does.
/// @throws RunTimeError as `deployDefaultSettings`
void replaceByDefaultSettings(const Platform& platform, std::span<const SettingChange> values);

/// Puts the default file into the place of the one that is there, in a folder that exists.
/// @throws RunTimeError as `deployDefaultSettings`
void resetSettings(const Platform& platform);

} // namespace pelloric
