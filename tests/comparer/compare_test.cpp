// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "comparer/compare.h"

#include "comparer/sha256.h"
#include "fakes/temp_folder.h"
#include "support/chinese_codec.h"

#include <gtest/gtest.h>

namespace pelloric::cases {

namespace {

using nlohmann::json;

json caseOf(const std::string& expected, const std::string& steps = "[]")
{
    return { { "id", "sample" }, { "title", "a sample" },
        { "input", { { "steps", json::parse(steps) }, { "show", json::array() } } },
        { "expected", json::parse(expected) } };
}

std::string differenceOf(
    const std::string& expected, const std::string& actual, const std::string& steps = "[]")
{
    return compareDump(caseOf(expected, steps), json::parse(actual)).value_or("");
}

struct Pair {
    const char* expected;
    const char* actual;
};

} // namespace

TEST(Comparer, TakesTheSameValuesHoweverTheyAreWritten)
{
    const Pair pairs[] = {
        { R"({"a": 1500})", R"({"a": 1500.0})" },
        { R"({"a": 1, "b": [2, null]})", R"({"b": [2, null], "a": 1})" },
        { R"({"table": {"w": 0.1}})", R"({"table": {"w": 0.10000000000000001}})" },
        { R"({"table": {"w": 0.3}})", R"({"table": {"w": 0.30000000000000004}})" },
        { R"({"view": {"divisor": 0.804527}})", R"({"view": {"divisor": 0.80452698469161987}})" },
        { R"({"style": {"bodyFont": ["x", 7.2900004]}})",
            R"({"style": {"bodyFont": ["x", 7.2900004386901855]}})" },
        { R"({"document": {"pages": [{"texts": [[0, 0, "x", 8.1, 0]]}]}})",
            R"({"document": {"pages": [{"texts": [[0, 0, "x", 8.1000003814697266, 0]]}]}})" },
        { R"({"a": "é"})", R"({"a": "\u00e9"})" },
    };
    for (const Pair& pair : pairs)
        EXPECT_EQ(differenceOf(pair.expected, pair.actual), "") << pair.expected;
}

TEST(Comparer, SeesEveryDifference)
{
    const Pair pairs[] = {
        { R"({"a": 1500})", R"({"a": 1501})" },
        { R"({"a": 1500})", R"({"a": 1500.0000001})" },
        { R"({"a": 1500.5})", R"({"a": 1500.50000001})" },
        { R"({"view": {"divisor": 0.804527}})", R"({"view": {"divisor": 0.8045271}})" },
        { R"({"a": 9007199254740993})", R"({"a": 9007199254740992})" },
        { R"({"a": 1})", R"({"a": true})" },
        { R"({"a": 0})", R"({"a": false})" },
        { R"({"a": 0})", R"({"a": null})" },
        { R"({"a": 1})", R"({"a": "1"})" },
        { R"({"a": "x"})", R"({"a": "x "})" },
        { R"({"a": "x"})", R"({"a": "X"})" },
        { R"({"a": [1, 2]})", R"({"a": [2, 1]})" },
        { R"({"a": [1, 2]})", R"({"a": [1]})" },
        { R"({"a": [1]})", R"({"a": [1, 2]})" },
        { R"({"a": {"b": 1}})", R"({"a": {}})" },
        { R"({"a": {}})", R"({"a": {"b": null}})" },
        { R"({"a": 1})", R"({"a": 1, "b": 2})" },
        { R"({"a": 1})", R"({})" },
        { R"({"a": []})", R"({"a": {}})" },
    };
    for (const Pair& pair : pairs)
        EXPECT_NE(differenceOf(pair.expected, pair.actual), "") << pair.expected;
}

TEST(Comparer, TellsWhereTheFirstDifferenceIs)
{
    EXPECT_EQ(differenceOf(R"({"a": [{"b": 1}, {"b": 2}]})", R"({"a": [{"b": 1}, {"b": 3}]})"),
        "dump/a/1/b: expected 2, got 3");
    EXPECT_EQ(
        differenceOf(R"({"a": {"b": 1}})", R"({"a": {}})"), "dump/a: the key \"b\" is missing");
    EXPECT_EQ(differenceOf(R"({"a": {}})", R"({"a": {"b": 1}})"),
        "dump/a: the key \"b\" is one too many");
}

TEST(Comparer, LetsResultsBeLeftOutOnlyWhenAllAreNull)
{
    const std::string steps = R"([["clear"], ["showPage"]])";
    EXPECT_EQ(differenceOf("{}", R"({"results": [null, null]})", steps), "");
    EXPECT_EQ(differenceOf(R"({"results": [null, null]})", "{}", steps), "");
    EXPECT_NE(differenceOf("{}", R"({"results": [null, 1]})", steps), "");
    EXPECT_NE(differenceOf("{}", R"({"results": [null]})", steps), "");
    EXPECT_NE(differenceOf(R"({"results": [1, null]})", "{}", steps), "");
}

TEST(Comparer, TakesSinglesInResultsWhereTheStepAnswersOne)
{
    const std::string expected = R"({"results": [0.1]})";
    const std::string actual = R"({"results": [0.10000000149011612]})";
    EXPECT_EQ(differenceOf(expected, actual, R"([["read DispScale"]])"), "");
    EXPECT_NE(differenceOf(expected, actual, R"([["val", "0.1"]])"), "");
    EXPECT_EQ(
        differenceOf(R"({"results": [[["FontSize", 8.1]]]})",
            R"({"results": [[["FontSize", 8.1000003814697266]]]})", R"([["printed page", 1]])"),
        "");
}

TEST(Comparer, SeesAChangedByteALostByteAndAWrongHashOfAFile)
{
    const std::unique_ptr<TextCodec> codec = chineseCodec();
    const std::string bytes = "\"\r\n\xCB\xCE\xCC\xE5\r\n";
    json expected = { { "lines", { "\"", "宋体" } }, { "sha256", sha256(bytes) } };
    EXPECT_EQ(compareFile(expected, bytes, *codec), std::nullopt);
    std::string changed = bytes;
    changed[4] = '\xCF';
    EXPECT_EQ(compareFile(expected, changed, *codec),
        "file: differs from byte 4 on, in line 2; expected 9 bytes, got 9");
    EXPECT_NE(compareFile(expected, bytes.substr(0, 8), *codec), std::nullopt);
    EXPECT_NE(compareFile(expected, bytes + "\n", *codec), std::nullopt);
    expected["sha256"] = sha256("");
    EXPECT_NE(compareFile(expected, bytes, *codec), std::nullopt);
}

TEST(Comparer, KnowsTheHashOfTheEmptyText)
{
    EXPECT_EQ(sha256(""), "e3b0c44298fc1c149afbf4c8996fb92427ae41e4649b934ca495991b7852b855");
}

TEST(Comparer, SeesWhatTheRunnerDidNotWrite)
{
    const std::unique_ptr<TextCodec> codec = chineseCodec();
    const TempFolder folder;
    const json expected = { { "a", 1 }, { "ostl", { { "lines", { "\"" } } } } };
    const auto path = folder.write("sample.json", caseOf(expected.dump()).dump());
    std::filesystem::create_directory(folder.file("out"));
    const auto compared = [&] { return compareCase(path, folder.file("out"), *codec); };
    EXPECT_EQ(compared(), "there is no dump");
    folder.write("out/sample.json", "{\"a\": ");
    EXPECT_EQ(compared(), "the dump is no object");
    folder.write("out/sample.json", "{\"a\": 1}");
    EXPECT_EQ(compared(), "there is no saved file");
    folder.write("out/sample.ostl", "x");
    EXPECT_NE(compared(), std::nullopt);
    const auto other = folder.write("other.json", caseOf("{}").dump());
    EXPECT_EQ(
        compareCase(other, folder.file("out"), *codec), "the case's id is not its file's name");
}

} // namespace pelloric::cases
