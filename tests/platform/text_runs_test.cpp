// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/text_runs.h"

#include "platform/numbers.h"
#include "platform/text_metrics.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// Has Latin, Arabic, emoji and Han glyphs of 10 twips, but no Thai ones, which are 6 wide.
class SampleFace : public InstalledFace {
public:
    SampleFace()
        : InstalledFace(24)
    {
    }

    int asked = 0;

protected:
    double glyphAdvance(char32_t codePoint) override { return isThai(codePoint) ? 6 : 10; }
    bool hasGlyph(char32_t codePoint) override
    {
        ++asked;
        return !isThai(codePoint) && codePoint != 0x2FFFE;
    }

private:
    static bool isThai(char32_t codePoint) { return codePoint >= 0x0E00 && codePoint < 0x0E80; }
};

/// One run a line: kind, line, left, advance and text.
std::string show(TextView text)
{
    SampleFace face;
    std::vector<TextRun> runs;
    cutIntoRuns(text, face, runs);
    std::string shown;
    for (const TextRun& run : runs) {
        constexpr const char* Kinds[] = { "plain", "shaped", "box" };
        shown += std::string(Kinds[static_cast<std::size_t>(run.kind)]) + " "
            + std::to_string(run.line) + " " + toUtf8(formatNumber(run.left)) + " "
            + toUtf8(formatNumber(run.advance)) + " " + toUtf8(run.text) + "\n";
    }
    return shown;
}

} // namespace

TEST(TextRuns, KeepAPlainTextWhole)
{
    EXPECT_EQ(show(u"Total 12"), "plain 0 0 80 Total 12\n");
    EXPECT_EQ(show(u"汉字"), "plain 0 0 20 汉字\n");
    EXPECT_EQ(show(u""), "");
}

TEST(TextRuns, BeginEveryLineAtTheLeftEdge)
{
    EXPECT_EQ(show(u"ab\ncde\r\n\nf"), "plain 0 0 20 ab\nplain 1 0 30 cde\nplain 3 0 10 f\n");
    EXPECT_EQ(lineCount(u"ab\ncde\r\n\nf"), 4U);
    EXPECT_EQ(lineCount(u""), 1U);
}

TEST(TextRuns, LeaveAGapOfFourBlanksForATab)
{
    EXPECT_EQ(show(u"a\tb\t\tc"), "plain 0 0 10 a\nplain 0 50 10 b\nplain 0 140 10 c\n");
}

TEST(TextRuns, DrawNothingForOtherControlCharacters)
{
    const Text text { u'a', 0, 1, 0x1B, 0x7F, 0x85, 0x9F, 0xAD, 0x200B, 0x2028, 0xFEFF, u'b' };
    EXPECT_EQ(show(text), "plain 0 0 10 a\nplain 0 10 10 b\n");
}

TEST(TextRuns, DrawABoxOfItsAdvanceForEachCharacterThatNoFaceHas)
{
    EXPECT_EQ(show(u"aกขb"), "plain 0 0 10 a\nbox 0 10 6 ก\nbox 0 16 6 ข\nplain 0 22 10 b\n");
    EXPECT_EQ(show(u"\U0002FFFE"), "box 0 0 10 \U0002FFFE\n");
}

TEST(TextRuns, LeaveToTheShaperWhatIsJoinedToItsNeighbours)
{
    EXPECT_EQ(show(u"a e\u0301"), "shaped 0 0 40 a e\u0301\n");
    EXPECT_EQ(show(u"س\u200Dل\tb"), "shaped 0 0 20 س\u200Dل\nplain 0 60 10 b\n");
    EXPECT_EQ(show(u"\u200E\u200F"), "");
    EXPECT_EQ(show(u"\U0001F600\uFE0F"), "shaped 0 0 10 \U0001F600\uFE0F\n");
}

TEST(TextRuns, DrawHalfAPairAsAReplacementCharacter)
{
    const Text text { u'a', 0xD800, u'b' };
    EXPECT_EQ(show(text), "plain 0 0 10 a\nplain 0 10 10 \uFFFD\nplain 0 20 10 b\n");
}

TEST(TextRuns, TakeAsMuchRoomAsWasMeasured)
{
    SampleFace face;
    std::vector<TextRun> runs;
    for (const TextView text : { u"a\tb", u"aกb", u"a\r\u0007b", u"س\u200Dل", u"e\u0301" }) {
        cutIntoRuns(text, face, runs);
        const TextRun& last = runs.back();
        EXPECT_EQ(last.left + last.advance, face.advanceOf(text)) << toUtf8(text);
    }
    EXPECT_EQ(longestLineAdvance(u"a\nbcd\ne", face), 30);
}

TEST(TextRuns, AskOnceWhetherThereIsAGlyph)
{
    SampleFace face;
    std::vector<TextRun> runs;
    cutIntoRuns(u"ab\U0001F600", face, runs);
    const int asked = face.asked;
    for (int round = 0; round < 3; ++round)
        cutIntoRuns(u"ab\U0001F600", face, runs);
    EXPECT_EQ(face.asked, asked);
}

TEST(TextRuns, MakeBoxesTallerThanWideAndHollow)
{
    for (const double advance : { 40.0, 100.0, 200.0 }) {
        const HollowBox box = hollowBox(advance, 200);
        EXPECT_GT(box.left, 0);
        EXPECT_LT(box.right, advance);
        EXPECT_GT(box.bottom - box.top, box.right - box.left) << advance;
        EXPECT_GT(box.bottom, 0) << "it reaches below the baseline";
        EXPECT_GT(box.right - box.left, 2 * box.stroke);
    }
}

} // namespace pelloric
