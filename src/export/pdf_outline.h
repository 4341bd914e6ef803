// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <span>

namespace pelloric::pdf {

class PdfFile;

/// Writes an outline that leads to every page: groups of pages, closed at first.
///
/// @param pages  object numbers; at least one
/// @return       object number
int writeOutline(PdfFile& file, std::span<const int> pages);

} // namespace pelloric::pdf
