// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"

#include <QString>

#include <cstdint>
#include <vector>

class QColor;

namespace pelloric::qt {

class ZipEntries;

/// What an office file says of a cell besides its text.
struct SheetLook {
    CellLook cell;
    bool isAligned = false; ///< else texts stand left, numbers right and truth values in the middle
};

/// A colour of an office file: 0x00BBGGRR.
Color colorNumber(const QColor& color);

/// What stands in a cell; it decides where the cell's text stands where nothing else does.
enum class SheetValue : std::uint8_t { Words, Number, Truth };

/// The cells of a sheet of an office file, as they look.
class SheetCells {
public:
    /// Puts a text into a cell; rows and columns count from 0.
    /// @throws RunTimeError Overflow: past the last row or column that a sheet has
    void put(
        std::int64_t row, std::int64_t column, Text text, const SheetLook& look, SheetValue value);

    /// A table of the part of the sheet that holds anything; its first row has the titles.
    /// @throws RunTimeError TypeMismatch: the sheet is empty
    TableGrid toTable() const;

private:
    struct Cell {
        Text text;
        std::uint16_t look = 0;
    };

    std::uint16_t numberOf(const CellLook& look);

    std::vector<std::vector<Cell>> rows_;
    std::vector<CellLook> looks_;
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
