// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

namespace pelloric {

/// The characters of a text, in their order, that occur in a set or that do not.
///
/// @param characters  the set; a character may stand in it more than once
/// @param keep        true: those that occur in it; false: those that do not
Text filterChars(TextView text, TextView characters, bool keep);

/// How often a character occurs in a text, for hosts that keep a list in a text of their own.
///
/// @param character  one character; anything else occurs nowhere
/// @throws RunTimeError Overflow: more than 32767 times
std::int16_t countChar(TextView text, TextView character);

/// One field of a text in which every field is followed by a separator; for the same hosts.
///
/// @param index       0 is the first field
/// @param separator   one character or more
/// @param afterColon  true: only what follows the first ":" of the field; one without a ":" is
///                    the result as a whole
/// @return            the field, borrowed from `text`; empty when there is none, which includes the
///                    last one of a text that does not end with a separator
TextView getField(TextView text, int index, TextView separator, bool afterColon);

} // namespace pelloric
