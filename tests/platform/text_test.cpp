// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/text.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(Text, IsTrimmedOfBlanksOnly)
{
    EXPECT_EQ(trimmed(u"  a b  "), u"a b");
    EXPECT_EQ(trimmed(u"   "), u"");
    EXPECT_EQ(trimmed(u""), u"");
    EXPECT_EQ(trimmed(u"\ta\r\n"), u"\ta\r\n");
    EXPECT_EQ(trimmed(u"　a\u00A0"), u"　a\u00A0");
}

TEST(Text, IsReplacedFromLeftToRight)
{
    EXPECT_EQ(replaceAll(u"aaa", u"aa", u"b"), u"ba");
    EXPECT_EQ(replaceAll(u"a.b.c", u".", u".."), u"a..b..c");
    EXPECT_EQ(replaceAll(u"abc", u"", u"x"), u"abc");
    EXPECT_EQ(replaceAll(u"", u"a", u"x"), u"");
    EXPECT_EQ(replaceAll(u"abab", u"ab", u""), u"");
}

TEST(Text, ContainsPartsOfExactlyTheSameLetters)
{
    EXPECT_TRUE(contains(u"abc", u"bc"));
    EXPECT_FALSE(contains(u"abc", u"BC"));
    EXPECT_TRUE(contains(u"", u""));
}

TEST(Text, CountsASurrogatePairAsOneCharacter)
{
    const Text text = u"a\U0001F600b";
    EXPECT_EQ(characterLength(text, 0), 1);
    EXPECT_EQ(characterLength(text, 1), 2);
    std::size_t position = 1;
    EXPECT_EQ(nextCodePoint(text, position), char32_t { 0x1F600 });
    EXPECT_EQ(position, 3U);
    const Text halves { char16_t { 0xDE00 }, char16_t { 0xD83D } };
    EXPECT_EQ(characterLength(halves, 0), 1);
    EXPECT_EQ(characterLength(halves, 1), 1);
}

TEST(Text, TurnsIntoUtf8AndBack)
{
    const Text text = u"a\u0080é\u07FF\u0800宋\uFFFD\U00010000\U0010FFFF";
    EXPECT_EQ(fromUtf8(toUtf8(text)), text);
    EXPECT_EQ(toUtf8(u"宋"), "\xE5\xAE\x8B");
    EXPECT_EQ(toUtf8(Text { char16_t { 0xD83D } }), "\xEF\xBF\xBD");
}

TEST(Text, ReplacesBytesThatAreNoCharacter)
{
    struct Row {
        const char* bytes;
        TextView text;
    };
    const Row rows[] = { { "a\xFFz", u"a\uFFFDz" }, { "\xC3", u"\uFFFD" },
        { "\xC0\x80", u"\uFFFD\uFFFD" }, { "\xED\xA0\x80", u"\uFFFD\uFFFD\uFFFD" },
        { "\xF4\x90\x80\x80", u"\uFFFD\uFFFD\uFFFD\uFFFD" }, { "\xE5\xAE", u"\uFFFD\uFFFD" },
        { "\x80", u"\uFFFD" } };
    for (const Row& row : rows)
        EXPECT_EQ(fromUtf8(row.bytes), row.text);
}

TEST(Text, PutsABlankForEveryLineBreak)
{
    EXPECT_EQ(onOneLine(u"a\r\nb\nc\rd\n\re\t"), u"a b c d  e\t");
    EXPECT_EQ(onOneLine(u"\r\n"), u" ");
    EXPECT_EQ(onOneLine(u""), u"");
}

TEST(Text, WritesWholeNumbers)
{
    EXPECT_EQ(decimal(0), u"0");
    EXPECT_EQ(decimal(-12), u"-12");
    EXPECT_EQ(decimal(INT64_MIN), u"-9223372036854775808");
}

} // namespace pelloric
