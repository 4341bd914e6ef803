// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/shown_number.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(ShownNumber, ReadsANumberInOneWayWhereThereIsOne)
{
    struct Case {
        TextView text;
        double value;
        int decimals;
        char16_t grouping;
        char16_t separator; ///< 0: the text does not tell
    };
    for (const Case& expected : {
             Case { u"12", 12, 0, 0, 0 },
             Case { u" 12.50 ", 12.5, 2, 0, u'.' },
             Case { u"12,50", 12.5, 2, 0, u',' },
             Case { u"1,234.50", 1234.5, 2, u',', u'.' },
             Case { u"1.234,50", 1234.5, 2, u'.', u',' },
             Case { u"1,234,567", 1234567, 0, u',', u'.' },
             Case { u"1.234.567", 1234567, 0, u'.', u',' },
             Case { u"12,34,567.8", 1234567.8, 1, u',', u'.' },
             Case { u"1 234,5", 1234.5, 1, u' ', u',' },
             Case { u"1\u00A0234\u00A0567", 1234567, 0, u'\u00A0', 0 },
             Case { u"1\u202F234,567", 1234.567, 3, u'\u202F', u',' },
             Case { u"1'234'567.89", 1234567.89, 2, u'\'', u'.' },
             Case { u"1\u2019234.5", 1234.5, 1, u'\u2019', u'.' },
             Case { u"0.125", 0.125, 3, 0, u'.' },
             Case { u"0,125", 0.125, 3, 0, u',' },
             Case { u"1234,567", 1234.567, 3, 0, u',' },
             Case { u".5", 0.5, 1, 0, u'.' },
             Case { u"-12.5", -12.5, 1, 0, u'.' },
             Case { u"\u2212 12.5", -12.5, 1, 0, u'.' },
             Case { u"+7", 7, 0, 0, 0 },
             Case { u"(1,234.50)", -1234.5, 2, u',', u'.' },
             Case { u"$1,234.50", 1234.5, 2, u',', u'.' },
             Case { u"-$ 12.50", -12.5, 2, 0, u'.' },
             Case { u"€ -12,50", -12.5, 2, 0, u',' },
             Case { u"12,50 €", 12.5, 2, 0, u',' },
             Case { u"12,50\u00A0€", 12.5, 2, 0, u',' },
             Case { u"￥1,200.00", 1200, 2, u',', u'.' },
             Case { u"1.5e3", 1500, 0, 0, u'.' },
             Case { u"25E-3", 0.025, 3, 0, 0 },
             Case { u"1.250e-1", 0.125, 4, 0, u'.' },
         }) {
        const ShownNumber wanted { expected.value, expected.decimals, expected.grouping };
        for (const char16_t locale : { u'.', u',' }) {
            const auto read = readShownNumber(expected.text, locale);
            ASSERT_TRUE(read.has_value()) << toUtf8(expected.text);
            EXPECT_DOUBLE_EQ(read->value, wanted.value) << toUtf8(expected.text);
            EXPECT_EQ(read->decimals, wanted.decimals) << toUtf8(expected.text);
            EXPECT_EQ(read->grouping, wanted.grouping) << toUtf8(expected.text);
        }
        EXPECT_EQ(decimalSeparatorOf(expected.text).value_or(0), expected.separator)
            << toUtf8(expected.text);
    }
}

TEST(ShownNumber, LetsTheLocaleDecideWhereThereAreTwoWays)
{
    EXPECT_EQ(readShownNumber(u"1,234", u'.'), (ShownNumber { 1234, 0, u',' }));
    EXPECT_EQ(readShownNumber(u"1,234", u','), (ShownNumber { 1.234, 3, 0 }));
    EXPECT_EQ(readShownNumber(u"-123.456", u'.'), (ShownNumber { -123.456, 3, 0 }));
    EXPECT_EQ(readShownNumber(u"-123.456", u','), (ShownNumber { -123456, 0, u'.' }));
    EXPECT_EQ(readShownNumber(u"12.500 €", u'\u066B'), (ShownNumber { 12.5, 3, 0 }))
        << "any other separator counts as a point";
    EXPECT_EQ(decimalSeparatorOf(u"1,234"), std::nullopt);
    EXPECT_EQ(decimalSeparatorOf(u"123.456"), std::nullopt);
}

TEST(ShownNumber, TakesNothingElseForANumber)
{
    for (const TextView text : { u"", u" ", u"-", u".", u",", u"€", u"n/a", u"12 pcs", u"12 %",
             u"12.05.2024", u"2024-05-12", u"12:30", u"1.2.3", u"1,2,3", u"1.", u"1,23,4", u"1 2",
             u"1,,234", u"1234,567,890", u"1.234,567,890", u"1.234 567", u"e5", u"1e", u"1e+",
             u"1,234e2,5", u"--1", u"$$1", u"$1€", u"(12", u"12)", u"()", u"0x1F", u"Dezember",
             u"1234'5", u",123,456" })
        for (const char16_t locale : { u'.', u',' }) {
            EXPECT_EQ(readShownNumber(text, locale), std::nullopt) << toUtf8(text);
            EXPECT_EQ(decimalSeparatorOf(text), std::nullopt) << toUtf8(text);
        }
}

} // namespace pelloric
