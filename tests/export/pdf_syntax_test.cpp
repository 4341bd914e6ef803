// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_syntax.h"

#include <gtest/gtest.h>

#include <limits>

namespace pelloric::pdf {

namespace {

std::string number(double value, int decimals = 3)
{
    std::string out;
    appendNumber(out, value, decimals);
    return out;
}

} // namespace

TEST(PdfSyntax, WritesNumbersWithoutDigitsThatSayNothing)
{
    EXPECT_EQ(number(0), "0");
    EXPECT_EQ(number(12), "12");
    EXPECT_EQ(number(-12.5), "-12.5");
    EXPECT_EQ(number(0.05), ".05");
    EXPECT_EQ(number(-0.25), "-.25");
    EXPECT_EQ(number(1.0004), "1");
    EXPECT_EQ(number(-0.0004), "0");
    EXPECT_EQ(number(2.4006, 3), "2.401");
    EXPECT_EQ(number(7.007, 2), "7.01");
    EXPECT_EQ(number(595.35, 6), "595.35");
}

TEST(PdfSyntax, WritesNoNumberThatReadersCannotRead)
{
    EXPECT_EQ(number(std::numeric_limits<double>::quiet_NaN()), "0");
    EXPECT_EQ(number(std::numeric_limits<double>::infinity()), "0");
    EXPECT_EQ(number(1e300), "0");
}

TEST(PdfSyntax, WritesTextsAsUtf16WithAMark)
{
    std::string out;
    appendText(out, u"A总\U0001F600");
    EXPECT_EQ(out, "<FEFF0041603BD83DDE00>");
}

TEST(PdfSyntax, EscapesWhatNamesCannotHold)
{
    std::string out;
    appendName(out, "A B#(\xE5)");
    EXPECT_EQ(out, "/A#20B#23#28#E5#29");
}

TEST(PdfSyntax, WritesColoursAsPartsOfOne)
{
    std::string out;
    appendColor(out, rgb(255, 0, 51));
    EXPECT_EQ(out, "1 0 .2 ");
}

} // namespace pelloric::pdf
