// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/printer.h"

#include <vector>

namespace pelloric {

struct PageSetup;

/// Gives a page set-up the size of a named paper: "8k", "16k", "A3", "A4", "B4" or "B5".
///
/// "B4" keeps the size in force. In landscape the two sizes are exchanged; then 400 twips are
/// taken off both. The caller lays its view out again.
/// @param name      compared exactly
/// @param portrait  the orientation flag
/// @return          false: unknown name, nothing has changed
/// @throws RunTimeError Overflow: outside 32 bits; nothing has changed
bool applyPaperName(TextView name, PageSetup& setup, bool portrait);

/// The standard papers in the order of their usual codes: the first is code 1, A4 is code 9.
std::vector<PaperForm> standardPaperForms();

/// The papers that people choose by their usual names: "A3", "B5", "Letter" and so on.
std::vector<PaperForm> papersToChoose();

} // namespace pelloric
