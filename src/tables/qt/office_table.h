// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"
#include "tables/qt/sheet_cells.h"

#include <QString>

#include <filesystem>

namespace pelloric::qt {

/// A sheet of an office file.
struct OfficeSource {
    std::filesystem::path path {};
    QString sheet {}; ///< empty: the first one
    bool takesHidden = false; ///< rows and columns that the sheet hides are read like the others
    HiddenCount* leftOut = nullptr; ///< gets what is hidden and was not read; may be null; borrowed
};

/// Whether a file is one of those that `readOffice` reads, by its beginning and its name.
bool isOfficeFile(const std::filesystem::path& path);

/// Reads a sheet of an .xlsx or .ods file into a table: the first row that holds anything has the
/// titles. Cells show their numbers with the decimals and percents of their formats, dates as
/// YYYY-MM-DD with the time behind, and formulas what they had come to when the file was saved.
/// Rows and columns that the sheet hides, a filter's among them, are left out.
///
/// Other office files, such as .xls, are converted by LibreOffice where it is installed. Every
/// column has the width -1.
/// @throws RunTimeError FileNotFound: it cannot be read; InvalidCall: there is no such sheet;
///         TypeMismatch: it is damaged, empty, hides all it holds, or needs LibreOffice, which is
///         not installed
TableGrid readOffice(const OfficeSource& source);

} // namespace pelloric::qt
