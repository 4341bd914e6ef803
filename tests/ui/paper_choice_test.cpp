// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/paper_choice.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(PaperChoice, ListsFormsWithTheirSizesAndPlaces)
{
    const auto rows = paperRows({ { u"A4", 210, 297 }, { u"Envelope DL", 110, 220.04 } });
    ASSERT_EQ(rows.size(), 2U);
    EXPECT_EQ(rows[0], (PaperRow { u"A4", u"210.00 mm", u"297.00 mm", u"1", false }));
    EXPECT_EQ(rows[1], (PaperRow { u"Envelope DL", u"110.00 mm", u"220.04 mm", u"2", true }));
}

TEST(PaperChoice, TakesARowAsTheOrientationIs)
{
    const PaperRow row { u"A4", u"210.00 mm", u"297.00 mm", u"9", false };
    PaperChoice choice;
    choice.chooseRow(row);
    EXPECT_EQ(choice.caption, u"PagerSize: A4");
    EXPECT_EQ(choice.paperName, u"A4");
    EXPECT_EQ(choice.paperCode, 9);
    EXPECT_EQ(choice.widthBox, u"210.00 mm");
    EXPECT_EQ(choice.heightBox, u"297.00 mm");
    choice.orientation = 2;
    choice.chooseRow(row);
    EXPECT_EQ(choice.widthBox, u"297.00 mm");
    EXPECT_EQ(choice.heightBox, u"210.00 mm");
}

TEST(PaperChoice, ExchangesSizesThatStandInTheWrongOrderAsTexts)
{
    PaperChoice choice { .widthBox = u"210mm", .heightBox = u"297mm" };
    choice.chooseOrientation(true);
    EXPECT_EQ(choice.widthBox, u"210mm");
    choice.chooseOrientation(false);
    EXPECT_EQ(choice.widthBox, u"297mm");
    EXPECT_EQ(choice.orientation, 2);
    choice = { .widthBox = u"1000mm", .heightBox = u"297mm" };
    choice.chooseOrientation(true);
    EXPECT_EQ(choice.widthBox, u"1000mm");
    choice.chooseOrientation(false);
    EXPECT_EQ(choice.widthBox, u"297mm");
}

} // namespace pelloric
