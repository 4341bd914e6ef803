// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/recorder.h"

#include "fakes/fake_metrics.h"
#include "fakes/fake_surface.h"
#include "report/table_row_set.h"
#include "support/errors.h"
#include "support/show_document.h"

#include <gtest/gtest.h>

#include <array>

namespace pelloric {

namespace {

/// Records at size 9: an ASCII character is 90 twips wide, a line 216 high.
struct RecorderTest : ::testing::Test {
    RecorderTest() { recorder.setTextFont({ .size = 9 }, 0); }

    Textobj text(std::size_t index) const { return document.text(0, index); }

    PageDocument document;
    FakeMetrics metrics;
    Recorder recorder { document, metrics };
};

} // namespace

TEST(Recorder, StartsWithTheStandardAttributes)
{
    PageDocument document;
    FakeMetrics metrics;
    Recorder recorder(document, metrics);
    EXPECT_EQ(recorder.point(), (Tpoint { 0, 0 }));
    EXPECT_EQ(recorder.textFont(), Font());
    EXPECT_EQ(recorder.textColor(), 0);
    recorder.lineTo({ 10, 0 });
    EXPECT_EQ(document.line(0, 0),
        (Lineobj { { 0, 0 }, { 10, 0 }, 0, 0, 1, TransparentFill, rgb(224, 224, 224) }));
}

TEST_F(RecorderTest, ConnectsLinesThatFollowEachOther)
{
    recorder.setLineAttributes({ 2, 255, 3, 0, 128 });
    recorder.moveTo({ 1, 2 });
    recorder.lineTo({ 10, 20 });
    recorder.lineTo({ 30, 5 });
    EXPECT_EQ(document.line(0, 0), (Lineobj { { 1, 2 }, { 10, 20 }, 2, 255, 3, 0, 128 }));
    EXPECT_EQ(document.line(0, 1), (Lineobj { { 10, 20 }, { 30, 5 }, 2, 255, 3, 0, 128 }));
    EXPECT_EQ(recorder.point(), (Tpoint { 30, 5 }));
}

TEST_F(RecorderTest, LeavesThePointAtTheEndOfATextOrAtTheStartOfTheNextLine)
{
    recorder.moveTo({ 100, 50 });
    recorder.printText(u"ab", false);
    recorder.printText(u"c", true);
    recorder.printText(u"d", false);
    EXPECT_EQ(text(0).pt, (Tpoint { 100, 50 }));
    EXPECT_EQ(text(1).pt, (Tpoint { 280, 50 }));
    EXPECT_EQ(text(2).pt, (Tpoint { 0, 266 }));
    EXPECT_EQ(recorder.point(), (Tpoint { 90, 266 }));
}

TEST_F(RecorderTest, LeavesThePointBehindTheLastLineOfATextWithLineFeeds)
{
    recorder.moveTo({ 100, 50 });
    recorder.printText(u"abcd\ne", false);
    EXPECT_EQ(text(0).Str, u"abcd\ne");
    EXPECT_EQ(recorder.point(), (Tpoint { 190, 266 }));
    recorder.printText(u"f\n\ng", true);
    EXPECT_EQ(recorder.point(), (Tpoint { 0, 266 + 3 * 216 }));
    EXPECT_EQ(recorder.textWidth(u"ab\ncde"), 3 * 90);
}

TEST_F(RecorderTest, GivesEveryTextTheFontAndColourOfItsMoment)
{
    recorder.setTextFont({ u"A", 10, true, false, true, true }, 5);
    recorder.printText(u"x", true);
    recorder.setTextFont({ u"B", 7.5F, false, true }, 6);
    recorder.printText(u"y", true);
    EXPECT_EQ(text(0), (Textobj { { 0, 0 }, u"x", { u"A", 10, true, false }, 5 }));
    EXPECT_EQ(text(1), (Textobj { { 0, 240 }, u"y", { u"B", 7.5F, false, true }, 6 }));
}

TEST_F(RecorderTest, CentresOnceHalfToEven)
{
    struct Row {
        double x;
        double width;
        Twips expected;
    };
    const Row rows[] = { { 100, 1000, 510 }, { 0, 181, 0 }, { 0, 183, 2 }, { 0.5, 182, 2 },
        { 0, 0, -90 }, { -10, 180, -10 } };
    for (const Row& row : rows) {
        recorder.printCentred(u"ab", row.x, row.width, 33);
        EXPECT_EQ(document.text(0, document.texts(0).size() - 1).pt, (Tpoint { row.expected, 33 }));
        EXPECT_EQ(recorder.point(), (Tpoint { 0, 33 + 216 }));
    }
}

TEST_F(RecorderTest, WrapsFromTheCurrentPointDownwards)
{
    recorder.moveTo({ 72, 10 });
    recorder.wrappingPrint(u"abcde", 144 + 180);
    EXPECT_EQ(textsOf(document, 0), "ab|cd|e");
    EXPECT_EQ(text(1).pt, (Tpoint { 72, 226 }));
    EXPECT_EQ(recorder.point(), (Tpoint { 72, 10 + 3 * 216 }));
    recorder.wrappingPrint(u"", 500);
    EXPECT_EQ(document.texts(0).size(), 3U);
}

TEST_F(RecorderTest, PrintsTheLinesOfACellEachCentredWhenItFits)
{
    recorder.moveTo({ 72, 0 });
    recorder.cellText(u"ab\r\nabcdefg\n\ntoo\rlong", 144 + 540, 72, 100);
    EXPECT_EQ(textsOf(document, 0), "ab|abcdef|g||toolon|g");
    EXPECT_EQ(text(0).pt, (Tpoint { 72 + (684 - 180) / 2, 100 }));
    EXPECT_EQ(text(1).pt, (Tpoint { 72, 316 }));
    EXPECT_EQ(text(3).pt, (Tpoint { 72 + 342, 748 }));
    EXPECT_EQ(recorder.point(), (Tpoint { 72, 100 + 6 * 216 }));
}

TEST_F(RecorderTest, BreaksACellTextAtSeparatorsToo)
{
    recorder.cellText(u"a★b", 1000, 0, 0);
    EXPECT_EQ(textsOf(document, 0), "a|b");
}

TEST_F(RecorderTest, MeasuresNothingForAFontOfNoSize)
{
    for (const float size : { 0.0F, -3.0F }) {
        recorder.setTextFont({ .size = size }, 0);
        EXPECT_EQ(recorder.textWidth(u"abc"), 0);
        EXPECT_EQ(recorder.textHeight(), 0);
    }
}

TEST_F(RecorderTest, MeasuresTheTallestCellOfARecordOrOfTheTitles)
{
    TableRowSet rows(std::make_shared<TextStore>());
    rows.appendField(u"title");
    rows.appendField(u"B\nb");
    rows.appendField(u"C\nc\nc\nc");
    rows.addRecord();
    rows.setLast(0, Value::ofText(u"  abcdef  "));
    rows.moveFirst();
    const std::array<double, 3> widths { 144 + 180, 1000, 144 };
    EXPECT_EQ(recorder.rowTextHeight(rows, widths, true, u'.'), 3 * 216);
    EXPECT_EQ(recorder.rowTextHeight(rows, widths, false, u'.'), 3 * 216);
    EXPECT_EQ(recorder.rowTextHeight(rows, {}, true, u'.'), 0);
    const std::array<double, 2> wide { 1000, 1000 };
    EXPECT_EQ(recorder.rowTextHeight(rows, wide, true, u'.'), 216);
    EXPECT_EQ(recorder.rowTextHeight(rows, wide, false, u'.'), 432);
}

TEST_F(RecorderTest, ClearsThePageAndPutsThePointAtTheCorner)
{
    recorder.setLineAttributes({ .LineColor = 9 });
    recorder.moveTo({ 5, 5 });
    recorder.printText(u"x", false);
    recorder.clear();
    EXPECT_EQ(recorder.point(), (Tpoint { 0, 0 }));
    EXPECT_TRUE(document.texts(0).empty());
    recorder.lineTo({ 1, 1 });
    recorder.printText(u"y", false);
    EXPECT_EQ(document.line(0, 0).LineColor, 9);
    EXPECT_EQ(text(0).prnFont.size, 9);
    recorder.newPage();
    EXPECT_EQ(recorder.point(), (Tpoint { 0, 0 }));
    EXPECT_EQ(document.currentPage, 1);
}

TEST_F(RecorderTest, RefusesToRecordOnAPageThatIsNotThere)
{
    document.currentPage = 3;
    recorder.moveTo({ 1, 1 });
    EXPECT_EQ(errorOf([&] { recorder.printText(u"x", true); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { recorder.lineTo({ 2, 2 }); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(recorder.point(), (Tpoint { 1, 1 }));
}

TEST_F(RecorderTest, OverflowsPastTheLastTwipAndRecordsNothing)
{
    recorder.moveTo({ 0, 2147483640 });
    EXPECT_EQ(errorOf([&] { recorder.printText(u"x", true); }), ErrorNumber::Overflow);
    recorder.moveTo({ 2147483640, 0 });
    EXPECT_EQ(errorOf([&] { recorder.printText(u"x", false); }), ErrorNumber::Overflow);
    EXPECT_TRUE(document.texts(0).empty());
}

TEST_F(RecorderTest, DrawsOnAVisibleSurfaceAsWell)
{
    FakeSurface surface;
    recorder.drawOn(&surface, 2);
    recorder.setLineAttributes({ 2, 255, 3, 0, 128 });
    EXPECT_EQ(surface.log(),
        "fill colour 128\nfill style 0\nfore colour 255\ndraw style 2\ndraw width 3\n");
    surface.forget();
    recorder.setTextFont({ u"A", 9, true, false }, 7);
    EXPECT_EQ(surface.log(), "bold 1\nitalic 0\nfont name A\nfont size 4.5\nfore colour 7\n");
    surface.forget();
    recorder.moveTo({ 1, 2 });
    recorder.lineTo({ 3, 4 });
    EXPECT_EQ(surface.log(),
        "x 1\ny 2\nfill colour 128\nfill style 0\nfore colour 255\ndraw style 2\ndraw width 3\n"
        "line 1,2 3,4\n");
    surface.forget();
    recorder.printText(u"ab", false);
    EXPECT_EQ(surface.log(),
        "bold 1\nitalic 0\nfont name A\nfont size 4.5\nfore colour 7\nprint ab\nx 183\ny 4\n");
    surface.forget();
    recorder.clear();
    EXPECT_EQ(surface.log().substr(0, 6), "clear\n");
    surface.forget();
    recorder.newPage();
    EXPECT_EQ(surface.log(), "clear\n");
    surface.forget();
    recorder.drawOn(nullptr, 2);
    recorder.printText(u"ab", false);
    EXPECT_EQ(surface.log(), "");
}

TEST_F(RecorderTest, RecordsTheLinesOfARowByTheirPattern)
{
    recorder.setLineAttributes({ .LineColor = 7 });
    const std::uint32_t pen = recorder.penNumber();
    const auto lines = std::to_array<PatternLine>({ { 10, 10, false, true, pen },
        { 90, 90, false, true, pen }, { 10, 90, true, true, pen } });
    const std::uint32_t pattern = document.addLinePattern(lines);
    const std::uint32_t none = document.addLinePattern({});
    recorder.rowLines(100, 130, pattern);
    EXPECT_EQ(recorder.point(), (Tpoint { 90, 130 }));
    recorder.rowLines(130, 190, none);
    ASSERT_EQ(document.lines(0).size(), 3U);
    const Lineobj first = document.line(0, 0);
    EXPECT_EQ(first.pt1, (Tpoint { 10, 100 }));
    EXPECT_EQ(first.pt2, (Tpoint { 10, 130 }));
    EXPECT_EQ(first.LineColor, 7);
    EXPECT_EQ(document.line(0, 2).pt1, (Tpoint { 10, 130 }));
    EXPECT_EQ(document.line(0, 2).pt2, (Tpoint { 90, 130 }));
    FakeSurface surface;
    recorder.drawOn(&surface, 1);
    recorder.rowLines(200, 230, pattern);
    EXPECT_NE(surface.log().find("line 90,200 90,230\n"), std::string::npos);
    EXPECT_EQ(document.lines(0).size(), 6U);
}

} // namespace pelloric
