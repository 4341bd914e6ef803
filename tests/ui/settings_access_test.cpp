// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/settings_access.h"

#include "fakes/fake_platform.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(SettingsAccess, AnswersNothingWithoutAFile)
{
    FakePlatform platform;
    const LenientSettings settings(platform.services());
    EXPECT_EQ(settings.text(SettingKey::Top), std::nullopt);
    EXPECT_EQ(settings.number(SettingKey::Top), std::nullopt);
    EXPECT_EQ(settings.font(ReportFont::Header), ColoredFont());
}

TEST(SettingsAccess, PassesOverNumbersPastTheirType)
{
    FakePlatform platform;
    platform.folder.write("OstlConfig.ini", "Top= 1e999\r\nFontSize= 1e200\r\n");
    const LenientSettings settings(platform.services());
    EXPECT_EQ(settings.number(SettingKey::Top), std::nullopt);
    EXPECT_EQ(settings.font(ReportFont::Body).font.size, Font().size);
}

TEST(SettingsAccess, WritesNumbersInTheLocalesForm)
{
    FakePlatform platform;
    platform.services().decimalSeparator = u',';
    platform.folder.write("OstlConfig.ini", "Top= 1\r\n");
    SettingChanges changes(platform.services());
    changes.addNumber(SettingKey::Top, 12.5);
    EXPECT_EQ(changes.save(FailurePolicy::StopAtFirst), SaveOutcome::Written);
    EXPECT_EQ(platform.folder.read("OstlConfig.ini"), "\"\r\nTop= 12,5\r\n\"\r\n");
}

TEST(SettingsAccess, ReadsAndChangesSettingsOfAReportsOwnInsteadOfTheFile)
{
    FakePlatform platform;
    platform.services().decimalSeparator = u',';
    ReportSettings own;
    own.topMm = 7.5;
    own.header.name = u"Sans";
    const LenientSettings settings(platform.services(), &own);
    EXPECT_EQ(settings.number(SettingKey::Top), 7.5);
    EXPECT_EQ(settings.font(ReportFont::Header).font.name, u"Sans");
    SettingChanges changes(platform.services(), &own);
    changes.addNumber(SettingKey::Top, 12.5);
    changes.addText(SettingKey::HeaderLeft, u" two\r\nlines ");
    EXPECT_EQ(changes.save(FailurePolicy::StopAtFirst), SaveOutcome::Written);
    EXPECT_EQ(own.topMm, 12.5);
    EXPECT_EQ(own.headerTexts[0], u"two lines");
    EXPECT_EQ(platform.folder.names().size(), 0U);
}

} // namespace pelloric
