// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "tables/number_look.h"
#include "tables/qt/sheet_cells.h"

#include <vector>

namespace pelloric::qt {

class ZipEntries;

/// What a style of an .xlsx file says of its cells.
struct XlsxStyle {
    NumberLook number;
    SheetLook look;
};

/// The styles of an .xlsx file by their numbers.
/// @throws RunTimeError TypeMismatch: the file is damaged
std::vector<XlsxStyle> readXlsxStyles(const ZipEntries& file);

} // namespace pelloric::qt
