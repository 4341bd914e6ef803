// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <optional>

namespace pelloric {

/// A number as a cell shows it.
struct ShownNumber {
    double value = 0;
    int decimals = 0; ///< digits behind the decimal separator
    char16_t grouping = 0; ///< stands between groups of digits; 0: nothing does

    bool operator==(const ShownNumber&) const = default;
};

/// The number that a text shows as a whole; nothing: it shows none.
///
/// Around the digits a sign, one currency sign, blanks, and brackets for "negative" may stand. The
/// last of a point and a comma is the decimal separator, the other one separates groups, as blanks
/// and apostrophes between digits do; a point or comma that occurs twice separates groups. The last
/// group has three digits, those before it two or three, the first one to three. A single point or
/// comma may be either where three digits follow and one to three stand before it, as in "1,234":
/// then it is what `decimalSeparator` says.
/// @param decimalSeparator  u',' or anything else, which stands for u'.'
std::optional<ShownNumber> readShownNumber(TextView text, char16_t decimalSeparator);

/// The decimal separator with which alone a text shows a number, u'.' or u','; nothing: it shows
/// none, or may be read with either.
std::optional<char16_t> decimalSeparatorOf(TextView text);

} // namespace pelloric
