// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_text_metrics.h"

#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_text.h"
#include "platform/qt/uming.h"

#include <QProcess>

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

TEST_F(QtTextMetricsTest, NamesOfSongStyleFacesAnswerTheInstalledOne)
{
    FaceMetrics* const song = &metrics_.face(u"宋体", false, false);
    for (const TextView name :
        { u"0", u"10.5", u"", u"新宋体", u"仿宋", u"simsun", u"SimSun-ExtB" })
        EXPECT_EQ(&metrics_.face(name, false, false), song) << toUtf8(name);
    EXPECT_EQ(textWidth(song->advanceOf(u"宋"), 10), 200);
    EXPECT_TRUE(fonts_.notes().empty());
}

TEST_F(QtTextMetricsTest, OtherFacesThatAreNotInstalledAnswerWhatTheSystemMatches)
{
    for (const char* const name :
        { "Arial", "Times New Roman", "Courier New", "Verdana", "黑体" }) {
        QProcess match;
        match.start(QStringLiteral("fc-match"),
            { QStringLiteral("-f"), QStringLiteral("%{family[0]}"), QString::fromUtf8(name) });
        ASSERT_TRUE(match.waitForFinished()) << "fc-match: install fontconfig";
        const QString family = QString::fromUtf8(match.readAllStandardOutput());
        ASSERT_FALSE(family.isEmpty());
        EXPECT_EQ(QtFonts::resolve(QString::fromUtf8(name)).toStdString(), family.toStdString())
            << name;
    }
}

TEST_F(QtTextMetricsTest, WhatWasTakenForAMissingFaceIsNotedOnce)
{
    for (int round = 0; round < 2; ++round) {
        metrics_.face(u"No Such Face", false, false);
        metrics_.face(u"No Such Face", true, false);
        metrics_.face(u"DejaVu Sans", false, false);
        metrics_.face(u"宋体", false, false);
    }
    const Text taken = toText(QtFonts::resolve(QStringLiteral("No Such Face")));
    EXPECT_EQ(fonts_.notes(), (std::vector<FontNote> { { u"No Such Face", taken } }));
}

TEST_F(QtTextMetricsTest, ATabIsAsWideAsFourBlanksAndOtherControlCharactersAreNothing)
{
    for (const TextView name : { Uming, TextView(u"DejaVu Sans") }) {
        FaceMetrics& face = metrics_.face(name, false, false);
        EXPECT_EQ(face.unitAdvance(u'\t'), static_cast<float>(4 * face.unitAdvance(u' ')));
        for (const char16_t unit :
            { u'\0', u'\x01', u'\r', u'\x1B', u'\x7F', u'\x85', u'\xAD', u'\x200B', u'\xFEFF' })
            EXPECT_EQ(face.unitAdvance(unit), 0) << static_cast<int>(unit);
    }
}

TEST_F(QtTextMetricsTest, CharactersThatNoFaceHasAreTold)
{
    FaceMetrics& face = uming();
    EXPECT_EQ(face.kindOf(U'A'), CharacterKind::Plain);
    EXPECT_EQ(face.kindOf(U'宋'), CharacterKind::Plain);
    EXPECT_EQ(face.kindOf(0x0E01), CharacterKind::Missing); // Thai
    EXPECT_GT(face.unitAdvance(0x0E01), 0);
    EXPECT_EQ(face.kindOf(0xFFFE), CharacterKind::Missing);
    EXPECT_EQ(face.kindOf(0x10FFFF), CharacterKind::Missing);
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
