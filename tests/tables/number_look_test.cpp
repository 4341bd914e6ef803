// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/number_look.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(NumberLook, ShowsNumbersAsTheirFormatSays)
{
    const struct {
        std::string_view format;
        double value;
        TextView shown;
    } cases[] = {
        { "General", 3.5, u"3.5" },
        { "", 1e20, u"1E+20" },
        { "0", 3.7, u"4" },
        { "0.00", 3.5, u"3.50" },
        { "#,##0.00", 1234.5, u"1234.50" },
        { "0%", 0.15, u"15%" },
        { "0.0%", 0.1525, u"15.2%" },
        { "\"yd\" 0.0", 2, u"2.0" },
        { "[Red]0.00;[Blue]-0.00", -2, u"-2.00" },
        { "[$€-407] 0.00", 2, u"2.00" },
        { "0.##", 2.5, u"2.5" },
        { "0.00E+00", 12345, u"12345" },
        { "@", 7, u"7" },
    };
    for (const auto& row : cases)
        EXPECT_EQ(shownNumber(row.value, numberLook(row.format)), row.shown) << row.format;
}

TEST(NumberLook, TellsDatesAndTimesFromNumbers)
{
    for (const std::string_view format : { "yyyy-mm-dd", "d/m/yy", "[$-409]dd mmm yyyy;@", "h:mm",
             "m/d/yy h:mm", "[h]:mm:ss", "mm:ss.0" })
        EXPECT_TRUE(numberLook(format).isDate) << format;
    for (const std::string_view format : { "General", "0.00", "[Red]0", "\"days\" 0", "# ?/?" })
        EXPECT_FALSE(numberLook(format).isDate) << format;
    EXPECT_TRUE(numberLook("m/d/yy h:mm").hasTime);
    EXPECT_FALSE(numberLook("yyyy-mm-dd").hasTime);
}

} // namespace pelloric
