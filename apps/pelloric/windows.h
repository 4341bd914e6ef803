// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "commands.h"

#include <QApplication>

#include <memory>

namespace pelloric {
struct Platform;
}

namespace pelloric::app {

/// Whether windows can be shown here.
bool hasDisplay();

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
