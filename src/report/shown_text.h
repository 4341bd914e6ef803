// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/cell_lines.h"
#include "platform/cell_look.h"

namespace pelloric {

class TextStore;

/// Breaks a text at its line feeds and, where a line is too wide, between words.
///
/// Words end at a blank, at a hyphen and at every ideograph; a word that is too wide by itself is
/// cut at any character. Blanks at which a line is broken are left out.
/// @param text   lives in the store that the lines are printed from
/// @param room   twips
/// @param lines  at least one is appended
void wrapWords(TextView text, double room, const MeasuredFont& font, std::vector<CellLine>& lines);

/// Breaks a text at its line feeds only and shortens every line that is too wide, by "…" or
/// plainly.
///
/// @param where  any but `Wrapped`: where the dots stand, if any
/// @param store  keeps the shortened lines
void cutLines(TextView text, double room, TooWide where, const MeasuredFont& font, TextStore& store,
    std::vector<CellLine>& lines);

} // namespace pelloric
