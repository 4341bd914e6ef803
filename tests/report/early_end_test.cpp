// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "support/errors.h"
#include "support/report_world.h"

#include <gtest/gtest.h>

#include <limits>

namespace pelloric {

TEST(EarlyEnd, AStartRowFarBelowTheFirstIsTheGridsOwnError)
{
    ReportWorld world;
    TableGrid grid = gridOf({ { u"A", 1000 } }, numberedRows(3, 1));
    world.canvas.platform().library.MarvenStartRow = std::numeric_limits<std::int32_t>::min();
    EXPECT_EQ(errorOf([&] { world.canvas.doPreview(grid); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(world.canvas.table(), nullptr);
}

TEST(EarlyEnd, AHeaderThatCannotBeDrawnLeavesTheProgressBarAlone)
{
    ReportWorld world(ReportWorld::Settings { { u"HeaderFontColor", u"1e10" } });
    TableGrid grid = gridOf({ { u"A", 1000 } }, numberedRows(3, 1));
    EXPECT_EQ(errorOf([&] { world.canvas.doPreview(grid); }), ErrorNumber::Overflow);
    EXPECT_EQ(world.buildBar.bar(), ProgressBar {});
    EXPECT_EQ(world.canvas.document().pageCount(), 1);
}

TEST(EarlyEnd, ATurnedPageMovesTheRightSlotOfTheNextRebuild)
{
    ReportWorld world(ReportWorld::Settings { { u"HeaderRight", u"h" } });
    TableGrid grid = gridOf({ { u"A", 1000 } }, numberedRows(1, 1));
    world.canvas.doPreview(grid);
    EXPECT_EQ(world.canvas.document().text(0, 0).pt, (Tpoint { 680 + 9 * 1055, 907 }));
    world.canvas.setVerticalDir(false);
    world.canvas.ReDrawZoom(grid);
    EXPECT_EQ(world.canvas.document().text(0, 0).pt, (Tpoint { 680 + 9 * 1548, 907 }));
}

} // namespace pelloric
