// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"
#include <pelloric/options.h>

namespace pelloric {
struct Platform;
}

namespace pelloric::app {

/// The options that shape a report, for every command that lays one out.
OptionTable reportOptions();

/// What the texts above and below pages may hold, for the help of the commands that take them.
QString textsDetails();

/// The first of these options that was given; null when none was.
const char* firstReportOption(const CommandLine& line);

/// What the options of a command are written over, unless "--defaults" or "--settings" says.
enum class SettingsBase {
    Defaults, ///< so that no other program's settings change a page
    Users,
};

/// Settings with the options of a command written over them; files are read and never written.
///
/// Where the user's are asked for and there are none, the default ones are put there once, if that
/// is possible. What is wrong with a file's settings, short of an error, is told.
/// @throws CommandError a value or a settings file that cannot be used
ReportSettings settingsFor(const CommandLine& line, const Platform& platform, SettingsBase base);

} // namespace pelloric::app
