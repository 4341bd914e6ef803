// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <pelloric/errors.h>

#include <cstdint>

namespace pelloric {

/// The plain English text of an error number, a phrase without a full stop and without a colon.
TextView errorText(ErrorNumber number);

/// "page 9; there are 5": the detail of an error about something that is not there.
///
/// @param what    a phrase in the singular
/// @param number  as a person counts it
Text noSuchItem(TextView what, std::int64_t number, std::int64_t count);

/// "40000 is not between -32768 and 32767": the detail of an error about a number past a limit.
Text outsideLimits(double number, std::int64_t least, std::int64_t most);

} // namespace pelloric
