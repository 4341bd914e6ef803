// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/grid_reader.h"

#include "document/cell_lines.h"
#include "document/limits.h"
#include "platform/automation_object.h"
#include "platform/cell_look.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/row_cells.h"
#include "platform/run_time_error.h"
#include "report/flex_rows.h"
#include "report/late_bound_rows.h"
#include "report/page_limit.h"
#include "report/table_row_set.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace pelloric {

/// What the readers fill of a `GridTable`.
struct GridTableParts {
    static TableRowSet& newTable(GridTable& result, const GridRequest& request)
    {
        result.table_ = std::make_unique<TableRowSet>(request.store);
        return *result.table_;
    }

    static void finishTable(GridTable& result)
    {
        if (result.table_->fieldCount() > 0)
            result.rows = result.table_.get();
    }

    static void takeSource(GridTable& result, const Value& source)
    {
        if (source.kind() == ValueKind::Object) {
            result.lateBound_ = std::make_unique<LateBoundRows>(source.toObject());
            result.rows = result.lateBound_.get();
        } else {
            result.rows = &source.toRows();
        }
    }
};

namespace {

constexpr double DefaultWidthMarker = -1; ///< a flex grid's column of no definite width
constexpr double DefinedWidth = 2000; ///< twips; what such a column gets
constexpr double WidenedWidth = 216; ///< twips; what a hidden column of a data grid gets

bool isPrinted(double width) { return width > CellPadding; }

/// A column of the grid that is printed.
struct PrintedColumn {
    int position = 0; ///< in the grid, from 0
    double width = 0; ///< twips
};

void addColumn(std::vector<PrintedColumn>& columns, const PrintedColumn& column)
{
    if (columns.size() == MostColumns)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"more than %1 columns are printed; leave some out", { decimal(MostColumns) }));
    columns.push_back(column);
}

std::int32_t wholeNumber(const Value& value) { return roundToInt32(value.toNumber()); }

/// The number of a grid's columns, refused where looking at them would not end.
std::int32_t columnCount(std::int32_t count)
{
    if (count > MostGridColumns)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"the grid has %1 columns, at most %2 can be read",
                { decimal(count), decimal(MostGridColumns) }));
    return count;
}

/// Names a field after its title; an empty title gets a name of its own, and a name that is there
/// already gets the column's number behind it.
void appendTitle(TableRowSet& table, TextView title, int position)
{
    const Text number = decimal(position);
    const Text name = title.empty() ? u"NULL" + number : Text(title);
    table.appendField(table.fieldExists(name) ? name + number : name);
}

std::vector<double> widthsOf(std::span<const PrintedColumn> columns)
{
    std::vector<double> widths;
    widths.reserve(columns.size());
    for (const PrintedColumn& column : columns)
        widths.push_back(column.width);
    return widths;
}

std::vector<int> positionsOf(std::span<const PrintedColumn> columns)
{
    std::vector<int> positions;
    positions.reserve(columns.size());
    for (const PrintedColumn& column : columns)
        positions.push_back(column.position);
    return positions;
}

void setWidths(GridTable& result, std::vector<double> gridWidths, const GridRequest& request)
{
    narrowToInt16(static_cast<std::int64_t>(gridWidths.size()));
    if (request.keptWidths) {
        if (request.keptWidths->size() != gridWidths.size())
            throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
                phrase(u"the grid prints %1 columns now, the report was built with %2; preview it "
                       u"anew",
                    { decimal(std::ssize(gridWidths)), decimal(std::ssize(*request.keptWidths)) }));
        gridWidths.assign(request.keptWidths->begin(), request.keptWidths->end());
    }
    result.ColumnWidths = std::move(gridWidths);
    result.tableWidth = tableWidthOf(result.ColumnWidths);
    result.ColumnBands
        = cutColumnBands(result.ColumnWidths, request.paperWidth, request.leftMargin);
}

/// The members of a flex grid.
class FlexGrid {
public:
    explicit FlexGrid(AutomationObject& grid)
        : grid_(grid)
        , colWidth_(memberOf(grid, u"ColWidth"))
        , textMatrix_(memberOf(grid, u"TextMatrix"))
        , columns_(columnCount(wholeNumber(getMember(grid, u"Cols"))))
    {
    }

    int columns() const { return columns_; }
    std::int32_t rows() const { return wholeNumber(getMember(grid_, u"Rows")); }

    double width(int column) const
    {
        const Value index = Value::ofNumber(column);
        return grid_.get(colWidth_, { &index, 1 }).toNumber();
    }

    void setWidth(int column, double width) const
    {
        const Value index = Value::ofNumber(column);
        grid_.put(colWidth_, { &index, 1 }, Value::ofNumber(width));
    }

    Value title(int column) const
    {
        const Value indexes[] = { Value::ofNumber(0), Value::ofNumber(column) };
        return grid_.get(textMatrix_, indexes);
    }

private:
    AutomationObject& grid_;
    MemberId colWidth_;
    MemberId textMatrix_;
    int columns_;
};

GridTable readFlexGrid(AutomationObject& object, const GridRequest& request)
{
    const FlexGrid grid(object);
    Pulse pulse(request.loop);
    std::vector<PrintedColumn> columns;
    for (int column = 0; column < grid.columns(); ++column) {
        pulse.beat();
        if (grid.width(column) == DefaultWidthMarker)
            grid.setWidth(column, DefinedWidth);
    }
    for (int column = 0; column < grid.columns(); ++column) {
        pulse.beat();
        const double width = grid.width(column);
        if (isPrinted(width))
            addColumn(columns, { column, width });
    }
    GridTable result;
    if (columns.empty())
        return result;
    TableRowSet& table = GridTableParts::newTable(result, request);
    Text buffer;
    for (const PrintedColumn& column : columns) {
        const Value title = grid.title(column.position);
        appendTitle(table, displayText(title, request.decimalSeparator, buffer), column.position);
    }
    const std::int32_t rows = grid.rows();
    const std::int64_t records = std::int64_t { rows } - std::max(0, request.startRow);
    requireRowsToFit(records, request.mostRows);
    table.reserveRecords(records);
    const std::vector<int> positions = positionsOf(columns);
    result.lentTexts
        = readFlexRows({ object, grid.columns(), positions, request.startRow, rows }, table, pulse);
    setWidths(result, widthsOf(columns), request);
    result.gridColumns = positions;
    result.firstLookRow = request.startRow;
    GridTableParts::finishTable(result);
    return result;
}

/// A collection whose items count from a first index.
class Collection {
public:
    explicit Collection(AutomationObject& object)
        : object_(object)
        , item_(memberOf(object, u"Item"))
        , count_(wholeNumber(getMember(object, u"Count")))
    {
    }

    int count() const { return count_; }

    AutomationObject& item(int index) const
    {
        const Value argument = Value::ofNumber(index);
        return object_.get(item_, { &argument, 1 }).toObject();
    }

private:
    AutomationObject& object_;
    MemberId item_;
    int count_;
};

std::vector<PrintedColumn> readHeaders(
    AutomationObject& object, TableRowSet& table, const GridRequest& request)
{
    const Collection headers(getMember(object, u"ColumnHeaders").toObject());
    const int count = columnCount(headers.count());
    Pulse pulse(request.loop);
    MemberOfItems widthMember(u"Width");
    MemberOfItems textMember(u"Text");
    std::vector<PrintedColumn> columns;
    Text buffer;
    for (int position = 0; position < count; ++position) {
        pulse.beat();
        AutomationObject& header = headers.item(position + 1);
        const double width = header.get(widthMember.of(header), {}).toNumber();
        if (!isPrinted(width))
            continue;
        const Value title = header.get(textMember.of(header), {});
        appendTitle(table, displayText(title, request.decimalSeparator, buffer), position);
        addColumn(columns, { position, width });
    }
    return columns;
}

void readItems(
    const Collection& items, std::span<const int> columns, TableRowSet& table, Pulse& pulse)
{
    MemberOfItems textMember(u"Text");
    MemberOfItems subItemsMember(u"SubItems");
    for (int number = 1; number <= items.count(); ++number) {
        AutomationObject& item = items.item(number);
        table.addRecord();
        int field = 0;
        for (const int column : columns) {
            pulse.beat();
            const Value position = Value::ofNumber(column);
            table.setLast(field++,
                column == 0 ? item.get(textMember.of(item), {})
                            : item.get(subItemsMember.of(item), { &position, 1 }));
        }
    }
}

GridTable readListView(AutomationObject& object, const GridRequest& request)
{
    GridTable result;
    TableRowSet& table = GridTableParts::newTable(result, request);
    const auto columns = readHeaders(object, table, request);
    if (columns.empty())
        return {};
    const Collection items(getMember(object, u"ListItems").toObject());
    requireRowsToFit(items.count(), request.mostRows);
    Pulse pulse(request.loop);
    table.reserveRecords(items.count());
    const std::vector<int> positions = positionsOf(columns);
    if (auto* const whole = dynamic_cast<RowCells*>(&object))
        readWholeRows(*whole, { 1, items.count() + 1, positions }, table, pulse);
    else
        readItems(items, positions, table, pulse);
    setWidths(result, widthsOf(columns), request);
    result.gridColumns = positions;
    GridTableParts::finishTable(result);
    return result;
}

/// Selects every column in turn, widens it when it is hidden, and tells its width.
std::vector<double> readDataColumns(AutomationObject& object, const GridRequest& request)
{
    const MemberId columnsMember = memberOf(object, u"Columns");
    const MemberId selected = memberOf(object, u"col");
    MemberOfItems widthMember(u"Width");
    std::vector<double> widths;
    Pulse pulse(request.loop);
    const int count = columnCount(Collection(object.get(columnsMember, {}).toObject()).count());
    for (int position = 0; position < count; ++position) {
        pulse.beat();
        object.put(selected, {}, Value::ofNumber(position));
        const Collection columns(object.get(columnsMember, {}).toObject());
        AutomationObject& column = columns.item(position);
        const MemberId width = widthMember.of(column);
        if (!isPrinted(column.get(width, {}).toNumber()))
            column.put(width, {}, Value::ofNumber(WidenedWidth));
        widths.push_back(column.get(width, {}).toNumber());
    }
    return widths;
}

GridTable readDataGrid(AutomationObject& object, const GridRequest& request)
{
    const MemberId source = memberOf(object, u"DataSource");
    std::vector<double> widths = readDataColumns(object, request);
    if (widths.empty())
        return {};
    GridTable result;
    GridTableParts::takeSource(result, object.get(source, {}));
    if (static_cast<std::size_t>(result.rows->fieldCount()) < widths.size())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            phrase(u"the data grid has more columns than fields"));
    requireRowsToFit(result.rows->recordCount(), request.mostRows);
    result.gridColumns.resize(widths.size());
    std::iota(result.gridColumns.begin(), result.gridColumns.end(), 0);
    setWidths(result, std::move(widths), request);
    return result;
}

struct ReaderRow {
    PrintObjKind kind;
    GridTable (*read)(AutomationObject&, const GridRequest&);
};

constexpr ReaderRow Readers[] = {
    { PrintObjKind::MSHFlexGrid, readFlexGrid },
    { PrintObjKind::MSFlexGrid, readFlexGrid },
    { PrintObjKind::ListView, readListView },
    { PrintObjKind::datagrid, readDataGrid },
};

} // namespace

GridTable::GridTable() = default;
GridTable::~GridTable() = default;
GridTable::GridTable(GridTable&&) noexcept = default;
GridTable& GridTable::operator=(GridTable&&) noexcept = default;

void GridTable::dropBorrowedRows()
{
    lateBound_.reset();
    looks = nullptr;
    rows = table_.get();
}

void GridTable::dropRows()
{
    table_.reset();
    dropBorrowedRows();
}

std::size_t GridTable::memoryBytes() const { return table_ ? table_->memoryBytes() : 0; }

GridTable readGrid(AutomationObject& grid, const GridRequest& request)
{
    for (const ReaderRow& row : Readers) {
        if (row.kind != request.kind)
            continue;
        GridTable table = row.read(grid, request);
        table.looks = grid.cellLooks();
        for (int field = 0; table.rows != nullptr && field < table.rows->fieldCount(); ++field)
            table.fieldNames.emplace_back(table.rows->fieldName(field));
        return table;
    }
    throw RunTimeError(ErrorNumber::InvalidCall, phrase(u"m_PrintObj names no kind of grid"));
}

} // namespace pelloric
