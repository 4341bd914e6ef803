// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "windows.h"

#include "command_line.h"
#include "platform/run_time_error.h"
#include "settings/default_settings.h"

namespace pelloric::app {

bool hasDisplay()
{
#if defined(Q_OS_UNIX) && !defined(Q_OS_MACOS)
    return qEnvironmentVariableIsSet("DISPLAY") || qEnvironmentVariableIsSet("WAYLAND_DISPLAY")
        || qEnvironmentVariableIsSet("QT_QPA_PLATFORM");
#else
    return true;
#endif
}

WindowedApplication::WindowedApplication(const Invocation& invocation)
{
    if (!hasDisplay())
        throw CommandError(QStringLiteral(
            "there is no display to show windows on; \"pelloric export\" and \"pelloric demo "
            "--walk OUT\" need none"));
    application_ = std::make_unique<QApplication>(invocation.argc, invocation.argv);
}

int WindowedApplication::run() { return QApplication::exec(); }

void prepareSettings(const Platform& platform)
{
    try {
        deployDefaultSettings(platform);
    } catch (const RunTimeError& error) {
        tell(describe(error));
    }
}

} // namespace pelloric::app
