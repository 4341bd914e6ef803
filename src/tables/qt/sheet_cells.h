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

/// Cells of a sheet: from 0.
struct SheetArea {
    std::int64_t row = 0;
    std::int64_t column = 0;
    std::int64_t rows = 1;
    std::int64_t columns = 1;

    /// What lies in another area, too; without rows or columns where nothing does.
    SheetArea within(const SheetArea& other) const;
    bool isEmpty() const { return rows <= 0 || columns <= 0; }
};

/// The cells of a sheet of an office file, as they look.
class SheetCells {
public:
    static constexpr std::int64_t MostRows = 1048576;
    static constexpr std::int64_t MostColumns = 16384;
    static constexpr std::int64_t MostCells = 1 << 26; ///< with the empty ones in front of others
    static constexpr std::int64_t MostCharacters = 1 << 30;

    /// Refuses more than fits, before it is made: a small file can name any number.
    /// @throws RunTimeError Overflow
    void requireRoom(std::int64_t cells, std::int64_t characters) const;

    /// Puts a text into a cell; rows and columns count from 0. Of a cell without a text only the
    /// background is kept.
    /// @throws RunTimeError Overflow: past the last row or column that a sheet has; no room
    void put(
        std::int64_t row, std::int64_t column, Text text, const SheetLook& look, SheetValue value);

    /// Gives cells a look as far as they are empty and nothing later says more of them.
    void fillBlanks(const SheetArea& area, const SheetLook& look);

    /// Makes one box of cells, which shows its first one.
    void merge(const SheetArea& area);

    /// Says how wide columns are: twips; 0: they are hidden.
    void setWidth(std::int64_t column, std::int64_t columns, Twips width);

    /// A table of the part of the sheet that holds texts; its first row has the titles.
    /// @throws RunTimeError TypeMismatch: the sheet is empty
    TableGrid toTable() const;

private:
    struct Cell {
        Text text;
        std::uint16_t look = 0;
    };

    /// Empty cells of one colour.
    struct Blanks {
        SheetArea area;
        std::uint16_t look = 0;
    };

    struct Width {
        std::int64_t column = 0;
        std::int64_t columns = 1;
        Twips width = 0;
    };

    std::uint16_t numberOf(const CellLook& look);
    SheetArea filledArea() const;
    std::vector<TableColumn> columnsOf(const SheetArea& area) const;

    std::vector<std::vector<Cell>> rows_;
    std::vector<CellLook> looks_ { CellLook() }; ///< the first is that of cells that say nothing
    std::vector<Blanks> blanks_; ///< later ones lie above earlier ones
    std::vector<SheetArea> boxes_;
    std::vector<Width> widths_;
    std::int64_t cells_ = 0;
    std::int64_t characters_ = 0;
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
