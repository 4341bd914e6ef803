// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "windows.h"

#include "command_line.h"
#include "platform/run_time_error.h"
#include "settings/default_settings.h"

#include <QWidget>

#include <algorithm>

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

/// A window that was closed while it was filled, before the program waits for the user, is no
/// reason to wait.
int WindowedApplication::run()
{
    const QWidgetList windows = QApplication::topLevelWidgets();
    const bool isShown = std::ranges::any_of(windows, &QWidget::isVisible);
    return isShown ? QApplication::exec() : Done;
}

void prepareSettings(const Platform& platform)
{
    try {
        deployDefaultSettings(platform);
    } catch (const RunTimeError& error) {
        tell(describe(error));
    }
}

} // namespace pelloric::app
