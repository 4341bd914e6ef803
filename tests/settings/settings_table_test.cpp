// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/settings_table.h"

#include "fakes/fake_platform.h"
#include "settings/default_settings.h"
#include "settings/settings_file.h"

#include <gtest/gtest.h>

#include <set>

namespace pelloric {

TEST(SettingsTable, HasARowOfItsOwnForEveryKey)
{
    std::set<Text> names;
    ReportSettings settings;
    std::set<SettingField> fields;
    for (const Setting& row : settingsTable()) {
        names.insert(Text(row.name));
        fields.insert(row.field(settings));
        EXPECT_EQ(&settingOf(row.key), &row);
    }
    EXPECT_EQ(names.size(), 42U);
    EXPECT_EQ(fields.size(), 42U);
}

TEST(SettingsTable, HasTheStartValuesOfTheSettingsThemselves)
{
    const ReportSettings settings;
    for (const Setting& row : settingsTable())
        EXPECT_EQ(settingText(settings, row.key, u'.'), row.start) << toUtf8(row.name);
}

TEST(SettingsTable, TurnsTheDefaultFileIntoTheStartValues)
{
    FakePlatform platform;
    deployDefaultSettings(platform.services());
    EXPECT_EQ(readReportSettings(platform.services()), ReportSettings());
}

TEST(SettingsTable, ReadsValuesAsTheFileHoldsThem)
{
    ReportSettings settings;
    setSetting(settings, SettingKey::ShowHeaders, u"abc");
    setSetting(settings, SettingKey::GridMerge, u"-1 yes");
    setSetting(settings, SettingKey::HeaderColor, u" 255abc");
    setSetting(settings, SettingKey::FooterFontSize, u"10.5");
    setSetting(settings, SettingKey::Top, u"12,5");
    setSetting(settings, SettingKey::HeaderRight, u"a = b");
    EXPECT_FALSE(settings.showHeaders);
    EXPECT_TRUE(settings.mergeCells);
    EXPECT_EQ(settings.headerColor, 255);
    EXPECT_EQ(settings.footer.size, 10.5);
    EXPECT_EQ(settings.topMm, 12);
    EXPECT_EQ(settings.headerTexts[2], u"a = b");
}

TEST(SettingsTable, TakesOnlyAWholeNumberForAPaperCode)
{
    ReportSettings settings;
    for (const TextView bad : { u"9 x", u"", u"40000", u"abc" }) {
        settings.paperCode = std::int16_t { 1 };
        setSetting(settings, SettingKey::PagerSizeValue, bad);
        EXPECT_EQ(settings.paperCode, std::nullopt) << toUtf8(bad);
        EXPECT_EQ(settingText(settings, SettingKey::PagerSizeValue, u'.'), u"");
    }
    setSetting(settings, SettingKey::PagerSizeValue, u"12");
    EXPECT_EQ(settings.paperCode, 12);
}

TEST(SettingsTable, WritesNumbersWithTheLocalesSeparator)
{
    ReportSettings settings;
    settings.leftMm = 12.25;
    settings.body.size = 10.1;
    settings.header.size = 1e300;
    EXPECT_EQ(settingText(settings, SettingKey::Left, u','), u"12,25");
    EXPECT_EQ(settingText(settings, SettingKey::FontSize, u','), u"10,1");
    EXPECT_EQ(settingText(settings, SettingKey::HeaderFontSize, u'.'), u"1E+300");
}

TEST(SettingsTable, NamesTheSettingsOfEveryFont)
{
    EXPECT_EQ(settingName(fontKey(ReportFont::Body, SettingKey::FontName)), u"FontName");
    EXPECT_EQ(settingName(fontKey(ReportFont::Header, SettingKey::FontBold)), u"HeaderFontBold");
    EXPECT_EQ(settingName(fontKey(ReportFont::Footer, SettingKey::FontColor)), u"FooterFontColor");
}

} // namespace pelloric
