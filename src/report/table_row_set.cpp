// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/table_row_set.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <algorithm>
#include <bit>
#include <cmath>

namespace pelloric {

namespace {

/// A grid may promise more rows than it has; beyond this room is made as rows come.
constexpr std::size_t MostReservedCells = 1U << 26U;

/// From here on 64 bits are no number that arithmetic yields: three bits of a tag, 48 of content.
constexpr std::uint64_t FirstTagged = 0xFFF8'0000'0000'0000ULL;
constexpr std::uint64_t NoNumber = 0x7FF8'0000'0000'0000ULL;
constexpr unsigned ContentBits = 48;
constexpr std::uint64_t ContentMask = (1ULL << ContentBits) - 1;

enum CellTag : std::uint64_t {
    NullTag,
    TruthTag,
    DateTag,
    LargeDateTag,
    ShortTextTag,
    LargeTextTag,
    LentTextTag
};

/// The content of a date: milliseconds more than this before 1970.
constexpr std::int64_t DateBias = 1LL << (ContentBits - 1);

/// The content of a short text: its place in the store and its length.
constexpr unsigned LengthBits = 12;
constexpr std::uint64_t LongestShortText = (1U << LengthBits) - 1;
constexpr std::uint64_t LastPlace = (1ULL << (ContentBits - LengthBits)) - 1;

constexpr std::uint64_t tagged(std::uint64_t tag, std::uint64_t content)
{
    return FirstTagged | (tag << ContentBits) | content;
}

} // namespace

TableRowSet::TableRowSet(std::shared_ptr<TextStore> store)
    : store_(std::move(store))
{
}

void TableRowSet::appendField(TextView name)
{
    names_.emplace_back(name);
    knownNames_.emplace(name);
}

bool TableRowSet::fieldExists(TextView name) const { return knownNames_.contains(Text(name)); }

void TableRowSet::reserveRecords(std::int64_t records)
{
    if (records <= 0)
        return;
    const std::size_t most = MostReservedCells / std::max<std::size_t>(1, names_.size());
    cells_.reserve(std::min(static_cast<std::size_t>(records), most) * names_.size());
}

void TableRowSet::addRecord()
{
    cells_.resize(cells_.size() + names_.size(), tagged(NullTag, 0));
    ++records_;
}

void TableRowSet::setLast(int field, const Value& value)
{
    if (value.kind() == ValueKind::Text)
        requireCellLength(value.text(), records_, field);
    cells_[cells_.size() - names_.size() + static_cast<std::size_t>(field)] = cellOf(value);
}

TableRowSet::Cell TableRowSet::cellOf(const Value& value)
{
    switch (value.kind()) {
    case ValueKind::Text:
        return cellOfText(value.text());
    case ValueKind::Number:
        return std::isnan(value.number()) ? NoNumber : std::bit_cast<Cell>(value.number());
    case ValueKind::Truth:
        return tagged(TruthTag, value.number() != 0 ? 1 : 0);
    case ValueKind::Date:
        return cellOfDate(value.number());
    case ValueKind::Null:
        return tagged(NullTag, 0);
    case ValueKind::Object:
    case ValueKind::Rows:
        break;
    }
    throw RunTimeError(ErrorNumber::TypeMismatch, phrase(u"a cell holds an object"));
}

/// Dates of four thousand years on either side of 1970 need nothing beside their cell.
TableRowSet::Cell TableRowSet::cellOfDate(double milliseconds)
{
    if (std::abs(milliseconds) >= static_cast<double>(DateBias))
        return largeCell(LargeDateTag, { milliseconds, {} });
    const auto whole = static_cast<std::int64_t>(milliseconds);
    return tagged(DateTag, static_cast<std::uint64_t>(whole + DateBias));
}

TableRowSet::Cell TableRowSet::cellOfText(TextView text)
{
    if (lent_ && text.size() <= LongestShortText) {
        const auto place = lent_->placeOf(text, lentBlock_);
        if (place && *place <= LastPlace)
            return tagged(LentTextTag, (*place << LengthBits) | text.size());
    }
    if (text.size() > LongestShortText)
        return largeCell(LargeTextTag, { 0, store_->add(text) });
    const std::uint64_t place = store_->place(text);
    if (place > LastPlace)
        return largeCell(LargeTextTag, { 0, { store_->at(place), text.size() } });
    return tagged(ShortTextTag, (place << LengthBits) | text.size());
}

TableRowSet::Cell TableRowSet::largeCell(std::uint64_t tag, const LargeValue& value)
{
    large_.push_back(value);
    return tagged(tag, large_.size() - 1);
}

Value TableRowSet::valueOf(Cell cell) const
{
    if (cell < FirstTagged)
        return Value::ofNumber(std::bit_cast<double>(cell));
    const std::uint64_t content = cell & ContentMask;
    switch ((cell - FirstTagged) >> ContentBits) {
    case ShortTextTag:
        return Value::ofText({ store_->at(content >> LengthBits), content & LongestShortText });
    case LentTextTag:
        return Value::ofText({ lent_->at(content >> LengthBits), content & LongestShortText });
    case LargeTextTag:
        return Value::ofText(large_[content].text);
    case TruthTag:
        return Value::ofTruth(content != 0);
    case DateTag:
        return Value::ofDate(static_cast<std::int64_t>(content) - DateBias);
    case LargeDateTag:
        return Value::ofDate(static_cast<std::int64_t>(large_[content].number));
    default:
        return {};
    }
}

std::size_t TableRowSet::memoryBytes() const
{
    return cells_.capacity() * sizeof(Cell) + large_.capacity() * sizeof(LargeValue);
}

TextView TableRowSet::fieldName(int field) const
{
    if (field < 0 || field >= fieldCount())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"field"), std::int64_t { field } + 1, fieldCount()));
    return names_[static_cast<std::size_t>(field)];
}

void TableRowSet::setPosition(std::int64_t position)
{
    position_ = std::clamp<std::int64_t>(position, 0, records_ + 1);
}

Value TableRowSet::value(int field)
{
    if (field < 0 || field >= fieldCount())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"field"), std::int64_t { field } + 1, fieldCount()));
    requireRecord();
    const auto record = static_cast<std::size_t>(position_ - 1);
    return valueOf(cells_[record * names_.size() + static_cast<std::size_t>(field)]);
}

void TableRowSet::requireRecord() const
{
    if (isBeforeFirst() || isAfterLast())
        throw RunTimeError(
            ErrorNumber::SubscriptOutOfRange, noSuchItem(phrase(u"row"), position_, records_));
}

void TableRowSet::values(int first, std::span<Value> into)
{
    const auto end = static_cast<std::size_t>(first) + into.size();
    if (first < 0 || end > names_.size())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"fields %1 to", { decimal(std::int64_t { first } + 1) }),
                static_cast<std::int64_t>(end), fieldCount()));
    requireRecord();
    const auto record = static_cast<std::size_t>(position_ - 1);
    const Cell* cell = cells_.data() + record * names_.size() + first;
    for (Value& value : into)
        value = valueOf(*cell++);
}

} // namespace pelloric
