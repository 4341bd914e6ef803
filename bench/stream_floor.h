// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <filesystem>

namespace pelloric {
class PageDocument;
}

namespace pelloric::bench {

/// What no writer of pages can do without: say where each text stands and what its characters
/// are, say where lines begin and end, compress that page by page as much as PDF files are, and
/// write it. There are no fonts, no checks and no structure; the file is no PDF.
///
/// @return  seconds of the processor
double streamFloorSeconds(const PageDocument& document, const std::filesystem::path& path);

} // namespace pelloric::bench
