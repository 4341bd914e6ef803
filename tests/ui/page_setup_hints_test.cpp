// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/page_setup_hints.h"

#include "fakes/fake_platform.h"
#include "settings/default_settings.h"
#include "ui/page_setup.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

struct Fixture {
    Fixture() { deployDefaultSettings(platform.services()); }

    std::string margin(Margin margin, TextView typed)
    {
        PageSetupState state(platform.services());
        state.typeMargin(margin, typed);
        return toUtf8(hintsOf(state).of(margin));
    }

    std::string sizes(TextView width, TextView height)
    {
        PageSetupState state(platform.services());
        state.paper.widthBox = width;
        state.paper.heightBox = height;
        return toUtf8(hintsOf(state).sizes);
    }

    FakePlatform platform;
};

} // namespace

TEST(PageSetupHints, AreNoneForTheDefaultSettings)
{
    Fixture fixture;
    const PageSetupState state(fixture.platform.services());
    const PageSetupHints hints = hintsOf(state);
    EXPECT_EQ(hints.sizes, u"");
    EXPECT_EQ(hints.file, u"");
    for (const Text& margin : hints.margins)
        EXPECT_EQ(margin, u"");
}

TEST(PageSetupHints, SayWhyAMarginCannotBeAndWhatOkWillDo)
{
    Fixture fixture;
    EXPECT_EQ(fixture.margin(Margin::Top, u"400"),
        "Top 400 mm is printed as 640 mm; a margin is at most 361 mm here. OK will store it, and "
        "no "
        "page can be built until it is smaller.");
    EXPECT_EQ(fixture.margin(Margin::Bottom, u"200"),
        "Buttom 200 mm is printed as 360 mm, and the sheet is 297 mm high: it lies outside. OK "
        "will store it all the same.");
    EXPECT_EQ(fixture.margin(Margin::Top, u"175"),
        "Top 175 mm is printed as 280 mm, and the sheet is 297 mm high: there is no room left for "
        "a row. OK will store it all the same.");
    EXPECT_EQ(fixture.margin(Margin::Left, u"88"),
        "Left 88 mm is printed as 105.6 mm, and the sheet is 210 mm wide: there is no room left "
        "for a column. OK will store it all the same.");
    EXPECT_EQ(fixture.margin(Margin::Right, u"88"), "");
    EXPECT_EQ(fixture.margin(Margin::Right, u"180"),
        "Right 180 mm is printed as 216 mm, and the sheet is 210 mm wide: it lies outside. OK will "
        "store it all the same.");
    EXPECT_EQ(fixture.margin(Margin::Right, u""), "Right 0 mm is printed as 20 mm.");
}

TEST(PageSetupHints, SayOnlyOfTheLargerMarginThatThereIsNoRoomBetweenTheTwo)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    state.typeMargin(Margin::Top, u"175");
    EXPECT_NE(hintsOf(state).of(Margin::Top), u"");
    EXPECT_EQ(hintsOf(state).of(Margin::Bottom), u"");
}

TEST(PageSetupHints, SayThatASteppedMarginLiesOutside)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    state.typeMargin(Margin::Left, u"0.5");
    state.stepMargin(Margin::Left, false);
    EXPECT_EQ(hintsOf(state).of(Margin::Left),
        u"Left lies outside the sheet. OK will store it all the same.");
}

TEST(PageSetupHints, TellOfSizesThatKeepOkFromSaving)
{
    Fixture fixture;
    EXPECT_EQ(fixture.sizes(u"200", u"297mm"),
        "Width \"200\" lacks its unit, as in \"210mm\": OK will save nothing of all three tabs.");
    EXPECT_EQ(fixture.sizes(u"210mm", u""), "Height is empty: OK keeps the stored one.");
    EXPECT_EQ(fixture.sizes(u"0mm", u"297mm"),
        "Width must be above 0: OK will store it, and no page can be laid out.");
    EXPECT_EQ(fixture.sizes(u"210mm", u"6000mm"),
        "Height is at most 5779 mm: OK will store it, and no page can be built until it is "
        "smaller.");
    EXPECT_EQ(fixture.sizes(u"x", u"y").size(),
        2
                * std::string("Width \"x\" lacks its unit, as in "
                              "\"210mm\": OK will save nothing of all three tabs.")
                      .size()
            + 2);
}

TEST(PageSetupHints, JudgeMarginsByTheSheetAsItIsTyped)
{
    Fixture fixture;
    PageSetupState state(fixture.platform.services());
    state.typeMargin(Margin::Left, u"40");
    EXPECT_EQ(hintsOf(state).of(Margin::Left), u"");
    state.paper.widthBox = u"90mm";
    EXPECT_NE(hintsOf(state).of(Margin::Left), u"");
    state.paper.widthBox = u"90";
    EXPECT_EQ(hintsOf(state).of(Margin::Left), u"");
}

TEST(PageSetupHints, TellOfAFileThatOkCannotWrite)
{
    FakePlatform platform;
    const PageSetupState none(platform.services());
    EXPECT_TRUE(hintsOf(none).file.starts_with(u"File not found: "));
    EXPECT_TRUE(hintsOf(none).file.ends_with(u" OK will save nothing."));
    platform.folder.write("OstlConfig.ini", "Top= 1\r\n");
    const PageSetupState lacking(platform.services());
    EXPECT_TRUE(hintsOf(lacking).file.starts_with(u"ShowHeaders, GridHor, GridVer and 38 more "));
}

} // namespace pelloric
