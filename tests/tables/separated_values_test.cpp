// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/separated_values.h"

#include <gtest/gtest.h>

#include <array>

namespace pelloric {

namespace {

/// "line:value|value|/line:value|": every row with the line on which it begins.
std::string show(std::string_view text, ValuesDialect dialect = {})
{
    SeparatedValues values(text, dialect);
    std::string shown;
    while (values.nextRow()) {
        shown += (shown.empty() ? "" : "/") + std::to_string(values.line()) + ":";
        for (std::size_t at = 0; at < values.valueCount(); ++at)
            shown += std::string(values.value(at)) + "|";
    }
    return shown;
}

struct Case {
    std::string_view text;
    std::string_view shown;
};

} // namespace

TEST(SeparatedValues, AreReadRowByRow)
{
    const Case cases[] = {
        { "", "" },
        { "\n\r\n\n", "" },
        { "a,b\n1,2\n", "1:a|b|/2:1|2|" },
        { "a,b\r\n1,2", "1:a|b|/2:1|2|" },
        { "a\r1\r\r2\r", "1:a|/2:1|/4:2|" },
        { "a,,\n,,b", "1:a|||/2:||b|" },
        { " a b ,\tc\t\n", "1:a b|c|" },
        { ",", "1:||" },
    };
    for (const Case& row : cases)
        EXPECT_EQ(show(row.text), row.shown) << row.text;
}

TEST(SeparatedValues, AreQuotedOnlyWhereTheClosingQuoteEndsThem)
{
    const Case cases[] = {
        { "\"a,b\",2\n", "1:a,b|2|" },
        { "\"say \"\"hi\"\"\",2", "1:say \"hi\"|2|" },
        { "\"\",\"\"\"\"", "1:|\"|" },
        { "1, \"x, y\"\n", "1:1|x, y|" },
        { "\"x\ny\",2\n3,4\n", "1:x\ny|2|/3:3|4|" },
        { "\"x\r\ny\"\r\n3\r\n", "1:x\r\ny|/3:3|" },
        { "\"abc\" def,2\n3,4\n", "1:\"abc\" def|2|/2:3|4|" },
        { "\"abc\n3,4\n", "1:\"abc|/2:3|4|" },
        { "5\" pipe,12\" pipe\n", "1:5\" pipe|12\" pipe|" },
        { "\"He said \"hi\", ok\",2\n", "1:\"He said \"hi\"|ok\"|2|" },
        { "\"\"a\"\",2\n", "1:\"\"a\"\"|2|" },
        { "a,\"", "1:a|\"|" },
    };
    for (const Case& row : cases)
        EXPECT_EQ(show(row.text), row.shown) << row.text;
}

TEST(SeparatedValues, TakeQuotesAsTextWhereNoneAreMeant)
{
    EXPECT_EQ(show("\"a,b\"\n", { .hasQuotes = false }), "1:\"a|b\"|");
}

TEST(SeparatedValues, EndForEveryTextOfQuotesAndBreaks)
{
    std::string text;
    constexpr std::string_view Bytes = "\",\n a";
    for (int number = 0; number < 5 * 5 * 5 * 5 * 5 * 5; ++number) {
        text.clear();
        for (int rest = number, at = 0; at < 6; ++at, rest /= 5)
            text += Bytes[static_cast<std::size_t>(rest % 5)];
        SeparatedValues values(text, {});
        std::size_t last = 0;
        while (values.nextRow()) {
            ASSERT_GT(values.position(), last) << text;
            last = values.position();
        }
        ASSERT_EQ(values.position(), text.size()) << text;
    }
}

TEST(SeparatedValues, TellLineBreaksInsideOfValues)
{
    SeparatedValues values("a,\"b\nc\"\nd,e\n", {});
    ASSERT_TRUE(values.nextRow());
    EXPECT_TRUE(values.hasLineBreak());
    ASSERT_TRUE(values.nextRow());
    EXPECT_FALSE(values.hasLineBreak());
}

TEST(SeparatedValues, FindTheirDelimiterByTheRowsThatHaveAsManyValuesAsTheTitles)
{
    const std::pair<std::string_view, char> cases[] = {
        { "a,b\n1,2\n", ',' },
        { "a\tb,c\n1\t2\n", '\t' },
        { "a;b\n1,5;2,5\n3,5;4,5\n", ';' },
        { "a|b|c\n1|2,0|3\n", '|' },
        { "name;\"last, first\"\nx;\"y, z\"\n", ';' },
        { "a,b;c\n1,2;3\n", ',' },
        { "a;b;\"c,d,e,f\"\n1;2,5;3\n", ';' },
        { "single\nvalue, with a comma\n", ',' },
        { "", ',' },
        { "a|b", '|' },
    };
    for (const auto& [text, delimiter] : cases)
        EXPECT_EQ(findDelimiter(text), delimiter) << text;
}

TEST(SeparatedValues, TakesALineThatNamesTheDelimiterForNoRow)
{
    struct Row {
        std::string_view text;
        char delimiter;
        std::size_t length;
    };
    for (const auto& [text, delimiter, length] : std::to_array<Row>({
             { "sep=;\r\na;b", ';', 5 },
             { "SEP=|\na|b", '|', 5 },
             { "sep=\t\na\tb", '\t', 5 },
             { "\"sep=;\"\na;b", ';', 7 },
             { "sep=;", ';', 5 },
             { "sep=\na", ',', 0 },
             { "sep=;;\na;b", ',', 0 },
             { "sep=;a\n", ',', 0 },
             { "step;b\n", ',', 0 },
             { "sep=\"\n", ',', 0 },
             { "", ',', 0 },
         })) {
        const DelimiterLine line = delimiterLineOf(text);
        EXPECT_EQ(line.length, length) << text;
        EXPECT_EQ(line.delimiter, delimiter) << text;
    }
}

} // namespace pelloric
