// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"

#include <QTemporaryDir>

namespace pelloric {
struct Platform;
}

namespace pelloric::qt {
class QtPlatform;
}

namespace pelloric::app {

/// The options that shape a report, for every command that lays one out.
OptionTable reportOptions();

/// The first of these options that was given; null when none was.
const char* firstReportOption(const CommandLine& line);

/// The user's settings with the options of a command written over them, in a folder of their own;
/// the user's file is read and never written.
///
/// Where the user has no settings file yet, the default one is put there once, if that is possible.
class PrivateSettings {
public:
    /// @param platform  borrowed; reads the private settings as long as the object lives
    /// @throws CommandError a value that cannot be used; settings that lack a key
    PrivateSettings(qt::QtPlatform& platform, const CommandLine& line);
    ~PrivateSettings();
    PrivateSettings(const PrivateSettings&) = delete;
    PrivateSettings& operator=(const PrivateSettings&) = delete;

private:
    qt::QtPlatform& platform_;
    QTemporaryDir folder_;
};

} // namespace pelloric::app
