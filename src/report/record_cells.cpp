// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/record_texts.h"

#include <algorithm>

namespace pelloric {

RecordTexts::RecordTexts(
    RowSet& rows, std::size_t fieldCount, bool neighbours, char16_t decimalSeparator)
    : rows_(rows)
    , neighbours_(neighbours)
    , decimalSeparator_(decimalSeparator)
{
    for (Record& record : records_) {
        record.texts.resize(fieldCount);
        record.stored.resize(fieldCount);
        record.buffers.resize(fieldCount);
    }
}

void RecordTexts::readCurrent()
{
    const std::int64_t position = rows_.position();
    if (!neighbours_) {
        read(1, position);
        return;
    }
    if (at(2).position == position)
        std::rotate(order_.begin(), order_.begin() + 1, order_.end());
    for (std::size_t place = 0; place < order_.size(); ++place) {
        const std::int64_t wanted = position + static_cast<std::int64_t>(place) - 1;
        if (at(place).position != wanted)
            read(place, wanted);
    }
    rows_.setPosition(position);
}

void RecordTexts::read(std::size_t place, std::int64_t position)
{
    Record& record = records_[order_[place]];
    record.position = position;
    if (!exists(position))
        return;
    if (neighbours_)
        rows_.setPosition(position);
    const bool kept = rows_.keepsTexts();
    for (std::size_t field = 0; field < record.texts.size(); ++field) {
        const Value value = rows_.value(static_cast<int>(field));
        Text& buffer = record.buffers[field];
        const bool stored = kept && value.kind() == ValueKind::Text;
        TextView text = displayText(value, decimalSeparator_, buffer);
        if (!stored && value.kind() == ValueKind::Text)
            text = buffer.assign(text);
        record.texts[field] = trimmed(text);
        record.stored[field] = stored ? 1 : 0;
    }
}

bool RecordTexts::equals(std::size_t place, int field, TextView text) const
{
    const Record& record = at(place);
    return exists(record.position) && record.texts[static_cast<std::size_t>(field)] == text;
}

bool RecordTexts::exists(std::int64_t position) const
{
    return position >= 1 && position <= rows_.recordCount();
}

} // namespace pelloric
