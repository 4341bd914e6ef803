// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/append_pages.h"

#include "support/recorded_pages.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(AppendPages, PutsPagesBehindEachOtherWithTheirOwnPageCounts)
{
    PageDocument one;
    addText(one, { 10, 20 }, u"Page 1 of [Pages]");
    addPages(one, 1);
    addText(one, { 10, 20 }, u"Page 2 of [Pages]");
    PageDocument other;
    addText(other, { 30, 40 }, u"alone of [Pages]");
    addLine(other, { 1, 2 }, { 3, 4 });
    other.addPicture(0, { PictureLayer::Above, { 5, 6 }, { 7, 8 }, other.store().add(u"seal") });
    PageDocument joined;
    appendPages(joined, one, true);
    appendPages(joined, other, false);
    ASSERT_EQ(joined.pageCount(), 3);
    EXPECT_EQ(joined.Totalpages, 3);
    EXPECT_EQ(joined.texts(0)[0].text(), u"Page 1 of 2");
    EXPECT_EQ(joined.texts(1)[0].text(), u"Page 2 of 2");
    EXPECT_EQ(joined.texts(2)[0].text(), u"alone of 1");
    EXPECT_EQ(joined.texts(2)[0].pt, (Tpoint { 30, 40 }));
    EXPECT_EQ(joined.line(2, 0), other.line(0, 0));
    EXPECT_TRUE(joined.reportPictures(0).empty());
    ASSERT_EQ(joined.reportPictures(2).size(), 1U);
    EXPECT_EQ(joined.reportPictures(2)[0].file, u"seal");
    EXPECT_EQ(joined.reportPictures(2)[0].layer, PictureLayer::Above);
    EXPECT_EQ(joined.text(1, 0).prnFont, one.text(1, 0).prnFont);
}

} // namespace pelloric
