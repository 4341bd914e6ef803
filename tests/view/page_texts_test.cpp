// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/page_texts.h"

#include "document/recorder.h"
#include "document/text_search.h"
#include "fakes/fake_metrics.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// A page on which texts are printed at points; with the fake measures a letter of size 10 is 100
/// twips wide and a line 240 high.
class PageTexts : public testing::Test {
protected:
    PageTexts() { recorder.setTextFont({ .size = 10 }, 0); }

    void print(Twips x, Twips y, TextView text)
    {
        recorder.moveTo({ x, y });
        recorder.printText(text, false);
    }

    FakeMetrics metrics;
    PageDocument document;
    Recorder recorder { document, metrics };
};

} // namespace

TEST_F(PageTexts, KnowsTheRectangleOfEachText)
{
    print(1000, 500, u"abc");
    print(2000, 900, u"1 of [Pages]");
    document.newPage();
    const std::vector<PlacedText> texts = placedTexts(document, 0, metrics);
    ASSERT_EQ(texts.size(), 2U);
    EXPECT_EQ(texts[0].area, (PageRect { 1000, 500, 1300, 740 }));
    EXPECT_EQ(texts[1].text, u"1 of 2");
    EXPECT_EQ(texts[1].area, (PageRect { 2000, 900, 2600, 1140 }));
    EXPECT_TRUE(placedTexts(document, 1, metrics).empty());
    EXPECT_TRUE(placedTexts(document, 2, metrics).empty());
}

TEST_F(PageTexts, HoldRectanglesWithinWhatNumbersHold)
{
    constexpr Twips Most = 2147483647;
    document.append(TextRecord {
        { Most - 200, Most - 100 }, u"abc", 3, document.styleNumber({ { .size = 10 }, 0 }) });
    EXPECT_EQ(placedTexts(document, 0, metrics).front().area,
        (PageRect { Most - 200, Most - 100, Most, Most }));
}

TEST_F(PageTexts, KnowsTheRectangleOfAPartOfAText)
{
    print(1000, 500, u"abcde");
    EXPECT_EQ(areaOf(document, 0, { .text = 0, .begin = 1, .length = 2 }, metrics),
        (PageRect { 1100, 500, 1300, 740 }));
    EXPECT_EQ(areaOf(document, 0, { .text = 0, .begin = 4, .length = 9 }, metrics),
        (PageRect { 1400, 500, 1500, 740 }));
}

TEST_F(PageTexts, TellsWhetherRectanglesMeet)
{
    const PageRect area { 10, 10, 20, 20 };
    EXPECT_TRUE(overlap(area, { 20, 20, 30, 30 }));
    EXPECT_TRUE(overlap(area, { 12, 12, 13, 13 }));
    EXPECT_FALSE(overlap(area, { 21, 0, 30, 30 }));
    EXPECT_FALSE(overlap(area, { 0, 0, 30, 9 }));
}

TEST_F(PageTexts, MakesATableOfTextsWithTabsBetweenThem)
{
    print(5000, 1000, u"second");
    print(1000, 1010, u"first");
    print(1000, 1500, u"tab\tin it");
    print(3000, 1500, u"");
    print(5000, 1500, u"third");
    EXPECT_EQ(asTable(placedTexts(document, 0, metrics)), u"first\tsecond\ntab in it\t\tthird");
    EXPECT_EQ(asTable({}), u"");
}

TEST_F(PageTexts, KeepsARowThatBeginsWithAnEmptyCell)
{
    print(1000, 1000, u"");
    print(3000, 1000, u"a");
    print(1000, 1500, u"");
    EXPECT_EQ(asTable(placedTexts(document, 0, metrics)), u"\ta\n");
}

} // namespace pelloric
