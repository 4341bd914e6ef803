// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/settings_check.h"

#include "document/page_document.h"
#include "fakes/fake_platform.h"
#include "platform/numbers.h"
#include "report/report_style.h"
#include "settings/default_settings.h"
#include "settings/settings_file.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

struct World {
    explicit World(std::vector<SettingChange> values = {})
    {
        platform.folder.write("OstlConfig.ini", toUtf8(settingsTextWith(values)));
    }
    World(TextView key, TextView value)
        : World(std::vector<SettingChange> { { key, value } })
    {
    }

    std::vector<SettingProblem> problems() { return settingProblems(platform.services()); }

    /// The text of the only problem; else how many there are.
    std::string problem()
    {
        const auto found = problems();
        return found.size() == 1 ? toUtf8(found[0].text) : std::to_string(found.size());
    }

    std::string path() const { return platform.folder.file("OstlConfig.ini").string(); }

    /// The error of the load, as a message box shows it.
    std::string error()
    {
        ReportStyle style;
        PageSetup setup;
        try {
            loadReportStyle(style, setup, platform.services());
            return "(no error)";
        } catch (const RunTimeError& error) {
            return toUtf8(error.text());
        }
    }

    FakePlatform platform;
};

} // namespace

TEST(SettingProblems, AreNoneInTheDefaultSettings)
{
    World world;
    EXPECT_TRUE(world.problems().empty());
}

TEST(SettingProblems, NameKeyValueFileLimitAndTheDialogsThatMendThem)
{
    struct Row {
        TextView key;
        TextView value;
        const char* limit;
        bool pageSetup;
        bool gridStyle;
    };
    const Row rows[] = {
        { u"Top", u"4000", "this margin is at most 361 mm", true, false },
        { u"Buttom", u"322", "this margin is at most 321 mm", true, false },
        { u"Left", u"482", "this margin is at most 481 mm", true, false },
        { u"PagerWidth", u"6000", "a sheet is wider than 0 and no wider than 5779 mm", true,
            false },
        { u"PagerHeight", u"0", "a sheet is higher than 0 and no higher than 5779 mm", true,
            false },
        { u"PagerSizeValue", u"A4", "the number of a paper is a whole number, such as 9", true,
            false },
        { u"PagerOrientation", u"40000", "1 is portrait and 2 is landscape", true, false },
        { u"GridLineColor", u"1e10", "a colour is a number from 0 to 16777215", false, true },
        { u"FontColor", u"1e10", "a colour is a number from 0 to 16777215", false, true },
        { u"FooterFontSize", u"0", "a font size is a number of points above 0, at most 16000", true,
            true },
        { u"FontSize", u"200000000", "a font size is a number of points above 0, at most 16000",
            false, true },
        { u"FontSize", u"-9", "a font size is a number of points above 0, at most 16000", false,
            true },
    };
    for (const Row& row : rows) {
        World world(row.key, row.value);
        EXPECT_EQ(world.problem(),
            toUtf8(row.key) + "= " + toUtf8(row.value) + " in " + world.path() + ": " + row.limit
                + ".");
        const auto problems = world.problems();
        ASSERT_EQ(problems.size(), 1U);
        ASSERT_TRUE(problems[0].key);
        EXPECT_EQ(settingName(*problems[0].key), row.key);
        EXPECT_EQ(problems[0].isInPageSetup, row.pageSetup) << toUtf8(row.key);
        EXPECT_EQ(problems[0].isInGridStyle, row.gridStyle) << toUtf8(row.key);
    }
}

TEST(SettingProblems, StandBesideTheLargestValuesThatTheLoadTakes)
{
    for (const auto& [key, value] :
        std::to_array<std::pair<TextView, TextView>>({ { u"PagerWidth", u"5779" },
            { u"PagerHeight", u"5779" }, { u"FontSize", u"16000" }, { u"HeaderColor", u"-5" } })) {
        World world(key, value);
        EXPECT_TRUE(world.problems().empty()) << world.problem();
        EXPECT_EQ(world.error(), "(no error)");
    }
}

TEST(SettingProblems, BeginBehindTheRangeThatTheTableGivesAKey)
{
    int judged = 0;
    for (const Setting& row : settingsTable()) {
        const bool isMargin = row.key >= SettingKey::Top && row.key <= SettingKey::Right;
        if (!isMargin && row.unit != SettingUnit::Points)
            continue;
        ++judged;
        ReportSettings settings;
        settings.paperWidthMm = settings.paperHeightMm
            = settingOf(SettingKey::PagerWidth).range.most;
        setSetting(settings, row.key, formatNumber(row.range.most));
        EXPECT_TRUE(settingProblems(settings).empty()) << toUtf8(row.name);
        setSetting(settings, row.key, formatNumber(row.range.most + 1));
        const auto problems = settingProblems(settings);
        ASSERT_EQ(problems.size(), 1U) << toUtf8(row.name);
        EXPECT_EQ(problems[0].key, row.key);
        EXPECT_NE(problems[0].text.find(u"at most " + formatNumber(row.range.most)), Text::npos);
    }
    EXPECT_EQ(judged, 7);
}

TEST(SettingProblems, NameEachOfSeveralBadValues)
{
    World world(std::vector<SettingChange> { { u"Top", u"4000" }, { u"FontSize", u"0" } });
    const auto problems = world.problems();
    ASSERT_EQ(problems.size(), 2U);
    EXPECT_EQ(problems[0].key, SettingKey::FontSize);
    EXPECT_FALSE(problems[0].isRefused);
    EXPECT_EQ(problems[1].key, SettingKey::Top);
    EXPECT_TRUE(problems[1].isRefused);
}

TEST(SettingProblems, TellOfAMissingFile)
{
    FakePlatform platform;
    const auto problems = settingProblems(platform.services());
    ASSERT_EQ(problems.size(), 1U);
    EXPECT_EQ(toUtf8(problems[0].text),
        "File not found: " + platform.folder.file("OstlConfig.ini").string() + ".");
    EXPECT_TRUE(platform.folder.names().empty());
}

TEST(SettingProblems, TellOfAByteOrderMark)
{
    World world;
    world.platform.folder.write("OstlConfig.ini", "\xEF\xBB\xBF" + toUtf8(defaultSettingsText()));
    EXPECT_TRUE(world.problem().starts_with(world.path() + " begins with a byte-order mark"))
        << world.problem();
}

TEST(SettingProblems, TellOfMissingKeys)
{
    World world;
    world.platform.folder.write("OstlConfig.ini", "HeaderLeft= Left\r\nTop= 10\r\n");
    EXPECT_EQ(world.problem(),
        "ShowHeaders, GridHor, GridVer and 37 more settings are missing in " + world.path() + ".");
    Text text = defaultSettingsText();
    text = replaceAll(text, u"PagerSizeValue= 9\r\n", u"");
    world.platform.folder.write("OstlConfig.ini", toUtf8(text));
    EXPECT_EQ(world.problem(), "PagerSizeValue is missing in " + world.path() + ".");
    text = replaceAll(text, u"Top= 10\r\n", u"");
    world.platform.folder.write("OstlConfig.ini", toUtf8(text));
    EXPECT_EQ(world.problem(), "PagerSizeValue and Top are missing in " + world.path() + ".");
}

TEST(SettingProblems, TellOfMarginsThatLeaveNothingOfTheSheet)
{
    World world(std::vector<SettingChange> { { u"Top", u"100" }, { u"Buttom", u"80" } });
    EXPECT_EQ(world.problem(),
        "Top= 100, Buttom= 80, PagerHeight= 297 in " + world.path()
            + ": the margins leave no room on the sheet; they are printed larger than stored, 1.6 "
              "times at the top, 1.8 times at the bottom and 1.2 times at the sides.");
    World sides(u"Left", u"88");
    EXPECT_TRUE(sides.problem().starts_with("Left= 88, Right= 10, PagerWidth= 210 in "));
}

TEST(ReportStyleErrors, NameKeyValueFileLimitAndRemedy)
{
    World margin(u"Top", u"4000");
    EXPECT_EQ(margin.error(),
        "Overflow: Top= 4000 in " + margin.path()
            + ": this margin is at most 361 mm; correct it in Page Setup or restore the defaults");
    World color(u"HeaderColor", u"1e300");
    EXPECT_EQ(color.error(),
        "Overflow: HeaderColor= 1e300 in " + color.path()
            + ": a colour is a number from 0 to 16777215; correct it in Design Report or restore "
              "the defaults");
    World paper(u"PagerWidth", u"6000");
    EXPECT_TRUE(paper.error().starts_with("Overflow: PagerWidth= 6000 in " + paper.path()));
    World code(u"PagerSizeValue", u"A4");
    EXPECT_TRUE(code.error().starts_with("Type mismatch: PagerSizeValue= A4 in " + code.path()));
}

TEST(ReportStyleErrors, TellOfAMissingFileAndAMissingKey)
{
    World world;
    world.platform.folder.write("OstlConfig.ini", "\"\r\nTop= 10\r\n\"\r\n");
    EXPECT_EQ(world.error(),
        "Type mismatch: PagerSizeValue is missing in " + world.path() + "; restore the defaults");
    std::filesystem::remove(world.platform.folder.file("OstlConfig.ini"));
    EXPECT_EQ(world.error(),
        "File not found: " + world.path()
            + ", which holds paper, margins and style; restore the defaults");
}

TEST(RestoreDefaultSettings, CreatesAMissingFile)
{
    FakePlatform platform;
    restoreDefaultSettings(platform.services());
    EXPECT_EQ(platform.folder.read("OstlConfig.ini"), toUtf8(defaultSettingsText()));
    EXPECT_EQ(platform.folder.names().size(), 1U);
}

TEST(RestoreDefaultSettings, KeepsWhatIsUsableAndTheOldFileBeside)
{
    FakePlatform platform;
    const std::string old = "Top= 4000\r\nHeaderLeft= Left of it\r\n  Left =12.5\r\nnotes\r\n";
    platform.folder.write("OstlConfig.ini", old);
    restoreDefaultSettings(platform.services());
    Text expected = replaceAll(defaultSettingsText(), u"HeaderLeft= ", u"HeaderLeft= Left of it");
    expected = replaceAll(expected, u"\r\nLeft= 10", u"\r\nLeft= 12.5");
    EXPECT_EQ(platform.folder.read("OstlConfig.ini"), toUtf8(expected));
    EXPECT_EQ(platform.folder.read("OstlConfig.ini.bak"), old);
    EXPECT_TRUE(settingProblems(platform.services()).empty());
}

TEST(RestoreDefaultSettings, MendsSettingsThatAreHeldAsAValue)
{
    ReportSettings settings;
    settings.topMm = 4000;
    settings.body.size = 0;
    settings.leftMm = 12;
    const auto problems = settingProblems(settings);
    ASSERT_EQ(problems.size(), 2U);
    EXPECT_EQ(problems[1].text, u"Top= 4000: this margin is at most 361 mm.");
    restoreDefaultSettings(settings);
    ReportSettings expected;
    expected.leftMm = 12;
    EXPECT_EQ(settings, expected);
}

TEST(RestoreDefaultSettings, LosesNothingWhenItCannotWrite)
{
    FakePlatform platform;
    platform.folder.write("a", "no folder");
    platform.folders.directory = platform.folder.file("a");
    EXPECT_THROW(restoreDefaultSettings(platform.services()), RunTimeError);
    EXPECT_EQ(platform.folder.read("a"), "no folder");
}

} // namespace pelloric
