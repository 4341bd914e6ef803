// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/page_fields.h"

#include "document/recorder.h"
#include "fakes/fake_platform.h"
#include "report/report_style.h"
#include "support/golden.h"
#include "support/show_document.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// A page with header and footer fonts of their own and a width of 1000 twips between the margins.
struct PageLinesTest : ::testing::Test, FakePlatform {
    PageLinesTest()
    {
        setup.intTop = 300;
        setup.intLeft = 100;
        setup.myWidth = 1201;
        style.printableWidthTenth = 100;
        style.header = { { .name = u"H", .size = 10, .bold = true, .underline = true }, 255 };
        style.footer = { { .name = u"F", .size = 8, .italic = true }, 65280.5 };
        style.body = { { .name = u"B", .size = 9 }, 7 };
    }

    PageDocument document;
    Recorder recorder { document, metrics };
    ReportStyle style;
    PageSetup setup;
    PageLines lines { style, setup, clock, recorder };
};

} // namespace

TEST(PageFields, AreFoundByTheirExactTokens)
{
    for (const TextView text : { u"[Date Printed]", u"[Time Printed]", u"[Date & Time Printed]",
             u"[Page # of Pages #]", u"[Total Pages]", u"[Page #]", u"  a[Page #]b " })
        EXPECT_TRUE(hasPageField(text)) << toUtf8(text);
    for (const TextView text :
        { u"", u"Page #", u"[page #]", u"[Page#]", u"[Pages]", u"[Page #", u"[Date  Printed]" })
        EXPECT_FALSE(hasPageField(text)) << toUtf8(text);
}

TEST(PageFields, ExpandTheFirstOfTheirOrderOnce)
{
    struct Row {
        TextView text;
        TextView expanded;
    };
    const Row rows[] = {
        { u"[Date Printed]", u"2004-10-23" },
        { u"[Time Printed]", u"12:34:56" },
        { u"[Date & Time Printed]", u"2004-10-23 12:34:56" },
        { u"[Page # of Pages #]", u"3 of [Pages]" },
        { u"[Total Pages]", u"[Pages]" },
        { u"[Page #]", u"3" },
        { u"Page [Page #]", u"Page 3" },
        { u"Printed [Date Printed] [Page #]", u"Printed 2004-10-23 [Page #]" },
        { u"[Page #] [Date Printed]", u"[Page #] 2004-10-23" },
        { u"[Time Printed][Date Printed]", u"[Time Printed]2004-10-23" },
        { u"[Page #][Page # of Pages #]", u"[Page #]3 of [Pages]" },
        { u"[Page #]-[Page #]", u"3-[Page #]" },
        { u"  [Page #]  ", u"  3  " },
        { u"[[Page #]]", u"[3]" },
        { u"[page #]", u"No.3" },
        { u"", u"No.3" },
    };
    const FakeClock clock;
    for (const Row& row : rows)
        EXPECT_EQ(expandPageField(row.text, 3, clock), row.expanded) << toUtf8(row.text);
}

TEST_F(PageLinesTest, DrawThreeTextsLeftCentredAndFromNineTenthsOn)
{
    style.headerTexts = { u"L", u"C[Page #]", u"a long right text" };
    lines.drawPageHeader(12);
    // The stored centre text is 900 wide: (1201 - 900) / 2 is 150.5, rounded to 150; the 300 of the
    // text put out are then centred within the 900.
    const std::string shown = showPage(document, 0);
    EXPECT_EQ(shown, golden("report/header_of_three_texts.txt", shown));
    EXPECT_EQ(document.text(0, 1).pt, (Tpoint { 450, 300 }));
    EXPECT_EQ(recorder.currentY(), 300 + 240);
    EXPECT_EQ(recorder.textFont().name, u"B");
    EXPECT_EQ(recorder.textColor(), 7);
}

TEST_F(PageLinesTest, DrawNothingForEmptyTextsAndStartTheTableAtTheTopMargin)
{
    recorder.moveTo({ 5, 6 });
    lines.drawPageHeader(1);
    EXPECT_TRUE(document.texts(0).empty());
    EXPECT_EQ(recorder.point(), (Tpoint { 5, 300 }));
    EXPECT_EQ(recorder.textFont().name, u"B");
}

TEST_F(PageLinesTest, DrawATextOfBlanksAndLeaveTheTableBelowIt)
{
    style.headerTexts = { u"", u"", u" " };
    lines.drawPageHeader(1);
    EXPECT_EQ(textsOf(document, 0), " ");
    EXPECT_EQ(recorder.currentY(), 540);
}

TEST_F(PageLinesTest, DrawTheFooterAtTheRoundedHeightAndSelectTheBodyFont)
{
    style.footerTexts = { u"[Date Printed]", u"[page #]", u"[Page # of Pages #]" };
    lines.drawPageFooter(2, 1000.5);
    const std::string shown = showPage(document, 0);
    EXPECT_EQ(shown, golden("report/footer_of_three_texts.txt", shown));
    EXPECT_EQ(recorder.textFont().name, u"B");
    style.footerTexts = {};
    lines.drawPageFooter(2, 50);
    EXPECT_EQ(document.texts(0).size(), 3U);
}

TEST_F(PageLinesTest, PassTheStoredPageCountTokenThrough)
{
    style.footerTexts = { u"[Pages]", u"", u"" };
    lines.drawPageFooter(1, 50);
    EXPECT_EQ(textsOf(document, 0), "[Pages]");
}

} // namespace pelloric
