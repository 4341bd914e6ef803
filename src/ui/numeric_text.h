// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

namespace pelloric {

/// What may be typed into a box for a number; "7" stands in it twice, which changes nothing.
inline constexpr TextView NumericCharacters = u"01234567879.";

/// The characters of a text that may be typed into a box for a number.
Text numericCharacters(TextView text);

/// Two decimals and always ".": the form in which a dialog shows measured lengths.
Text twoDecimals(double value);

} // namespace pelloric
