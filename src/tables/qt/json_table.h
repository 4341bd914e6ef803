// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"
#include "tables/qt/text_file.h"

namespace pelloric::qt {

/// Whether a text looks like JSON: its first mark is a bracket, and what follows can stand in one.
///
/// @param start  the beginning of a text, in UTF-8
bool looksLikeJson(std::string_view start);

/// Reads a JSON file into a table: an array of objects, or one object a line.
///
/// Every name that an object has is a column, in the order in which they come up. Numbers stay as
/// they are written, null is empty, and an array or object within an object is its own JSON text.
/// Every column has the width -1.
/// @throws RunTimeError as `readTextFile`; TypeMismatch also, naming the line: text that is no
/// JSON,
///         or JSON that is no table; Overflow: too many columns
TableGrid readJson(const std::filesystem::path& path, const TextFileOptions& options);

} // namespace pelloric::qt
