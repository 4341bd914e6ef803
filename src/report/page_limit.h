// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>

namespace pelloric {

/// A document has at most so many pages.
inline constexpr std::int16_t MostPages = 32767;

/// What to say when a report needs more pages than a document holds: how many it needs, how many
/// rows fit, and what to do.
///
/// @param rowsThatFit  rows that are printed in full on the pages there are
/// @param rows         rows of the report
Text tooManyPages(std::int64_t rowsThatFit, std::int64_t rows);

} // namespace pelloric
