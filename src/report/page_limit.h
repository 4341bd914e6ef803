// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "platform/units.h"

#include <cstdint>

namespace pelloric {

struct PageSetup;

/// What to say when a report needs more than `MostPages`: how many it needs, how many rows fit, and
/// what to do.
///
/// @param rowsThatFit  rows that are printed in full on the pages there are
/// @param rows         rows of the report
Text tooManyPages(std::int64_t rowsThatFit, std::int64_t rows);

/// So many rows fit on the pages of a document if none is higher than `rowHeight`; more need not
/// be read.
///
/// @param rowHeight  twips, 1 or more
std::int64_t mostRowsOnPages(const PageSetup& setup, Twips rowHeight);

/// Refuses rows that need not be read to know that they do not fit, unless they are few enough to
/// be laid out all the same, which tells how many fit.
///
/// @param rows  of the grid
/// @param most  that can fit
/// @throws RunTimeError Overflow: there are more, and more than a million
void requireRowsToFit(std::int64_t rows, std::int64_t most);

} // namespace pelloric
