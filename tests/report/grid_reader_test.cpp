// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/grid_reader.h"

#include "fakes/fake_object.h"
#include "report/late_bound_rows.h"
#include "report/table_row_set.h"
#include "support/errors.h"
#include "support/report_world.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

using Widths = std::vector<double>;
using Names = std::vector<Text>;

GridRequest requestOf(PrintObjKind kind)
{
    GridRequest request;
    request.kind = kind;
    request.paperWidth = 11907;
    request.leftMargin = 680;
    request.store = std::make_shared<TextStore>();
    return request;
}

GridTable readAs(PrintObjKind kind, AutomationObject& grid)
{
    return readGrid(grid, requestOf(kind));
}

/// All records, fields divided by "," and records by ";".
std::string recordsOf(RowSet& rows)
{
    std::string shown;
    Text buffer;
    for (rows.moveFirst(); !rows.isAfterLast(); rows.moveNext()) {
        for (int field = 0; field < rows.fieldCount(); ++field)
            shown += toUtf8(displayText(rows.value(field), u'.', buffer)) + ",";
        shown += ";";
    }
    return shown;
}

} // namespace

TEST(FlexGridReader, LeavesTextsOfATableWhereTheyAre)
{
    TableGrid grid = gridOf({ { u"A", 1000 }, { u"B", 0 }, { u"C", 1000 } },
        { { u"1", u"2", u"3" }, { u"4", u"5", u"6" } });
    const GridTable table = readAs(PrintObjKind::MSFlexGrid, grid);
    EXPECT_EQ(recordsOf(*table.rows), "1,3,;4,6,;");
    table.rows->setPosition(2);
    EXPECT_EQ(table.rows->value(1).text().data(), grid.cell(1, 2).data());
    EXPECT_EQ(table.lentTexts, grid.keptTexts());
}

TEST(FlexGridReader, CopiesTheTitlesOfATableWhereTheyArePrintedAsARow)
{
    TableGrid grid = gridOf({ { u"A", 1000 } }, { { u"1" } });
    GridRequest request = requestOf(PrintObjKind::MSFlexGrid);
    request.startRow = 0;
    EXPECT_EQ(recordsOf(*readGrid(grid, request).rows), "A,;1,;");
    request.startRow = 2;
    EXPECT_EQ(recordsOf(*readGrid(grid, request).rows), "");
    request.startRow = -1;
    EXPECT_EQ(errorOf([&] { readGrid(grid, request); }), ErrorNumber::SubscriptOutOfRange);
}

TEST(FlexGridReader, CopiesTheColumnsWiderThan144Twips)
{
    TableGrid grid = gridOf({ { u"A", 145 }, { u"B", 144 }, { u"C", 0 }, { u"D", 1000 } },
        { { u"1", u"2", u"3", u"4" }, { u"5", u"6", u"7", u"8" } });
    for (const PrintObjKind kind : { PrintObjKind::MSHFlexGrid, PrintObjKind::MSFlexGrid }) {
        const GridTable table = readAs(kind, grid);
        EXPECT_EQ(table.fieldNames, (Names { u"A", u"D" }));
        EXPECT_EQ(table.ColumnWidths, (Widths { 145, 1000 }));
        EXPECT_EQ(table.tableWidth, 1145);
        EXPECT_EQ(table.fieldCount(), 2);
        EXPECT_EQ(table.ColumnBands, (std::vector<ColPos> { { 1, 2 } }));
        EXPECT_EQ(recordsOf(*table.rows), "1,4,;5,8,;");
    }
}

TEST(FlexGridReader, GivesAColumnOfTheDefaultWidth2000TwipsInTheHostsGrid)
{
    TableGrid grid = gridOf({ { u"A", -1 }, { u"B", -2 } }, {});
    const GridTable table = readAs(PrintObjKind::MSFlexGrid, grid);
    EXPECT_EQ(grid.column(0).width, 2000);
    EXPECT_EQ(grid.column(1).width, -2);
    EXPECT_EQ(table.ColumnWidths, (Widths { 2000 }));
}

TEST(FlexGridReader, NamesFieldsSoThatEachColumnHasOne)
{
    TableGrid grid = gridOf({ { u"Qty", 500 }, { u"Qty", 500 }, { u"", 500 }, { u"", 100 },
                                { u" ", 500 }, { u"qty", 500 }, { u"Qty1", 500 } },
        {});
    const GridTable table = readAs(PrintObjKind::MSFlexGrid, grid);
    EXPECT_EQ(table.fieldNames, (Names { u"Qty", u"Qty1", u"NULL2", u" ", u"qty", u"Qty16" }));
}

TEST(FlexGridReader, AcceptsAGeneratedNameThatCollides)
{
    TableGrid grid = gridOf({ { u"A2", 500 }, { u"A", 500 }, { u"A", 500 } }, {});
    EXPECT_EQ(readAs(PrintObjKind::MSFlexGrid, grid).fieldNames, (Names { u"A2", u"A", u"A2" }));
}

TEST(FlexGridReader, BeginsAtTheStartRow)
{
    struct Row {
        std::int32_t start;
        const char* records;
    };
    const Row rows[] = { { 1, "r1c1,;r2c1,;r3c1,;" }, { 3, "r3c1,;" }, { 4, "" }, { 100, "" },
        { 0, "T,;r1c1,;r2c1,;r3c1,;" } };
    for (const Row& row : rows) {
        TableGrid grid = gridOf({ { u"T", 500 } }, numberedRows(3, 1));
        GridRequest request = requestOf(PrintObjKind::MSFlexGrid);
        request.startRow = row.start;
        const GridTable table = readGrid(grid, request);
        EXPECT_EQ(recordsOf(*table.rows), row.records) << row.start;
    }
    TableGrid grid = gridOf({ { u"T", 500 } }, numberedRows(3, 1));
    GridRequest request = requestOf(PrintObjKind::MSFlexGrid);
    request.startRow = -1;
    EXPECT_EQ(errorOf([&] { readGrid(grid, request); }), ErrorNumber::SubscriptOutOfRange);
}

TEST(FlexGridReader, MakesNoRowSetWithoutAPrintedColumn)
{
    TableGrid grid = gridOf({ { u"A", 144 } }, { { u"1" } });
    EXPECT_EQ(readAs(PrintObjKind::MSFlexGrid, grid).rows, nullptr);
    TableGrid none = gridOf({}, {});
    EXPECT_EQ(readAs(PrintObjKind::MSHFlexGrid, none).rows, nullptr);
}

TEST(FlexGridReader, RefusesMoreColumnsThanABandCanNumber)
{
    const std::vector<TableColumn> columns(32768, TableColumn { .title = {}, .width = 200 });
    TableGrid grid(columns);
    EXPECT_EQ(errorOf([&] { readAs(PrintObjKind::MSFlexGrid, grid); }), ErrorNumber::Overflow);
}

TEST(FlexGridReader, RefusesEndlessColumnsBeforeItLooksAtOne)
{
    FakeObject grid;
    int looks = 0;
    const auto look = [&](FakeObject::Arguments) {
        ++looks;
        return Value::ofNumber(0);
    };
    grid.number(u"Cols", 1e9);
    grid.number(u"Rows", 2);
    grid.member(u"ColWidth", look);
    grid.member(u"TextMatrix", look);
    EXPECT_EQ(errorOf([&] { readGrid(grid, {}); }), ErrorNumber::Overflow);
    EXPECT_EQ(looks, 0);
}

TEST(GridReader, KeepsTheWidthsOfAnEarlierBuild)
{
    TableGrid grid = gridOf({ { u"A", 6000 }, { u"B", 6000 } }, {});
    GridRequest request = requestOf(PrintObjKind::MSFlexGrid);
    const Widths kept { 5400.5, 5400.25 };
    request.keptWidths = kept;
    const GridTable table = readGrid(grid, request);
    EXPECT_EQ(table.ColumnWidths, kept);
    EXPECT_EQ(table.tableWidth, 10800.75);
    EXPECT_EQ(table.ColumnBands, (std::vector<ColPos> { { 1, 1 }, { 2, 2 } }));
    const Widths fewer { 5400 };
    request.keptWidths = fewer;
    EXPECT_EQ(errorOf([&] { readGrid(grid, request); }), ErrorNumber::SubscriptOutOfRange);
}

TEST(GridReader, FailsAtTheFirstMemberThatAnotherKindLacks)
{
    TableGrid flex = gridOf({ { u"A", 500 } }, {});
    FakeListView list;
    list.addHeader(u"A", 500);
    for (const PrintObjKind kind : { PrintObjKind::ListView, PrintObjKind::datagrid })
        EXPECT_EQ(errorOf([&] { readAs(kind, flex); }), ErrorNumber::NoSuchMember);
    for (const PrintObjKind kind :
        { PrintObjKind::MSHFlexGrid, PrintObjKind::MSFlexGrid, PrintObjKind::datagrid })
        EXPECT_EQ(errorOf([&] { readAs(kind, list); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(
        errorOf([&] { readAs(static_cast<PrintObjKind>(4), flex); }), ErrorNumber::InvalidCall);
}

TEST(ListViewReader, TakesTextForTheFirstHeaderAndSubItemsByPositionForOthers)
{
    FakeListView list;
    list.addHeader(u"Name", 1000);
    list.addHeader(u"Hidden", 144);
    list.addHeader(u"", 500);
    list.addHeader(u"Name", 600);
    list.addItem({ u"a", u"b", u"c", u"d" });
    list.addItem({ u"e", u"f", u"g", u"h" });
    const GridTable table = readAs(PrintObjKind::ListView, list);
    EXPECT_EQ(table.fieldNames, (Names { u"Name", u"NULL2", u"Name3" }));
    EXPECT_EQ(table.ColumnWidths, (Widths { 1000, 500, 600 }));
    EXPECT_EQ(recordsOf(*table.rows), "a,c,d,;e,g,h,;");
}

TEST(ListViewReader, PrintsAHiddenFirstColumnNowhere)
{
    FakeListView list;
    list.addHeader(u"Name", 0);
    list.addHeader(u"B", 500);
    list.addItem({ u"a", u"b" });
    const GridTable table = readAs(PrintObjKind::ListView, list);
    EXPECT_EQ(recordsOf(*table.rows), "b,;");
    FakeListView none;
    none.addHeader(u"Name", 0);
    EXPECT_EQ(readAs(PrintObjKind::ListView, none).rows, nullptr);
}

TEST(DataGridReader, WalksTheHostsRowSetAndWidensHiddenColumns)
{
    TableRowSet rows(std::make_shared<TextStore>());
    for (const TextView name : { u"A", u"B", u"C" })
        rows.appendField(name);
    rows.addRecord();
    rows.setLast(0, Value::ofNumber(1));
    FakeDataGrid grid(Value::ofRows(rows), { 0, 144, 145 });
    const GridTable table = readAs(PrintObjKind::datagrid, grid);
    EXPECT_EQ(table.rows, &rows);
    EXPECT_EQ(grid.widths, (Widths { 216, 216, 145 }));
    EXPECT_EQ(grid.selected, (std::vector<int> { 0, 1, 2 }));
    EXPECT_EQ(table.ColumnWidths, (Widths { 216, 216, 145 }));
    EXPECT_EQ(table.fieldNames, (Names { u"A", u"B", u"C" }));
}

TEST(DataGridReader, RefusesMoreColumnsThanFields)
{
    TableRowSet rows(std::make_shared<TextStore>());
    rows.appendField(u"A");
    FakeDataGrid grid(Value::ofRows(rows), { 500, 500 });
    EXPECT_EQ(
        errorOf([&] { readAs(PrintObjKind::datagrid, grid); }), ErrorNumber::SubscriptOutOfRange);
    FakeDataGrid noRows(Value(), { 500 });
    EXPECT_EQ(errorOf([&] { readAs(PrintObjKind::datagrid, noRows); }), ErrorNumber::TypeMismatch);
}

TEST(DataGridReader, TakesARowSetThatIsItselfALateBoundObject)
{
    FakeRecords records({ u"A", u"B" }, { { u"a1", u"b1" }, { u"a2", u"b2" } });
    FakeDataGrid grid(Value::ofObject(records), { 500, 500 });
    GridTable table = readAs(PrintObjKind::datagrid, grid);
    EXPECT_EQ(table.fieldNames, (Names { u"A", u"B" }));
    EXPECT_EQ(recordsOf(*table.rows), "a1,b1,;a2,b2,;");
    EXPECT_EQ(errorOf([&] { table.rows->fieldName(2); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { table.rows->value(0); }), ErrorNumber::SubscriptOutOfRange);
    table.dropBorrowedRows();
    EXPECT_EQ(table.rows, nullptr);
    FakeObject noRecords;
    FakeDataGrid other(Value::ofObject(noRecords), { 500 });
    EXPECT_EQ(errorOf([&] { readAs(PrintObjKind::datagrid, other); }), ErrorNumber::NoSuchMember);
}

TEST(GridTable, FreesItsRecordsAndKeepsTheRest)
{
    TableGrid grid = gridOf({ { u"A", 500 } }, numberedRows(3, 1));
    GridTable table = readAs(PrintObjKind::MSFlexGrid, grid);
    EXPECT_EQ(table.memoryBytes(), 3U * 8);
    table.dropRows();
    EXPECT_EQ(table.rows, nullptr);
    EXPECT_EQ(table.memoryBytes(), 0U);
    EXPECT_EQ(table.fieldNames, (Names { u"A" }));
}

} // namespace pelloric
