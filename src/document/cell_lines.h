// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text_metrics.h"

#include <vector>

namespace pelloric {

/// What a cell keeps free of its width, both sides together: twips.
inline constexpr Twips CellPadding = 144;

/// A face at a size, ready to measure with.
struct MeasuredFont {
    FaceMetrics* face = nullptr;
    float size = 0; ///< points
    Twips lineHeight = 0; ///< twips

    /// @throws RunTimeError Overflow: wider than 32 bits of twips
    Twips width(TextView text) const { return textWidth(face->advanceOf(text), size); }
};

/// What one look over a cell's text tells.
struct CellText {
    TextView text; ///< without carriage returns
    Twips width = 0; ///< of the whole text: twips
    bool hasLineFeed = false;
    bool hasSeparator = false; ///< holds a `LineSeparator` that somebody typed
    bool hasCarriageReturn = false; ///< `text` still holds one; it has not been measured
};

/// Measures a cell's text in one pass.
CellText readCellText(TextView text, const MeasuredFont& font);

/// A text without its carriage returns: one before a line feed belongs to it, others mean nothing.
Text withoutCarriageReturns(TextView text);

/// One printed line of a cell.
struct CellLine {
    TextView text;
    Twips width = 0; ///< twips
    bool fits = true; ///< centred; else a piece of a line that was too wide, from the left edge
};

/// Cuts a text that is too wide into the longest pieces that fit, at any character.
///
/// A piece holds at least one character, so cutting ends for every width. An empty text has no
/// pieces.
/// @param room   twips; may have a fraction
/// @param lines  the pieces are appended
void wrapText(TextView text, double room, const MeasuredFont& font, std::vector<CellLine>& lines);

/// Breaks a text at line feeds and separators, and wraps every line that is too wide.
///
/// An empty line is a line of its own.
/// @param text   without carriage returns
/// @param room   twips; may have a fraction
/// @param lines  at least one is appended
void breakText(TextView text, double room, const MeasuredFont& font, std::vector<CellLine>& lines);

/// Breaks a text as it is printed in a cell: as `breakText` does where it holds a line feed, else
/// it is one line, wrapped where it is too wide; a typed separator alone breaks nothing.
/// @param text   without carriage returns
/// @param room   twips; may have a fraction
/// @param lines  appended; an empty text has one
void breakPrinted(
    TextView text, double room, const MeasuredFont& font, std::vector<CellLine>& lines);

} // namespace pelloric
