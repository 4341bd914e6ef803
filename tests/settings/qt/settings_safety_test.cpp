// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/settings_file.h"

#include "fakes/fake_platform.h"
#include "platform/qt/qt_files.h"
#include "settings/default_settings.h"
#include "support/child_process.h"
#include "support/other_user.h"

#include <gtest/gtest.h>

#include <set>
#include <sys/stat.h>

namespace pelloric::qt {

namespace {

constexpr const char* FileName = "OstlConfig.ini";

/// The default settings file in a folder of the system's own files.
class SettingsSafety : public testing::Test {
protected:
    SettingsSafety()
        : fake_(fakes_.services())
        , platform_ { fake_.metrics, fake_.codec, fake_.messages, fake_.loop, fake_.clock,
            fake_.folders, files_, fake_.printer, fake_.printers, fake_.library }
    {
        deployDefaultSettings(platform_);
    }

    std::string bytes() const { return fakes_.folder.read(FileName); }
    std::filesystem::path path() const { return fakes_.folder.file(FileName); }

    FakePlatform fakes_;
    Platform& fake_;
    QtFiles files_;
    Platform platform_;
};

} // namespace

TEST_F(SettingsSafety, TwoProgramsThatWriteAtOnceLoseNoKey)
{
    const auto write = [&](TextView key) {
        for (int round = 1; round <= 100; ++round) {
            if (writeSetting(platform_, key, decimal(round)) != SaveOutcome::Written)
                throw 1;
        }
    };
    const Child first([&] { write(u"PagerWidth"); });
    const Child second([&] { write(u"PagerHeight"); });
    EXPECT_EQ(first.wait(), 0);
    EXPECT_EQ(second.wait(), 0);
    EXPECT_EQ(readSetting(platform_, u"PagerWidth"), u"100");
    EXPECT_EQ(readSetting(platform_, u"PagerHeight"), u"100");
    EXPECT_EQ(fakes_.folder.names().size(), 1U);
}

TEST_F(SettingsSafety, AKillLeavesTheOldFileOrTheNewOne)
{
    const Text longText(3000, u'x');
    std::set<std::string> whole;
    writeSetting(platform_, u"FooterLeft", longText);
    whole.insert(bytes());
    writeSetting(platform_, u"FooterLeft", u"");
    whole.insert(bytes());
    for (int round = 0; round < 100; ++round) {
        const Child child([&] {
            for (;;) {
                writeSetting(platform_, u"FooterLeft", longText);
                writeSetting(platform_, u"FooterLeft", u"");
            }
        });
        child.killAfter(std::chrono::microseconds(200 + 61 * round % 4000));
        ASSERT_EQ(child.wait(), -1);
        ASSERT_TRUE(whole.contains(bytes())) << bytes();
    }
    writeSetting(platform_, u"Top", u"10");
    EXPECT_EQ(fakes_.folder.names(), std::vector<std::string> { FileName });
}

TEST_F(SettingsSafety, AFileThatCannotBeWrittenIsNotReplacedEither)
{
    const std::string before = bytes();
    ::chmod(path().c_str(), 0444);
    ::chmod(fakes_.folder.path().c_str(), 0777);
    SaveOutcome outcome = SaveOutcome::Written;
    {
        const OtherUser user;
        outcome = writeSetting(platform_, u"Top", u"5");
    }
    EXPECT_EQ(outcome, SaveOutcome::WriteFailed);
    EXPECT_EQ(bytes(), before);
    EXPECT_EQ(fakes_.folder.names().size(), 1U);
}

TEST_F(SettingsSafety, ALinkedFileIsWrittenThroughTheLink)
{
    const TempFolder elsewhere;
    std::filesystem::rename(path(), elsewhere.file("mine.ini"));
    std::filesystem::create_symlink(elsewhere.file("mine.ini"), path());
    EXPECT_EQ(writeSetting(platform_, u"Top", u"5"), SaveOutcome::Written);
    EXPECT_TRUE(std::filesystem::is_symlink(path()));
    EXPECT_NE(elsewhere.read("mine.ini").find("\r\nTop= 5\r\n"), std::string::npos);
    EXPECT_EQ(elsewhere.names().size(), 1U);
}

TEST_F(SettingsSafety, TheRightsOfTheFileStay)
{
    ::chmod(path().c_str(), 0660);
    writeSetting(platform_, u"Top", u"5");
    EXPECT_EQ(std::filesystem::status(path()).permissions(), std::filesystem::perms(0660));
}

} // namespace pelloric::qt
