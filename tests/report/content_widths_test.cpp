// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/content_widths.h"

#include "fakes/fake_metrics.h"
#include "fakes/fake_services.h"
#include "grids/table_grid.h"
#include "support/errors.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

constexpr Twips Spare = 244; ///< beside the longest text: padding and clearance
constexpr Twips CharacterWidth = 100; ///< of an ASCII character at 10 points

TableGrid oneColumn(Text title, std::initializer_list<TextView> cells)
{
    TableGrid grid({ { .title = std::move(title), .width = -1 } });
    for (const TextView cell : cells)
        grid.addRow({ &cell, 1 });
    return grid;
}

Twips widthOf(const TableGrid& grid)
{
    FakeMetrics metrics;
    return contentWidths(grid, metrics.face(u"any", false, false), 10).at(0);
}

} // namespace

TEST(ContentWidths, FollowTheLongestLineOfTitleOrCells)
{
    EXPECT_EQ(widthOf(oneColumn(u"12345678", { u"1" })), 8 * CharacterWidth + Spare);
    EXPECT_EQ(widthOf(oneColumn(u"1", { u"12", u"1234567890" })), 10 * CharacterWidth + Spare);
    EXPECT_EQ(widthOf(oneColumn(u"1", { u"12345678\n123" })), 8 * CharacterWidth + Spare);
    EXPECT_EQ(widthOf(oneColumn(u"Unit\nprice/pc", { u"1" })), 8 * CharacterWidth + Spare);
    EXPECT_EQ(widthOf(oneColumn(u"1", { u"123\n  12345678" })), 10 * CharacterWidth + Spare)
        << "blanks inside a cell are printed";
    EXPECT_EQ(widthOf(oneColumn(u"1", { u"汉字汉字" })), 8 * CharacterWidth + Spare);
}

TEST(ContentWidths, KeepWithinTheirBounds)
{
    EXPECT_EQ(widthOf(oneColumn(u"", {})), NarrowestContent);
    const Text longText(500, u'x');
    EXPECT_EQ(widthOf(oneColumn(u"", { longText })), WidestContent);
}

TEST(ContentWidths, FindTheLongestTextOfALargeTableWhereverItStands)
{
    TableGrid grid({ { .title = u"n", .width = -1 } });
    const TextView plain = u"12345";
    const TextView longest = u"1234567890123";
    for (int row = 0; row < 30001; ++row)
        grid.addRow({ row == 20000 ? &longest : &plain, 1 });
    EXPECT_EQ(widthOf(grid), 13 * CharacterWidth + Spare);
}

struct FitCase {
    std::vector<Twips> widths;
    Twips room;
    std::vector<Twips> fitted;
};

TEST(FitWidths, NarrowOnlyTheWidestColumnsAndOnlyWhereTheyStayReadable)
{
    const FitCase cases[] = {
        { { 1000, 4000, 4500 }, 9500, { 1000, 4000, 4500 } },
        { { 1000, 4000, 4500 }, 7000, { 1000, 3000, 3000 } },
        { { 1000, 2000, 4500 }, 5500, { 1000, 2000, 2500 } },
        { { 2000, 2000, 2000 }, 3000, { 2000, 2000, 2000 } },
        { {}, 3000, {} },
    };
    for (const FitCase& row : cases) {
        std::vector<Twips> widths = row.widths;
        fitWidths(widths, row.room);
        EXPECT_EQ(widths, row.fitted) << "room " << row.room;
    }
}

TEST(ContentWidths, AreLeftBetweenTwoColumnsWhenTheUserCancels)
{
    const TableGrid grid({ { u"a", -1 }, { u"b", -1 }, { u"c", -1 } });
    FakeMetrics metrics;
    FakeMessageLoop loop;
    loop.cancelAtBeat = 2;
    EXPECT_EQ(errorOf([&] { contentWidths(grid, metrics.face(u"any", false, false), 10, &loop); }),
        ErrorNumber::Cancelled);
    EXPECT_EQ(loop.beats, 2);
}

} // namespace pelloric
