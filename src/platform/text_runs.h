// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <vector>

namespace pelloric {

class FaceMetrics;

/// How a run is drawn.
enum class RunKind : std::uint8_t {
    Plain, ///< glyph by glyph, each at its advance
    Shaped, ///< by a shaper, squeezed into the run's advance where it needs more
    Box, ///< one hollow box for one character that no installed face has
};

/// A piece of a text that is drawn at one go.
struct TextRun {
    TextView text; ///< what is drawn, no control character in it; of a box: the missing character
    std::size_t line = 0; ///< how many lines below the first one
    double left = 0; ///< from the text's left edge, at size 1: twips
    double advance = 0; ///< at size 1: twips
    RunKind kind = RunKind::Plain;
};

/// Cuts a text into what is drawn for it. Screen, images, paper and every kind of file draw a text
/// by these runs, so that all of them show the same, and what was measured.
///
/// A line feed begins another line, at the text's left edge. A tab is a gap of four blanks. Any
/// other control character is nothing. Half of a surrogate pair is drawn as U+FFFD, and a character
/// that no installed face has as a hollow box.
/// @param runs  replaced; in the order of the text; they look into the text
void cutIntoRuns(TextView text, FaceMetrics& face, std::vector<TextRun>& runs);

/// How many lines a text takes: one more than it has line feeds.
std::size_t lineCount(TextView text);

/// The advance of the longest line of a text at size 1: twips.
double longestLineAdvance(TextView text, FaceMetrics& face);

/// The box that is drawn for a missing character: twips, from the left end of the run's baseline,
/// y growing downwards. What lies between the outer and the inner edges is filled.
///
/// It is taller than the ballot box (U+2610) and reaches below the baseline, so that nobody takes
/// one for the other.
struct HollowBox {
    double left = 0;
    double top = 0; ///< below 0
    double right = 0;
    double bottom = 0;
    double stroke = 0; ///< from the outer to the inner edge
};

/// @param advance  of the character: twips
/// @param em       of the font: twips
HollowBox hollowBox(double advance, double em);

} // namespace pelloric
