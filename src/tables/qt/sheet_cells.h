// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"

#include <QString>

#include <vector>

namespace pelloric::qt {

class ZipEntries;

/// The cells of a sheet of an office file, as they look.
class SheetCells {
public:
    /// Puts a text into a cell; rows and columns count from 0.
    /// @throws RunTimeError Overflow: past the last row or column that a sheet has
    void put(std::int64_t row, std::int64_t column, Text text);

    /// A table of the part of the sheet that holds anything; its first row has the titles.
    /// @throws RunTimeError TypeMismatch: the sheet is empty
    TableGrid toTable() const;

private:
    std::vector<std::vector<Text>> rows_;
};

/// Reads a sheet of an .xlsx file.
/// @param sheet  its name; empty: the first one
/// @throws RunTimeError InvalidCall: there is no such sheet; TypeMismatch: the file is damaged
SheetCells readXlsxSheet(const ZipEntries& file, const QString& sheet);

/// Reads a sheet of an .ods file, likewise.
SheetCells readOdsSheet(const ZipEntries& file, const QString& sheet);

/// @throws RunTimeError InvalidCall, naming the sheets there are
[[noreturn]] void refuseSheet(const QString& sheet, const QStringList& present);

/// @throws RunTimeError TypeMismatch
[[noreturn]] void refuseDamaged();

} // namespace pelloric::qt
