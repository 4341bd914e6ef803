// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/units.h"

#include <span>
#include <vector>

namespace pelloric {

class FaceMetrics;
class MessageLoop;
class TableGrid;

/// The bounds of a column's width that is taken from what the column holds: twips.
inline constexpr Twips NarrowestContent = 600;
inline constexpr Twips WidestContent = 4500; ///< longer texts are wrapped

/// A width for each column of a table in which its title and its texts stand in one line.
///
/// Of a large table some ten thousand rows are measured, evenly spread, and of every column the
/// longest text besides.
/// @param body  the face that texts are printed in
/// @param size  points
/// @param loop  kept alive between columns; null: nothing is
/// @return      twips, from `NarrowestContent` to `WidestContent`; left to right
/// @throws RunTimeError Cancelled: by the message loop
std::vector<Twips> contentWidths(
    const TableGrid& grid, FaceMetrics& body, float size, MessageLoop* loop = nullptr);

/// Narrows the widest columns so that all of them fit on one sheet, where that leaves each of them
/// readable; else the widths stay as they are and the sheet's edge divides the table.
///
/// @param widths  twips
/// @param room    twips between the margins
void fitWidths(std::span<Twips> widths, Twips room);

} // namespace pelloric
