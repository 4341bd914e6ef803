// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/numbers.h"

#include "support/errors.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace pelloric {

namespace {

struct LeadingRow {
    const char16_t* text;
    double number;
};

constexpr double Infinity = std::numeric_limits<double>::infinity();
constexpr double NotANumber = std::numeric_limits<double>::quiet_NaN();

} // namespace

TEST(LeadingNumber, TakesTheLongestNumberThatATextBeginsWith)
{
    const LeadingRow rows[] = { { u"", 0 }, { u"abc", 0 }, { u"12", 12 }, { u"  12", 12 },
        { u"\t12", 0 }, { u"　12", 0 }, { u"12abc", 12 }, { u"-3.5", -3.5 }, { u"+7", 7 },
        { u"- 7", 0 }, { u"1 2", 1 }, { u"1,5", 1 }, { u".5", 0.5 }, { u"5.", 5 }, { u".", 0 },
        { u"-.5", -0.5 }, { u"1e3", 1000 }, { u"1E+2", 100 }, { u"1e-2x", 0.01 }, { u"1e", 1 },
        { u"1e+", 1 }, { u"1ex", 1 }, { u"e5", 0 }, { u"0x10", 0 }, { u"&H10", 0 }, { u"inf", 0 },
        { u"nan", 0 }, { u"1.2.3", 1.2 }, { u"--1", 0 }, { u"1e-400", 0 }, { u"１", 0 },
        { u"1d5", 1 }, { u"1e400", Infinity }, { u"-1e400", -Infinity } };
    for (const LeadingRow& row : rows) {
        EXPECT_EQ(leadingNumber(TextView(row.text)), row.number) << toUtf8(row.text);
        const std::string bytes = toUtf8(row.text);
        EXPECT_EQ(leadingNumber(std::string_view(bytes)), row.number) << bytes;
    }
}

TEST(LeadingNumber, EndsForALongRowOfDigits)
{
    EXPECT_EQ(leadingNumber(TextView(Text(100000, u'1'))), Infinity);
    EXPECT_EQ(leadingNumber(TextView(u"0." + Text(100000, u'0') + u"1")), 0);
    EXPECT_EQ(leadingNumber(TextView(u"-0." + Text(400, u'0') + u"1e5")), 0);
    EXPECT_EQ(leadingNumber(TextView(u"1" + Text(400, u'0') + u"e-5")), Infinity);
    EXPECT_EQ(leadingNumber(TextView(u"1" + Text(400, u'0') + u"e-400")), 1);
    EXPECT_EQ(leadingNumber(TextView(u"1e" + Text(400, u'9'))), Infinity);
    EXPECT_EQ(leadingNumber(TextView(u"1e-" + Text(400, u'9'))), 0);
    EXPECT_EQ(leadingNumber(TextView(u"0e" + Text(400, u'9'))), 0);
}

TEST(IsNumber, WantsTheWholeText)
{
    for (const TextView text : { u"1", u" 1.5 ", u"-1e3", u".5" })
        EXPECT_TRUE(isNumber(text)) << toUtf8(text);
    for (const TextView text : { u"", u" ", u"1x", u"1 2", u"1\t", u"1,5", u"." })
        EXPECT_FALSE(isNumber(text)) << toUtf8(text);
}

TEST(Rounding, GoesHalfToEven)
{
    const LeadingRow rows[] = { { u"0.5", 0 }, { u"1.5", 2 }, { u"2.5", 2 }, { u"-0.5", 0 },
        { u"-1.5", -2 }, { u"-2.5", -2 }, { u"2.4999", 2 }, { u"2.5001", 3 }, { u"7", 7 } };
    for (const LeadingRow& row : rows) {
        EXPECT_EQ(roundHalfEven(leadingNumber(TextView(row.text))), row.number);
        EXPECT_EQ(roundToInt16(leadingNumber(TextView(row.text))), row.number);
        EXPECT_EQ(roundToInt32(leadingNumber(TextView(row.text))), row.number);
    }
}

TEST(Rounding, OverflowsOutsideItsType)
{
    EXPECT_EQ(roundToInt16(32767.4), 32767);
    EXPECT_EQ(roundToInt16(-32768.5), -32768);
    EXPECT_EQ(roundToInt32(2147483647.4), 2147483647);
    EXPECT_EQ(roundToInt32(-2147483648.5), -2147483647 - 1);
    for (const double value : { 32767.5, -32768.6, Infinity, -Infinity, NotANumber })
        EXPECT_EQ(errorOf([&] { roundToInt16(value); }), ErrorNumber::Overflow) << value;
    for (const double value : { 2147483647.5, -2147483649.0, Infinity, -Infinity, NotANumber })
        EXPECT_EQ(errorOf([&] { roundToInt32(value); }), ErrorNumber::Overflow) << value;
    EXPECT_EQ(narrowToInt16(-32768), -32768);
    EXPECT_EQ(errorOf([] { narrowToInt16(32768); }), ErrorNumber::Overflow);
    EXPECT_EQ(errorOf([] { narrowToInt16(-32769); }), ErrorNumber::Overflow);
}

TEST(ToSingle, OverflowsPastASinglesRangeAndNamesTheNumber)
{
    EXPECT_EQ(toSingle(8.1), 8.1F);
    EXPECT_EQ(toSingle(-3.4028234663852886e38), -3.4028234663852886e38F);
    for (const double value : { 3.41e38, -3.41e38, Infinity, -Infinity, NotANumber })
        EXPECT_EQ(errorOf([&] { toSingle(value); }), ErrorNumber::Overflow) << value;
    const auto textOf = [](double value, TextView what) {
        try {
            toSingle(value, what);
        } catch (const RunTimeError& error) {
            return toUtf8(error.text());
        }
        return std::string("no error");
    };
    EXPECT_EQ(textOf(1e60, u""), "Overflow: 1E+60 is past what a single-precision number holds");
    EXPECT_EQ(textOf(1e60, u"BodyFontSize"),
        "Overflow: BodyFontSize: 1E+60 is past what a single-precision number holds");
}

TEST(StrictInt16, TakesAWholeNumberAndNothingElse)
{
    EXPECT_EQ(strictInt16(u" 9 "), 9);
    EXPECT_EQ(strictInt16(u"-32768"), -32768);
    for (const TextView text : { u"", u"A4", u"9.5", u"9 mm", u"32768", u"-32769", u"1e9" })
        EXPECT_EQ(errorOf([&] { strictInt16(text); }), ErrorNumber::TypeMismatch) << toUtf8(text);
}

TEST(FormatNumber, WritesFifteenDigitsWithoutZerosAtTheEnd)
{
    struct Row {
        double value;
        TextView text;
    };
    const Row rows[] = { { 0, u"0" }, { -0.0, u"0" }, { 1, u"1" }, { -2.5, u"-2.5" },
        { 0.1 + 0.2, u"0.3" }, { 1.0 / 3, u"0.333333333333333" }, { 0.9, u"0.9" },
        { 38.99999999999999, u"39" }, { 123456789012345, u"123456789012345" }, { 1e15, u"1E+15" },
        { 999999999999999.9, u"1E+15" } };
    for (const Row& row : rows)
        EXPECT_EQ(toUtf8(formatNumber(row.value)), toUtf8(row.text));
    EXPECT_EQ(formatNumber(-2.5, u','), u"-2,5");
}

TEST(FormatSingle, WritesTheShortestFormThatReadsBackAsTheSame)
{
    EXPECT_EQ(formatSingle(0), u"0");
    EXPECT_EQ(formatSingle(9), u"9");
    EXPECT_EQ(formatSingle(8.1F), u"8.1");
    EXPECT_EQ(formatSingle(7.2900004F), u"7.2900004");
    EXPECT_EQ(formatSingle(8.1F, u','), u"8,1");
    for (float value = 0.1F; value < 1e6F; value *= 1.37F)
        EXPECT_EQ(static_cast<float>(leadingNumber(TextView(formatSingle(value)))), value);
}

TEST(ToSingle, OverflowsPastSinglePrecision)
{
    EXPECT_EQ(toSingle(0.1), 0.1F);
    EXPECT_EQ(toSingle(-3.4e38), -3.4e38F);
    for (const double bad : { 1e39, -1e39, std::nan("") })
        EXPECT_EQ(errorOf([&] { toSingle(bad); }), ErrorNumber::Overflow) << bad;
}

} // namespace pelloric
