// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QString>

namespace pelloric::qt {
class QtPlatform;
class QtPreviewOpener;
}

namespace pelloric::app {

class DemoWindow;

/// Walks through the demonstration as a person would, and leaves screenshots of every step, the
/// reports as PDF and a document file in a folder, naming each file that it has written.
/// @param out  the folder; made if need be
/// @throws CommandError a file cannot be written; a step did not come out as it should
void walkDemo(
    DemoWindow& demo, qt::QtPreviewOpener& opener, qt::QtPlatform& platform, const QString& out);

} // namespace pelloric::app
