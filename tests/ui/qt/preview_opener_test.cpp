// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/preview_opener.h"

#include "controls/qt/default_platform.h"
#include "fakes/fake_services.h"
#include "fakes/temp_folder.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"
#include "settings/settings_file.h"

#include <pelloric/kestrane.h>

#include <gtest/gtest.h>

namespace pelloric::qt {

TEST(InstallPreviewWindow, PutsTheDefaultSettingsWhereThereAreNone)
{
    const TempFolder folder;
    QtPlatform platform;
    platform.folders().setSystemDirectory(folder.file("config"));
    installPreviewWindow(platform);
    EXPECT_EQ(readSetting(platform.record(), u"PagerSizeValue"), u"9");
}

TEST(InstallPreviewWindow, LeavesSettingsAlone)
{
    const TempFolder folder;
    folder.write("OstlConfig.ini", "Top= 3\r\n");
    QtPlatform platform;
    platform.folders().setSystemDirectory(folder.path());
    installPreviewWindow(platform);
    EXPECT_EQ(folder.read("OstlConfig.ini"), "Top= 3\r\n");
}

TEST(InstallPreviewWindow, EndsNoHostWhoseSettingsCannotBeWritten)
{
    const TempFolder folder;
    folder.write("file", "no folder");
    QtPlatform platform;
    FakeMessages messages;
    platform.useMessages(messages);
    platform.folders().setSystemDirectory(folder.file("file"));
    installPreviewWindow(platform);
    EXPECT_EQ(folder.read("file"), "no folder");
}

TEST(InstallPreviewWindow, LeavesWritingToItAlone)
{
    const TempFolder folder;
    QtPlatform platform;
    FakeMessages messages;
    platform.useMessages(messages);
    platform.folders().setSystemDirectory(folder.path());
    const Kestrane facade(platform);
    EXPECT_TRUE(folder.names().empty());
}

TEST(DeployDefaultSettings, IsCalledByAHostWithoutTheWindowAsTheReadmeSays)
{
    const TempFolder folder;
    defaultPlatform().folders().setSystemDirectory(folder.path());
    pelloric::deployDefaultSettings(pelloric::qt::defaultPlatform().record());
    defaultPlatform().folders().setSystemDirectory({});
    EXPECT_EQ(folder.names().size(), 1U);
}

} // namespace pelloric::qt
