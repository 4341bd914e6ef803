// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "platform/units.h"

#include <cstdint>
#include <optional>

namespace pelloric {

/// Where a cell's text stands across the cell.
enum class CellAlignment : std::uint8_t { Left, Centre, Right };

/// Where a cell's text stands from top to bottom of its row.
enum class CellPlace : std::uint8_t { Top, Middle, Bottom };

/// The check box before a cell's text.
enum class CheckMark : std::uint8_t { None, Off, Partly, On };

/// What becomes of a text that is wider than its cell.
enum class TooWide : std::uint8_t { Wrapped, CutLeft, CutMiddle, CutRight, CutPlainly };

/// One box over several cells: rows and columns of the grid, both ends included.
struct CellBox {
    std::int32_t firstRow = 0;
    std::int32_t lastRow = 0;
    std::int32_t firstColumn = 0;
    std::int32_t lastColumn = 0;

    bool operator==(const CellBox&) const = default;
};

/// What a view shows of a cell besides its text.
struct CellLook {
    CellAlignment alignment = CellAlignment::Left;
    CellPlace place = CellPlace::Middle;
    bool bold = false;
    bool italic = false;
    bool underline = false;
    bool strikethrough = false;
    std::optional<Color> foreground {};
    std::optional<Color> background {};
    CheckMark check = CheckMark::None;
    TooWide tooWide = TooWide::Wrapped;
    std::uint16_t level = 0; ///< of a tree, from 0
    Twips indent = 0; ///< of the text: twips
    std::uint64_t goesOn = 0; ///< bit n: the branch of level n has more rows below this one
    bool isBranch = false; ///< the cell stands in a tree's column of branches
    TextView icon {}; ///< file of the square picture before the text; empty: none
    std::optional<CellBox> box {}; ///< the box that the cell belongs to

    bool operator==(const CellLook&) const = default;
};

/// What a view shows of its grid as a whole.
struct GridLook {
    bool showsLines = true;
    std::int16_t lineStyle = 0; ///< in the numbering of drawing surfaces
    Color lineColor = 0;
};

/// Tells how a view shows its cells; see `AutomationObject::looks`.
///
/// Rows count from 1 as a flex grid's rows behind its titles and the items of a list view do;
/// columns from 0 as the grid's own.
class CellLooks {
public:
    virtual ~CellLooks() = default;

    /// Whether there is anything to tell; a table in memory may have texts alone.
    virtual bool hasLooks() const { return true; }

    virtual GridLook gridLook() = 0;

    /// Overwrites all of `look`; its icon is borrowed until the next build.
    virtual void readLook(std::int32_t row, std::int32_t column, CellLook& look) = 0;

    /// The text of a cell as it stands in the plain grid; of a box the first of its cells has it.
    /// @return  borrowed until the next call
    virtual TextView text(std::int32_t row, std::int32_t column) = 0;

    /// Where a column's title stands.
    virtual CellAlignment titleAlignment(std::int32_t column) = 0;

    /// Whether a cell of the row is selected.
    virtual bool isMarked(std::int32_t row) = 0;

    /// The number that the cell shows, as exact as the view has it; nothing: it shows no number.
    virtual std::optional<double> number(std::int32_t row, std::int32_t column) = 0;
};

} // namespace pelloric
