// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QGuiApplication>

namespace pelloric::fuzz {

/// Makes the application that fonts and images need, once and without a display.
inline void application()
{
    static int count = 1;
    static char name[] = "fuzzer";
    static char* arguments[] = { name, nullptr };
    static const bool isOffscreen = qputenv("QT_QPA_PLATFORM", "offscreen");
    static const QGuiApplication application(count, arguments);
    static_cast<void>(isOffscreen);
}

} // namespace pelloric::fuzz
