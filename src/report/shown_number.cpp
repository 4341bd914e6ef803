// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/shown_number.h"

#include "platform/numbers.h"

#include <algorithm>
#include <array>
#include <string>

namespace pelloric {

namespace {

constexpr std::size_t GroupDigits = 3; ///< of the last group, and of a group at most
constexpr std::size_t LeastGroupDigits = 2; ///< of a group between the first and the last
constexpr int MostDecimals = 15;

constexpr TextView Blanks = u" \t\u00A0\u2009\u202F";
constexpr TextView Signs = u"+-\u2212";
constexpr TextView Groupings = u" \u00A0\u2009\u202F'\u2019"; ///< besides point and comma

bool isDigit(char16_t unit) { return unit >= u'0' && unit <= u'9'; }

bool isOneOf(char16_t unit, TextView units) { return units.find(unit) != TextView::npos; }

bool isCurrency(char16_t unit)
{
    return isOneOf(unit, u"$¢£¤¥￥") || (unit >= 0x20A0 && unit <= 0x20CF);
}

void trimBlanks(TextView& text)
{
    while (!text.empty() && isOneOf(text.front(), Blanks))
        text.remove_prefix(1);
    while (!text.empty() && isOneOf(text.back(), Blanks))
        text.remove_suffix(1);
}

/// Takes what may stand around the digits off a text. @return  whether the number is negative
bool takeSurroundings(TextView& text)
{
    trimBlanks(text);
    bool isNegative = false;
    bool hasSign = false;
    bool hasCurrency = false;
    if (text.size() > 2 && text.front() == u'(' && text.back() == u')') {
        text = text.substr(1, text.size() - 2);
        isNegative = hasSign = true;
        trimBlanks(text);
    }
    while (!text.empty()) {
        const char16_t unit = text.front();
        if (!hasSign && isOneOf(unit, Signs)) {
            hasSign = true;
            isNegative = unit != u'+';
        } else if (!hasCurrency && isCurrency(unit)) {
            hasCurrency = true;
        } else {
            break;
        }
        text.remove_prefix(1);
        trimBlanks(text);
    }
    if (!hasCurrency && !text.empty() && isCurrency(text.back())) {
        text.remove_suffix(1);
        trimBlanks(text);
    }
    return isNegative;
}

/// A text without what may stand around its digits.
struct NumberParts {
    explicit NumberParts(TextView text)
        : isNegative(takeSurroundings(text))
        , digits(text.substr(0, text.find_first_of(u"eE")))
        , hasExponent(digits.size() < text.size())
        , exponent(hasExponent ? text.substr(digits.size() + 1) : TextView())
    {
    }

    bool isNegative;
    TextView digits; ///< with what separates them
    bool hasExponent;
    TextView exponent; ///< with its sign
};

/// How often point and comma occur, and where they do last.
struct Separators {
    explicit Separators(TextView digits)
    {
        for (std::size_t at = 0; at < digits.size(); ++at) {
            for (std::size_t kind = 0; kind < Kinds.size(); ++kind) {
                if (digits[at] == Kinds[kind]) {
                    ++counts[kind];
                    last[kind] = at;
                }
            }
            hasOther = hasOther || isOneOf(digits[at], Groupings);
        }
    }

    static constexpr std::array<char16_t, 2> Kinds { u'.', u',' };
    std::array<std::size_t, 2> counts {};
    std::array<std::size_t, 2> last {};
    bool hasOther = false; ///< something else separates groups
};

/// The decimal separator of what stands between signs; `preferred` where it may be either, 0 where
/// there is none.
char16_t decimalOf(const NumberParts& parts, char16_t preferred)
{
    const TextView digits = parts.digits;
    const Separators found(digits);
    const auto& [points, commas] = found.counts;
    if (points > 0 && commas > 0)
        return found.last[0] > found.last[1] ? u'.' : u',';
    if (points + commas == 0)
        return 0;
    const std::size_t kind = points > 0 ? 0 : 1;
    if (found.counts[kind] > 1)
        return Separators::Kinds[1 - kind];
    const std::size_t before = found.last[kind];
    const bool mayGroup = !parts.hasExponent && !found.hasOther && before >= 1
        && before <= GroupDigits && digits.front() != u'0'
        && digits.size() - before - 1 == GroupDigits;
    return mayGroup ? preferred : Separators::Kinds[kind];
}

/// The digits of a whole part whose groups are as they should be; else nothing.
std::optional<std::string> wholeDigits(TextView whole, char16_t decimal, char16_t& grouping)
{
    std::string digits;
    std::size_t group = 0; ///< digits since the last separator
    for (const char16_t unit : whole) {
        if (isDigit(unit)) {
            digits.push_back(static_cast<char>(unit));
            ++group;
            continue;
        }
        const bool separates
            = isOneOf(unit, Groupings) || ((unit == u'.' || unit == u',') && unit != decimal);
        const std::size_t least = grouping == 0 ? 1 : LeastGroupDigits;
        if (!separates || (grouping != 0 && unit != grouping) || group < least
            || group > GroupDigits)
            return std::nullopt;
        grouping = unit;
        group = 0;
    }
    if (grouping != 0 && group != GroupDigits)
        return std::nullopt;
    return digits;
}

bool isWholeNumber(TextView text)
{
    if (!text.empty() && (text.front() == u'+' || text.front() == u'-'))
        text.remove_prefix(1);
    return !text.empty() && std::all_of(text.begin(), text.end(), isDigit);
}

} // namespace

std::optional<ShownNumber> readShownNumber(TextView text, char16_t decimalSeparator)
{
    const NumberParts parts(text);
    const TextView digits = parts.digits;
    if (digits.empty() || !isDigit(digits.back())
        || (parts.hasExponent && !isWholeNumber(parts.exponent)))
        return std::nullopt;
    const char16_t decimal = decimalOf(parts, decimalSeparator == u',' ? u',' : u'.');
    const std::size_t point = decimal == 0 ? TextView::npos : digits.find(decimal);
    const TextView fraction = point == TextView::npos ? TextView() : digits.substr(point + 1);
    if (!std::all_of(fraction.begin(), fraction.end(), isDigit))
        return std::nullopt;
    ShownNumber number;
    auto plain = wholeDigits(digits.substr(0, point), decimal, number.grouping);
    if (!plain)
        return std::nullopt;
    if (!fraction.empty())
        plain->append(1, '.').append(fraction.begin(), fraction.end());
    if (parts.hasExponent)
        plain->append(1, 'e').append(parts.exponent.begin(), parts.exponent.end());
    const double value = leadingNumber(*plain);
    const double decimals = static_cast<double>(fraction.size()) - leadingNumber(parts.exponent);
    number.value = parts.isNegative ? -value : value;
    number.decimals = static_cast<int>(std::clamp<double>(decimals, 0, MostDecimals));
    return number;
}

std::optional<char16_t> decimalSeparatorOf(TextView text)
{
    const auto withPoint = readShownNumber(text, u'.');
    if (!withPoint || withPoint != readShownNumber(text, u','))
        return std::nullopt;
    const char16_t decimal = decimalOf(NumberParts(text), u'.');
    return decimal == 0 ? std::nullopt : std::optional(decimal);
}

} // namespace pelloric
