// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/number_look.h"

#include "platform/numbers.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <string>

namespace pelloric {

namespace {

constexpr int MostDecimals = 15;

/// The first part of a format in small letters, without literal texts and what stands in brackets;
/// elapsed hours, minutes and seconds, which also stand in brackets, stay.
std::string marksOf(std::string_view format)
{
    std::string marks;
    for (std::size_t at = 0; at < format.size() && format[at] != ';'; ++at) {
        const char mark = format[at];
        if (mark == '\\' || mark == '_' || mark == '*') {
            ++at;
        } else if (mark == '"' || mark == '[') {
            const std::size_t end
                = std::min(format.find(mark == '"' ? '"' : ']', at + 1), format.size());
            const std::string_view inner = format.substr(at + 1, end - at - 1);
            if (mark == '[' && !inner.empty()
                && inner.find_first_not_of("hmsHMS") == std::string_view::npos)
                marks += inner;
            at = end;
        } else {
            marks += mark;
        }
    }
    std::ranges::transform(marks, marks.begin(),
        [](char mark) { return mark >= 'A' && mark <= 'Z' ? static_cast<char>(mark + 32) : mark; });
    return marks;
}

Text fixed(double value, int decimals)
{
    char digits[400];
    const auto end
        = std::to_chars(digits, digits + sizeof digits, value, std::chars_format::fixed, decimals);
    return end.ec == std::errc() ? Text(digits, end.ptr) : formatNumber(value);
}

} // namespace

NumberLook numberLook(std::string_view format)
{
    const std::string marks = marksOf(format);
    NumberLook look;
    if (marks.find("general") != std::string::npos || marks.find('@') != std::string::npos)
        return look;
    look.hasTime = marks.find_first_of("hs") != std::string::npos;
    look.isDate = look.hasTime || marks.find_first_of("yd") != std::string::npos;
    if (look.isDate)
        return look;
    look.isPercent = marks.find('%') != std::string::npos;
    const std::size_t point = marks.find('.');
    const bool isNumber = marks.find_first_of("0#") != std::string::npos;
    if (!isNumber || marks.find_first_of("e/?") != std::string::npos)
        return look;
    const std::string behind = point == std::string::npos ? std::string() : marks.substr(point);
    const auto zeros = std::ranges::count(behind, '0');
    const bool isOpen = behind.find('#') != std::string::npos;
    look.decimals = isOpen ? -1 : static_cast<int>(std::min<std::ptrdiff_t>(zeros, MostDecimals));
    return look;
}

Text shownNumber(double value, const NumberLook& look)
{
    constexpr double Hundred = 100;
    const double shown = look.isPercent ? value * Hundred : value;
    Text text = look.decimals >= 0 && std::isfinite(shown) ? fixed(shown, look.decimals)
                                                           : formatNumber(shown);
    return look.isPercent ? text + u"%" : text;
}

} // namespace pelloric
