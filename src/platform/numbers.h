// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>

namespace pelloric {

/// The number that a text begins with, 0 when it begins with none.
///
/// Leading blanks (U+0020), a sign, digits, "." with digits and an exponent are taken as far as
/// they form a number; "." is the only decimal point and there is no hexadecimal form.
/// A number past a double's range is infinite, so that a conversion of it overflows.
double leadingNumber(TextView text);

/// The same for a text of plain bytes; a byte above 0x7F ends the number.
double leadingNumber(std::string_view bytes);

/// Whether the whole text, blanks at both ends aside, is one decimal number.
bool isNumber(TextView text);

/// Rounds half to even.
double roundHalfEven(double value);

/// Rounds half to even into 16 bits.
/// @throws RunTimeError Overflow: outside -32768 to 32767, or no number
std::int16_t roundToInt16(double value);

/// Rounds half to even into 32 bits.
/// @throws RunTimeError Overflow: outside 32 bits, or no number
std::int32_t roundToInt32(double value);

/// A whole number as 16 bits.
/// @throws RunTimeError Overflow: outside -32768 to 32767
std::int16_t narrowToInt16(std::int64_t value);

/// The strict conversion: a trimmed decimal whole number.
/// @throws RunTimeError TypeMismatch: anything else, or outside 16 bits
std::int16_t strictInt16(TextView text);

/// A number as a single-precision one.
/// @param what  names the number in the error; may be empty
/// @throws RunTimeError Overflow: past a single's range, or no number
float toSingle(double value, TextView what = {});

/// General form: at most 15 significant digits, no trailing zeros, no exponent below 1e15.
///
/// @param separator  stands between whole part and fraction
Text formatNumber(double value, char16_t separator = u'.');

/// With exactly so many decimals, and no sign where all digits are 0.
///
/// A number of 1e15 or more has the general form.
/// @param decimals   0 or more
/// @param separator  stands between whole part and fraction
Text formatFixed(double value, int decimals, char16_t separator = u'.');

/// The shortest decimal that reads back as the same single-precision number.
///
/// @param separator  stands between whole part and fraction
Text formatSingle(float value, char16_t separator = u'.');

} // namespace pelloric
