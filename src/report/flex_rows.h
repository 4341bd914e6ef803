// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

#include <memory>
#include <span>

namespace pelloric {

class MessageLoop;
class RowCells;
class TableRowSet;
class TextStore;

/// Keeps windows alive while cells are read.
class Pulse {
public:
    /// @param loop  borrowed; null: there are none
    explicit Pulse(MessageLoop* loop)
        : loop_(loop)
    {
    }

    /// To be called for every cell or column.
    /// @throws RunTimeError Cancelled
    void beat() { beat(1); }

    /// To be called for several of them.
    void beat(std::size_t cells);

private:
    MessageLoop* loop_;
    std::size_t cells_ = 0; ///< since the last time
};

/// Rows of a flex grid that are read.
struct FlexRows {
    AutomationObject& grid;
    int gridColumns = 0; ///< how many the grid has
    std::span<const int> columns; ///< that are read, from 0
    std::int32_t first = 1; ///< 0: the titles
    std::int32_t end = 1; ///< behind the last
};

/// Rows that are read as a whole.
struct WholeRows {
    std::int32_t first = 1;
    std::int32_t end = 1; ///< behind the last
    std::span<const int> columns; ///< of the grid, from 0
};

/// Reads rows into a table. Windows live between rows only, for they may change the grid.
/// @throws RunTimeError as `readFlexRows`
void readWholeRows(RowCells& cells, const WholeRows& rows, TableRowSet& table, Pulse& pulse);

/// Reads rows of a flex grid into a table: one by one through its members, or the faster way that
/// the grid offers, see `KeptCells` and `RowCells`.
///
/// @return  where texts are that were not copied; null: all were
/// @throws RunTimeError of the grid; Overflow: a text is too long; Cancelled
std::shared_ptr<const TextStore> readFlexRows(
    const FlexRows& rows, TableRowSet& table, Pulse& pulse);

} // namespace pelloric
