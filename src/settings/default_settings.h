// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <span>

namespace pelloric {

struct Platform;

/// A key of the default file with its value.
struct DefaultSetting {
    TextView key;
    TextView value;
};

/// Every key in the order of the default file's lines: a key stands above every other line that
/// contains it, and the header and footer texts, which may hold any word, stand last.
std::span<const DefaultSetting> defaultSettings();

/// The default file's text, in the form in which the program saves a settings file.
Text defaultSettingsText();

/// Puts the default file into the system directory, which is created if need be, where there is
/// no settings file; an existing one is never touched.
///
/// @return  whether the file was created
/// @throws RunTimeError WriteFailed, with the path: the folder or the file cannot be created
bool deployDefaultSettings(const Platform& platform);

} // namespace pelloric
