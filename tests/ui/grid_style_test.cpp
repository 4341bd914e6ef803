// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/grid_style.h"

#include "controls/messages.h"
#include "fakes/fake_platform.h"
#include "settings/default_settings.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

constexpr const char* File = "OstlConfig.ini";

} // namespace

TEST(GridStyle, LoadsSwitchesColoursAndFonts)
{
    FakePlatform platform;
    platform.folder.write(File,
        "ShowHeaders= 2\r\nGridHor= 0\r\nGridVer= x\r\nGridMerge= -1\r\nHeaderColor= 255\r\n"
        "GridLineColor= 65280\r\nFontName= Arial\r\nFontSize= 10.5\r\nFontBold= 0\r\n"
        "FontItalic= 0\r\nFontStrikethru= 0\r\nFontUnderline= 1\r\nFontColor= 7\r\n");
    const GridStyleState state(platform.services());
    EXPECT_EQ(state.value(GridSwitch::ShowHeaders), 1);
    EXPECT_EQ(state.value(GridSwitch::GridHor), 0);
    EXPECT_EQ(state.value(GridSwitch::GridVer), 0);
    EXPECT_EQ(state.value(GridSwitch::GridMerge), 1);
    EXPECT_EQ(state.headerColor, 255);
    EXPECT_EQ(state.gridLineColor, 65280);
    EXPECT_EQ(state.description(GridFont::Body), u"10.5 pt. Arial [ Underline ]");
    EXPECT_EQ(state.font(GridFont::Body).color, 7);
}

TEST(GridStyle, AsksForARowBeforeAFont)
{
    FakePlatform platform;
    deployDefaultSettings(platform.services());
    GridStyleState state(platform.services());
    EXPECT_EQ(std::get<Message>(state.pressChangeFont()), messageOf(Notice::NoFontRow));
    state.selectRow(u"Footer Font");
    EXPECT_EQ(std::get<ColoredFont>(state.pressChangeFont()), state.font(GridFont::Footer));
}

TEST(GridStyle, GivesTheChosenFontToTheSelectedRow)
{
    FakePlatform platform;
    deployDefaultSettings(platform.services());
    GridStyleState state(platform.services());
    state.selectRow(u"Header Font");
    state.setChosenFont({ { .name = u"", .size = 9, .italic = true }, 16711680 });
    EXPECT_EQ(state.description(GridFont::Header), u"9 pt. 宋体 [ Italic ]");
    EXPECT_EQ(state.font(GridFont::Header).color, 16711680);
    EXPECT_EQ(state.save(), SaveOutcome::Written);
    EXPECT_EQ(readSetting(platform.services(), u"HeaderFontColor"), u"16711680");
    EXPECT_EQ(readSetting(platform.services(), u"HeaderFontItalic"), u"1");
}

TEST(GridStyle, SavesWhatTheFileHasAndSkipsTheRest)
{
    FakePlatform platform;
    platform.folder.write(File, "ShowHeaders= 1\r\nGridLineColor= 5\r\n");
    GridStyleState state(platform.services());
    state.setValue(GridSwitch::ShowHeaders, 2);
    state.gridLineColor = 12632256;
    EXPECT_EQ(state.save(), SaveOutcome::Written);
    EXPECT_EQ(
        platform.folder.read(File), "\"\r\nShowHeaders= 2\r\nGridLineColor= 12632256\r\n\"\r\n");
}

} // namespace pelloric
