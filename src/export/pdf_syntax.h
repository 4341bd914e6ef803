// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "platform/units.h"

#include <string>
#include <string_view>

namespace pelloric::pdf {

/// Appends a whole number.
void appendInteger(std::string& out, std::int64_t number);

/// Appends a number with at most `decimals` digits behind the point, none that says nothing.
///
/// @param number    what is no number or past 9e12 becomes 0
/// @param decimals  0 to 6
void appendNumber(std::string& out, double number, int decimals = 3);

/// Appends several numbers, each with a blank behind it.
template <typename... Numbers> void appendNumbers(std::string& out, Numbers... numbers)
{
    ((appendNumber(out, static_cast<double>(numbers)), out += ' '), ...);
}

/// Appends "12 0 R".
void appendReference(std::string& out, int object);

/// Appends a text as a string in hexadecimal UTF-16, which every reader shows as it is.
void appendText(std::string& out, TextView text);

/// Appends code units in hexadecimal, without brackets.
void appendHex(std::string& out, TextView units);

/// Appends a byte as two hexadecimal digits.
void appendHexByte(std::string& out, unsigned char byte);

/// Appends a name; bytes that a name cannot hold are written as their numbers.
void appendName(std::string& out, std::string_view name);

/// Appends red, green and blue, 0 to 1, each with a blank behind it.
void appendColor(std::string& out, Color color);

} // namespace pelloric::pdf
