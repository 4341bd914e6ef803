// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/numeric_text.h"

#include "settings/text_helpers.h"

#include <charconv>
#include <string_view>

namespace pelloric {

Text numericCharacters(TextView text) { return filterChars(text, NumericCharacters, true); }

Text twoDecimals(double value)
{
    char digits[400]; // a double has at most 309 digits before its point
    const auto end
        = std::to_chars(digits, digits + sizeof digits, value, std::chars_format::fixed, 2);
    std::string_view written(digits, static_cast<std::size_t>(end.ptr - digits));
    if (written == "-0.00")
        written.remove_prefix(1);
    return { written.begin(), written.end() };
}

} // namespace pelloric
