// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/sheet_cells.h"

#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QColor>
#include <QStringList>

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr std::int64_t MostRows = 1048576;
constexpr std::int64_t MostSheetColumns = 16384;
constexpr std::size_t MostLooks = 4000;

constexpr CellAlignment UsualAlignments[]
    = { CellAlignment::Left, CellAlignment::Right, CellAlignment::Centre };

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

void SheetCells::put(
    std::int64_t row, std::int64_t column, Text text, const SheetLook& look, SheetValue value)
{
    if (row < 0 || row >= MostRows || column < 0 || column >= MostSheetColumns)
        throw RunTimeError(ErrorNumber::Overflow, phrase(u"a cell past the end of its sheet"));
    if (text.empty())
        return;
    if (rows_.size() <= static_cast<std::size_t>(row))
        rows_.resize(static_cast<std::size_t>(row) + 1);
    std::vector<Cell>& cells = rows_[static_cast<std::size_t>(row)];
    if (cells.size() <= static_cast<std::size_t>(column))
        cells.resize(static_cast<std::size_t>(column) + 1);
    CellLook seen = look.cell;
    if (!look.isAligned)
        seen.alignment = UsualAlignments[static_cast<std::size_t>(value)];
    cells[static_cast<std::size_t>(column)] = { std::move(text), numberOf(seen) };
}

TableGrid SheetCells::toTable() const
{
    const auto isFilled = [](const Cell& cell) { return !cell.text.empty(); };
    std::size_t first = MostSheetColumns;
    std::size_t end = 0;
    for (const std::vector<Cell>& cells : rows_) {
        const auto filled = std::ranges::find_if(cells, isFilled);
        if (filled != cells.end())
            first = std::min(first, static_cast<std::size_t>(filled - cells.begin()));
        end = std::max(end, cells.size());
    }
    const auto titles = std::ranges::find_if(rows_,
        [&](const std::vector<Cell>& cells) { return std::ranges::any_of(cells, isFilled); });
    if (titles == rows_.end())
        throw RunTimeError(ErrorNumber::TypeMismatch, phrase(u"the sheet is empty"));
    std::vector<TableColumn> columns(end - first, TableColumn { .title = {}, .width = -1 });
    for (std::size_t column = first; column < titles->size(); ++column)
        columns[column - first] = { .title = (*titles)[column].text,
            .width = -1,
            .alignment = looks_[(*titles)[column].look].alignment };
    TableGrid grid(std::move(columns));
    grid.setLooks(looks_);
    std::vector<TextView> texts;
    std::vector<std::uint16_t> looks;
    for (auto row = titles + 1; row != rows_.end(); ++row) {
        texts.clear();
        looks.clear();
        for (std::size_t column = first; column < row->size(); ++column) {
            texts.emplace_back((*row)[column].text);
            looks.push_back((*row)[column].look);
        }
        grid.addRow(texts, looks);
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
