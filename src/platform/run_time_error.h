// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <pelloric/errors.h>

#include <cstdint>

namespace pelloric {

/// The plain English text of an error number, without a full stop.
TextView errorText(ErrorNumber number);

/// "page 9; there are 5": the detail of an error about something that is not there.
///
/// @param what    in the singular, as a person calls it
/// @param number  as a person counts it
Text noSuchItem(TextView what, std::int64_t number, std::int64_t count);

/// "40000 is not between -32768 and 32767": the detail of an error about a number past a limit.
Text outsideLimits(double number, std::int64_t least, std::int64_t most);

} // namespace pelloric
