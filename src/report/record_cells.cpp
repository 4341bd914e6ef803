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
    int field = static_cast<int>(first);
    for (RecordCell& cell : cells) {
        if (!cell.isRead) {
            if (rows_.position() != position)
                rows_.setPosition(position);
            readCell(cell, field);
        }
        ++field;
    }
    return cells;
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

void RecordCells::readCell(RecordCell& cell, int field)
{
    const Value value = rows_.value(field);
    const bool isKept = keepsTexts_ && value.kind() == ValueKind::Text;
    TextView text = trimmed(displayText(value, decimalSeparator_, buffer_));
    if (!isKept)
        text = store_.add(text);
    if (text.size() > 0xFFFFFFFFU)
        throw RunTimeError(ErrorNumber::Overflow);
    cell.units = text.data();
    cell.length = static_cast<std::uint32_t>(text.size());
    cell.isRead = true;
}

} // namespace pelloric
