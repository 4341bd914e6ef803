// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"

#include <filesystem>

namespace pelloric::bench {

/// A table of eight columns that fits A4 portrait, with mixed Latin and Chinese texts.
TableGrid sampleTable(std::int64_t rows);

/// A table of many columns, eight of which go on a page of A4 portrait, with short texts.
TableGrid wideTable(std::int64_t rows, int columns);

/// Writes a table as a CSV file with its titles; no text needs quotes.
void writeCsv(const TableGrid& table, const std::filesystem::path& path);

/// Bytes of the texts of all its cells.
std::int64_t textBytes(const TableGrid& table);

} // namespace pelloric::bench
