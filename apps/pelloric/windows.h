// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"
#include "commands.h"

#include <QApplication>

#include <memory>

namespace pelloric {
struct Platform;
}

namespace pelloric::app {

/// Whether windows can be shown here.
bool hasDisplay();

/// The options of every command with windows.
OptionTable windowOptions();

/// Shows windows in the language that the option names, as far as their texts are not published;
/// without the option they are English. There is an application object.
/// @throws CommandError WrongUsage: there is no such language
void chooseLanguage(const CommandLine& line);

/// The application object of a command with windows.
class WindowedApplication {
public:
    /// @throws CommandError there is no display
    explicit WindowedApplication(const Invocation& invocation);

    /// Runs until the last window is closed. @return  the exit status
    int run();

private:
    std::unique_ptr<QApplication> application_;
};

/// Puts the default settings file where there is none.
///
/// A folder that cannot be written is told in one line; the first preview says what is missing.
void prepareSettings(const Platform& platform);

} // namespace pelloric::app
