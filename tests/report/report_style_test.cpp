// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/report_style.h"

#include "support/errors.h"
#include "support/report_world.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

struct StyleWorld : ReportWorld {
    using ReportWorld::ReportWorld;

    void load() { loadReportStyle(style, setup, services()); }

    ReportStyle style;
    PageSetup setup;
};

std::int16_t marginOf(const char16_t* key, const char16_t* value, std::int16_t PageSetup::*field)
{
    StyleWorld world({ { key, value } });
    world.load();
    return world.setup.*field;
}

} // namespace

TEST(ReportStyle, TakesEveryKeyIntoItsField)
{
    StyleWorld world({ { u"ShowHeaders", u"0" }, { u"GridHor", u"1" }, { u"GridVer", u"0" },
        { u"GridMerge", u"1" }, { u"HeaderColor", u"255" }, { u"GridLineColor", u"65280" },
        { u"FontName", u"Body Face" }, { u"FontSize", u"10.5" }, { u"FontBold", u"1" },
        { u"FontItalic", u"0" }, { u"FontStrikethru", u"1" }, { u"FontUnderline", u"0" },
        { u"FontColor", u"1.5" }, { u"HeaderFontName", u"Header Face" },
        { u"HeaderFontSize", u"12" }, { u"HeaderFontBold", u"0" }, { u"HeaderFontItalic", u"1" },
        { u"HeaderFontStrikethru", u"0" }, { u"HeaderFontUnderline", u"1" },
        { u"HeaderFontColor", u"2" }, { u"FooterFontName", u"Footer Face" },
        { u"FooterFontSize", u"7" }, { u"FooterFontBold", u"1" }, { u"FooterFontItalic", u"1" },
        { u"FooterFontStrikethru", u"1" }, { u"FooterFontUnderline", u"1" },
        { u"FooterFontColor", u"3" }, { u"PagerSize", u"A3" }, { u"PagerOrientation", u"2" },
        { u"PagerSizeValue", u"8" }, { u"HeaderLeft", u"hl" }, { u"HeaderCenter", u"hc" },
        { u"HeaderRight", u"hr" }, { u"FooterLeft", u"fl" }, { u"FooterCenter", u"fc" },
        { u"FooterRight", u"fr" } });
    world.load();
    ReportStyle expected;
    expected.GridHor = true;
    expected.GridMerge = true;
    expected.HeaderColor = 255;
    expected.GridLineColor = 65280;
    expected.body = { { u"Body Face", 10.5F, true, false, true, false }, 1.5 };
    expected.header = { { u"Header Face", 12, false, true, false, true }, 2 };
    expected.footer = { { u"Footer Face", 7, true, true, true, true }, 3 };
    expected.PagerSize = u"A3";
    expected.PagerOrientation = 2;
    expected.PagerSizeValue = 8;
    expected.printableWidthTenth = 1055;
    expected.printableHeightTenth = 1491;
    expected.headerTexts = { u"hl", u"hc", u"hr" };
    expected.footerTexts = { u"fl", u"fc", u"fr" };
    EXPECT_EQ(world.style, expected);
}

TEST(ReportStyle, TurnsMillimetresIntoEnlargedMarginsAndPaper)
{
    StyleWorld world;
    world.load();
    const PageSetup expected { 907, 1021, 680, 680, 16840, 11907 };
    EXPECT_EQ(world.setup, expected);
}

TEST(ReportStyle, RoundsMarginsHalfToEven)
{
    EXPECT_EQ(marginOf(u"Left", u"12.5", &PageSetup::intLeft), 850);
    EXPECT_EQ(marginOf(u"Top", u"9.375", &PageSetup::intTop), 850);
    EXPECT_EQ(marginOf(u"Buttom", u"75", &PageSetup::intButtom), 7654);
}

TEST(ReportStyle, GivesTwoCentimetresForAMarginOfNothing)
{
    for (const char16_t* value : { u"0", u"", u"abc", u"0.001", u"-0" })
        EXPECT_EQ(marginOf(u"Top", value, &PageSetup::intTop), 1134) << toUtf8(value);
    EXPECT_EQ(marginOf(u"Top", u"-10", &PageSetup::intTop), -907);
}

TEST(ReportStyle, OverflowsPastSixteenBitsAndKeepsWhatWasReadBefore)
{
    EXPECT_EQ(marginOf(u"Top", u"361", &PageSetup::intTop), 32750);
    StyleWorld world({ { u"HeaderColor", u"77" }, { u"Top", u"20" }, { u"Buttom", u"362" } });
    EXPECT_EQ(errorOf([&] { world.load(); }), ErrorNumber::Overflow);
    EXPECT_EQ(world.style.HeaderColor, 77);
    EXPECT_EQ(world.setup.intTop, 1814);
    EXPECT_EQ(world.setup.intLeft, 1134);
    for (const char16_t* key : { u"HeaderColor", u"PagerWidth", u"FontSize" }) {
        StyleWorld other({ { key, u"1e300" } });
        EXPECT_EQ(errorOf([&] { other.load(); }), ErrorNumber::Overflow) << toUtf8(key);
    }
    StyleWorld orientation({ { u"PagerOrientation", u"40000" } });
    EXPECT_EQ(errorOf([&] { orientation.load(); }), ErrorNumber::Overflow);
}

TEST(ReportStyle, RoundsThePaperHalfToEven)
{
    StyleWorld world({ { u"PagerWidth", u"15" }, { u"PagerHeight", u"215" } });
    world.load();
    EXPECT_EQ(world.setup.myWidth, 850);
    EXPECT_EQ(world.setup.myHeight, 12190);
}

TEST(ReportStyle, HasNoPaperOfItsOwnWhenTheFileSaysNone)
{
    StyleWorld world({ { u"PagerWidth", u"" }, { u"PagerHeight", u"x" } });
    world.load();
    EXPECT_EQ(world.setup.myWidth, 0);
    EXPECT_EQ(world.setup.myHeight, 0);
    EXPECT_EQ(world.style.printableWidthTenth, -136);
}

TEST(ReportStyle, ComputesTheTenthsOfLandscapePaperAsOfPortraitPaper)
{
    StyleWorld world({ { u"PagerWidth", u"297" }, { u"PagerHeight", u"210" } });
    world.load();
    EXPECT_EQ(world.style.printableWidthTenth, 1548);
    EXPECT_EQ(world.style.printableHeightTenth, 998);
}

TEST(ReportStyle, TakesASwitchForOnWhenItIsNotZero)
{
    struct Row {
        const char16_t* value;
        bool on;
    };
    const Row rows[] = { { u"1", true }, { u"-1", true }, { u"0.1", true }, { u"2abc", true },
        { u"abc", false }, { u"0", false }, { u"", false }, { u"True", false } };
    for (const Row& row : rows) {
        StyleWorld world({ { u"ShowHeaders", row.value } });
        world.load();
        EXPECT_EQ(world.style.ShowHeaders, row.on) << toUtf8(row.value);
    }
}

TEST(ReportStyle, ConvertsThePaperCodeStrictly)
{
    for (const char16_t* value : { u"", u"A4", u"9.5", u"40000", u"9 mm" }) {
        StyleWorld world({ { u"PagerSizeValue", value } });
        EXPECT_EQ(errorOf([&] { world.load(); }), ErrorNumber::TypeMismatch) << toUtf8(value);
    }
    StyleWorld world({ { u"PagerSizeValue", u"  -3 " } });
    world.load();
    EXPECT_EQ(world.style.PagerSizeValue, -3);
}

TEST(ReportStyle, FailsWithoutASettingsFile)
{
    StyleWorld world;
    std::filesystem::remove(world.folder.file("OstlConfig.ini"));
    EXPECT_EQ(errorOf([&] { world.load(); }), ErrorNumber::FileNotFound);
}

TEST(ReportStyle, ReadsTheFileAnewAtEveryLoad)
{
    StyleWorld world;
    world.load();
    world.set({ { u"Top", u"20" }, { u"GridHor", u"0" } });
    world.load();
    EXPECT_EQ(world.setup.intTop, 1814);
    EXPECT_FALSE(world.style.GridHor);
}

} // namespace pelloric
