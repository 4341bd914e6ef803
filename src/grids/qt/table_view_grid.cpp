// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/table_view_grid.h"

#include "grids/qt/data_view_grid.h"
#include "platform/drawing_surface.h"
#include "platform/member_names.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QHeaderView>
#include <QItemSelectionModel>
#include <QStyle>
#include <QStyleOptionViewItem>
#include <QTableView>

#include <iterator>

namespace pelloric::qt {

namespace {

enum Member { Cols, Rows, ColWidth, TextMatrix, MemberCount };

constexpr TextView Names[] = { u"Cols", u"Rows", u"ColWidth", u"TextMatrix" };
static_assert(std::size(Names) == MemberCount);

} // namespace

TableViewGrid::TableViewGrid(QTableView& view)
    : view_(&view)
{
    takeAnew();
}

TableViewGrid::~TableViewGrid() = default;

/// The members of the data grid follow its own.
std::optional<MemberId> TableViewGrid::findMember(TextView name)
{
    if (const auto own = findMemberName(Names, name))
        return own;
    const auto ofDataGrid = dataGrid().findMember(name);
    return ofDataGrid ? std::optional<MemberId>(MemberCount + *ofDataGrid) : std::nullopt;
}

const void* TableViewGrid::memberTable() const { return Names; }

Value TableViewGrid::get(MemberId member, std::span<const Value> arguments)
{
    switch (member) {
    case Cols:
        takeAnew();
        return Value::ofNumber(columns_.count());
    case Rows:
        return Value::ofNumber(rows_.count() + 1);
    case ColWidth:
        return Value::ofNumber(sectionWidth(*view().horizontalHeader(), columnOf(arguments, 0)));
    case TextMatrix: {
        const int row = indexArgument(arguments, 0, 0, rows_.count());
        const int column = indexArgument(arguments, 1, 0, columns_.count() - 1);
        if (row == 0)
            return Value::ofText(title(columns_.logical(column)));
        TextView shown;
        readRow(row, { &column, 1 }, [&](TextView text) { shown = text; });
        return Value::ofText(shown);
    }
    default:
        if (DataViewGrid::takesRows(member - MemberCount))
            takeAnew();
        return dataGrid().get(member - MemberCount, arguments);
    }
}

void TableViewGrid::put(MemberId member, std::span<const Value> arguments, const Value& value)
{
    if (member >= MemberCount) {
        dataGrid().put(member - MemberCount, arguments, value);
        return;
    }
    if (member != ColWidth)
        refuseMember(Names, member);
    const int column = columnOf(arguments, 0);
    setSectionWidth(*view().horizontalHeader(), column, roundToInt32(value.toNumber()));
}

QTableView& TableViewGrid::view() const
{
    if (!view_ || !view_->model())
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"the grid is gone"));
    return *view_;
}

void TableViewGrid::takeAnew()
{
    QTableView& table = view();
    fetchAll(*table.model(), table.rootIndex());
    rows_ = SectionMap::shown(*table.verticalHeader());
    columns_ = SectionMap::all(*table.horizontalHeader());
    spans_ = CellSpans(table, rows_, columns_);
    text_.take(table);
    looks_.take(table);
}

DataViewGrid& TableViewGrid::dataGrid()
{
    if (!dataGrid_)
        dataGrid_ = std::make_unique<DataViewGrid>(view());
    return *dataGrid_;
}

int TableViewGrid::columnOf(std::span<const Value> arguments, std::size_t position) const
{
    return columns_.logical(indexArgument(arguments, position, 0, columns_.count() - 1));
}

void TableViewGrid::readRow(
    std::int32_t row, std::span<const int> columns, const std::function<void(TextView text)>& take)
{
    const QTableView& table = view();
    const QAbstractItemModel& model = *table.model();
    const QModelIndex root = table.rootIndex();
    if (row < 1 || row > rows_.count())
        throw RunTimeError(
            ErrorNumber::SubscriptOutOfRange, noSuchItem(phrase(u"row"), row, rows_.count()));
    const int modelRow = rows_.logical(row - 1);
    const int modelColumns = modelRow < model.rowCount(root) ? model.columnCount(root) : 0;
    for (const int column : columns) {
        const int modelColumn = columns_.logical(column);
        if (modelColumn >= modelColumns)
            throw RunTimeError(ErrorNumber::SubscriptOutOfRange, phrase(u"the grid has lost rows"));
        take(text(table, root, { modelRow, modelColumn }));
    }
}

/// @param column  the model's
TextView TableViewGrid::title(int column)
{
    title_ = columnTitle(*view().model(), column);
    return viewOf(title_);
}

TextView TableViewGrid::text(const QTableView& table, const QModelIndex& root, ModelCell cell)
{
    if (const CellSpan* const span = spans_.isEmpty() ? nullptr : spans_.at(cell)) {
        if (span->shown != cell)
            return {};
        cell = span->first;
    }
    return text_.of(table, table.model()->index(cell.row, cell.column, root));
}

GridLook TableViewGrid::gridLook()
{
    const QTableView& table = view();
    if (!table.showGrid())
        return ViewLooks::withoutLines();
    QStyleOptionViewItem option;
    option.initFrom(&table); // the palette that styles take the colour from
    const int hint = table.style()->styleHint(QStyle::SH_Table_GridLineColor, &option, &table);
    const QColor color = QColor::fromRgb(static_cast<QRgb>(hint));
    constexpr std::int16_t Styles[] = { 5, 0, 1, 2, 3, 4 }; // in the order of Qt::PenStyle
    const auto style = static_cast<std::size_t>(table.gridStyle());
    return GridLook { .showsLines = true,
        .lineStyle = style < std::size(Styles) ? Styles[style] : SolidPen,
        .lineColor = rgb(color.red(), color.green(), color.blue()) };
}

void TableViewGrid::readLook(std::int32_t row, std::int32_t column, CellLook& look)
{
    if (!hasCell(row, column)) {
        look = {};
        return;
    }
    const ModelCell cell { rows_.logical(row - 1), columns_.logical(column) };
    const CellSpan* const span = spans_.isEmpty() ? nullptr : spans_.at(cell);
    const ModelCell shown = span && span->shown == cell ? span->first : cell;
    const QTableView& table = view();
    looks_.read(table, table.model()->index(shown.row, shown.column, table.rootIndex()), look);
    looks_.alternate(row, look);
    if (span)
        look.box = CellBox { span->firstPlace.row + 1, span->lastPlace.row + 1,
            span->firstPlace.column, span->lastPlace.column };
}

TextView TableViewGrid::text(std::int32_t row, std::int32_t column)
{
    if (!hasCell(row, column))
        return {};
    const QTableView& table = view();
    return text(table, table.rootIndex(), { rows_.logical(row - 1), columns_.logical(column) });
}

CellAlignment TableViewGrid::titleAlignment(std::int32_t column)
{
    return ViewLooks::titleAlignment(*view().horizontalHeader(), columns_.logical(column));
}

bool TableViewGrid::isMarked(std::int32_t row)
{
    const QTableView& table = view();
    const QItemSelectionModel* const selection = table.selectionModel();
    return hasCell(row, 0) && selection
        && selection->rowIntersectsSelection(rows_.logical(row - 1), table.rootIndex());
}

std::optional<double> TableViewGrid::number(std::int32_t row, std::int32_t column)
{
    return hasCell(row, column) ? ViewLooks::number(indexOf(row, column)) : std::nullopt;
}

bool TableViewGrid::hasCell(std::int32_t row, std::int32_t column) const
{
    return row >= 1 && row <= rows_.count() && column >= 0 && column < columns_.count();
}

QModelIndex TableViewGrid::indexOf(std::int32_t row, std::int32_t column) const
{
    const QTableView& table = view();
    return table.model()->index(
        rows_.logical(row - 1), columns_.logical(column), table.rootIndex());
}

} // namespace pelloric::qt
