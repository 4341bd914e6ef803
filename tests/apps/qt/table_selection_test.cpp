// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "table_selection.h"

#include "platform/numbers.h"

#include <gtest/gtest.h>

namespace pelloric::app {

namespace {

/// Five rows of four columns, A1 to D5; the cells of rows 2 to 3 in B and C are one box.
TableGrid boxedTable()
{
    TableGrid table({ { u"A", 900 }, { u"B", 900 }, { u"C", 900 }, { u"D", 900 } });
    CellLook boxed;
    boxed.bold = true;
    boxed.box = CellBox { .firstRow = 2, .lastRow = 3, .firstColumn = 1, .lastColumn = 2 };
    table.setLooks({ CellLook(), boxed });
    for (int row = 1; row <= 5; ++row) {
        std::vector<Text> texts;
        std::vector<std::uint16_t> looks;
        for (int column = 0; column < 4; ++column) {
            texts.push_back(Text(1, static_cast<char16_t>(u'A' + column)) + decimal(row));
            const bool isBoxed = (row == 2 || row == 3) && (column == 1 || column == 2);
            looks.push_back(isBoxed ? 1 : 0);
        }
        table.addRow(std::vector<TextView>(texts.begin(), texts.end()), looks);
    }
    return table;
}

TableGrid taken(const QStringList& arguments)
{
    return selected(boxedTable(), CommandLine(arguments, { selectionOptions() }, 0));
}

/// The box of a cell of the table that was taken: rows from 1, columns from 0.
std::optional<CellBox> boxAt(TableGrid& table, std::int32_t row, std::int32_t column)
{
    CellLook look;
    table.readLook(row, column, look);
    EXPECT_EQ(look.bold, table.lookNumber(row - 1, column) == 1);
    return look.box;
}

} // namespace

TEST(TableSelection, ABoxMovesWithItsRowsAndColumns)
{
    TableGrid table = taken({ QStringLiteral("--columns"), QStringLiteral("D,B,C"),
        QStringLiteral("--rows"), QStringLiteral("2-5") });
    ASSERT_EQ(table.rowCount(), 4);
    EXPECT_EQ(table.cell(0, 1), u"B2");
    const CellBox moved { .firstRow = 1, .lastRow = 2, .firstColumn = 1, .lastColumn = 2 };
    for (const std::int32_t row : { 1, 2 }) {
        EXPECT_EQ(boxAt(table, row, 1), moved);
        EXPECT_EQ(boxAt(table, row, 2), moved);
    }
    EXPECT_FALSE(boxAt(table, 1, 0));
    EXPECT_FALSE(boxAt(table, 3, 1));
}

TEST(TableSelection, ABoxOfWhichAPartIsTakenShrinksToIt)
{
    TableGrid table = taken({ QStringLiteral("--columns"), QStringLiteral("A,C"),
        QStringLiteral("--rows"), QStringLiteral("3-") });
    const CellBox rest { .firstRow = 1, .lastRow = 1, .firstColumn = 1, .lastColumn = 1 };
    EXPECT_EQ(boxAt(table, 1, 1), rest);
    EXPECT_FALSE(boxAt(table, 2, 1));
}

TEST(TableSelection, ABoxThatIsTornApartIsNoneButItsCellsKeepTheirLook)
{
    TableGrid torn = taken({ QStringLiteral("--columns"), QStringLiteral("B,A,C") });
    EXPECT_FALSE(boxAt(torn, 2, 0));
    EXPECT_FALSE(boxAt(torn, 2, 2));
    EXPECT_EQ(torn.lookNumber(1, 0), 1);
    TableGrid turned = taken({ QStringLiteral("--sort"), QStringLiteral("A:desc") });
    EXPECT_EQ(turned.cell(0, 0), u"A5");
    EXPECT_FALSE(boxAt(turned, 3, 1)); // its rows stand upside down
    EXPECT_EQ(turned.lookNumber(2, 1), 1);
}

TEST(TableSelection, ABoxOfWhichNothingIsTakenLeavesNoCellBoxed)
{
    TableGrid table = taken({ QStringLiteral("--rows"), QStringLiteral("4-5") });
    for (std::int32_t row = 1; row <= 2; ++row) {
        for (std::int32_t column = 0; column < 4; ++column)
            EXPECT_FALSE(boxAt(table, row, column));
    }
}

} // namespace pelloric::app
