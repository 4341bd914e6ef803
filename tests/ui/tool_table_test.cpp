// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/tool_table.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(ToolTable, KeepsCaptionsToTheBlank)
{
    EXPECT_EQ(clickedTool(1)->caption, u"Design  Report");
    EXPECT_EQ(clickedTool(9)->caption, u" Show More Pages");
    EXPECT_EQ(clickedTool(15)->caption, u" Show Whole Page");
    EXPECT_EQ(clickedTool(22)->caption, u"Clear  All Pages");
    EXPECT_EQ(clickedTool(23)->caption, u"Maximum ");
}

TEST(ToolTable, NeverFindsAComboByItsNumber)
{
    EXPECT_EQ(clickedTool(15)->action, ToolAction::WholePage);
    EXPECT_EQ(clickedTool(16)->action, ToolAction::TwoPages);
    EXPECT_EQ(clickedTool(14), nullptr);
    EXPECT_EQ(clickedTool(0), nullptr);
}

TEST(ToolTable, PairsZoomCaptionsWithTheCanvasesOppositeMembers)
{
    EXPECT_EQ(clickedTool(3)->caption, u"Zoom In");
    EXPECT_EQ(clickedTool(3)->action, ToolAction::ZoomOut);
    EXPECT_EQ(clickedTool(4)->caption, u"Zoom Out");
    EXPECT_EQ(clickedTool(4)->action, ToolAction::ZoomIn);
}

TEST(ToolTable, WritesPagesAndCount)
{
    EXPECT_EQ(pageEntry(12), u"   NO. 12");
    EXPECT_EQ(pageBoxText(7), u"NO. 7");
    EXPECT_EQ(pageBoxText(1, 6), u"【1-6】");
    EXPECT_EQ(pageCountLabel(21), u" 【共 21 页】");
}

TEST(ToolTable, WritesScalesWithSevenDigitsAtMost)
{
    EXPECT_EQ(scaleText(1), u"100%");
    EXPECT_EQ(scaleText(1 / 1.5F), u"150%");
    EXPECT_EQ(scaleText(3), u"33.33333%");
    EXPECT_EQ(scaleText(0.804527F), u"124.2966%");
    EXPECT_EQ(scaleText(1e-10F), u"1000000000000%");
}

} // namespace pelloric
