// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/column_bands.h"

#include "support/errors.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

using Bands = std::vector<ColPos>;

struct Row {
    const char* what;
    std::vector<double> widths;
    double paper;
    double left;
    Bands bands;
};

} // namespace

TEST(ColumnBands, AreCutWhereAColumnReachesThePapersEdge)
{
    const Row rows[] = {
        { "a table that fits", { 1000, 2000 }, 11907, 680, { { 1, 2 } } },
        { "one twip less than the room", { 5000, 5546 }, 11907, 680, { { 1, 2 } } },
        { "exactly the room", { 5000, 5547 }, 11907, 680, { { 1, 1 }, { 2, 2 } } },
        { "a fraction less than the room", { 5000, 5546.5 }, 11907, 680, { { 1, 2 } } },
        { "one column of exactly the room", { 10547 }, 11907, 680, { { 1, 1 } } },
        { "a first column wider than the paper", { 20000, 100 }, 11907, 680,
            { { 1, 1 }, { 2, 2 } } },
        { "a middle column wider than the paper", { 500, 20000, 500 }, 11907, 680,
            { { 1, 1 }, { 2, 2 }, { 3, 3 } } },
        { "greedy from the left", { 4000, 4000, 4000, 4000, 4000 }, 11907, 680,
            { { 1, 2 }, { 3, 4 }, { 5, 5 } } },
        { "a margin that leaves no room", { 200, 200 }, 1000, 600, { { 1, 1 }, { 2, 2 } } },
        { "no paper at all", { 200, 200 }, 0, 1134, { { 1, 1 }, { 2, 2 } } },
        { "a negative margin widens the room", { 600, 600 }, 1000, -200, { { 1, 2 } } },
    };
    for (const Row& row : rows)
        EXPECT_EQ(cutColumnBands(row.widths, row.paper, row.left), row.bands) << row.what;
}

TEST(ColumnBands, SumTheWidthsOfColumns)
{
    EXPECT_EQ(tableWidthOf(std::vector<double> { 1.5, 2.25 }), 3.75);
    EXPECT_EQ(tableWidthOf({}), 0);
}

TEST(ColumnBands, OverflowPastTheLastColumnNumber)
{
    const std::vector<double> most(32767, 1000);
    EXPECT_EQ(cutColumnBands(most, 11907, 680).back().EndCol, 32767);
    const std::vector<double> more(32768, 1000);
    EXPECT_EQ(errorOf([&] { cutColumnBands(more, 11907, 680); }), ErrorNumber::Overflow);
}

} // namespace pelloric
