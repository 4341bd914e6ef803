// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/numeric_text.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(NumericText, KeepsDigitsAndPoints)
{
    EXPECT_EQ(numericCharacters(u"-1a2.7.5 mm"), u"12.7.5");
    EXPECT_EQ(numericCharacters(u""), u"");
}

TEST(NumericText, WritesTwoDecimals)
{
    EXPECT_EQ(twoDecimals(210), u"210.00");
    EXPECT_EQ(twoDecimals(215.9), u"215.90");
    EXPECT_EQ(twoDecimals(-0.001), u"0.00");
    EXPECT_EQ(twoDecimals(-1.5), u"-1.50");
    EXPECT_EQ(twoDecimals(1e308).size(), 312U);
}

} // namespace pelloric
