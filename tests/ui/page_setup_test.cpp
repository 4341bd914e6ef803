// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/page_setup.h"

#include "fakes/fake_platform.h"
#include "settings/default_settings.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

struct Fixture {
    Fixture() { deployDefaultSettings(platform.services()); }

    void set(TextView key, TextView value) { writeSetting(platform.services(), key, value); }
    Text get(TextView key) { return readSetting(platform.services(), key); }
    std::string file() { return platform.folder.read("OstlConfig.ini"); }

    FakePlatform platform;
};

} // namespace

TEST(PageSetup, LoadsSizesAndMargins)
{
    Fixture fixture;
    fixture.set(u"Top", u"0");
    fixture.set(u"Buttom", u"12.50");
    fixture.set(u"PagerWidth", u"210");
    fixture.set(u"PagerHeight", u"297");
    fixture.set(u"PagerOrientation", u"3");
    const PageSetupState state(fixture.platform.services());
    EXPECT_EQ(state.marginBox(Margin::Top), u"10 mm");
    EXPECT_EQ(state.sketch().margin(Margin::Top), 284);
    EXPECT_EQ(state.marginBox(Margin::Bottom), u"12.5 mm");
    EXPECT_EQ(state.sketch().margin(Margin::Bottom), 355);
    EXPECT_EQ(state.paper.orientation, 2);
    EXPECT_EQ(state.paper.widthBox, u"297mm");
    EXPECT_EQ(state.paper.heightBox, u"210mm");
    EXPECT_EQ(state.paper.caption, u"PagerSize");
}

TEST(PageSetup, OpensWithoutASettingsFileAndWritesNone)
{
    FakePlatform platform;
    const PageSetupState state(platform.services());
    EXPECT_EQ(state.marginBox(Margin::Left), u"10 mm");
    EXPECT_EQ(state.save(), SaveOutcome::NothingWritten);
    EXPECT_EQ(platform.folder.read("OstlConfig.ini"), "(no file)");
}

TEST(PageSetup, FiltersWhatIsTypedIntoAMargin)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    state.typeMargin(Margin::Left, u"a-2x0 mm");
    EXPECT_EQ(state.marginBox(Margin::Left), u"20 mm");
    EXPECT_EQ(state.sketch().margin(Margin::Left), 568);
    state.typeMargin(Margin::Left, u"");
    EXPECT_EQ(state.marginBox(Margin::Left), u" mm");
    EXPECT_EQ(state.sketch().margin(Margin::Left), 0);
}

TEST(PageSetup, StepsMarginsDownOnlyAboveZero)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    const auto step = [&](TextView from, bool up) {
        state.typeMargin(Margin::Top, from);
        state.stepMargin(Margin::Top, up);
        return state.marginBox(Margin::Top);
    };
    EXPECT_EQ(step(u"0", false), u"0 mm");
    EXPECT_EQ(step(u"0.5", false), u"-0.5 mm");
    EXPECT_DOUBLE_EQ(state.sketch().margin(Margin::Top), -14.2);
    EXPECT_EQ(step(u"12.5", true), u"13.5 mm");
    EXPECT_EQ(step(u"19", true), u"20 mm");
}

TEST(PageSetup, RestoresTenMillimetres)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    state.typeMargin(Margin::Right, u"33");
    state.restoreMargins();
    EXPECT_EQ(state.marginBox(Margin::Right), u"10 mm");
    EXPECT_EQ(state.sketch().margin(Margin::Right), 284);
}

TEST(PageSetup, WritesADraggedMarginWithTwoDecimals)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    state.restoreMargins();
    state.sketch().mouseMove(Margin::Right, 0, 0);
    state.sketch().mouseDown(Margin::Right, -35, 0);
    state.releaseLine();
    EXPECT_EQ(state.marginBox(Margin::Right), u"11.23 mm");
    EXPECT_DOUBLE_EQ(state.sketch().margin(Margin::Right), 11.23 * 28.4);
}

TEST(PageSetup, PutsAFieldInPlaceOfTheLastBoxesText)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    const auto before = state.formatTexts;
    state.chooseField(0);
    EXPECT_EQ(state.formatTexts, before);
    state.formatTexts[3] = u"other";
    state.focusFormatBox(4);
    state.focusFormatBox(9);
    state.chooseField(2);
    EXPECT_EQ(state.formatTexts[3], u"[Date & Time Printed]");
}

TEST(PageSetup, SizesTheSketchInItsFrame)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    state.chooseOrientation(true);
    EXPECT_EQ(state.picture(), sketchRect(SketchFrameWidth, SketchFrameHeight, true));
    EXPECT_EQ(state.sketch().height(), state.picture().height);
    state.chooseOrientation(false);
    EXPECT_EQ(state.picture(), sketchRect(SketchFrameWidth, SketchFrameHeight, false));
    EXPECT_EQ(sketchRect(3300, 6600, true), (SketchRect { 150, 300, 3000, 6000 }));
    EXPECT_EQ(sketchRect(3300, 6600, false), (SketchRect { 150, 2550, 3000, 1500 }));
}

TEST(PageSetup, SavesEveryKeyOfItsOwn)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    state.paper.chooseOrientation(true);
    state.paper.chooseRow({ u"Letter", u"215.90 mm", u"279.40 mm", u"1", false });
    state.typeMargin(Margin::Top, u"39");
    state.typeMargin(Margin::Bottom, u"0.9");
    state.formatTexts[0] = u"  head  ";
    state.formatTexts[5] = u"two\r\nlines";
    state.setHeaderFont({ { u"", 10.5F, true, false, false, true }, 255 });
    EXPECT_EQ(state.headerFontText(), u"10.5 pt. 宋体 [ Bold Underline ]");
    EXPECT_EQ(state.save(), SaveOutcome::Written);
    struct Case {
        TextView key;
        TextView value;
    };
    const Case cases[] = {
        { u"PagerSize", u"Letter" },
        { u"PagerSizeValue", u"1" },
        { u"PagerOrientation", u"1" },
        { u"PagerWidth", u"215.90" },
        { u"PagerHeight", u"279.40" },
        { u"Top", u"39" },
        { u"Buttom", u"0.9" },
        { u"HeaderFontName", u"宋体" },
        { u"HeaderFontSize", u"10.5" },
        { u"HeaderFontBold", u"1" },
        { u"HeaderFontItalic", u"0" },
        { u"HeaderFontUnderline", u"1" },
        { u"HeaderFontColor", u"255" },
        { u"HeaderLeft", u"head" },
        { u"FooterRight", u"two lines" },
    };
    for (const Case& row : cases)
        EXPECT_EQ(fixture.get(row.key), row.value) << toUtf8(row.key);
}

TEST(PageSetup, WritesNothingWhenAStepFails)
{
    Fixture fixture;
    const std::string before = fixture.file();
    PageSetupState state(fixture.platform.services());
    state.typeMargin(Margin::Top, u"77");
    state.paper.heightBox = u"297";
    EXPECT_EQ(state.save(), SaveOutcome::NothingWritten);
    EXPECT_EQ(fixture.file(), before);
}

TEST(PageSetup, LeavesASizeAloneWhoseBoxIsEmpty)
{
    Fixture fixture;
    const Text width = fixture.get(u"PagerWidth");
    PageSetupState state(fixture.platform.services());
    state.paper.widthBox.clear();
    state.paper.heightBox = u"300mm";
    EXPECT_EQ(state.save(), SaveOutcome::Written);
    EXPECT_EQ(fixture.get(u"PagerWidth"), width);
    EXPECT_EQ(fixture.get(u"PagerHeight"), u"300");
}

TEST(PageSetup, WritesNothingWhenTheFileLacksAKey)
{
    Fixture fixture;
    fixture.platform.folder.write("OstlConfig.ini", "Top= 1\r\n");
    const PageSetupState state(fixture.platform.services());
    EXPECT_EQ(state.save(), SaveOutcome::NothingWritten);
    EXPECT_EQ(fixture.file(), "Top= 1\r\n");
}

} // namespace pelloric
