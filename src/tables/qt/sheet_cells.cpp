// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/sheet_cells.h"

#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QStringList>

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr std::int64_t MostRows = 1048576;
constexpr std::int64_t MostSheetColumns = 16384;

} // namespace

void SheetCells::put(std::int64_t row, std::int64_t column, Text text)
{
    if (row < 0 || row >= MostRows || column < 0 || column >= MostSheetColumns)
        throw RunTimeError(ErrorNumber::Overflow, u"a cell past the end of its sheet");
    if (text.empty())
        return;
    if (rows_.size() <= static_cast<std::size_t>(row))
        rows_.resize(static_cast<std::size_t>(row) + 1);
    std::vector<Text>& cells = rows_[static_cast<std::size_t>(row)];
    if (cells.size() <= static_cast<std::size_t>(column))
        cells.resize(static_cast<std::size_t>(column) + 1);
    cells[static_cast<std::size_t>(column)] = std::move(text);
}

TableGrid SheetCells::toTable() const
{
    const auto isFilled = [](const Text& text) { return !text.empty(); };
    std::size_t first = MostSheetColumns;
    std::size_t end = 0;
    for (const std::vector<Text>& cells : rows_) {
        const auto filled = std::ranges::find_if(cells, isFilled);
        if (filled != cells.end())
            first = std::min(first, static_cast<std::size_t>(filled - cells.begin()));
        end = std::max(end, cells.size());
    }
    const auto titles = std::ranges::find_if(rows_,
        [&](const std::vector<Text>& cells) { return std::ranges::any_of(cells, isFilled); });
    if (titles == rows_.end())
        throw RunTimeError(ErrorNumber::TypeMismatch, u"the sheet is empty");
    std::vector<TableColumn> columns(end - first, TableColumn { .title = {}, .width = -1 });
    for (std::size_t column = first; column < titles->size(); ++column)
        columns[column - first].title = (*titles)[column];
    TableGrid grid(std::move(columns));
    for (auto row = titles + 1; row != rows_.end(); ++row) {
        const auto begin = std::min(row->size(), first);
        grid.addRow(
            std::vector<TextView>(row->begin() + static_cast<std::ptrdiff_t>(begin), row->end()));
    }
    return grid;
}

void refuseSheet(const QString& sheet, const QStringList& present)
{
    throw RunTimeError(ErrorNumber::InvalidCall,
        toText(QStringLiteral("no sheet %1; the file has: %2")
                   .arg(sheet, present.join(QStringLiteral(", ")))));
}

void refuseDamaged()
{
    throw RunTimeError(ErrorNumber::TypeMismatch,
        u"the office file is damaged; open it in its program and save it again, or save it as CSV");
}

} // namespace pelloric::qt
