// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

namespace pelloric {
class PageDocument;
}

namespace pelloric::qt {
class QtPlatform;
}

namespace pelloric::app {

/// Refuses to go on where there is nothing to draw texts with.
/// @throws CommandError no font is installed
void requireFonts();

/// Tells which faces were taken for others that are not installed, and which characters of a
/// document no installed face has.
void tellFonts(const PageDocument& document, qt::QtPlatform& platform);

} // namespace pelloric::app
