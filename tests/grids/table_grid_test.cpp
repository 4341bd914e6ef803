// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/table_grid.h"

#include "support/errors.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

namespace pelloric {

namespace {

TableGrid fruits()
{
    TableGrid grid({ { u"Name", 1000 }, { u"数量", -1 }, { u"", 0 } });
    const TextView apple[] = { u"苹果", u"12", u"x" };
    const TextView pear[] = { u"pear" };
    grid.addRow(apple);
    grid.addRow(pear);
    grid.addRow({});
    return grid;
}

Value cellOf(TableGrid& grid, int row, int column)
{
    const Value indexes[] = { Value::ofNumber(row), Value::ofNumber(column) };
    return grid.get(memberOf(grid, u"TextMatrix"), indexes);
}

Value widthOf(TableGrid& grid, int column)
{
    const Value index[] = { Value::ofNumber(column) };
    return grid.get(memberOf(grid, u"ColWidth"), index);
}

} // namespace

TEST(TableGrid, CountsTheTitlesAsTheFirstRow)
{
    TableGrid grid = fruits();
    EXPECT_EQ(getMember(grid, u"Cols").number(), 3);
    EXPECT_EQ(getMember(grid, u"Rows").number(), 4);
    EXPECT_EQ(cellOf(grid, 0, 1).text(), u"数量");
    EXPECT_EQ(cellOf(grid, 1, 0).text(), u"苹果");
    EXPECT_EQ(cellOf(grid, 1, 2).text(), u"x");
}

TEST(TableGrid, FillsShortRowsWithEmptyCells)
{
    TableGrid grid = fruits();
    EXPECT_EQ(cellOf(grid, 2, 0).text(), u"pear");
    EXPECT_EQ(cellOf(grid, 2, 1).text(), u"");
    EXPECT_EQ(cellOf(grid, 2, 2).text(), u"");
    EXPECT_EQ(cellOf(grid, 3, 0).text(), u"");
}

TEST(TableGrid, RefusesARowWithMoreCellsThanColumnsAndKeepsTheOthers)
{
    TableGrid grid = fruits();
    const TextView cells[] = { u"1", u"2", u"3", u"4" };
    EXPECT_EQ(errorOf([&] { grid.addRow(cells); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(grid.rowCount(), 3);
}

TEST(TableGrid, HandsOutTheTextsOfARowAsTheyAreKept)
{
    const TableGrid grid = fruits();
    std::vector<TextView> texts(3);
    for (std::int32_t row = 1; row <= grid.rowCount(); ++row) {
        grid.rowTexts(row, texts);
        for (int column = 0; column < 3; ++column) {
            const TextView cell = grid.cell(row - 1, column);
            EXPECT_EQ(texts[static_cast<std::size_t>(column)], cell);
            EXPECT_EQ(texts[static_cast<std::size_t>(column)].data(), cell.data());
        }
    }
    for (const std::int32_t row : { 0, 4 })
        EXPECT_EQ(errorOf([&] { grid.rowTexts(row, texts); }), ErrorNumber::SubscriptOutOfRange);
}

TEST(TableGrid, LeavesTextsWhereTheyAreWhenRowsAreAddedAndWhenItGoes)
{
    auto grid = std::make_unique<TableGrid>(fruits());
    const std::shared_ptr<const TextStore> kept = grid->keptTexts();
    const TextView first = grid->cell(0, 0);
    const Text before(first);
    for (int row = 0; row < 10000; ++row) {
        const TextView cells[] = { u"a text that needs room" };
        grid->addRow(cells);
    }
    EXPECT_EQ(grid->cell(0, 0).data(), first.data());
    grid.reset();
    EXPECT_EQ(first, before);
}

TEST(TableGrid, HasEmptyCellsWhereItIsWidened)
{
    TableGrid grid = fruits();
    const Text last(grid.cell(2, 2));
    grid.widen(5, { .title = u"more", .width = -1 });
    const TextView cells[] = { u"1", u"2", u"3", u"4", u"5" };
    grid.addRow(cells);
    EXPECT_EQ(grid.columnCount(), 5);
    EXPECT_EQ(grid.column(4).title, u"more");
    EXPECT_EQ(grid.cell(2, 2), last);
    EXPECT_EQ(grid.cell(2, 3), u"");
    EXPECT_EQ(grid.cell(0, 4), u"");
    EXPECT_EQ(grid.cell(3, 4), u"5");
}

TEST(TableGrid, RefusesMoreCellsThanItHoldsAndKeepsThoseItHas)
{
    TableGrid grid({ { u"a", 1000 } });
    for (int row = 0; row < 20000; ++row)
        grid.addRow(std::vector<TextView> { u"1" });
    const auto widen = [&] { grid.widen(32767, { u"b", 1000 }); };
    EXPECT_EQ(errorOf(widen), ErrorNumber::Overflow);
    EXPECT_EQ(grid.columnCount(), 1);
    EXPECT_EQ(grid.cell(19999, 0), u"1");
}

TEST(TableGrid, TakesWidthsAsTheyArePut)
{
    TableGrid grid = fruits();
    const Value index[] = { Value::ofNumber(1) };
    EXPECT_EQ(widthOf(grid, 1).number(), -1);
    grid.put(memberOf(grid, u"ColWidth"), index, Value::ofNumber(2000));
    EXPECT_EQ(widthOf(grid, 1).number(), 2000);
    EXPECT_EQ(grid.column(1).width, 2000);
}

TEST(TableGrid, RefusesIndexesOutsideTheTable)
{
    TableGrid grid = fruits();
    for (const auto& cell : { std::pair(-1, 0), { 4, 0 }, { 0, 3 }, { 1, -1 } }) {
        EXPECT_EQ(errorOf([&] { cellOf(grid, cell.first, cell.second); }),
            ErrorNumber::SubscriptOutOfRange)
            << cell.first << ", " << cell.second;
    }
    EXPECT_EQ(errorOf([&] { widthOf(grid, 3); }), ErrorNumber::SubscriptOutOfRange);
}

TEST(TableGrid, RefusesMembersThatItDoesNotHave)
{
    TableGrid grid = fruits();
    EXPECT_EQ(errorOf([&] { memberOf(grid, u"ColumnHeaders"); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { memberOf(grid, u"cols"); }), ErrorNumber::NoSuchMember);
    const auto write = [&] { grid.put(memberOf(grid, u"Rows"), {}, Value::ofNumber(1)); };
    EXPECT_EQ(errorOf(write), ErrorNumber::NoSuchMember);
    EXPECT_EQ(
        errorOf([&] { grid.get(memberOf(grid, u"ColWidth"), {}); }), ErrorNumber::NoSuchMember);
}

} // namespace pelloric
