// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>
#include <optional>

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

/// Reads a page list item by item.
///
/// An item counts when all of it, blanks at its ends aside, is one decimal number within 16 bits
/// after rounding half to even; every other item is passed over.
class PageNumbers {
public:
    /// @param list  numbers separated by ","; borrowed
    explicit PageNumbers(TextView list);

    /// The next page number, one-based and maybe no page of the document; nothing at the end.
    std::optional<std::int16_t> next();

private:
    TextView rest_;
    bool atEnd_ = false;
};

/// The number of copies that a text asks for: its leading number, and 1 when it is empty.
/// @throws RunTimeError Overflow: past 16 bits
std::int16_t copiesOf(TextView text);

} // namespace pelloric
