// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_syntax.h"

#include <array>
#include <charconv>
#include <cmath>

namespace pelloric::pdf {

namespace {

constexpr std::string_view HexDigits = "0123456789ABCDEF";

constexpr auto PowersOfTen
    = std::to_array<std::int64_t>({ 1, 10, 100, 1000, 10'000, 100'000, 1'000'000 });

/// Times the largest power of ten this is still a whole number of 64 bits.
constexpr double LargestNumber = 9e12;

/// Digits of a part of a channel's brightness that tell all 256 apart.
constexpr int ColorDecimals = 4;

bool isPlainInName(unsigned char byte)
{
    constexpr std::string_view Delimiters = "()<>[]{}/%#";
    return byte > ' ' && byte < 0x7F
        && Delimiters.find(static_cast<char>(byte)) == std::string::npos;
}

} // namespace

void appendInteger(std::string& out, std::int64_t number)
{
    std::array<char, 24> digits {};
    const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), number).ptr;
    out.append(digits.data(), end);
}

void appendNumber(std::string& out, double number, int decimals)
{
    const std::int64_t scale = PowersOfTen[static_cast<std::size_t>(decimals)];
    if (!(std::abs(number) < LargestNumber))
        number = 0;
    const auto scaled
        = static_cast<std::int64_t>(std::nearbyint(number * static_cast<double>(scale)));
    const std::int64_t size = scaled < 0 ? -scaled : scaled;
    if (scaled < 0)
        out += '-';
    std::int64_t rest = size % scale;
    if (size >= scale || rest == 0)
        appendInteger(out, size / scale);
    if (rest == 0)
        return;
    out += '.';
    for (std::int64_t digit = scale / 10; rest > 0; digit /= 10) {
        out += static_cast<char>('0' + rest / digit);
        rest %= digit;
    }
}

void appendReference(std::string& out, int object)
{
    appendInteger(out, object);
    out += " 0 R";
}

void appendText(std::string& out, TextView text)
{
    out += "<FEFF";
    appendHex(out, text);
    out += '>';
}

void appendHex(std::string& out, TextView units)
{
    for (const char16_t unit : units) {
        appendHexByte(out, static_cast<unsigned char>(unit >> 8U));
        appendHexByte(out, static_cast<unsigned char>(unit & 0xFFU));
    }
}

void appendHexByte(std::string& out, unsigned char byte)
{
    out += HexDigits[byte >> 4U];
    out += HexDigits[byte & 0xFU];
}

void appendName(std::string& out, std::string_view name)
{
    out += '/';
    for (const char character : name) {
        const auto byte = static_cast<unsigned char>(character);
        if (isPlainInName(byte)) {
            out += character;
        } else {
            out += '#';
            appendHexByte(out, byte);
        }
    }
}

void appendColor(std::string& out, Color color)
{
    constexpr double Brightest = 255;
    for (const int shift : { 0, 8, 16 }) {
        appendNumber(out, ((color >> shift) & 0xFF) / Brightest, ColorDecimals);
        out += ' ';
    }
}

} // namespace pelloric::pdf
