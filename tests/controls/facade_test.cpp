// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/facade.h"

#include "settings/settings_file.h"
#include "support/report_world.h"
#include "support/show_document.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

struct FacadeTest : ::testing::Test, ReportWorld, PreviewOpener {
    void openPreview(std::unique_ptr<AutomationObject> grid) override
    {
        EXPECT_EQ(loop.runs, 1);
        opened.push_back(std::move(grid));
    }

    Text setting(TextView key) { return readSetting(services(), key); }

    Facade facade { services(), *this };
    std::vector<std::unique_ptr<AutomationObject>> opened;
};

} // namespace

TEST_F(FacadeTest, StartsWithItsSwitchesOffWhateverTheFileSays)
{
    EXPECT_FALSE(facade.ShowHeader());
    EXPECT_FALSE(facade.MergeGrid());
    EXPECT_EQ(facade.MarvenStartRow(), 1);
    EXPECT_EQ(setting(u"ShowHeaders"), u"1");
}

TEST_F(FacadeTest, RunsTheMessageLoopOnceAndOpensThePreview)
{
    auto grid = std::make_unique<TableGrid>(std::vector<TableColumn> { { u"A", 1000 } });
    const AutomationObject* given = grid.get();
    facade.doPreview(std::move(grid));
    ASSERT_EQ(opened.size(), 1U);
    EXPECT_EQ(opened.front().get(), given);
}

TEST_F(FacadeTest, WritesItsSwitchesAtOnce)
{
    facade.setShowHeader(false);
    EXPECT_EQ(setting(u"ShowHeaders"), u"0");
    facade.setShowHeader(true);
    EXPECT_TRUE(facade.ShowHeader());
    EXPECT_EQ(setting(u"ShowHeaders"), u"1");
    facade.setMergeGrid(true);
    EXPECT_TRUE(facade.MergeGrid());
    EXPECT_EQ(setting(u"GridMerge"), u"1");
    facade.setMergeGrid(false);
    EXPECT_FALSE(facade.MergeGrid());
    EXPECT_EQ(setting(u"GridMerge"), u"0");
    Facade other(services(), *this);
    EXPECT_FALSE(other.ShowHeader());
}

TEST_F(FacadeTest, WritesTheTextOfASlotAndTheRightOneForAnyOtherPlace)
{
    struct Row {
        std::int32_t location;
        TextView slot;
    };
    const Row rows[] = { { 0, u"Left" }, { 1, u"Center" }, { 2, u"Right" }, { 3, u"Right" },
        { -1, u"Right" }, { 65536, u"Right" }, { 65537, u"Right" } };
    for (const Row& row : rows) {
        const Text text = u"at " + decimal(row.location);
        facade.AddHeader(text, row.location);
        EXPECT_EQ(setting(u"Header" + Text(row.slot)), text);
        facade.AddFooter(text, row.location);
        EXPECT_EQ(setting(u"Footer" + Text(row.slot)), text);
    }
}

TEST_F(FacadeTest, ClearsASlotAndWritesATextOnOneLine)
{
    facade.AddFooter(u"first\r\nsecond\nthird", 1);
    EXPECT_EQ(setting(u"FooterCenter"), u"first second third");
    facade.AddFooter(u"", 1);
    EXPECT_EQ(setting(u"FooterCenter"), u"");
}

TEST_F(FacadeTest, SharesOneStartRowThatANewFacadeResets)
{
    const std::string before = folder.read("OstlConfig.ini");
    facade.setMarvenStartRow(3);
    EXPECT_EQ(facade.MarvenStartRow(), 3);
    EXPECT_EQ(folder.read("OstlConfig.ini"), before);
    TableGrid grid = gridOf({ { u"A", 1000 } }, numberedRows(3, 1));
    canvas.doPreview(grid);
    EXPECT_EQ(textsOf(canvas.document(), 0), "A|r3c1");
    Facade other(services(), *this);
    EXPECT_EQ(facade.MarvenStartRow(), 1);
}

TEST_F(FacadeTest, HasItsTextsPrintedByTheNextPreview)
{
    facade.AddHeader(u"Page [Page #]", 2);
    facade.setShowHeader(false);
    TableGrid grid = gridOf({ { u"A", 1000 } }, { { u"x" } });
    canvas.doPreview(grid);
    EXPECT_EQ(textsOf(canvas.document(), 0), "Page 1|x");
    EXPECT_EQ(canvas.document().text(0, 0).pt, (Tpoint { 680 + 9 * 1055, 907 }));
}

TEST_F(FacadeTest, PassesOverASaveThatFails)
{
    folders.directory = folder.file("none");
    facade.AddHeader(u"x", 0);
    facade.setShowHeader(true);
    EXPECT_TRUE(facade.ShowHeader());
}

} // namespace pelloric
