// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/default_settings.h"

#include "fakes/fake_platform.h"
#include "platform/numbers.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"
#include "support/errors.h"
#include "support/file_size_limit.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(DefaultSettings, HoldNoKeyBelowALineThatContainsIt)
{
    const auto rows = settingsTable();
    for (std::size_t line = 0; line < rows.size(); ++line) {
        for (std::size_t above = 0; above < line; ++above) {
            EXPECT_FALSE(contains(rows[above].name, rows[line].name)
                || contains(rows[above].start, rows[line].name))
                << toUtf8(rows[line].name) << " stands below " << toUtf8(rows[above].name);
        }
    }
}

TEST(DefaultSettings, HaveTheHeaderAndFooterTextsLast)
{
    const auto rows = settingsTable();
    const TextView last[] = { u"HeaderLeft", u"HeaderCenter", u"HeaderRight", u"FooterLeft",
        u"FooterCenter", u"FooterRight" };
    for (std::size_t at = 0; at < std::size(last); ++at)
        EXPECT_EQ(rows[rows.size() - std::size(last) + at].name, last[at]);
}

TEST(DefaultSettings, ReadBackWhatTheirTableSays)
{
    FakePlatform platform;
    deployDefaultSettings(platform.services());
    const SettingsSnapshot file(platform.services());
    for (const Setting& setting : settingsTable())
        EXPECT_EQ(file.value(setting.name), setting.start) << toUtf8(setting.name);
    EXPECT_EQ(strictInt16(file.value(u"PagerSizeValue")), 9);
}

TEST(DefaultSettings, AreTheBytesThatASaveLeaves)
{
    FakePlatform platform;
    EXPECT_TRUE(deployDefaultSettings(platform.services()));
    EXPECT_EQ(platform.folder.read("OstlConfig.ini"),
        "\"\r\nShowHeaders= 1\r\nGridHor= 1\r\nGridVer= 1\r\nGridMerge= 0\r\n"
        "HeaderColor= 14737632\r\nGridLineColor= 0\r\nFontName= 宋体\r\nFontSize= 9\r\n"
        "FontBold= 0\r\nFontItalic= 0\r\nFontStrikethru= 0\r\nFontUnderline= 0\r\n"
        "FontColor= 0\r\nHeaderFontName= 宋体\r\nHeaderFontSize= 9\r\nHeaderFontBold= 0\r\n"
        "HeaderFontItalic= 0\r\nHeaderFontStrikethru= 0\r\nHeaderFontUnderline= 0\r\n"
        "HeaderFontColor= 0\r\nFooterFontName= 宋体\r\nFooterFontSize= 9\r\n"
        "FooterFontBold= 0\r\nFooterFontItalic= 0\r\nFooterFontStrikethru= 0\r\n"
        "FooterFontUnderline= 0\r\nFooterFontColor= 0\r\nPagerSize= A4\r\n"
        "PagerOrientation= 1\r\nPagerSizeValue= 9\r\nTop= 10\r\nButtom= 10\r\nLeft= 10\r\n"
        "Right= 10\r\nPagerWidth= 210\r\nPagerHeight= 297\r\nHeaderLeft= \r\n"
        "HeaderCenter= \r\nHeaderRight= \r\nFooterLeft= \r\n"
        "FooterCenter= [Page # of Pages #]\r\nFooterRight= \r\n\"\r\n");
    const std::string before = platform.folder.read("OstlConfig.ini");
    writeSetting(platform.services(), u"Top", u"10");
    EXPECT_EQ(platform.folder.read("OstlConfig.ini"), before);
}

TEST(DeployDefaultSettings, NeverTouchesASettingsFile)
{
    for (const char* content : { "Top= 3", "\"\r\nTop= 4000\r\n\"\r\n", "junk\n\n  FontSize=0\n",
             "PagerSize", "\"\rLeft= 1\r\"" }) {
        FakePlatform platform;
        platform.folder.write("OstlConfig.ini", content);
        EXPECT_FALSE(deployDefaultSettings(platform.services())) << content;
        EXPECT_EQ(platform.folder.read("OstlConfig.ini"), content);
        EXPECT_EQ(platform.folder.names().size(), 1U);
    }
}

TEST(DeployDefaultSettings, KeepsAFileWithoutASettingBesideTheDefaults)
{
    FakePlatform deployed;
    deployDefaultSettings(deployed.services());
    const std::string defaults = deployed.folder.read("OstlConfig.ini");
    for (const std::string_view content :
        { "", "\"\"\r\n", "\"\r\n\"\r\n", "<html>", "my Top= 3\n", "\0\0" }) {
        FakePlatform platform;
        platform.folder.write("OstlConfig.ini", content);
        EXPECT_TRUE(deployDefaultSettings(platform.services())) << content;
        EXPECT_EQ(platform.folder.read("OstlConfig.ini"), defaults);
        EXPECT_EQ(platform.folder.read("OstlConfig.ini.bak"), content);
    }
}

#if defined(__unix__)
TEST(DeployDefaultSettings, LeavesAFileThatTheDiskHasNoRoomToKeep)
{
    FakePlatform platform;
    const std::string content(5000, 'x');
    platform.folder.write("OstlConfig.ini", content);
    {
        const FileSizeLimit full(1000);
        EXPECT_EQ(
            errorOf([&] { deployDefaultSettings(platform.services()); }), ErrorNumber::DiskFull);
    }
    EXPECT_EQ(platform.folder.names().size(), 1U);
    EXPECT_EQ(platform.folder.read("OstlConfig.ini"), content);
}
#endif

TEST(DeployDefaultSettings, NeverOverwritesAFileThatWasKept)
{
    FakePlatform platform;
    for (const char* content : { "one", "two", "three" }) {
        platform.folder.write("OstlConfig.ini", content);
        EXPECT_TRUE(deployDefaultSettings(platform.services()));
    }
    EXPECT_EQ(platform.folder.read("OstlConfig.ini.bak"), "one");
    EXPECT_EQ(platform.folder.read("OstlConfig.ini.bak1"), "two");
    EXPECT_EQ(platform.folder.read("OstlConfig.ini.bak2"), "three");
}

TEST(DeployDefaultSettings, ReplacesWhatAFacadeWroteBeforeIt)
{
    FakePlatform platform;
    writeSetting(platform.services(), u"HeaderLeft", u"before");
    writeSetting(platform.services(), u"HeaderLeft", u"again");
    EXPECT_EQ(platform.folder.read("OstlConfig.ini"), "\"\r\n\"\r\n");
    EXPECT_TRUE(deployDefaultSettings(platform.services()));
    EXPECT_EQ(readSetting(platform.services(), u"PagerSizeValue"), u"9");
}

TEST(DeployDefaultSettings, LeavesAFolderOfThatNameAlone)
{
    FakePlatform platform;
    std::filesystem::create_directory(platform.folder.file("OstlConfig.ini"));
    EXPECT_FALSE(deployDefaultSettings(platform.services()));
    EXPECT_EQ(platform.folder.names().size(), 1U);
}

TEST(DeployDefaultSettings, CreatesTheFolder)
{
    FakePlatform platform;
    platform.folders.directory = platform.folder.file("a") / "b";
    EXPECT_TRUE(deployDefaultSettings(platform.services()));
    EXPECT_EQ(readSetting(platform.services(), u"PagerSize"), u"A4");
}

TEST(DeployDefaultSettings, TellsWhichFileItCannotWrite)
{
    FakePlatform platform;
    platform.folder.write("a", "no folder");
    platform.folders.directory = platform.folder.file("a");
    try {
        deployDefaultSettings(platform.services());
        FAIL() << "no error";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::WriteFailed);
        EXPECT_TRUE(contains(error.text(), u"OstlConfig.ini"));
    }
}

} // namespace pelloric
