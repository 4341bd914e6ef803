// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/report_totals.h"

#include "platform/numbers.h"
#include "platform/phrase.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace pelloric {

namespace {

/// A word of totals and its English wording.
struct Word {
    Text TotalWords::*word;
    TextView english;
};

constexpr int MeanDecimals = 2; ///< that a mean may have more than its cells
constexpr std::size_t GroupDigits = 3;

/// Those of the functions in their order, then that of the whole report.
constexpr auto Words = std::to_array<Word>({
    { &TotalWords::sum, phraseText(u"Sum") },
    { &TotalWords::count, phraseText(u"Count") },
    { &TotalWords::mean, phraseText(u"Mean") },
    { &TotalWords::minimum, phraseText(u"Minimum") },
    { &TotalWords::maximum, phraseText(u"Maximum") },
    { &TotalWords::total, phraseText(u"Total") },
});
static_assert(Words.size() == static_cast<std::size_t>(AggregateFunction::Maximum) + 2);

} // namespace

Totals::Totals(std::span<const Aggregation> aggregations, std::span<const int> fields,
    std::span<const char16_t> separators)
{
    for (std::size_t place = 0; place < aggregations.size(); ++place) {
        Column& column = columns_.emplace_back();
        column.function = aggregations[place].function;
        column.field = fields[place];
        column.separator = separators[place];
        if (std::find(functions_.begin(), functions_.end(), column.function) == functions_.end())
            functions_.push_back(column.function);
    }
}

void Totals::clear()
{
    for (Column& column : columns_) {
        const Column kept = column;
        column = {};
        column.function = kept.function;
        column.field = kept.field;
        column.separator = kept.separator;
    }
}

void Totals::add(std::size_t place, std::optional<ShownNumber> number, bool isText)
{
    Column& column = columns_[place];
    if (isText || number)
        ++column.texts;
    if (!number)
        return;
    const double value = number->value;
    const double before = column.sum;
    column.sum += value;
    column.lost += std::abs(before) >= std::abs(value) ? (before - column.sum) + value
                                                       : (value - column.sum) + before;
    column.least = column.numbers == 0 ? value : std::min(column.least, value);
    column.most = column.numbers == 0 ? value : std::max(column.most, value);
    column.decimals = std::max(column.decimals, number->decimals);
    if (column.grouping == 0)
        column.grouping = number->grouping;
    ++column.numbers;
}

Text Totals::text(std::size_t row, int field) const
{
    for (const Column& column : columns_) {
        if (column.field != field || column.function != functions_[row])
            continue;
        if (column.function == AggregateFunction::Count)
            return decimal(column.texts);
        if (column.numbers == 0)
            return {};
        switch (column.function) {
        case AggregateFunction::Sum:
        case AggregateFunction::Count:
            return shown(column, column.sum + column.lost, column.decimals);
        case AggregateFunction::Mean:
            return meanOf(column);
        case AggregateFunction::Minimum:
            return shown(column, column.least, column.decimals);
        case AggregateFunction::Maximum:
            return shown(column, column.most, column.decimals);
        }
    }
    return {};
}

std::int64_t Totals::leftOut(std::size_t place) const
{
    const Column& column = columns_[place];
    return column.function == AggregateFunction::Count ? 0 : column.texts - column.numbers;
}

/// Without the zeros at the end of the decimals that the cells have not.
Text Totals::meanOf(const Column& column)
{
    const double mean = (column.sum + column.lost) / static_cast<double>(column.numbers);
    Text text = shown(column, mean, column.decimals + MeanDecimals);
    const std::size_t point = text.find(column.separator);
    if (point == Text::npos || text.find(u'E') != Text::npos)
        return text;
    const std::size_t least = point + 1 + static_cast<std::size_t>(column.decimals);
    while (text.size() > least && text.back() == u'0')
        text.pop_back();
    if (text.size() == point + 1)
        text.pop_back();
    return text;
}

Text Totals::shown(const Column& column, double number, int decimals)
{
    Text text = formatFixed(number, decimals, column.separator);
    if (column.grouping == 0 || text.find(u'E') != Text::npos)
        return text;
    const std::size_t first = text.front() == u'-' ? 1 : 0;
    for (std::size_t at = std::min(text.find(column.separator), text.size());
         at > first + GroupDigits;) {
        at -= GroupDigits;
        text.insert(at, 1, column.grouping);
    }
    return text;
}

TotalWords englishTotalWords()
{
    TotalWords words;
    for (const Word& row : Words)
        words.*row.word = row.english;
    return words;
}

TotalWords completed(const TotalWords& given)
{
    TotalWords words = given;
    for (const Word& row : Words) {
        if ((words.*row.word).empty())
            words.*row.word = phrase(row.english);
    }
    return words;
}

const Text& wordOf(const TotalWords& words, AggregateFunction function)
{
    return words.*Words[static_cast<std::size_t>(function)].word;
}

} // namespace pelloric
