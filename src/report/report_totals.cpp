// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/report_totals.h"

#include "platform/numbers.h"

#include <algorithm>
#include <cmath>

namespace pelloric {

namespace {

struct FunctionName {
    AggregateFunction function;
    TextView name;
};

constexpr FunctionName Names[] = {
    { AggregateFunction::Sum, u"Sum" },
    { AggregateFunction::Count, u"Count" },
    { AggregateFunction::Mean, u"Mean" },
    { AggregateFunction::Minimum, u"Minimum" },
    { AggregateFunction::Maximum, u"Maximum" },
};

} // namespace

Totals::Totals(std::span<const Aggregation> aggregations, std::span<const int> fields)
{
    for (std::size_t place = 0; place < aggregations.size(); ++place) {
        Column& column = columns_.emplace_back();
        column.function = aggregations[place].function;
        column.field = fields[place];
        if (std::find(functions_.begin(), functions_.end(), column.function) == functions_.end())
            functions_.push_back(column.function);
    }
}

void Totals::clear()
{
    for (Column& column : columns_) {
        const auto kept = column;
        column = {};
        column.function = kept.function;
        column.field = kept.field;
    }
}

void Totals::add(std::size_t place, std::optional<double> number, bool isText)
{
    Column& column = columns_[place];
    if (isText)
        ++column.texts;
    if (!number)
        return;
    const double before = column.sum;
    column.sum += *number;
    column.lost += std::abs(before) >= std::abs(*number) ? (before - column.sum) + *number
                                                         : (*number - column.sum) + before;
    column.least = column.numbers == 0 ? *number : std::min(column.least, *number);
    column.most = column.numbers == 0 ? *number : std::max(column.most, *number);
    ++column.numbers;
}

Text Totals::text(std::size_t row, int field, char16_t decimalSeparator) const
{
    for (const Column& column : columns_) {
        if (column.field != field || column.function != functions_[row])
            continue;
        double number = column.sum + column.lost;
        switch (column.function) {
        case AggregateFunction::Sum:
            break;
        case AggregateFunction::Count:
            return decimal(column.texts);
        case AggregateFunction::Mean:
            number /= static_cast<double>(std::max<std::int64_t>(1, column.numbers));
            break;
        case AggregateFunction::Minimum:
            number = column.least;
            break;
        case AggregateFunction::Maximum:
            number = column.most;
            break;
        }
        const bool isKnown = column.numbers > 0 || column.function == AggregateFunction::Sum;
        return isKnown ? formatNumber(number, decimalSeparator) : Text();
    }
    return {};
}

TextView functionName(AggregateFunction function)
{
    for (const FunctionName& row : Names) {
        if (row.function == function)
            return row.name;
    }
    return {};
}

std::optional<double> shownNumber(TextView text, char16_t decimalSeparator)
{
    Text plain(trimmed(text));
    std::replace(plain.begin(), plain.end(), decimalSeparator, u'.');
    if (plain.empty() || !isNumber(plain))
        return std::nullopt;
    return leadingNumber(plain);
}

} // namespace pelloric
