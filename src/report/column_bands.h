// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/records.h>

#include <cstdint>
#include <span>
#include <vector>

namespace pelloric {

/// Sum of the widths of columns: twips.
double tableWidthOf(std::span<const double> widths);

/// The width that no column may exceed for all of them to fit into a room: the widest give way
/// first.
/// @param widths  twips, as the room is
double widthCap(std::vector<double> widths, double room);

/// Cuts columns that are together too wide for the paper into bands, from left to right.
///
/// The room is the paper's width less the left margin taken twice. A table that is exactly as wide
/// does not fit. A column wider than the paper is a band of its own.
/// @param widths  twips; one per printed column
/// @param paper   twips
/// @param left    left margin: twips
/// @return        at least one band; they follow each other without gaps
std::vector<ColPos> cutColumnBands(std::span<const double> widths, double paper, double left);

} // namespace pelloric
