// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/text_store.h"
#include "platform/row_set.h"
#include "platform/units.h"
#include "report/column_bands.h"

#include <pelloric/records.h>

#include <limits>
#include <memory>
#include <optional>
#include <span>
#include <vector>

namespace pelloric {

class AutomationObject;
class CellLooks;
class LateBoundRows;
class MessageLoop;
class TableRowSet;

/// A grid of more columns, hidden ones among them, is refused before any of them is looked at.
inline constexpr std::int32_t MostGridColumns = 1'000'000;

/// What a reader is told.
struct GridRequest {
    PrintObjKind kind = PrintObjKind::MSHFlexGrid;
    std::int32_t startRow = 1; ///< first row of a flex grid that is printed; row 0 has the titles
    Twips paperWidth = 0; ///< twips
    std::int16_t leftMargin = 0; ///< twips
    /// Widths of an earlier build to go on with; nothing: the grid's own are taken. Twips.
    std::optional<std::span<const double>> keptWidths;
    std::shared_ptr<TextStore> store; ///< where texts are kept that are copied from the grid
    char16_t decimalSeparator = u'.';
    /// More rows cannot be printed; see `requireRowsToFit`.
    std::int64_t mostRows = std::numeric_limits<std::int64_t>::max();
    MessageLoop* loop = nullptr; ///< kept alive while rows are read; null: nothing is
};

/// What a reader makes of a grid.
class GridTable {
public:
    GridTable();
    ~GridTable();
    GridTable(GridTable&&) noexcept;
    GridTable& operator=(GridTable&&) noexcept;

    /// The records; null when no column is printed. A data grid's own row set is borrowed.
    RowSet* rows = nullptr;
    /// Width of each printed column: twips.
    std::vector<double> ColumnWidths;
    double tableWidth = 0; ///< their sum: twips
    std::vector<ColPos> ColumnBands;

    /// Where texts of the grid are that were not copied; null: all were.
    std::shared_ptr<const TextStore> lentTexts;

    /// The titles of the row set's fields.
    std::vector<Text> fieldNames;

    CellLooks* looks = nullptr; ///< the grid's own, borrowed; null: it is no view
    std::vector<int> gridColumns; ///< which of the grid each printed column is, from 0
    std::int32_t firstLookRow = 1; ///< the row of the looks that the first record shows

    /// The number of printed columns.
    std::int16_t fieldCount() const { return static_cast<std::int16_t>(ColumnWidths.size()); }

    /// Lets go of a row set that belongs to the host.
    void dropBorrowedRows();

    /// Frees the records; widths, bands and names stay.
    void dropRows();

    /// Bytes that copied records hold, their texts aside.
    std::size_t memoryBytes() const;

private:
    friend struct GridTableParts;
    std::unique_ptr<TableRowSet> table_;
    std::unique_ptr<LateBoundRows> lateBound_;
};

/// Reads a grid through its members.
///
/// Columns of 144 twips or less are skipped, except those of a data grid, which are widened to 216
/// twips in the host's grid. A flex grid's column of the default width becomes 2000 twips wide in
/// the host's grid.
/// @throws RunTimeError NoSuchMember: the object is of another kind; SubscriptOutOfRange: kept
///         widths for another number of columns, or a data grid with more columns than fields;
///         Overflow: more than 32767 printed columns, more than `MostGridColumns` in all, or more
///         rows than asked for;
///         Cancelled: by the message loop; or the grid's own error
GridTable readGrid(AutomationObject& grid, const GridRequest& request);

} // namespace pelloric
