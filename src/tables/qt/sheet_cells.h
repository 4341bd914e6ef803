// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"

#include <QString>

#include <cstdint>
#include <span>
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

/// How many rows and columns that hold anything a sheet hides.
struct HiddenCount {
    std::int64_t rows = 0;
    std::int64_t columns = 0;

    bool operator==(const HiddenCount&) const = default;
};

/// The rows or the columns of a sheet, some of which are hidden: from 0.
class HiddenLines {
public:
    /// @param most  how many the sheet has
    explicit HiddenLines(std::int64_t most)
        : most_(most)
    {
    }

    /// What lies past the end of the sheet is passed over.
    void hide(std::int64_t first, std::int64_t count);

    /// Where each one stands once the hidden ones are left out, and one more for the end; where a
    /// hidden one stood, the next one that is shown does. Empty: none is hidden.
    std::vector<std::int32_t> places() const;

private:
    std::int64_t most_;
    std::vector<std::int32_t> changes_; ///< of how many areas hide a line, to the one before
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

    /// Says how wide columns are: twips.
    void setWidth(std::int64_t column, std::int64_t columns, Twips width);

    /// The rows and columns that the sheet hides.
    HiddenLines& hiddenRows() { return hiddenRows_; }
    HiddenLines& hiddenColumns() { return hiddenColumns_; }

    /// Closes the gaps that hidden rows and columns leave. A box shows its first cell even where
    /// that one is hidden.
    /// @return  how many of those that hold texts were left out
    /// @throws RunTimeError TypeMismatch: nothing is left
    HiddenCount leaveOutHidden();

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
    HiddenCount countHidden(
        std::span<const std::int32_t> rows, std::span<const std::int32_t> columns) const;
    void moveBoxTexts(std::span<const std::int32_t> rows, std::span<const std::int32_t> columns);
    std::vector<TableColumn> columnsOf(const SheetArea& area) const;

    std::vector<std::vector<Cell>> rows_;
    std::vector<CellLook> looks_ { CellLook() }; ///< the first is that of cells that say nothing
    std::vector<Blanks> blanks_; ///< later ones lie above earlier ones
    std::vector<SheetArea> boxes_;
    std::vector<Width> widths_;
    HiddenLines hiddenRows_ { MostRows };
    HiddenLines hiddenColumns_ { MostColumns };
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
