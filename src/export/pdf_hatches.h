// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/units.h"

#include <string>
#include <string_view>

namespace pelloric::pdf {

class PdfFile;

/// The name of the pattern that a fill style hatches with; empty: it fills all.
std::string_view hatchName(std::int16_t fillStyle);

/// The patterns of hatched rectangles, written to a file when all is drawn.
/// @param pixel        what hatches are measured in: twips
/// @param paperHeight  hatches begin at the top of the paper: twips
/// @return             entries of a resource dictionary
std::string writeHatches(PdfFile& file, double pixel, Twips paperHeight);

} // namespace pelloric::pdf
