// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/page_list.h"

#include "document/limits.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

namespace pelloric {

namespace {

constexpr std::size_t LongestList = std::size_t { 1 } << 24U; ///< code units

TextView firstItem(TextView piece) { return piece.substr(0, piece.find(u',')); }

TextView lastItem(TextView piece)
{
    const std::size_t comma = piece.rfind(u',');
    return comma == TextView::npos ? piece : piece.substr(comma + 1);
}

double endOf(TextView item) { return roundHalfEven(leadingNumber(item)); }

/// Appends the numbers strictly between two ends, each with a comma in front.
void appendBetween(double first, double last, Text& list)
{
    for (double page = first + 1; page < last && page <= MostPages; ++page) {
        list.push_back(u',');
        list += decimal(roundToInt32(page));
    }
    if (list.size() > LongestList)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"the page list names too many pages; write fewer ranges"));
}

/// Appends a piece behind the piece at its left, and the run between the two.
void appendJoined(TextView left, TextView piece, Text& list)
{
    const TextView leftItem = lastItem(left);
    const TextView rightItem = firstItem(piece);
    const double first = endOf(leftItem);
    const double last = endOf(rightItem);
    appendBetween(first, last, list);
    if (first == last && isNumber(leftItem) && isNumber(rightItem)) {
        list += piece.substr(rightItem.size());
        return;
    }
    list.push_back(u',');
    list += piece;
}

} // namespace

Text pageListOf(TextView rangeText)
{
    std::size_t dash = rangeText.find(u'-');
    TextView left = rangeText.substr(0, dash);
    Text list(left);
    while (dash != TextView::npos) {
        rangeText.remove_prefix(dash + 1);
        dash = rangeText.find(u'-');
        const TextView piece = rangeText.substr(0, dash);
        appendJoined(left, piece, list);
        left = piece;
    }
    return list;
}

std::vector<std::int16_t> pageNumbersOf(TextView list)
{
    std::vector<std::int16_t> numbers;
    for (bool atEnd = false; !atEnd;) {
        const TextView item = firstItem(list);
        atEnd = item.size() == list.size();
        list.remove_prefix(atEnd ? item.size() : item.size() + 1);
        if (!isNumber(item))
            continue;
        const double number = endOf(item);
        if (number >= -MostPages - 1 && number <= MostPages)
            numbers.push_back(roundToInt16(number));
    }
    return numbers;
}

std::int16_t copiesOf(TextView text)
{
    return text.empty() ? std::int16_t { 1 } : roundToInt16(leadingNumber(text));
}

} // namespace pelloric
