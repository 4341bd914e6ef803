// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// The control's own header publishes every record and enumeration: nothing else is included first.
#include <pelloric/sorvane.h>

#include <gtest/gtest.h>

namespace pelloric {

TEST(PublishedRecords, ComeWithTheHeaderOfTheControl)
{
    const Tpoint point { .x = 1, .y = 2 };
    Lineobj line;
    line.pt1 = point;
    Textobj text;
    text.pt = point;
    MapLocation picture;
    picture.nWidth = 3;
    ColPos columns;
    columns.EndCol = 4;
    MuliPageType window;
    window.nPages = 6;
    EXPECT_EQ(line.pt1, text.pt);
    EXPECT_EQ(picture.nWidth + columns.EndCol + window.nPages, 13);
    EXPECT_EQ(static_cast<int>(OrderStyle::Six), 6);
    EXPECT_EQ(static_cast<int>(PrintObjKind::datagrid), 3);
    EXPECT_EQ(static_cast<int>(AlignmentType::LocRight), 2);
}

} // namespace pelloric
