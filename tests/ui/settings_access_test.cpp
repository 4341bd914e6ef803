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
    EXPECT_EQ(settings.text(u"Top"), std::nullopt);
    EXPECT_EQ(settings.number(u"Top"), std::nullopt);
    EXPECT_EQ(settings.font(u"Header"), ColoredFont());
}

TEST(SettingsAccess, PassesOverNumbersPastTheirType)
{
    FakePlatform platform;
    platform.folder.write("OstlConfig.ini", "Top= 1e999\r\nFontSize= 1e200\r\n");
    const LenientSettings settings(platform.services());
    EXPECT_EQ(settings.number(u"Top"), std::nullopt);
    EXPECT_EQ(settings.font(u"").font.size, Font().size);
}

TEST(SettingsAccess, WritesNumbersInTheLocalesForm)
{
    FakePlatform platform;
    platform.services().decimalSeparator = u',';
    platform.folder.write("OstlConfig.ini", "Top= 1\r\n");
    SettingChanges changes(platform.services());
    changes.addNumber(u"Top", 12.5);
    EXPECT_EQ(changes.save(FailurePolicy::StopAtFirst), SaveOutcome::Written);
    EXPECT_EQ(platform.folder.read("OstlConfig.ini"), "\"\r\nTop= 12,5\r\n\"\r\n");
}

} // namespace pelloric
