// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/numbers.h"

#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>
#include <string>

namespace pelloric {

namespace {

bool isDigit(char byte) { return byte >= '0' && byte <= '9'; }

/// The text up to its first character that is not ASCII, for no number holds one.
std::string asciiPrefix(TextView text)
{
    std::string prefix;
    for (const char16_t unit : text) {
        if (unit > 0x7F)
            break;
        prefix.push_back(static_cast<char>(unit));
    }
    return prefix;
}

/// What of a text is a number.
struct NumberSpan {
    std::string digits; ///< as the standard library's parser takes it; empty when there is none
    std::size_t end = 0; ///< index behind the number in the text
};

std::size_t copyDigits(std::string_view text, std::size_t at, std::string& digits)
{
    while (at < text.size() && isDigit(text[at]))
        digits.push_back(text[at++]);
    return at;
}

/// Takes an exponent only when at least one digit follows the letter and the sign.
std::size_t copyExponent(std::string_view text, std::size_t at, std::string& digits)
{
    if (at >= text.size() || (text[at] != 'e' && text[at] != 'E'))
        return at;
    std::string exponent = "e";
    std::size_t next = at + 1;
    if (next < text.size() && (text[next] == '+' || text[next] == '-'))
        exponent.push_back(text[next++]);
    const std::size_t end = copyDigits(text, next, exponent);
    if (end == next)
        return at;
    if (exponent[1] == '+')
        exponent.erase(1, 1);
    digits.append(exponent);
    return end;
}

NumberSpan scanNumber(std::string_view text)
{
    NumberSpan span;
    std::size_t at = 0;
    while (at < text.size() && text[at] == ' ')
        ++at;
    if (at < text.size() && (text[at] == '+' || text[at] == '-')) {
        if (text[at] == '-')
            span.digits.push_back('-');
        ++at;
    }
    const std::size_t start = at;
    at = copyDigits(text, at, span.digits);
    std::size_t count = at - start;
    if (at < text.size() && text[at] == '.') {
        span.digits.append(count == 0 ? "0." : ".");
        const std::size_t fraction = at + 1;
        at = copyDigits(text, fraction, span.digits);
        count += at - fraction;
    }
    if (count == 0)
        return {};
    if (span.digits.back() == '.')
        span.digits.push_back('0');
    span.end = copyExponent(text, at, span.digits);
    return span;
}

/// The exponent behind the mark, held within what can be added to a place in a text.
std::int64_t exponentOf(std::string_view digits, std::size_t mark)
{
    constexpr std::int64_t largest = std::int64_t { 1 } << 60;
    if (mark == digits.size())
        return 0;
    std::int64_t exponent = 0;
    const char* end = digits.data() + digits.size();
    const auto result = std::from_chars(digits.data() + mark + 1, end, exponent);
    if (result.ec == std::errc::result_out_of_range)
        return digits[mark + 1] == '-' ? -largest : largest;
    return std::clamp(exponent, -largest, largest);
}

/// The parser leaves a number out of range alone: one that is too large is infinite, one that is
/// too small 0. Where the first digit that counts stands tells which it is.
double outOfRange(const std::string& digits)
{
    const std::size_t mark = std::min(digits.find('e'), digits.size());
    const std::size_t point = std::min(digits.find('.'), mark);
    const std::size_t first = std::min(digits.find_first_of("123456789"), mark);
    const auto places = static_cast<std::int64_t>(point) - static_cast<std::int64_t>(first);
    const bool tiny = first == mark || places + exponentOf(digits, mark) <= 0;
    const double value = tiny ? 0.0 : std::numeric_limits<double>::infinity();
    return digits.front() == '-' ? -value : value;
}

double parse(std::string_view text)
{
    const NumberSpan span = scanNumber(text);
    if (span.digits.empty())
        return 0;
    double value = 0;
    const char* first = span.digits.data();
    const auto result = std::from_chars(first, first + span.digits.size(), value);
    return result.ec == std::errc::result_out_of_range ? outOfRange(span.digits) : value;
}

/// Writes "-d.ddd" digits with their decimal point moved `exponent` places.
Text positional(std::string digits, int exponent, bool negative, char16_t separator)
{
    while (digits.size() > 1 && digits.back() == '0')
        digits.pop_back();
    const int pointAt = exponent + 1;
    if (pointAt <= 0)
        digits.insert(0, static_cast<std::size_t>(1 - pointAt), '0');
    const auto whole = static_cast<std::size_t>(std::max(pointAt, 1));
    if (digits.size() < whole)
        digits.append(whole - digits.size(), '0');
    Text text;
    if (negative)
        text.push_back(u'-');
    text.append(digits.begin(), digits.begin() + static_cast<std::ptrdiff_t>(whole));
    if (digits.size() > whole) {
        text.push_back(separator);
        text.append(digits.begin() + static_cast<std::ptrdiff_t>(whole), digits.end());
    }
    return text;
}

/// Turns the parser's "d.ddde±xx" into general form.
Text generalForm(std::string_view scientific, char16_t separator)
{
    const bool negative = scientific.front() == '-';
    if (negative)
        scientific.remove_prefix(1);
    const std::size_t mark = scientific.find('e');
    int exponent = 0;
    const std::size_t sign = scientific[mark + 1] == '+' ? 2 : 1;
    std::from_chars(
        scientific.data() + mark + sign, scientific.data() + scientific.size(), exponent);
    std::string digits(scientific.substr(0, mark));
    std::erase(digits, '.');
    if (exponent < 15)
        return positional(digits, exponent, negative, separator);
    Text text = positional(digits, 0, negative, separator);
    return text.append(u"E+").append(decimal(exponent));
}

Text special(double value)
{
    if (std::isnan(value))
        return u"NaN";
    return value < 0 ? u"-Inf" : u"Inf";
}

} // namespace

double leadingNumber(TextView text) { return parse(asciiPrefix(text)); }

double leadingNumber(std::string_view bytes) { return parse(bytes); }

bool isNumber(TextView text)
{
    const TextView number = trimmed(text);
    const NumberSpan span = scanNumber(asciiPrefix(number));
    return !span.digits.empty() && span.end == number.size();
}

double roundHalfEven(double value)
{
    const double floor = std::floor(value);
    const double part = value - floor;
    if (part < 0.5)
        return floor;
    if (part > 0.5)
        return floor + 1;
    return std::fmod(floor, 2) == 0 ? floor : floor + 1;
}

std::int16_t roundToInt16(double value)
{
    const double rounded = roundHalfEven(value);
    if (!(rounded >= -32768 && rounded <= 32767))
        throw RunTimeError(ErrorNumber::Overflow, outsideLimits(value, -32768, 32767));
    return static_cast<std::int16_t>(rounded);
}

std::int32_t roundToInt32(double value)
{
    constexpr double Usual = 1e9;
    if (value > -Usual && value < Usual) { // most of the millions of positions of a layout
        const auto whole = static_cast<std::int32_t>(value);
        const double part = value - whole;
        const bool isOdd = (whole & 1) != 0;
        const int up = part > 0.5 || (part == 0.5 && isOdd) ? 1 : 0;
        const int down = part < -0.5 || (part == -0.5 && isOdd) ? 1 : 0;
        return whole + up - down;
    }
    const double rounded = roundHalfEven(value);
    if (!(rounded >= -2147483648.0 && rounded <= 2147483647.0))
        throw RunTimeError(ErrorNumber::Overflow, outsideLimits(value, -2147483648, 2147483647));
    return static_cast<std::int32_t>(rounded);
}

std::int16_t narrowToInt16(std::int64_t value)
{
    if (value < -32768 || value > 32767)
        throw RunTimeError(
            ErrorNumber::Overflow, outsideLimits(static_cast<double>(value), -32768, 32767));
    return static_cast<std::int16_t>(value);
}

float toSingle(double value, TextView what)
{
    if (std::abs(value) <= static_cast<double>(std::numeric_limits<float>::max()))
        return static_cast<float>(value);
    Text detail(what);
    detail.append(detail.empty() ? u"" : u": ").append(formatNumber(value));
    throw RunTimeError(ErrorNumber::Overflow,
        phrase(u"%1 is past what a single-precision number holds", { detail }));
}

namespace {

Text notWhole(TextView text)
{
    return phrase(u"\"%1\" is no whole number between -32768 and 32767", { text });
}

} // namespace

std::int16_t strictInt16(TextView text)
{
    const TextView number = trimmed(text);
    if (!isNumber(number))
        throw RunTimeError(ErrorNumber::TypeMismatch, notWhole(text));
    const double value = leadingNumber(number);
    if (value != std::floor(value) || !(value >= -32768 && value <= 32767))
        throw RunTimeError(ErrorNumber::TypeMismatch, notWhole(text));
    return static_cast<std::int16_t>(value);
}

Text formatNumber(double value, char16_t separator)
{
    if (!std::isfinite(value))
        return special(value);
    if (value == 0)
        return u"0";
    char buffer[64];
    const auto end
        = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::scientific, 14);
    return generalForm({ buffer, end.ptr }, separator);
}

Text formatFixed(double value, int decimals, char16_t separator)
{
    constexpr double General = 1e15;
    constexpr int MostDecimals = 300;
    if (!(std::abs(value) < General))
        return formatNumber(value, separator);
    char buffer[MostDecimals + 64];
    const auto end = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::fixed,
        std::clamp(decimals, 0, MostDecimals));
    std::string_view digits(buffer, static_cast<std::size_t>(end.ptr - buffer));
    if (digits.front() == '-' && digits.find_first_of("123456789") == std::string_view::npos)
        digits.remove_prefix(1);
    Text text(digits.begin(), digits.end());
    if (const std::size_t point = text.find(u'.'); point != Text::npos)
        text[point] = separator;
    return text;
}

Text formatSingle(float value, char16_t separator)
{
    if (!std::isfinite(value))
        return special(static_cast<double>(value));
    if (value == 0)
        return u"0";
    char buffer[64];
    const auto end
        = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::scientific);
    return generalForm({ buffer, end.ptr }, separator);
}

} // namespace pelloric
