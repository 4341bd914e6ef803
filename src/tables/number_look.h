// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <string_view>

namespace pelloric {

/// What a number format of an office file makes of a number.
struct NumberLook {
    bool isDate = false; ///< days since the file's first day; shown as a date
    bool hasTime = false; ///< with a time behind the date, or alone
    bool isPercent = false;
    int decimals = -1; ///< digits behind the point; below 0: as many as the number has
};

/// Reads a format such as "0.00%", "yyyy-mm-dd hh:mm" or "General".
///
/// Of a format with several parts the first one counts. Literal texts, colours and currencies are
/// passed over.
NumberLook numberLook(std::string_view format);

/// A number as it is shown; not for dates.
Text shownNumber(double value, const NumberLook& look);

} // namespace pelloric
