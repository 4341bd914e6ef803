// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"

namespace pelloric::bench {

/// A table of eight columns that fits A4 portrait, with mixed Latin and Chinese texts.
TableGrid sampleTable(std::int64_t rows);

/// A table of many columns, eight of which go on a page of A4 portrait, with short texts.
TableGrid wideTable(std::int64_t rows, int columns);

/// Bytes of the texts of all its cells.
std::int64_t textBytes(const TableGrid& table);

} // namespace pelloric::bench
