// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/sheet_cells.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QColor>
#include <QStringList>

#include <algorithm>
#include <span>
#include <utility>

namespace pelloric::qt {

namespace {

constexpr std::size_t MostLooks = 4000;

constexpr CellAlignment UsualAlignments[]
    = { CellAlignment::Left, CellAlignment::Right, CellAlignment::Centre };

/// The looks of the cells below the titles, and the boxes that they make.
class ShownCells {
public:
    ShownCells(const SheetArea& body, std::vector<CellLook> looks)
        : body_(body)
        , looks_(std::move(looks))
        , numbers_(static_cast<std::size_t>(body.rows * body.columns))
        , mostChecked_(MostChecks * body.rows * body.columns)
    {
    }

    /// @param row  of the body: from 0, as the column
    std::uint16_t& lookAt(std::int64_t row, std::int64_t column)
    {
        return numbers_[static_cast<std::size_t>(row * body_.columns + column)];
    }

    std::span<const std::uint16_t> row(std::int64_t row) const
    {
        return std::span(numbers_).subspan(
            static_cast<std::size_t>(row * body_.columns), static_cast<std::size_t>(body_.columns));
    }

    const std::vector<CellLook>& looks() const { return looks_; }

    void fill(const SheetArea& area, std::uint16_t look)
    {
        forEachCell(area.within(body_), [&](std::uint16_t& number) {
            number = look;
            return true;
        });
    }

    /// A box that touches another one is none, as the file is wrong then.
    void merge(const SheetArea& area)
    {
        const SheetArea part = area.within(body_);
        if (part.isEmpty() || looks_.size() > MostNumbers || mostChecked_ < 0)
            return;
        bool isFree = true;
        forEachCell(part, [&](const std::uint16_t& number) {
            --mostChecked_;
            isFree = !looks_[number].box;
            return isFree;
        });
        if (!isFree)
            return;
        const auto row = static_cast<std::int32_t>(part.row - body_.row);
        const auto column = static_cast<std::int32_t>(part.column - body_.column);
        CellLook look = looks_[lookAt(row, column)];
        look.box = CellBox { row + 1, row + static_cast<std::int32_t>(part.rows), column,
            column + static_cast<std::int32_t>(part.columns) - 1 };
        looks_.push_back(look);
        fill(part, static_cast<std::uint16_t>(looks_.size() - 1));
    }

private:
    static constexpr std::size_t MostNumbers = 65000;
    static constexpr std::int64_t MostChecks = 4; ///< of a cell, whatever boxes a file names

    template <typename Action> void forEachCell(const SheetArea& area, const Action& action)
    {
        for (std::int64_t row = 0; row < area.rows; ++row) {
            for (std::int64_t column = 0; column < area.columns; ++column) {
                if (!action(
                        lookAt(area.row - body_.row + row, area.column - body_.column + column)))
                    return;
            }
        }
    }

    SheetArea body_;
    std::vector<CellLook> looks_;
    std::vector<std::uint16_t> numbers_; ///< of the looks, row by row
    std::int64_t mostChecked_;
};

/// Where a row or column stands once the hidden ones are left out.
/// @param places  as `HiddenLines` has them
std::int64_t placeOf(std::span<const std::int32_t> places, std::int64_t at)
{
    return places.empty() ? at
                          : places[static_cast<std::size_t>(std::min(at, std::ssize(places) - 1))];
}

bool isHidden(std::span<const std::int32_t> places, std::int64_t at)
{
    return !places.empty() && placeOf(places, at + 1) == placeOf(places, at);
}

/// The first of some lines that is not hidden; -1: all are.
std::int64_t firstShown(
    std::span<const std::int32_t> places, std::int64_t first, std::int64_t count)
{
    if (places.empty())
        return first;
    const std::int64_t end = std::min(first + count, std::ssize(places) - 1);
    if (first >= end || placeOf(places, end) == placeOf(places, first))
        return -1;
    const auto after = std::upper_bound(
        places.begin() + first, places.begin() + end + 1, placeOf(places, first));
    return after - places.begin() - 1;
}

SheetArea shownPart(const SheetArea& area, std::span<const std::int32_t> rows,
    std::span<const std::int32_t> columns)
{
    SheetArea part { placeOf(rows, area.row), placeOf(columns, area.column) };
    part.rows = placeOf(rows, area.row + area.rows) - part.row;
    part.columns = placeOf(columns, area.column + area.columns) - part.column;
    return part;
}

template <typename Line>
void closeGaps(std::span<const std::int32_t> places, std::vector<Line>& lines)
{
    std::size_t kept = 0;
    for (std::size_t at = 0; at < lines.size(); ++at) {
        if (isHidden(places, static_cast<std::int64_t>(at)))
            continue;
        if (kept != at)
            lines[kept] = std::move(lines[at]);
        ++kept;
    }
    lines.resize(kept);
}

} // namespace

Color colorNumber(const QColor& color) { return rgb(color.red(), color.green(), color.blue()); }

/// A sheet has few looks, and neighbours mostly the same. More than can be numbered look plain.
std::uint16_t SheetCells::numberOf(const CellLook& look)
{
    const auto found = std::ranges::find(looks_.rbegin(), looks_.rend(), look);
    if (found != looks_.rend())
        return static_cast<std::uint16_t>(looks_.rend() - found - 1);
    if (looks_.size() > MostLooks)
        return 0;
    looks_.push_back(look);
    return static_cast<std::uint16_t>(looks_.size() - 1);
}

SheetArea SheetArea::within(const SheetArea& other) const
{
    SheetArea common { std::max(row, other.row), std::max(column, other.column) };
    common.rows = std::min(row + rows, other.row + other.rows) - common.row;
    common.columns = std::min(column + columns, other.column + other.columns) - common.column;
    return common;
}

void SheetCells::requireRoom(std::int64_t cells, std::int64_t characters) const
{
    if (cells > MostCells - cells_)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"the sheet holds more than %1 cells; save the part that is wanted as CSV",
                { decimal(MostCells) }));
    if (characters > MostCharacters - characters_)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"the sheet holds more than %1 characters; save the part that is wanted as CSV",
                { decimal(MostCharacters) }));
}

void SheetCells::put(
    std::int64_t row, std::int64_t column, Text text, const SheetLook& look, SheetValue value)
{
    if (row < 0 || row >= MostRows || column < 0 || column >= MostColumns)
        throw RunTimeError(ErrorNumber::Overflow, phrase(u"a cell past the end of its sheet"));
    if (text.empty())
        return fillBlanks({ row, column }, look);
    const auto characters = static_cast<std::int64_t>(text.size());
    requireRoom(0, characters);
    if (rows_.size() <= static_cast<std::size_t>(row))
        rows_.resize(static_cast<std::size_t>(row) + 1);
    std::vector<Cell>& cells = rows_[static_cast<std::size_t>(row)];
    if (const std::int64_t more = column + 1 - std::ssize(cells); more > 0) {
        requireRoom(more, 0);
        cells.resize(static_cast<std::size_t>(column) + 1);
        cells_ += more;
    }
    characters_ += characters;
    CellLook seen = look.cell;
    if (!look.isAligned)
        seen.alignment = UsualAlignments[static_cast<std::size_t>(value)];
    cells[static_cast<std::size_t>(column)] = { std::move(text), numberOf(seen) };
}

void SheetCells::fillBlanks(const SheetArea& area, const SheetLook& look)
{
    if (!look.cell.background && blanks_.empty())
        return;
    CellLook seen;
    seen.background = look.cell.background;
    blanks_.push_back({ area, numberOf(seen) });
}

void SheetCells::merge(const SheetArea& area)
{
    if (area.rows > 1 || area.columns > 1)
        boxes_.push_back(area);
}

void HiddenLines::hide(std::int64_t first, std::int64_t count)
{
    const std::int64_t end = std::min(first + count, most_);
    if (first < 0 || first >= end)
        return;
    if (changes_.empty())
        changes_.resize(static_cast<std::size_t>(most_) + 1);
    ++changes_[static_cast<std::size_t>(first)];
    --changes_[static_cast<std::size_t>(end)];
}

std::vector<std::int32_t> HiddenLines::places() const
{
    std::vector<std::int32_t> places;
    places.reserve(changes_.size());
    std::int32_t shown = 0;
    std::int32_t hiding = 0;
    for (const std::int32_t change : changes_) {
        places.push_back(shown);
        hiding += change;
        shown += hiding == 0 ? 1 : 0;
    }
    return places;
}

/// What a box shows goes to the first of its cells that is not hidden.
void SheetCells::moveBoxTexts(
    std::span<const std::int32_t> rows, std::span<const std::int32_t> columns)
{
    for (const SheetArea& box : boxes_) {
        const std::int64_t row = firstShown(rows, box.row, box.rows);
        const std::int64_t column = firstShown(columns, box.column, box.columns);
        if (row < 0 || column < 0 || (row == box.row && column == box.column)
            || box.row >= std::ssize(rows_))
            continue;
        const std::vector<Cell>& from = rows_[static_cast<std::size_t>(box.row)];
        if (box.column >= std::ssize(from))
            continue;
        Cell shown = from[static_cast<std::size_t>(box.column)];
        if (row >= std::ssize(rows_))
            rows_.resize(static_cast<std::size_t>(row) + 1);
        std::vector<Cell>& into = rows_[static_cast<std::size_t>(row)];
        if (const std::int64_t more = column + 1 - std::ssize(into); more > 0) {
            requireRoom(more, 0);
            into.resize(static_cast<std::size_t>(column) + 1);
            cells_ += more;
        }
        into[static_cast<std::size_t>(column)] = std::move(shown);
    }
}

/// How many of the hidden lines hold texts.
HiddenCount SheetCells::countHidden(
    std::span<const std::int32_t> rows, std::span<const std::int32_t> columns) const
{
    HiddenCount count;
    std::vector<bool> isFilled(columns.size());
    for (std::int64_t row = 0; row < std::ssize(rows_); ++row) {
        bool isRowFilled = false;
        std::int64_t column = 0;
        for (const Cell& cell : rows_[static_cast<std::size_t>(row)]) {
            if (!cell.text.empty() && isHidden(columns, column))
                isFilled[static_cast<std::size_t>(column)] = true;
            isRowFilled = isRowFilled || !cell.text.empty();
            ++column;
        }
        count.rows += isRowFilled && isHidden(rows, row) ? 1 : 0;
    }
    count.columns = std::ranges::count(isFilled, true);
    return count;
}

HiddenCount SheetCells::leaveOutHidden()
{
    const std::vector<std::int32_t> rows = hiddenRows_.places();
    const std::vector<std::int32_t> columns = hiddenColumns_.places();
    const HiddenCount count = countHidden(rows, columns);
    moveBoxTexts(rows, columns);
    closeGaps(rows, rows_);
    for (std::vector<Cell>& row : rows_)
        closeGaps(columns, row);
    for (Blanks& blanks : blanks_)
        blanks.area = shownPart(blanks.area, rows, columns);
    for (SheetArea& box : boxes_)
        box = shownPart(box, rows, columns);
    std::erase_if(boxes_, [](const SheetArea& box) { return box.rows * box.columns <= 1; });
    for (Width& width : widths_) {
        const SheetArea part = shownPart({ 0, width.column, 1, width.columns }, {}, columns);
        width = { part.column, part.columns, width.width };
    }
    const auto isBlank = [](const std::vector<Cell>& row) {
        return std::ranges::all_of(row, [](const Cell& cell) { return cell.text.empty(); });
    };
    if (count != HiddenCount() && std::ranges::all_of(rows_, isBlank))
        throw RunTimeError(
            ErrorNumber::TypeMismatch, phrase(u"all that the sheet holds is hidden"));
    return count;
}

void SheetCells::setWidth(std::int64_t column, std::int64_t columns, Twips width)
{
    widths_.push_back({ column, columns, width });
}

/// From the row of titles to the last row, and from the first to the last column that hold texts.
SheetArea SheetCells::filledArea() const
{
    const auto isFilled = [](const Cell& cell) { return !cell.text.empty(); };
    std::int64_t first = MostColumns;
    std::int64_t end = 0;
    std::int64_t titles = -1;
    for (std::size_t row = 0; row < rows_.size(); ++row) {
        const std::vector<Cell>& cells = rows_[row];
        const auto filled = std::ranges::find_if(cells, isFilled);
        if (filled == cells.end())
            continue;
        if (titles < 0)
            titles = static_cast<std::int64_t>(row);
        first = std::min<std::int64_t>(first, filled - cells.begin());
        end = std::max(end, std::ssize(cells));
    }
    if (titles < 0)
        throw RunTimeError(ErrorNumber::TypeMismatch, phrase(u"the sheet is empty"));
    return { titles, first, std::ssize(rows_) - titles, end - first };
}

std::vector<TableColumn> SheetCells::columnsOf(const SheetArea& area) const
{
    std::vector<TableColumn> columns(
        static_cast<std::size_t>(area.columns), TableColumn { .title = {}, .width = -1 });
    const std::vector<Cell>& titles = rows_[static_cast<std::size_t>(area.row)];
    for (auto column = static_cast<std::size_t>(area.column); column < titles.size(); ++column) {
        TableColumn& made = columns[column - static_cast<std::size_t>(area.column)];
        made.title = titles[column].text;
        made.alignment = looks_[titles[column].look].alignment;
    }
    for (const Width& width : widths_) {
        const SheetArea part = SheetArea { area.row, width.column, 1, width.columns }.within(area);
        for (std::int64_t column = 0; column < part.columns; ++column)
            columns[static_cast<std::size_t>(part.column - area.column + column)].shownWidth
                = width.width;
    }
    return columns;
}

TableGrid SheetCells::toTable() const
{
    const SheetArea all = filledArea();
    const SheetArea body { all.row + 1, all.column, all.rows - 1, all.columns };
    // The corners of an area may be all that it holds.
    if (static_cast<std::uint64_t>(all.rows * all.columns) > TableGrid::MostCells)
        requireRoom(MostCells + 1, 0);
    TableGrid grid(columnsOf(all));
    ShownCells shown(body, looks_);
    for (const Blanks& blanks : blanks_)
        shown.fill(blanks.area, blanks.look);
    std::vector<TextView> texts(static_cast<std::size_t>(body.columns));
    for (std::int64_t row = 0; row < body.rows; ++row) {
        const std::vector<Cell>& cells = rows_[static_cast<std::size_t>(body.row + row)];
        for (std::int64_t column = 0; column < body.columns; ++column) {
            const auto at = static_cast<std::size_t>(body.column + column);
            if (at < cells.size() && !cells[at].text.empty())
                shown.lookAt(row, column) = cells[at].look;
        }
    }
    for (const SheetArea& box : boxes_)
        shown.merge(box);
    grid.setLooks(shown.looks());
    for (std::int64_t row = 0; row < body.rows; ++row) {
        const std::vector<Cell>& cells = rows_[static_cast<std::size_t>(body.row + row)];
        for (std::size_t column = 0; column < texts.size(); ++column) {
            const std::size_t at = static_cast<std::size_t>(body.column) + column;
            texts[column] = at < cells.size() ? TextView(cells[at].text) : TextView();
        }
        grid.addRow(texts, shown.row(row));
    }
    return grid;
}

void refuseSheet(const QString& sheet, const QStringList& present)
{
    throw RunTimeError(ErrorNumber::InvalidCall,
        phrase(u"no sheet %1; the file has: %2",
            { toText(sheet), toText(present.join(QStringLiteral(", "))) }));
}

void refuseDamaged()
{
    throw RunTimeError(ErrorNumber::TypeMismatch,
        phrase(u"the office file is damaged; open it in its program and save it again, or save it "
               u"as CSV"));
}

} // namespace pelloric::qt
