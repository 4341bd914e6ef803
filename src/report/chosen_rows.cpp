// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/chosen_rows.h"

#include "platform/cell_look.h"
#include "platform/name_list.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <algorithm>
#include <numeric>

namespace pelloric {

namespace {

/// Reads the texts of records for a filter.
class FilteredRows {
public:
    FilteredRows(RowSet& rows, const RowFilter& filter, char16_t decimalSeparator)
        : rows_(rows)
        , filter_(filter)
        , decimalSeparator_(decimalSeparator)
        , texts_(static_cast<std::size_t>(rows.fieldCount()))
        , buffers_(texts_.size())
    {
    }

    bool isWanted(std::int64_t record)
    {
        rows_.setPosition(record);
        for (std::size_t field = 0; field < texts_.size(); ++field) {
            const Value value = rows_.value(static_cast<int>(field));
            Text& buffer = buffers_[field];
            const TextView text = displayText(value, decimalSeparator_, buffer);
            const bool isLent = value.kind() == ValueKind::Text && !rows_.keepsTexts();
            texts_[field] = isLent ? TextView(buffer.assign(text)) : text;
        }
        return filter_(record, texts_);
    }

private:
    RowSet& rows_;
    const RowFilter& filter_;
    char16_t decimalSeparator_;
    std::vector<TextView> texts_;
    std::vector<Text> buffers_;
};

[[noreturn]] void refuseColumn(TextView name, std::span<const Text> titles)
{
    constexpr std::size_t MostNames = 12;
    Text names = listOf(titles.first(std::min(titles.size(), MostNames)));
    if (titles.size() > MostNames)
        names.append(u" …");
    throw RunTimeError(ErrorNumber::InvalidCall,
        phrase(u"the grid prints no column \"%1\"; there are: %2", { name, names }));
}

} // namespace

ChosenRows::ChosenRows(RowSet& rows, std::vector<int> fields, std::vector<std::int64_t> records)
    : rows_(rows)
    , fields_(std::move(fields))
    , records_(std::move(records))
{
}

TextView ChosenRows::fieldName(int field) const { return rows_.fieldName(fieldOf(field)); }

void ChosenRows::setPosition(std::int64_t position)
{
    position_ = std::clamp<std::int64_t>(position, 0, recordCount() + 1);
    if (!isBeforeFirst() && !isAfterLast())
        rows_.setPosition(records_[static_cast<std::size_t>(position_ - 1)]);
}

Value ChosenRows::value(int field)
{
    if (isBeforeFirst() || isAfterLast())
        throw RunTimeError(
            ErrorNumber::SubscriptOutOfRange, noSuchItem(phrase(u"row"), position_, recordCount()));
    return rows_.value(fieldOf(field));
}

int ChosenRows::fieldOf(int field) const
{
    if (field < 0 || field >= fieldCount())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"field"), std::int64_t { field } + 1, fieldCount()));
    return fields_[static_cast<std::size_t>(field)];
}

std::vector<int> fieldsNamed(std::span<const Text> titles, std::span<const Text> names)
{
    std::vector<int> fields;
    for (const Text& name : names) {
        const auto found = std::find(titles.begin(), titles.end(), name);
        if (found == titles.end())
            refuseColumn(name, titles);
        const auto field = static_cast<int>(found - titles.begin());
        if (std::find(fields.begin(), fields.end(), field) == fields.end())
            fields.push_back(field);
    }
    return fields;
}

std::vector<int> keyFieldsOf(const ReportOptions& options, std::span<const Text> titles)
{
    if (!options.keyColumnNames.empty())
        return fieldsNamed(titles, options.keyColumnNames);
    const auto count = std::clamp<std::ptrdiff_t>(options.keyColumns, 0, std::ssize(titles));
    std::vector<int> fields(static_cast<std::size_t>(count));
    std::iota(fields.begin(), fields.end(), 0);
    return fields;
}

std::vector<std::int64_t> chosenRecords(RowSet& rows, const ReportOptions& options,
    CellLooks* looks, std::int32_t firstRow, char16_t decimalSeparator)
{
    std::int64_t first = 1;
    std::int64_t last = rows.recordCount();
    if (options.rows == RowChoice::Range) {
        first = std::max(first, options.firstRow);
        last = std::min(last, options.lastRow);
    }
    const bool isMarked = options.rows == RowChoice::Marked;
    if (isMarked && looks == nullptr)
        throw RunTimeError(ErrorNumber::InvalidCall,
            phrase(u"this grid does not tell which of its rows are marked"));
    FilteredRows filtered(rows, options.filter, decimalSeparator);
    std::vector<std::int64_t> records;
    for (std::int64_t record = first; record <= last; ++record) {
        if (isMarked && !looks->isMarked(static_cast<std::int32_t>(firstRow + record - 1)))
            continue;
        if (!options.filter || filtered.isWanted(record))
            records.push_back(record);
    }
    if (isMarked && records.empty() && !options.filter)
        throw RunTimeError(ErrorNumber::InvalidCall,
            phrase(u"no row of the grid is marked; mark rows, or print all"));
    return records;
}

} // namespace pelloric
