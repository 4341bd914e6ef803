// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_text_metrics.h"

#include "platform/qt/qt_fonts.h"
#include "platform/qt/uming.h"

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

class QtTextMetricsTest : public testing::Test {
protected:
    void SetUp() override { ASSERT_TRUE(loadUming()); }

    FaceMetrics& uming() { return metrics_.face(Uming, false, false); }

    QtFonts fonts_;
    QtTextMetrics metrics_ { fonts_ };
};

} // namespace

TEST_F(QtTextMetricsTest, LatinIsHalfAnEmWideAndHanAWholeOne)
{
    EXPECT_EQ(textWidth(uming().advanceOf(u"A"), 10), 100);
    EXPECT_EQ(textWidth(uming().advanceOf(u"宋"), 10), 200);
    EXPECT_EQ(textWidth(uming().advanceOf(u"NO. 宋体★"), 10.5F), 5 * 210);
}

TEST_F(QtTextMetricsTest, ALineIsAsHighAsAscentAndDescent)
{
    EXPECT_NEAR(uming().lineHeight(), 1.047 * 20, 0.01);
    EXPECT_EQ(textHeight(uming(), 10), 209);
    EXPECT_EQ(textHeight(uming(), 0), 0);
}

TEST_F(QtTextMetricsTest, WidthsGrowInStepWithTheSize)
{
    const double advance = uming().advanceOf(u"Quantity 数量 fi ffl AVATAR");
    EXPECT_NEAR(textWidth(advance, 100), 10.0 * textWidth(advance, 10), 5);
    EXPECT_NEAR(textWidth(advance, 1000), 100.0 * textWidth(advance, 10), 50);
}

TEST_F(QtTextMetricsTest, ATextIsAsWideAsItsCharacters)
{
    for (const TextView face : { Uming, TextView(u"DejaVu Sans") }) {
        FaceMetrics& metrics = metrics_.face(face, false, false);
        const TextView text = u"AVATAR To fi ffl 数量";
        double sum = 0;
        for (const char16_t unit : text)
            sum += metrics.unitAdvance(unit);
        EXPECT_NEAR(metrics.advanceOf(text), sum, 1e-9);
    }
}

TEST_F(QtTextMetricsTest, FacesThatAreNotInstalledAnswerTheSubstitute)
{
    FaceMetrics* const substitute = &metrics_.face(u"宋体", false, false);
    for (const TextView name : { u"0", u"no such face", u"" })
        EXPECT_EQ(&metrics_.face(name, false, false), substitute);
    EXPECT_EQ(textWidth(substitute->advanceOf(u"宋"), 10), 200);
}

TEST_F(QtTextMetricsTest, AMadeUpBoldIsAsWideAsTheRegularFace)
{
    QtFace& bold = fonts_.face(Uming, true, false);
    EXPECT_TRUE(bold.isBoldMadeUp());
    EXPECT_FALSE(fonts_.face(Uming, false, false).isBoldMadeUp());
    EXPECT_EQ(bold.advanceOf(u"Bold 粗"), uming().advanceOf(u"Bold 粗"));
}

TEST_F(QtTextMetricsTest, AFaceKeepsItsPlace)
{
    FaceMetrics& face = uming();
    metrics_.face(u"DejaVu Sans", true, true);
    EXPECT_EQ(&uming(), &face);
}

TEST_F(QtTextMetricsTest, HalfAPairIsMeasured)
{
    EXPECT_GE(uming().advanceOf(TextView(u"\xD800", 1)), 0);
    EXPECT_GT(uming().advanceOf(u"\U00020000"), 0);
}

} // namespace pelloric::qt
