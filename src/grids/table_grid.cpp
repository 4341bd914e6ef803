// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/table_grid.h"

#include "platform/member_names.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "platform/text_copy.h"

#include <algorithm>
#include <iterator>
#include <limits>

namespace pelloric {

namespace {

enum Member { Cols, Rows, ColWidth, TextMatrix, MemberCount };

constexpr TextView Names[] = { u"Cols", u"Rows", u"ColWidth", u"TextMatrix" };
static_assert(std::size(Names) == MemberCount);

} // namespace

TableGrid::TableGrid(std::vector<TableColumn> columns)
    : columns_(std::move(columns))
    , store_(std::make_shared<TextStore>())
{
}

void TableGrid::reserve(std::size_t rows)
{
    rowStarts_.reserve(rows);
    cellEnds_.reserve(std::min<std::size_t>(rows * columns_.size(), MostCells));
}

void TableGrid::requireRoom(std::size_t rows, std::size_t columns) const
{
    if (columns > 0 && rows > MostCells / columns)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"row %1 of a table of %2 columns makes more than %3 cells; take fewer rows or "
                   u"columns",
                { decimal(rowCount()), decimal(static_cast<std::int64_t>(columns)),
                    decimal(static_cast<std::int64_t>(MostCells)) }));
}

void TableGrid::widen(std::size_t count, const TableColumn& column)
{
    requireRoom(rowStarts_.size(), count);
    const std::size_t before = columns_.size();
    std::vector<std::uint32_t> ends;
    ends.reserve(std::min<std::size_t>(rowStarts_.capacity() * count, MostCells));
    for (std::size_t row = 0; row < rowStarts_.size(); ++row) {
        const auto first = cellEnds_.begin() + static_cast<std::ptrdiff_t>(row * before);
        ends.insert(ends.end(), first, first + static_cast<std::ptrdiff_t>(before));
        ends.resize((row + 1) * count, before > 0 ? ends.back() : 0);
    }
    cellEnds_ = std::move(ends);
    if (!looks_.empty()) {
        std::vector<std::uint16_t> looks(rowStarts_.size() * count);
        for (std::size_t row = 0; row < rowStarts_.size(); ++row)
            std::copy_n(cellLooks_.begin() + static_cast<std::ptrdiff_t>(row * before), before,
                looks.begin() + static_cast<std::ptrdiff_t>(row * count));
        cellLooks_ = std::move(looks);
    }
    columns_.resize(count, column);
}

void TableGrid::addRow(std::span<const TextView> cells, std::span<const std::uint16_t> looks)
{
    if (cells.size() > columns_.size())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            phrase(u"a row of %1 cells; there are %2 columns",
                { decimal(static_cast<std::int64_t>(cells.size())), decimal(columnCount()) }));
    std::uint64_t length = 0;
    for (const TextView cell : cells)
        length += cell.size();
    if (length > std::numeric_limits<std::uint32_t>::max())
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"row %1 holds more than 4294967295 characters", { decimal(rowCount() + 1) }));

    requireRoom(rowStarts_.size() + 1, columns_.size());
    char16_t* const texts = store_->room(length);
    rowStarts_.push_back(texts);
    std::uint32_t end = 0;
    for (const TextView cell : cells) {
        putText(texts + end, cell);
        end += static_cast<std::uint32_t>(cell.size());
        cellEnds_.push_back(end);
    }
    cellEnds_.resize(rowStarts_.size() * columns_.size(), end);
    if (looks_.empty())
        return;
    const std::size_t count = std::min(looks.size(), columns_.size());
    cellLooks_.insert(
        cellLooks_.end(), looks.begin(), looks.begin() + static_cast<std::ptrdiff_t>(count));
    cellLooks_.resize(rowStarts_.size() * columns_.size());
}

void TableGrid::setLooks(std::vector<CellLook> looks) { looks_ = std::move(looks); }

std::uint16_t TableGrid::lookNumber(std::int64_t row, int column) const
{
    const std::size_t cell
        = static_cast<std::size_t>(row) * columns_.size() + static_cast<std::size_t>(column);
    return cell < cellLooks_.size() ? cellLooks_[cell] : std::uint16_t { 0 };
}

void TableGrid::readLook(std::int32_t row, std::int32_t column, CellLook& look)
{
    const std::size_t number = row > 0 ? lookNumber(std::int64_t { row } - 1, column) : 0;
    look = number < looks_.size() ? looks_[number] : CellLook();
}

CellAlignment TableGrid::titleAlignment(std::int32_t column)
{
    return this->column(column).alignment;
}

const TableColumn& TableGrid::column(int column) const
{
    if (column < 0 || column >= columnCount())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"column"), std::int64_t { column } + 1, columnCount()));
    return columns_[static_cast<std::size_t>(column)];
}

TextView TableGrid::cell(std::int64_t row, int column) const
{
    if (row < 0 || row >= rowCount())
        throw RunTimeError(
            ErrorNumber::SubscriptOutOfRange, noSuchItem(phrase(u"row"), row + 1, rowCount()));
    if (column < 0 || column >= columnCount())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"column"), std::int64_t { column } + 1, columnCount()));
    const auto at = static_cast<std::size_t>(row);
    const std::size_t first = at * columns_.size();
    const std::size_t cell = first + static_cast<std::size_t>(column);
    const std::size_t begin = cell == first ? 0 : cellEnds_[cell - 1];
    return TextView(rowStarts_[at] + begin, cellEnds_[cell] - begin);
}

void TableGrid::rowTexts(std::int32_t row, std::span<TextView> into) const
{
    if (row < 1 || row > rowCount())
        throw RunTimeError(
            ErrorNumber::SubscriptOutOfRange, noSuchItem(phrase(u"row"), row, rowCount()));
    const auto at = static_cast<std::size_t>(row - 1);
    const std::uint32_t* end = cellEnds_.data() + at * columns_.size();
    std::uint32_t begin = 0;
    for (TextView& text : into) {
        text = TextView(rowStarts_[at] + begin, *end - begin);
        begin = *end++;
    }
}

std::optional<MemberId> TableGrid::findMember(TextView name) { return findMemberName(Names, name); }

const void* TableGrid::memberTable() const { return Names; }

Value TableGrid::get(MemberId member, std::span<const Value> arguments)
{
    const auto rows = static_cast<int>(rowCount());
    switch (member) {
    case Cols:
        return Value::ofNumber(columnCount());
    case Rows:
        return Value::ofNumber(rows + 1);
    case ColWidth:
        return Value::ofNumber(column(indexArgument(arguments, 0, 0, columnCount() - 1)).width);
    case TextMatrix: {
        const int row = indexArgument(arguments, 0, 0, rows);
        const int at = indexArgument(arguments, 1, 0, columnCount() - 1);
        return Value::ofText(row == 0 ? TextView(column(at).title) : cell(row - 1, at));
    }
    default:
        refuseMember(Names, member);
    }
}

void TableGrid::put(MemberId member, std::span<const Value> arguments, const Value& value)
{
    if (member != ColWidth)
        refuseMember(Names, member);
    const int at = indexArgument(arguments, 0, 0, columnCount() - 1);
    columns_[static_cast<std::size_t>(at)].width = roundToInt32(value.toNumber());
}

} // namespace pelloric
