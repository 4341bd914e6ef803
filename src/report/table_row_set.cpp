// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/table_row_set.h"

#include "platform/run_time_error.h"

#include <algorithm>

namespace pelloric {

namespace {

/// A grid may promise more rows than it has; beyond this room is made as rows come.
constexpr std::size_t MostReservedCells = 1U << 26U;

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
    cells_.resize(cells_.size() + names_.size());
    ++records_;
}

void TableRowSet::setLast(int field, const Value& value)
{
    Cell& cell = cells_[cells_.size() - names_.size() + static_cast<std::size_t>(field)];
    switch (value.kind()) {
    case ValueKind::Text: {
        if (value.text().size() > 0xFFFFFFFFU)
            throw RunTimeError(ErrorNumber::Overflow);
        const TextView kept = store_->add(value.text());
        cell.units = kept.data();
        cell.length = static_cast<std::uint32_t>(kept.size());
        break;
    }
    case ValueKind::Truth:
    case ValueKind::Number:
    case ValueKind::Date:
        cell.number = value.number();
        break;
    case ValueKind::Null:
        break;
    case ValueKind::Object:
    case ValueKind::Rows:
        throw RunTimeError(ErrorNumber::TypeMismatch, u"a cell holds an object");
    }
    cell.kind = value.kind();
}

TextView TableRowSet::fieldName(int field) const
{
    if (field < 0 || field >= fieldCount())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
    return names_[static_cast<std::size_t>(field)];
}

void TableRowSet::setPosition(std::int64_t position)
{
    position_ = std::clamp<std::int64_t>(position, 0, records_ + 1);
}

Value TableRowSet::value(int field)
{
    if (field < 0 || field >= fieldCount() || isBeforeFirst() || isAfterLast())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
    const auto record = static_cast<std::size_t>(position_ - 1);
    const Cell& cell = cells_[record * names_.size() + static_cast<std::size_t>(field)];
    switch (cell.kind) {
    case ValueKind::Text:
        return Value::ofText(TextView(cell.units, cell.length));
    case ValueKind::Truth:
        return Value::ofTruth(cell.number != 0);
    case ValueKind::Number:
        return Value::ofNumber(cell.number);
    case ValueKind::Date:
        return Value::ofDate(static_cast<std::int64_t>(cell.number));
    case ValueKind::Null:
    case ValueKind::Object:
    case ValueKind::Rows:
        break;
    }
    return {};
}

} // namespace pelloric
