// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/options.h>

#include <cstdint>
#include <span>
#include <vector>

namespace pelloric {

struct PageSetup;

/// The columns of a band, from 0, left to right: key columns first.
using BandColumns = std::vector<int>;

/// Cuts columns into bands, each of which begins with the key columns and holds at least one
/// column more, where there is one.
///
/// Without key columns the bands are those of `cutColumnBands`.
/// @param widths  twips; one per printed column
/// @param keys    columns from 0, each once
/// @param paper   twips
/// @param left    left margin: twips
std::vector<BandColumns> cutKeyedBands(
    std::span<const double> widths, std::span<const int> keys, double paper, double left);

/// Narrows columns that would leave the paper: where the key columns and another one are wider
/// than the sheet, the key columns get half of it or what the other one leaves, and no other column
/// is wider than the rest. The widest columns give way first, and what is narrow enough stays.
/// @param widths  twips; one per printed column
/// @param keys    columns from 0, each once
void narrowToSheet(std::span<double> widths, std::span<const int> keys, const PageSetup& setup);

/// Decides how a table is brought onto the sheet.
///
/// The sheet is turned only from upright to lying; texts and widths shrink to the floors of the
/// options at most.
/// @param size  of the body font: points
FitResult fitReport(std::span<const double> widths, std::span<const int> keys,
    const PageSetup& setup, float size, const FitOptions& options);

} // namespace pelloric
