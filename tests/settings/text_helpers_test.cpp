// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/text_helpers.h"

#include "support/errors.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(FilterChars, KeepsOrDropsTheCharactersOfASet)
{
    EXPECT_EQ(filterChars(u"1a2.b3 mm", u"01234567879.", true), u"12.3");
    EXPECT_EQ(filterChars(u"a1b2", u"12", false), u"ab");
    EXPECT_EQ(filterChars(u"abc", u"", true), u"");
    EXPECT_EQ(filterChars(u"abc", u"", false), u"abc");
    EXPECT_EQ(filterChars(u"", u"abc", true), u"");
    EXPECT_EQ(filterChars(u"Aa", u"a", true), u"a");
}

TEST(FilterChars, TakesASurrogatePairAsOneCharacter)
{
    EXPECT_EQ(filterChars(u"😀😁", u"😀", true), u"😀");
    EXPECT_EQ(filterChars(u"😀😁", u"😀", false), u"😁");
}

TEST(CountChar, CountsACharacter)
{
    EXPECT_EQ(countChar(u"a,b,,c", u","), 3);
    EXPECT_EQ(countChar(u"", u","), 0);
    EXPECT_EQ(countChar(u"aaa", u"aa"), 0);
    EXPECT_EQ(countChar(u"aaa", u""), 0);
    EXPECT_EQ(countChar(u"😀a😀", u"😀"), 2);
}

TEST(CountChar, CountsIn16Bits)
{
    EXPECT_EQ(countChar(Text(32767, u'x'), u"x"), 32767);
    EXPECT_EQ(errorOf([] { countChar(Text(32768, u'x'), u"x"); }), ErrorNumber::Overflow);
}

TEST(GetField, FindsAFieldThatASeparatorFollows)
{
    struct Row {
        TextView text;
        int index;
        TextView separator;
        bool afterColon;
        TextView field;
    };
    const Row rows[] = {
        { u"one,two:2,three", 0, u",", false, u"one" },
        { u"one,two:2,three", 1, u",", false, u"two:2" },
        { u"one,two:2,three", 2, u",", false, u"" },
        { u"one,two:2,three", 3, u",", false, u"" },
        { u"one,two:2:3,three,", 1, u",", true, u"2:3" },
        { u"one,two:2:3,three,", 2, u",", true, u"three" },
        { u"one,two,", 0, u",", true, u"one" },
        { u",a,", 0, u",", false, u"" },
        { u",a,", 1, u",", false, u"a" },
        { u"a:,", 0, u",", true, u"" },
        { u"a=>b=>c=>", 1, u"=>", false, u"b" },
        { u"a=>b=>c", 2, u"=>", false, u"" },
        { u"a,b", 1'000'000'000, u",", false, u"" },
        { u"a,b,", -1, u",", false, u"a" },
        { u"a,b,", 0, u"", false, u"" },
        { u"", 0, u",", false, u"" },
    };
    for (const Row& row : rows) {
        EXPECT_EQ(getField(row.text, row.index, row.separator, row.afterColon), row.field)
            << toUtf8(row.text) << " " << row.index;
    }
}

} // namespace pelloric
