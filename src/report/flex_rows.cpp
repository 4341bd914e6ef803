// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/flex_rows.h"

#include "document/kept_cells.h"
#include "platform/row_cells.h"
#include "platform/services.h"
#include "report/table_row_set.h"

#include <algorithm>
#include <vector>

namespace pelloric {

namespace {

void readByMembers(const FlexRows& rows, TableRowSet& table, Pulse& pulse)
{
    const MemberId textMatrix = memberOf(rows.grid, u"TextMatrix");
    for (std::int32_t row = rows.first; row < rows.end; ++row) {
        table.addRecord();
        int field = 0;
        for (const int column : rows.columns) {
            const Value indexes[] = { Value::ofNumber(row), Value::ofNumber(column) };
            table.setLast(field++, rows.grid.get(textMatrix, indexes));
            pulse.beat();
        }
    }
}

void readKept(const KeptCells& cells, const FlexRows& rows, TableRowSet& table, Pulse& pulse)
{
    std::vector<TextView> texts(static_cast<std::size_t>(rows.gridColumns));
    for (std::int32_t row = rows.first; row < rows.end; ++row) {
        cells.rowTexts(row, texts);
        table.addRecord();
        int field = 0;
        for (const int column : rows.columns)
            table.setLast(field++, Value::ofText(texts[static_cast<std::size_t>(column)]));
        pulse.beat(rows.columns.size());
    }
}

} // namespace

void Pulse::beat(std::size_t cells)
{
    constexpr std::size_t CellsBetween = 64;
    cells_ += cells;
    if (loop_ == nullptr || cells_ < CellsBetween)
        return;
    cells_ = 0;
    loop_->keepAlive();
}

void readWholeRows(RowCells& cells, const WholeRows& rows, TableRowSet& table, Pulse& pulse)
{
    for (std::int32_t row = rows.first; row < rows.end; ++row) {
        table.addRecord();
        int field = 0;
        cells.readRow(
            row, rows.columns, [&](TextView text) { table.setLast(field++, Value::ofText(text)); });
        pulse.beat(rows.columns.size());
    }
}

std::shared_ptr<const TextStore> readFlexRows(
    const FlexRows& rows, TableRowSet& table, Pulse& pulse)
{
    const auto* const kept = dynamic_cast<const KeptCells*>(&rows.grid);
    auto* const whole = dynamic_cast<RowCells*>(&rows.grid);
    if (kept == nullptr && whole == nullptr) {
        readByMembers(rows, table, pulse);
        return nullptr;
    }
    FlexRows titles = rows;
    titles.end = std::min(rows.end, std::max(1, rows.first));
    readByMembers(titles, table, pulse);
    FlexRows below = rows;
    below.first = std::max(1, rows.first);
    if (kept == nullptr) {
        readWholeRows(*whole, { below.first, below.end, below.columns }, table, pulse);
        return nullptr;
    }
    std::shared_ptr<const TextStore> texts = kept->keptTexts();
    table.borrow(texts);
    readKept(*kept, below, table, pulse);
    return texts;
}

} // namespace pelloric
