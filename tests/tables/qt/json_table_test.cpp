// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/json_table.h"

#include "fakes/temp_folder.h"
#include "platform/run_time_error.h"

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

/// "title|title|/cell|cell|": what reading gives, or the error's text.
std::string read(std::string_view bytes)
{
    const TempFolder folder;
    try {
        const TableGrid grid = readJson(folder.write("a.json", bytes), {});
        Text text;
        for (int column = 0; column < grid.columnCount(); ++column)
            text.append(grid.column(column).title).append(u"|");
        for (std::int64_t row = 0; row < grid.rowCount(); ++row) {
            text.append(u"/");
            for (int column = 0; column < grid.columnCount(); ++column)
                text.append(grid.cell(row, column)).append(u"|");
        }
        return toUtf8(text);
    } catch (const RunTimeError& error) {
        return toUtf8(error.text());
    }
}

struct Case {
    std::string_view bytes;
    std::string_view result;
};

constexpr std::string_view Shape
    = "a table is an array of objects, [{\"name\": value, …}, …], or one object a line";

} // namespace

TEST(JsonTable, ReadsArraysOfObjectsAndLines)
{
    const Case cases[] = {
        { "[{\"b\":1,\"a\":\"x\"},{\"a\":\"y\",\"c\":true}]", "b|a|c|/1|x||/|y|true|" },
        { "{\"a\":1}\n\n{\"a\":2,\"b\":null}\r\n", "a|b|/1||/2||" },
        { "[{\"n\":1.50,\"m\":12345678901234567890123,\"e\":1e5,\"z\":-0}]",
            "n|m|e|z|/1.50|12345678901234567890123|1e5|0|" },
        { "[{\"a\":[1,\"x\",{\"k\":null,\"l\":[]}],\"b\":{\"c\":2}}]",
            "a|b|/[1,\"x\",{\"k\":null,\"l\":[]}]|{\"c\":2}|" },
        { "[{\"城市\":\"北京\\n\\u5317\"}]", "城市|/北京\n北|" },
        { "\xEF\xBB\xBF[{\"a\":1}]", "a|/1|" },
        { "{\n\"a\":1,\n\"b\":\"x\"\n}", "a|b|/1|x|" },
        { "[{},{\"a\":1}]", "a|/|/1|" },
    };
    for (const Case& row : cases)
        EXPECT_EQ(read(row.bytes), row.result) << row.bytes;
}

TEST(JsonTable, NamesTheLineOfWhatItCannotReadAndWhatATableIs)
{
    EXPECT_EQ(
        read("[{\"a\":1},\n{\"a\":}\n]").substr(0, 40), "Type mismatch: line 2: this is no JSON: ");
    EXPECT_EQ(
        read("{\"a\":1}\n{\"a\"\n").substr(0, 40), "Type mismatch: line 2: this is no JSON: ");
    EXPECT_EQ(read("[1,2]"), "Type mismatch: line 1: " + std::string(Shape));
    EXPECT_EQ(read("[[1],[2]]"), "Type mismatch: line 1: " + std::string(Shape));
    EXPECT_EQ(read("{\"a\":1}\n3\n"), "Type mismatch: line 2: " + std::string(Shape));
    EXPECT_EQ(read(" \n"), "Type mismatch: the file is empty");
    for (const char* const nameless : { "[]", "[{}]", "{}\n{}\n" })
        EXPECT_EQ(read(nameless),
            "Type mismatch: no object of the file has a name, so there is no column; "
                + std::string(Shape));
}

TEST(JsonTable, SaysHowTheRowsComeOutOfAnObject)
{
    const std::string one = "take the array out of it, for example with: jq ";
    const std::string several
        = "take one of its arrays out of it, for example with jq and one of: ";
    const std::string none = "it holds no array of objects, but ";
    struct WayOut {
        std::string_view bytes;
        std::string text;
    };
    const WayOut ways[] = {
        { "{\n\"data\": [{\"a\":1}]\n}", one + ".data" },
        { "{\"n\":[1],\"data\":[{\"a\":1}]}", one + ".data" },
        { "{\"a b\":[{\"a\":1}]}", one + "'.\"a b\"'" },
        { "{\"it's\":[{\"a\":1}]}", one + "'.\"it'\\''s\"'" },
        { "{\"page\":1,\"data\":{\"2024\":{\"items\":[{}]}}}", one + "'.data.\"2024\".items'" },
        { "{\"x\":{\"far\":[{\"a\":1}]},\"rows\":[{}],\"cells\":[{}]}",
            several + ".rows, .cells, .x.far" },
        { "{\"a\":[{}],\"b\":[{}],\"c\":[{}],\"d\":[{}],\"e\":[{}]}", several + ".a, .b, .c, .d" },
        { "{\"x\":{\"a\":1},\"y\":{\"a\":2}}",
            "make rows of its objects, for example with: jq '[.[]]'" },
        { "{\"z\":[1,2],\"m\":{\"k\":0},\"n\":1.50}", none + "\"z\": […], \"m\": {…}, \"n\": 1.5" },
        { "{\"rows\":[],\"b\":true,\"c\":null,\"d\":\"x\",\"e\":1}",
            none + "\"rows\": [], \"b\": true, \"c\": null, \"d\": \"x\", …" },
    };
    for (const WayOut& way : ways)
        EXPECT_EQ(read(way.bytes),
            "Type mismatch: the file is one object; " + std::string(Shape) + "; " + way.text);
}

TEST(JsonTable, TakesOneNestedObjectForARowWhereTheNameSaysSo)
{
    const TempFolder folder;
    const TableGrid grid = readJson(folder.write("a.jsonl", "{\"a\":[{\"b\":1}]}\n"), {});
    EXPECT_EQ(grid.rowCount(), 1);
    EXPECT_EQ(toUtf8(Text(grid.cell(0, 0))), "[{\"b\":1}]");
}

TEST(JsonTable, EndsForDeepNesting)
{
    const std::string deep
        = "[{\"a\":" + std::string(200000, '[') + std::string(200000, ']') + "}]";
    EXPECT_EQ(read(deep).size(), 4 + 400000U);
}

TEST(JsonTable, RefusesAValueWithoutEnd)
{
    const TempFolder folder;
    const auto read = [&](const std::string& bytes) {
        try {
            readJson(folder.write("a.json", bytes), { .mostValueBytes = 40 });
            return std::string();
        } catch (const RunTimeError& error) {
            return toUtf8(error.text());
        }
    };
    const std::string ten = "\"123456\",";
    EXPECT_EQ(read("[{\"a\":[" + ten + ten + ten + "12345678]}]"), "");
    EXPECT_EQ(read("[{\"a\":[" + ten + ten + ten + ten + ten + "1]}]"),
        "Type mismatch: line 1: a value holds more than 40 bytes; leave it out, or shorten it");
    EXPECT_EQ(read("[{\"b\":1,\"a\":\"" + std::string(41, 'x')),
        "Overflow: the value behind byte 13 holds more than 40 bytes; leave it out, or shorten it");
}

TEST(JsonTable, IsToldByItsBeginning)
{
    for (const std::string_view start : { "[{\"a\":1}]", " [\n {", "{\"a\":", "[\n1" })
        EXPECT_TRUE(looksLikeJson(start)) << start;
    for (const std::string_view start : { "", "a,b", "[1],b", "{a},b", "[x] a,b", "[" })
        EXPECT_FALSE(looksLikeJson(start)) << start;
}

} // namespace pelloric::qt
