// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"
#include "settings/report_settings.h"

namespace pelloric {
struct Platform;
}

namespace pelloric::app {

/// The options that shape a report, for every command that lays one out.
OptionTable reportOptions();

/// The first of these options that was given; null when none was.
const char* firstReportOption(const CommandLine& line);

/// The user's settings with the options of a command written over them; the user's file is read
/// and never written.
///
/// Where the user has no settings file yet, the default one is put there once, if that is possible.
/// @throws CommandError a value that cannot be used; RunTimeError the file cannot be read
ReportSettings settingsFor(const CommandLine& line, const Platform& platform);

} // namespace pelloric::app
