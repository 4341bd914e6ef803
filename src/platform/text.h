// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace pelloric {

/// The one text type: UTF-16, as grids, widgets and automation hand it over.
using Text = std::u16string;

/// A borrowed text.
using TextView = std::u16string_view;

/// Stands for a line break while the text of a cell is laid out ("★").
inline constexpr char16_t LineSeparator = u'\u2605';

/// The text without the blanks (U+0020 only) at both ends; tabs, line ends and wide blanks stay.
TextView trimmed(TextView text);

/// The text with every occurrence of `from` replaced by `to`, found from left to right.
///
/// An empty `from` leaves the text as it is.
Text replaceAll(TextView text, TextView from, TextView to);

/// Whether `text` holds `part`, letter case told apart; the empty part is in every text.
bool contains(TextView text, TextView part);

/// The number of code units (1, or 2 for a surrogate pair) of the character at `position`.
///
/// @param position  code unit index, below the text's length; half a pair counts as one character
int characterLength(TextView text, std::size_t position);

/// The code point at `position`, and behind it the next character's position.
char32_t nextCodePoint(TextView text, std::size_t& position);

/// UTF-8 to UTF-16; a sequence that is no character becomes U+FFFD.
Text fromUtf8(std::string_view bytes);

/// The same, put behind a text.
void appendUtf8(Text& text, std::string_view bytes);

/// UTF-16 to UTF-8; half a surrogate pair becomes U+FFFD.
std::string toUtf8(TextView text);

/// The text with a blank for every line break, as a setting or a cell of plain text holds it.
Text onOneLine(TextView text);

/// Plain decimal, "-" in front when negative.
Text decimal(std::int64_t number);

} // namespace pelloric
