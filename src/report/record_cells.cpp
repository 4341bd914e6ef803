// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/record_cells.h"

#include "document/text_store.h"
#include "platform/run_time_error.h"

#include <algorithm>
#include <utility>

namespace pelloric {

namespace {

/// The record that is printed and those beside it never share a slot; a power of two.
constexpr std::size_t FewestSlots = 4;

} // namespace

RecordCells::RecordCells(RowSet& rows, std::size_t fieldCount, bool keepsPages,
    char16_t decimalSeparator, TextStore& store, std::size_t mostCells)
    : rows_(rows)
    , store_(store)
    , fieldCount_(fieldCount)
    , mostCells_(mostCells)
    , count_(rows.recordCount())
    , keepsPages_(keepsPages)
    , keepsTexts_(rows.keepsTexts())
    , decimalSeparator_(decimalSeparator)
    , held_(FewestSlots)
    , cells_(FewestSlots * fieldCount)
{
}

std::span<RecordCell> RecordCells::read(std::int64_t position, std::size_t first, std::size_t count)
{
    const std::span<RecordCell> cells(cellsOf(position) + first, count);
    const auto isRead = [](const RecordCell& cell) { return cell.isRead; };
    if (std::all_of(cells.begin(), cells.end(), isRead))
        return cells;
    if (rows_.position() != position)
        rows_.setPosition(position);
    if (keepsTexts_ && !cells.front().isRead) {
        readKept(cells, position, static_cast<int>(first));
        return cells;
    }
    int field = static_cast<int>(first);
    for (RecordCell& cell : cells) {
        if (!cell.isRead)
            take(rows_.value(field), position, field, cell);
        ++field;
    }
    return cells;
}

/// Reads in one call what most records are read of.
void RecordCells::readKept(std::span<RecordCell> cells, std::int64_t position, int first)
{
    values_.resize(cells.size());
    rows_.values(first, values_);
    const Value* value = values_.data();
    for (RecordCell& cell : cells) {
        if (!cell.isRead)
            take(*value, position, first, cell);
        ++value;
        ++first;
    }
}

bool RecordCells::holds(std::int64_t position, int field, TextView text)
{
    return exists(position)
        && read(position, static_cast<std::size_t>(field), 1).front().text() == text;
}

std::size_t RecordCells::slotOf(std::int64_t position) const
{
    return static_cast<std::size_t>(position) & (held_.size() - 1);
}

/// A record that is still wanted gives way only where no more may be kept.
RecordCell* RecordCells::cellsOf(std::int64_t position)
{
    std::size_t slot = slotOf(position);
    while (held_[slot] != position && keepsPages_ && held_[slot] > 0 && held_[slot] >= keepFrom_
        && grow())
        slot = slotOf(position);
    RecordCell* const cells = cells_.data() + slot * fieldCount_;
    if (held_[slot] != position) {
        held_[slot] = position;
        std::fill_n(cells, fieldCount_, RecordCell {});
    }
    return cells;
}

bool RecordCells::grow()
{
    const std::size_t slots = held_.size() * 2;
    if (slots * fieldCount_ > mostCells_)
        return false;
    const std::vector<std::int64_t> held = std::exchange(held_, std::vector<std::int64_t>(slots));
    std::vector<RecordCell> cells(slots * fieldCount_);
    for (std::size_t slot = 0; slot < held.size(); ++slot) {
        if (held[slot] == 0)
            continue;
        const auto from = cells_.begin() + static_cast<std::ptrdiff_t>(slot * fieldCount_);
        const std::size_t place = slotOf(held[slot]);
        held_[place] = held[slot];
        std::copy_n(
            from, fieldCount_, cells.begin() + static_cast<std::ptrdiff_t>(place * fieldCount_));
    }
    cells_ = std::move(cells);
    return true;
}

void RecordCells::take(const Value& value, std::int64_t position, int field, RecordCell& cell)
{
    const bool isKept = keepsTexts_ && value.kind() == ValueKind::Text;
    TextView text = isKept ? value.text() : displayText(value, decimalSeparator_, buffer_);
    if (!text.empty() && (text.front() == u' ' || text.back() == u' '))
        text = trimmed(text);
    if (text.size() > MostCellUnits)
        requireCellLength(text, position, field);
    if (!isKept)
        text = store_.add(text);
    cell.units = text.data();
    cell.length = static_cast<std::uint32_t>(text.size());
    cell.isRead = true;
}

} // namespace pelloric
