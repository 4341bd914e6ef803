// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/cell_lines.h"

#include "document/recorder.h"
#include "fakes/fake_metrics.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// Measures at size 9: an ASCII character is 90 twips wide, any other 180, a line 216 high.
struct CellLinesTest : ::testing::Test {
    /// The lines with "|" between them; those that fit in parentheses.
    std::string broken(TextView text, double room)
    {
        std::vector<CellLine> lines;
        breakText(text, room, font, lines);
        return shown(lines);
    }

    std::string wrapped(TextView text, double room)
    {
        std::vector<CellLine> lines;
        wrapText(text, room, font, lines);
        return shown(lines);
    }

    static std::string shown(const std::vector<CellLine>& lines)
    {
        std::string text;
        for (const CellLine& line : lines)
            text += (line.fits ? "(" + toUtf8(line.text) + ")" : toUtf8(line.text)) + "|";
        return text;
    }

    FakeFace face;
    MeasuredFont font { &face, 9, 216 };
};

} // namespace

TEST_F(CellLinesTest, CutTheLongestPiecesThatFit)
{
    EXPECT_EQ(wrapped(u"abcde", 180), "ab|cd|e|");
    EXPECT_EQ(wrapped(u"abcde", 179.9), "a|b|c|d|e|");
    EXPECT_EQ(wrapped(u"abcde", 269.9), "ab|cd|e|");
    EXPECT_EQ(wrapped(u"a中b中", 270), "a中|b中|");
    EXPECT_EQ(wrapped(u"", 270), "");
}

TEST_F(CellLinesTest, HoldOneCharacterInAPieceForEveryWidth)
{
    for (const double room : { 0.0, -1000.0, 1.0, 89.0 })
        EXPECT_EQ(wrapped(u"ab中", room), "a|b|中|") << room;
}

TEST_F(CellLinesTest, NeverCutASurrogatePair)
{
    EXPECT_EQ(wrapped(u"\U0001F600\U0001F601", 1), "\xF0\x9F\x98\x80|\xF0\x9F\x98\x81|");
    EXPECT_EQ(font.width(u"\U0001F600"), 180);
    const char16_t half[] = { 0xD83D, u'a', 0 };
    EXPECT_EQ(wrapped(half, 1).size(), 6U);
}

TEST_F(CellLinesTest, BreakAtLineFeedsAndSeparators)
{
    EXPECT_EQ(broken(u"a\nb★c", 500), "(a)|(b)|(c)|");
    EXPECT_EQ(broken(u"\n", 500), "()|()|");
    EXPECT_EQ(broken(u"", 500), "()|");
    EXPECT_EQ(broken(u"abc\nd", 180), "ab|c|(d)|");
}

TEST_F(CellLinesTest, DropCarriageReturns)
{
    EXPECT_EQ(withoutCarriageReturns(u"a\r\nb\rc\r"), u"a\nbc");
}

TEST_F(CellLinesTest, TellAllOfATextInOneLook)
{
    const CellText plain = readCellText(u"ab", font);
    EXPECT_EQ(plain.width, 180);
    EXPECT_FALSE(plain.hasLineFeed || plain.hasSeparator || plain.hasCarriageReturn);
    EXPECT_TRUE(readCellText(u"a\nb", font).hasLineFeed);
    EXPECT_TRUE(readCellText(u"a★b", font).hasSeparator);
    EXPECT_TRUE(readCellText(u"a\r", font).hasCarriageReturn);
}

TEST_F(CellLinesTest, MeasureTheHeightOfACell)
{
    struct Row {
        TextView text;
        double width;
        double height;
    };
    const Row rows[] = {
        { u"", 1000, 216 },
        { u"abc", 414, 216 },
        { u"abc", 413, 432 },
        { u"a\nb", 1000, 432 },
        { u"a\r\nb", 1000, 432 },
        { u"a\r\n\r\nb", 1000, 648 },
        { u"a★b", 1000, 432 },
        { u"a\rbc", 414, 216 },
        { u"abcd\ne", 414, 648 },
        { u"\n", 1000, 432 },
        { u"abc", 145, 648 },
    };
    for (const Row& row : rows)
        EXPECT_EQ(cellTextHeight(row.text, row.width, font), row.height) << toUtf8(row.text);
}

TEST_F(CellLinesTest, MeasureNothingForAFontOfNoSize)
{
    MeasuredFont none { &face, 0, textHeight(face, 0) };
    EXPECT_EQ(none.lineHeight, 0);
    EXPECT_EQ(none.width(u"abc"), 0);
    std::vector<CellLine> lines;
    wrapText(u"abc", -5, none, lines);
    EXPECT_EQ(shown(lines), "a|b|c|");
}

} // namespace pelloric
