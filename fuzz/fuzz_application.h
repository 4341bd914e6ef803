// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QGuiApplication>

/// What the toolkit's font library never gives back is no finding.
extern "C" const char* __lsan_default_suppressions() { return "leak:libfontconfig"; }

namespace pelloric::fuzz {

/// Makes the application that fonts and images need, once and without a display. It stays to the
/// end of the process, for what the toolkit keeps for each thread is freed through it.
inline void application()
{
    static int count = 1;
    static char name[] = "fuzzer";
    static char* arguments[] = { name, nullptr };
    static const bool isOffscreen = qputenv("QT_QPA_PLATFORM", "offscreen");
    static const auto* const application = new QGuiApplication(count, arguments);
    static_cast<void>(isOffscreen);
    static_cast<void>(application);
}

} // namespace pelloric::fuzz
