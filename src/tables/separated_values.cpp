// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/separated_values.h"

#include <algorithm>
#include <array>

namespace pelloric {

namespace {

/// In the order in which equals are settled.
constexpr auto Delimiters = std::to_array({ ',', '\t', ';', '|' });

constexpr int SampledRows = 200;

bool isBlank(char byte) { return byte == ' ' || byte == '\t'; }

std::string_view withoutBlanks(std::string_view text)
{
    while (!text.empty() && isBlank(text.front()))
        text.remove_prefix(1);
    while (!text.empty() && isBlank(text.back()))
        text.remove_suffix(1);
    return text;
}

/// How well a delimiter suits the first rows.
struct Fit {
    double part = 0; ///< of the rows that look as the titles do
    std::size_t values = 1; ///< in the row of titles
};

Fit fitOf(std::string_view start, char delimiter)
{
    SeparatedValues values(start, { .delimiter = delimiter });
    if (!values.nextRow() || values.valueCount() < 2)
        return {};
    Fit fit { .values = values.valueCount() };
    int rows = 1;
    int alike = values.hasStrayQuote() ? 0 : 1;
    // The last row may be cut off: it counts only where it is the only one.
    while (rows < SampledRows && values.nextRow() && values.position() < start.size()) {
        ++rows;
        alike += values.valueCount() == fit.values && !values.hasStrayQuote() ? 1 : 0;
    }
    fit.part = static_cast<double>(alike) / rows;
    return fit;
}

} // namespace

SeparatedValues::SeparatedValues(std::string_view text, ValuesDialect dialect)
    : text_(text)
    , dialect_(dialect)
{
    for (const char end : { '\n', '\r', dialect.delimiter })
        kinds_[static_cast<unsigned char>(end)] |= EndsValue;
    kinds_[static_cast<unsigned char>('"')] |= IsQuote;
}

bool SeparatedValues::nextRow()
{
    valueCount_ = 0;
    scratch_.clear();
    hasLineBreak_ = false;
    hasStrayQuote_ = false;
    skipLineEnds();
    rowLine_ = line_;
    if (position_ == text_.size())
        return false;
    readRow();
    return true;
}

/// Goes behind all line ends that follow.
void SeparatedValues::skipLineEnds()
{
    while (position_ < text_.size() && isLineEnd(position_)) {
        const bool isPair = text_[position_] == '\r' && position_ + 1 < text_.size()
            && text_[position_ + 1] == '\n';
        position_ += isPair ? 2 : 1;
        ++line_;
    }
}

void SeparatedValues::readRow()
{
    while (true) {
        std::size_t begin = position_;
        while (begin < text_.size() && isBlank(text_[begin]) && text_[begin] != dialect_.delimiter)
            ++begin;
        const bool mayBeQuoted = dialect_.hasQuotes && begin < text_.size() && text_[begin] == '"';
        if (!mayBeQuoted || !readQuoted(begin))
            readPlain();
        if (position_ == text_.size() || text_[position_] != dialect_.delimiter)
            return;
        ++position_;
    }
}

/// Reads a quoted value. @return  false: it is none; nothing has been read
bool SeparatedValues::readQuoted(std::size_t quote)
{
    const std::size_t begin = quote + 1;
    std::size_t end = begin;
    bool hasDoubled = false;
    while (true) {
        end = text_.find('"', end);
        if (end == std::string_view::npos)
            return false;
        if (end + 1 == text_.size() || text_[end + 1] != '"')
            break;
        hasDoubled = true;
        end += 2;
    }
    if (!endsValue(end + 1))
        return false;
    const std::string_view inner = text_.substr(begin, end - begin);
    for (std::size_t at = begin; at < end; ++at) {
        if (!isLineEnd(at))
            continue;
        hasLineBreak_ = true;
        line_ += text_[at] == '\n' || text_[at + 1] != '\n' ? 1 : 0;
    }
    if (hasDoubled)
        addUnquoted(inner);
    else
        add({ begin, inner.size(), false });
    position_ = end + 1;
    return true;
}

void SeparatedValues::readPlain()
{
    const std::size_t begin = position_;
    std::size_t end = begin;
    unsigned seen = Plain;
    for (; end < text_.size(); ++end) {
        const unsigned kind = kindAt(end);
        if ((kind & EndsValue) != 0)
            break;
        seen |= kind;
    }
    position_ = end;
    const std::string_view value = withoutBlanks(text_.substr(begin, end - begin));
    const std::size_t offset
        = value.empty() ? begin : static_cast<std::size_t>(value.data() - text_.data());
    add({ offset, value.size(), false });
    hasStrayQuote_ = hasStrayQuote_ || (seen & IsQuote) != 0;
}

/// Adds a value with its doubled quotes made single.
void SeparatedValues::addUnquoted(std::string_view inner)
{
    const std::size_t begin = scratch_.size();
    for (std::size_t at = 0; at < inner.size(); ++at) {
        scratch_ += inner[at];
        at += inner[at] == '"' ? 1 : 0;
    }
    add({ begin, scratch_.size() - begin, true });
}

char findDelimiter(std::string_view start)
{
    char found = Delimiters.front();
    Fit best;
    for (const char delimiter : Delimiters) {
        const Fit fit = fitOf(start, delimiter);
        if (fit.part > best.part || (fit.part == best.part && fit.values > best.values)) {
            best = fit;
            found = delimiter;
        }
    }
    return found;
}

DelimiterLine delimiterLineOf(std::string_view text)
{
    constexpr std::string_view Key = "sep=";
    const std::string_view line = text.substr(0, text.find_first_of("\r\n"));
    const bool isQuoted = line.size() > 2 && line.front() == '"' && line.back() == '"';
    const std::string_view named = isQuoted ? line.substr(1, line.size() - 2) : line;
    const auto isSame = [](char letter, char key) { return (letter | 0x20) == (key | 0x20); };
    if (named.size() != Key.size() + 1
        || !std::equal(Key.begin(), Key.end(), named.begin(), isSame))
        return {};
    const char delimiter = named.back();
    const bool isUsable = static_cast<unsigned char>(delimiter) < 0x80 && delimiter != '"';
    return isUsable ? DelimiterLine { delimiter, line.size() } : DelimiterLine {};
}

} // namespace pelloric
