// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>
#include <vector>

namespace pelloric {

/// The page list of a range text: "1,3,5-7" becomes "1,3,5,6,7".
///
/// "-" joins the number before it to the number after it; a run written downwards adds nothing
/// between, and a joint number that equals its neighbour is not written again. Ends are rounded
/// half to even, no number counts as 0, and a run past 32767 stops there. What is no number is
/// passed through, blanks stay.
/// @param rangeText  trimmed
/// @throws RunTimeError Overflow: the list would be longer than any document asks for
Text pageListOf(TextView rangeText);

/// The page numbers of a page list, in its order, one-based and maybe no pages of the document.
///
/// An item counts when all of it, blanks at its ends aside, is one decimal number within 16 bits
/// after rounding half to even; every other item is passed over.
/// @param list  numbers separated by ","
std::vector<std::int16_t> pageNumbersOf(TextView list);

/// The number of copies that a text asks for: its leading number, and 1 when it is empty.
/// @throws RunTimeError Overflow: past 16 bits
std::int16_t copiesOf(TextView text);

} // namespace pelloric
