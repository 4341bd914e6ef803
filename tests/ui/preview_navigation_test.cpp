// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/preview_navigation.h"

#include "controls/canvas.h"
#include "controls/messages.h"
#include "fakes/fake_platform.h"
#include "grids/table_grid.h"
#include "settings/default_settings.h"
#include "settings/settings_file.h"
#include "support/errors.h"
#include "ui/tool_table.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

class FakeHost : public PreviewHost {
public:
    DialogEnd showGridStyle() override { return ended("grid style"); }
    DialogEnd showPageSetup() override { return ended("page setup"); }
    void showPrintOptions() override { log += "print options;"; }
    void showAbout() override { log += "about;"; }
    std::filesystem::path chooseFileToOpen() override { return chosen("open;"); }
    std::filesystem::path chooseFileToSave() override { return chosen("save;"); }
    void unload() override { log += "unload;"; }
    void navigationChanged() override { ++changes; }
    void beforeBuild(AutomationObject&) override
    {
        if (doubt)
            throw RunTimeError(*doubt);
    }

    std::string log;
    std::filesystem::path path; ///< empty: the user cancels
    DialogEnd end = DialogEnd::Cancelled;
    int changes = 0;
    std::optional<ErrorNumber> doubt; ///< of the grid's owner before it is read

private:
    DialogEnd ended(const std::string& dialog)
    {
        log += dialog + ";";
        return end;
    }

    std::filesystem::path chosen(const std::string& dialog)
    {
        log += dialog;
        if (path.empty())
            throw RunTimeError(ErrorNumber::Cancelled);
        return path;
    }
};

/// A session over a canvas with so many empty A4 pages.
struct Fixture {
    explicit Fixture(int pages)
        : canvas(platform.services())
    {
        canvas.page.myWidth = 11907;
        canvas.page.myHeight = 16840;
        for (int page = 1; page < pages; ++page)
            canvas.newPage();
        canvas.setCurrentpage(1);
    }

    void click(const std::vector<int>& ids)
    {
        for (const int id : ids)
            session().click(id);
    }

    PreviewSession& session()
    {
        if (!session_)
            session_.emplace(canvas, host);
        return *session_;
    }

    /// Current page, window, enabled tools 5 to 8, text of the page box.
    std::string position()
    {
        const NavigationState& state = session().state();
        std::string text = std::to_string(canvas.Currentpage()) + " ("
            + std::to_string(canvas.WindowPages()) + "," + std::to_string(canvas.WindowMinPage())
            + "," + std::to_string(canvas.WindowMaxPage()) + ") ";
        for (const bool enabled : { state.first, state.previous, state.next, state.last })
            text += enabled ? '+' : '-';
        return text + " " + toUtf8(state.pageBox);
    }

    FakePlatform platform;
    FakeHost host;
    Canvas canvas;

private:
    std::optional<PreviewSession> session_;
};

/// An object that answers nothing but the members that it is given.
class NamedObject : public AutomationObject {
public:
    explicit NamedObject(std::vector<Text> members, AutomationObject* items = nullptr)
        : members_(std::move(members))
        , items_(items)
    {
    }

    std::optional<MemberId> findMember(TextView name) override
    {
        for (std::size_t id = 0; id < members_.size(); ++id) {
            if (members_[id] == name)
                return static_cast<MemberId>(id);
        }
        return std::nullopt;
    }
    const void* memberTable() const override { return this; }
    Value get(MemberId, std::span<const Value>) override
    {
        return items_ ? Value::ofObject(*items_) : Value();
    }
    void put(MemberId, std::span<const Value>, const Value&) override { }

private:
    std::vector<Text> members_;
    AutomationObject* items_;
};

} // namespace

TEST(PreviewNavigation, MovesAndArrangesAsEachToolSays)
{
    struct Case {
        int pages;
        std::vector<int> clicks;
        std::string position;
    };
    const Case cases[] = {
        { 1, {}, "1 (0,0,0) ---- NO. 1" },
        { 1, { 5 }, "1 (0,0,0) ---- NO. 1" },
        { 1, { 6 }, "1 (0,0,0) ---- NO. 1" },
        { 1, { 8 }, "1 (0,0,0) ---- NO. 1" },
        { 1, { 9 }, "1 (0,0,0) ---- NO. 1" },
        { 1, { 10 }, "1 (0,0,0) ---- NO. 1" },
        { 1, { 15 }, "1 (0,0,0) ---- NO. 1" },
        { 1, { 16 }, "1 (2,0,1) ---- 【1-1】" },
        { 1, { 18 }, "1 (4,0,3) ---- 【1-1】" },
        { 2, {}, "1 (0,0,0) --++ NO. 1" },
        { 2, { 7 }, "2 (0,0,0) ++-- NO. 2" },
        { 2, { 7, 6 }, "1 (0,0,0) --++ NO. 1" },
        { 2, { 8 }, "2 (0,0,0) ++-- NO. 2" },
        { 2, { 8, 8 }, "2 (0,0,0) ++-- NO. 2" },
        { 2, { 8, 5 }, "1 (0,0,0) --++ NO. 1" },
        { 2, { 8, 9 }, "1 (0,0,0) --++ NO. 1" },
        { 2, { 8, 15 }, "2 (0,0,0) ++-- NO. 2" },
        { 2, { 16 }, "1 (2,0,1) ---- 【1-2】" },
        { 2, { 8, 16 }, "2 (2,1,2) ++-- 【2-2】" },
        { 2, { 18, 10 }, "1 (0,0,0) --++ NO. 1" },
        { 5, { 7 }, "2 (0,0,0) ++++ NO. 2" },
        { 5, { 8 }, "5 (0,0,0) ++-- NO. 5" },
        { 5, { 8, 6 }, "4 (0,0,0) ++++ NO. 4" },
        { 5, { 7, 10 }, "2 (0,0,0) ++++ NO. 2" },
        { 5, { 16 }, "1 (2,0,1) --++ 【1-2】" },
        { 5, { 16, 7 }, "2 (2,2,3) ++++ 【3-4】" },
        { 5, { 16, 7, 7 }, "3 (2,4,5) ++-- 【5-5】" },
        { 5, { 16, 7, 6 }, "1 (2,0,1) --++ 【1-2】" },
        { 5, { 16, 7, 6, 6 }, "1 (2,0,1) --++ 【1-2】" },
        { 5, { 16, 8 }, "5 (2,3,4) ++-- 【4-5】" },
        { 5, { 16, 8, 6 }, "4 (2,1,2) ++++ 【2-3】" },
        { 5, { 16, 8, 6, 6 }, "3 (2,-1,0) --++ 【1-2】" },
        { 5, { 16, 8, 5 }, "1 (2,0,1) --++ 【1-2】" },
        { 5, { 18 }, "1 (4,0,3) --++ 【1-4】" },
        { 5, { 18, 7 }, "2 (4,4,7) ++-- 【5-5】" },
        { 5, { 18, 8 }, "5 (4,1,4) ++-- 【2-5】" },
        { 5, { 18, 15 }, "1 (0,0,0) --++ NO. 1" },
        { 20, { 8, 9 }, "1 (0,0,0) --++ NO. 1" },
        { 20, { 9, 7 }, "2 (0,0,0) ++++ NO. 2" },
        { 20, { 18, 8 }, "20 (4,16,19) ++-- 【17-20】" },
        { 21, { 9 }, "1 (6,0,5) --++ 【1-6】" },
        { 21, { 7, 7, 9 }, "3 (6,2,7) ++++ 【3-8】" },
        { 21, { 9, 7 }, "2 (6,6,11) ++++ 【7-12】" },
        { 21, { 9, 7, 7, 7 }, "4 (6,18,23) ++-- 【19-21】" },
        { 21, { 9, 7, 6 }, "1 (6,0,5) --++ 【1-6】" },
        { 21, { 9, 8 }, "21 (6,15,20) ++-- 【16-21】" },
        { 21, { 9, 8, 6 }, "20 (6,9,14) ++++ 【10-15】" },
        { 21, { 9, 8, 5 }, "1 (6,0,5) --++ 【1-6】" },
        { 21, { 9, 8, 10 }, "21 (0,0,0) ++-- NO. 21" },
        { 21, { 9, 15 }, "1 (0,0,0) --++ NO. 1" },
        { 21, { 9, 16 }, "1 (2,0,1) --++ 【1-2】" },
    };
    for (const Case& row : cases) {
        Fixture fixture(row.pages);
        fixture.click(row.clicks);
        EXPECT_EQ(fixture.position(), row.position)
            << row.pages << " pages, " << testing::PrintToString(row.clicks);
    }
}

TEST(PreviewNavigation, ShowsTwentyPagesAtOnceAndAWindowOfTwentyOne)
{
    Fixture twenty(20);
    twenty.click({ 9 });
    EXPECT_EQ(twenty.canvas.WindowOrderStyle(), OrderStyle::Multiple);
    EXPECT_EQ(twenty.canvas.view().surfaces.size(), 20U);
    Fixture more(21);
    more.click({ 9 });
    EXPECT_EQ(more.canvas.WindowOrderStyle(), OrderStyle::Six);
    EXPECT_EQ(more.canvas.view().surfaces.size(), 6U);
}

TEST(PreviewNavigation, TellsOnceThatThereIsNoNextPage)
{
    Fixture fixture(2);
    fixture.click({ 8, 7 });
    EXPECT_EQ(
        fixture.platform.messages.take(), std::vector<Message> { messageOf(Notice::NoNextPage) });
    EXPECT_EQ(fixture.position(), "2 (0,0,0) ++-- NO. 2");
}

TEST(PreviewNavigation, OpensOnPageOneAndLetsTheCanvasPaint)
{
    Fixture fixture(3);
    const NavigationState expected { .first = false,
        .previous = false,
        .next = true,
        .last = true,
        .pageBox = u"NO. 1",
        .pageEntries = 3,
        .scale = u"   100 %",
        .countLabel = u" 【共 3 页】" };
    EXPECT_EQ(fixture.session().state(), expected);
    EXPECT_EQ(fixture.canvas.strSCliectRect, u"full");
    EXPECT_EQ(fixture.host.changes, 0);
}

TEST(PreviewNavigation, ZoomsAndShowsTheScale)
{
    Fixture fixture(1);
    fixture.click({ 3 });
    EXPECT_EQ(fixture.session().state().scale, u"200%");
    fixture.click({ 4, 4 });
    EXPECT_EQ(fixture.session().state().scale, u"50%");
    EXPECT_EQ(fixture.canvas.DispScale(), 2.0F);
}

TEST(PreviewNavigation, SetsTheScaleThatWasChosen)
{
    Fixture fixture(1);
    fixture.session().chooseScale(u"   25 %");
    EXPECT_EQ(fixture.canvas.DispScale(), 4.0F);
    fixture.session().chooseScale(u"   200 %");
    EXPECT_EQ(fixture.canvas.DispScale(), 0.5F);
    for (const TextView text : { u"0", u"abc", u"" }) {
        fixture.session().chooseScale(text);
        EXPECT_EQ(fixture.canvas.DispScale(), 0.5F);
        EXPECT_EQ(fixture.session().state().scale, u"   200 %"); // the one in force
    }
}

TEST(PreviewNavigation, ShowsThePageThatWasChosen)
{
    Fixture fixture(21);
    PreviewSession& session = fixture.session();
    session.choosePage(u"   NO. 5");
    EXPECT_EQ(fixture.position(), "5 (0,0,0) ++++ NO. 5");
    session.choosePage(u"  【1-6】");
    EXPECT_EQ(fixture.position(), "5 (0,0,0) ++++ NO. 5");
    session.choosePage(u"NO. 21");
    EXPECT_EQ(fixture.position(), "21 (0,0,0) ++-- NO. 21");
    session.choosePage(u"3");
    EXPECT_EQ(fixture.position(), "3 (0,0,0) ++++ NO. 3");
    session.choosePage(u"99999");
    EXPECT_EQ(fixture.position(), "3 (0,0,0) ++++ NO. 3");
    session.choosePage(u"NO. 22");
    EXPECT_EQ(fixture.platform.messages.take().size(), 1U);
    EXPECT_EQ(fixture.position(), "3 (0,0,0) ++++ NO. 3");
}

TEST(PreviewNavigation, LeavesPanModeAndCentresOnEveryClick)
{
    Fixture fixture(2);
    fixture.click({ 11 });
    EXPECT_TRUE(fixture.canvas.view().pan);
    fixture.click({ 14 });
    EXPECT_FALSE(fixture.canvas.view().pan);
    EXPECT_TRUE(fixture.canvas.ReSetLeftTop());
}

TEST(PreviewNavigation, HandsDialogsToItsHost)
{
    Fixture fixture(2);
    fixture.click({ 1, 13, 12, 19, 20, 21 });
    EXPECT_EQ(fixture.host.log, "grid style;page setup;print options;about;open;save;");
    EXPECT_EQ(fixture.canvas.Totalpages(), 2);
    fixture.click({ 17 });
    EXPECT_EQ(fixture.canvas.document().pageCount(), 1);
}

TEST(PreviewNavigation, RefreshesTheNavigationAfterClearing)
{
    Fixture fixture(5);
    fixture.click({ 8, 22 });
    EXPECT_EQ(fixture.position(), "1 (0,0,0) ---- NO. 1");
    EXPECT_EQ(fixture.session().state().pageEntries, 1);
    EXPECT_EQ(fixture.session().state().countLabel, u" 【共 1 页】");
}

TEST(PreviewNavigation, OpensWhatItSaved)
{
    Fixture fixture(5);
    fixture.host.path = fixture.platform.folder.file("pages.ostl");
    fixture.click({ 21, 22, 20 });
    EXPECT_EQ(fixture.position(), "1 (0,0,4) --++ NO. 1");
    EXPECT_EQ(fixture.session().state().pageEntries, 5);
}

TEST(PreviewNavigation, ReadsNavigationAnewWhenAFileCannotBeOpened)
{
    Fixture fixture(5);
    fixture.host.path = fixture.platform.folder.file("none.ostl");
    fixture.click({ 20 });
    EXPECT_EQ(fixture.session().state().countLabel, u" 【共 1 页】");
}

TEST(PreviewNavigation, BuildsRefreshesAndZoomsAGrid)
{
    Fixture fixture(1);
    deployDefaultSettings(fixture.platform.services());
    TableGrid grid({ { u"a", 1000 }, { u"b", 2000 } });
    grid.addRow(std::vector<TextView> { u"1", u"2" });
    fixture.session().open(grid);
    EXPECT_EQ(fixture.canvas.m_PrintObj, PrintObjKind::MSHFlexGrid);
    EXPECT_EQ(fixture.session().state().scale, u"100%");
    fixture.click({ 23 });
    EXPECT_DOUBLE_EQ(fixture.canvas.table()->ColumnWidths[0], 1100);
    fixture.click({ 24 });
    EXPECT_DOUBLE_EQ(fixture.canvas.table()->ColumnWidths[0], 990);
    fixture.click({ 2 });
    EXPECT_DOUBLE_EQ(fixture.canvas.table()->ColumnWidths[0], 1000);
    fixture.session().forgetGrid();
    try {
        fixture.session().refresh(true);
        ADD_FAILURE() << "no error";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::ObjectMissing);
        EXPECT_EQ(error.detail(), u"no grid is previewed");
    }
    EXPECT_EQ(errorOf([&] { fixture.session().reZoom(); }), ErrorNumber::ObjectMissing);
    fixture.click({ 2, 23, 24 });
}

TEST(PreviewNavigation, SaysAboveThePagesWhyNoneCouldBeBuilt)
{
    Fixture fixture(3);
    TableGrid grid({ { u"a", 1000 } });
    const std::string path = fixture.platform.folder.file("OstlConfig.ini").string();
    EXPECT_EQ(errorOf([&] { fixture.session().open(grid); }), ErrorNumber::FileNotFound);
    ASSERT_TRUE(fixture.session().notice());
    EXPECT_EQ(*fixture.session().notice(),
        (PreviewNotice {
            .text = fromUtf8("The pages could not be built. File not found: " + path + "."),
            .offersDefaults = true }));
    EXPECT_EQ(fixture.canvas.Totalpages(), 3);
    fixture.session().restoreDefaults();
    EXPECT_FALSE(fixture.session().notice());
    EXPECT_EQ(fixture.canvas.Totalpages(), 1);
    EXPECT_EQ(fixture.platform.folder.read("OstlConfig.ini"), toUtf8(defaultSettingsText()));
}

TEST(PreviewNavigation, SaysAboveThePagesWhatTheGridsOwnerFindsBeforeABuild)
{
    Fixture fixture(1);
    deployDefaultSettings(fixture.platform.services());
    TableGrid grid({ { u"a", 1000 } });
    fixture.host.doubt = ErrorNumber::Overflow;
    EXPECT_EQ(errorOf([&] { fixture.session().open(grid); }), ErrorNumber::Overflow);
    ASSERT_TRUE(fixture.session().notice());
    EXPECT_EQ(toUtf8(fixture.session().notice()->text), "The pages could not be built. Overflow.");
}

TEST(PreviewNavigation, OffersTheDialogsThatMendABadValue)
{
    Fixture fixture(1);
    deployDefaultSettings(fixture.platform.services());
    TableGrid grid({ { u"a", 1000 } });
    fixture.session().open(grid);
    EXPECT_FALSE(fixture.session().notice());
    writeSetting(fixture.platform.services(), u"Top", u"4000");
    fixture.click({ 2 });
    ASSERT_TRUE(fixture.session().notice());
    EXPECT_TRUE(contains(fixture.session().notice()->text, u"Top= 4000 in "));
    EXPECT_TRUE(fixture.session().notice()->offersPageSetup);
    EXPECT_FALSE(fixture.session().notice()->offersGridStyle);
    writeSetting(fixture.platform.services(), u"Top", u"10");
    writeSetting(fixture.platform.services(), u"FontSize", u"0");
    fixture.click({ 2 });
    ASSERT_TRUE(fixture.session().notice());
    EXPECT_TRUE(fixture.session().notice()->text.starts_with(u"FontSize= 0 in "));
    EXPECT_TRUE(fixture.session().notice()->offersGridStyle);
    fixture.session().showNotice(std::nullopt);
    EXPECT_FALSE(fixture.session().notice());
}

TEST(PreviewNavigation, SaysNothingAboveThePagesOfABuildThatTheUserEnds)
{
    Fixture fixture(1);
    deployDefaultSettings(fixture.platform.services());
    TableGrid grid({ { u"a", 1000 } });
    fixture.platform.loop.cancelAt = 1;
    EXPECT_EQ(errorOf([&] { fixture.session().open(grid); }), ErrorNumber::Cancelled);
    EXPECT_FALSE(fixture.session().notice());
}

TEST(PreviewNavigation, SaysThatTheDefaultsCannotBeRestored)
{
    Fixture fixture(1);
    fixture.platform.folder.write("file", "no folder");
    fixture.platform.folders.directory = fixture.platform.folder.file("file");
    fixture.session().restoreDefaults();
    ASSERT_TRUE(fixture.session().notice());
    EXPECT_TRUE(fixture.session().notice()->text.starts_with(u"The file cannot be written: "));
}

TEST(PreviewNavigation, RebuildsNoDocumentThatWasOpenedWithoutAGrid)
{
    Fixture fixture(2);
    deployDefaultSettings(fixture.platform.services());
    fixture.host.path = fixture.platform.folder.file("pages.ostl");
    EXPECT_TRUE(fixture.session().state().rebuild);
    fixture.click({ 21, 20 });
    EXPECT_FALSE(fixture.session().state().rebuild);
    TableGrid grid({ { u"a", 1000 } });
    fixture.session().open(grid);
    EXPECT_TRUE(fixture.session().state().rebuild);
    fixture.click({ 20 });
    EXPECT_TRUE(fixture.session().state().rebuild);
}

TEST(PreviewNavigation, RefreshesAfterOkAndNotAfterCancel)
{
    Fixture fixture(5);
    fixture.click({ 8, 1 });
    EXPECT_EQ(fixture.position(), "5 (0,0,0) ++-- NO. 5");
    fixture.host.end = DialogEnd::Accepted;
    fixture.click({ 13 });
    EXPECT_EQ(fixture.position(), "5 (0,0,0) --++ NO. 5");
}

TEST(PreviewNavigation, FindsTheKindOfAGridByItsMembers)
{
    NamedObject items({ u"Count" });
    NamedObject bare({});
    NamedObject flex({ u"TextMatrix", u"ListItems" });
    NamedObject list({ u"ListItems" }, &items);
    NamedObject uncounted({ u"ListItems" }, &bare);
    NamedObject empty({ u"ListItems" });
    NamedObject data({ u"DataSource" });
    EXPECT_EQ(gridKindOf(flex), PrintObjKind::MSHFlexGrid);
    EXPECT_EQ(gridKindOf(list), PrintObjKind::ListView);
    for (NamedObject* const object : { &uncounted, &empty, &data })
        EXPECT_EQ(gridKindOf(*object), PrintObjKind::datagrid);
}

TEST(PreviewNavigation, HoldsAScaleBetweenOneAndSixThousandFourHundredPercent)
{
    struct Case {
        TextView text;
        float divisor;
        TextView shown;
    };
    const Case cases[] = {
        { u"0.5", 100, u"1%" },
        { u"-50", 100, u"1%" },
        { u"1", 100, u"1%" },
        { u"33.333", 1 / 0.33333F, u"33.333%" },
        { u"6400", 1 / 64.0F, u"6400%" },
        { u"99999 %", 1 / 64.0F, u"6400%" },
        { u"1e300", 1 / 64.0F, u"6400%" },
    };
    for (const Case& row : cases) {
        Fixture fixture(1);
        fixture.session().chooseScale(row.text);
        EXPECT_FLOAT_EQ(fixture.canvas.DispScale(), row.divisor) << toUtf8(row.text);
        EXPECT_EQ(fixture.session().state().scale, row.shown);
    }
}

TEST(PreviewNavigation, CentresAtAChosenScaleAndKeepsAPageInSight)
{
    Fixture fixture(1);
    fixture.session();
    fixture.canvas.setViewport(6000, 6000);
    fixture.canvas.showPage();
    fixture.canvas.OnDraw();
    fixture.canvas.setVbar(100);
    fixture.session().chooseScale(u"   25 %");
    EXPECT_EQ(fixture.canvas.view().offset, (Tpoint { 5946, 3480 }));
    for (const TextView scale : { u"6400", u"1", u"500", u"10", u"6400" }) {
        fixture.canvas.setVbar(fixture.canvas.view().Vbar.maximum);
        fixture.session().chooseScale(scale);
        EXPECT_FALSE(surfacesInView(fixture.canvas.view(), fixture.canvas.facts()).empty())
            << toUtf8(scale);
    }
}

TEST(PreviewNavigation, ShowsThePageThatWasPickedFromAWindowOfPages)
{
    Fixture fixture(9);
    fixture.click({ 16 });
    fixture.session().choosePage(u"   NO. 5");
    EXPECT_EQ(fixture.position(), "5 (2,0,1) ++++ NO. 5");
    fixture.click({ 7 });
    EXPECT_EQ(fixture.position(), "6 (2,2,3) ++++ 【3-4】");
    fixture.session().choosePage(u"   NO. 9");
    EXPECT_EQ(fixture.position(), "9 (2,2,3) ++-- NO. 9");
    fixture.session().choosePage(u"   NO. 1");
    EXPECT_EQ(fixture.position(), "1 (2,2,3) --++ NO. 1");
}

TEST(PreviewNavigation, KeepsThePageInViewAfterANumberOfNoPage)
{
    struct Case {
        TextView text;
        std::int16_t current;
    };
    for (const Case& row : { Case { u"0", 0 }, { u"abc", 0 }, { u"NO. -3", -3 } }) {
        Fixture fixture(9);
        PreviewSession& session = fixture.session();
        fixture.click({ 7, 7 });
        session.choosePage(row.text);
        EXPECT_EQ(fixture.canvas.Currentpage(), row.current);
        EXPECT_EQ(toUtf8(session.state().pageBox), "NO. 3");
        EXPECT_TRUE(session.state().previous);
        fixture.click({ 7 });
        EXPECT_EQ(fixture.position(), "4 (0,0,0) ++++ NO. 4");
        session.choosePage(row.text);
        fixture.click({ 6 });
        EXPECT_EQ(fixture.position(), "3 (0,0,0) ++++ NO. 3");
    }
}

TEST(PreviewNavigation, TellsOfWhatAHostDoesWithTheCanvas)
{
    Fixture fixture(9);
    PreviewSession& session = fixture.session();
    fixture.canvas.setDispScale(0.3F);
    EXPECT_EQ(toUtf8(session.state().scale), "30%");
    EXPECT_EQ(fixture.host.changes, 1);
    fixture.canvas.setCurrentpage(9);
    EXPECT_EQ(fixture.position(), "9 (0,0,0) ++-- NO. 9");
    fixture.canvas.SetShowStyle(2, 2, 3);
    fixture.canvas.showMuliPage(2);
    EXPECT_EQ(fixture.position(), "9 (2,2,3) ++++ 【3-4】");
    EXPECT_EQ(session.state().scale, scaleText(fixture.canvas.DispScale()));
    fixture.canvas.clear();
    EXPECT_EQ(toUtf8(session.state().countLabel), " 【共 1 页】");
}

TEST(PreviewNavigation, ShowsTheScaleThatAnArrangementWasFittedTo)
{
    Fixture fixture(9);
    for (const int tool : { 15, 16, 18, 9 }) {
        fixture.click({ tool });
        EXPECT_EQ(fixture.session().state().scale, scaleText(fixture.canvas.DispScale())) << tool;
    }
}

TEST(PreviewNavigation, BringsTheBarsToTheirStartBeforeAToolCentres)
{
    for (const int tool : { 11, 10, 3, 7, 19 }) {
        Fixture fixture(2);
        fixture.session();
        fixture.canvas.setViewport(6000, 6000);
        fixture.canvas.showPage();
        fixture.canvas.OnDraw();
        fixture.canvas.setVbar(60);
        fixture.canvas.setHbar(30);
        fixture.click({ tool });
        fixture.canvas.showPage(); // as a paint does
        const ViewState& view = fixture.canvas.view();
        EXPECT_EQ(view.Vbar.value, 0) << tool;
        EXPECT_EQ(view.Hbar.value, 0) << tool;
        EXPECT_EQ(view.offset, (Tpoint { 100, 100 })) << tool;
    }
}

TEST(PreviewNavigation, ReadsFromPageToPage)
{
    Fixture fixture(3);
    PreviewSession& session = fixture.session();
    fixture.canvas.setViewport(20000, 10000);
    fixture.canvas.showPage();
    fixture.canvas.OnDraw();
    const auto place = [&] {
        return fixture.position().substr(0, 1) + ":"
            + std::to_string(fixture.canvas.view().Vbar.value);
    };
    std::vector<std::string> seen;
    for (int press = 0; press < 9; ++press) {
        session.read(ReadingWay::On);
        seen.push_back(place());
    }
    EXPECT_EQ(seen,
        (std::vector<std::string> {
            "1:42", "1:72", "2:0", "2:42", "2:72", "3:0", "3:42", "3:72", "3:72" }));
    seen.clear();
    for (int press = 0; press < 9; ++press) {
        session.read(ReadingWay::Back);
        seen.push_back(place());
    }
    EXPECT_EQ(seen,
        (std::vector<std::string> {
            "3:30", "3:0", "2:72", "2:30", "2:0", "1:72", "1:30", "1:0", "1:0" }));
}

TEST(PreviewNavigation, ReadsOnFromAPageThatWasPickedFromAWindow)
{
    Fixture fixture(9);
    fixture.click({ 16 });
    fixture.session().choosePage(u"5");
    fixture.canvas.setViewport(30000, 30000);
    fixture.canvas.OnDraw();
    fixture.session().read(ReadingWay::On);
    EXPECT_EQ(fixture.position(), "6 (2,0,1) ++++ NO. 6");
}

TEST(PreviewNavigation, ReadsWindowsOfPagesWithoutAMessageAtTheLastPage)
{
    Fixture fixture(6);
    fixture.canvas.setCurrentpage(6);
    fixture.session();
    fixture.canvas.setViewport(100000, 10000);
    fixture.canvas.SetShowStyle(2, 0, 1);
    fixture.canvas.showMuliPage(2);
    fixture.canvas.setDispScale(0.1F);
    fixture.session().read(ReadingWay::On);
    EXPECT_EQ(fixture.position(), "6 (2,2,3) ++++ 【3-4】");
}

TEST(PreviewNavigation, FitsAPageAndKeepsItFittedInAnotherViewport)
{
    Fixture fixture(2);
    PreviewSession& session = fixture.session();
    fixture.canvas.setViewport(20000, 10000);
    session.fitPageWidth();
    EXPECT_NEAR(fixture.canvas.DispScale(), 12107 / 20000.0, 1e-5);
    EXPECT_FALSE(fixture.canvas.view().Hbar.enabled);
    session.fitPage();
    EXPECT_NEAR(fixture.canvas.DispScale(), 17040 / 10000.0, 1e-5);
    EXPECT_FALSE(fixture.canvas.view().Vbar.enabled);
    fixture.canvas.setViewport(20000, 8520);
    session.viewportChanged();
    EXPECT_NEAR(fixture.canvas.DispScale(), 2, 1e-5);
    EXPECT_EQ(session.state().scale, scaleText(fixture.canvas.DispScale()));
    fixture.click({ 3 });
    fixture.canvas.setViewport(20000, 10000);
    session.viewportChanged();
    EXPECT_NEAR(fixture.canvas.DispScale(), 1, 1e-5); // a zoom has ended the fit
}

TEST(PreviewNavigation, CentresANewReport)
{
    Fixture fixture(1);
    deployDefaultSettings(fixture.platform.services());
    TableGrid grid({ { u"a", 1000 } });
    grid.addRow(std::vector<TextView> { u"1" });
    fixture.canvas.setViewport(30000, 30000);
    fixture.session().open(grid);
    EXPECT_EQ(fixture.canvas.view().offset, (Tpoint { 8946, 6480 }));
}

TEST(PreviewNavigation, GoesToAPageInWhateverIsShown)
{
    Fixture fixture(21);
    PreviewSession& session = fixture.session();
    EXPECT_EQ(session.showPage(4), 0);
    EXPECT_EQ(fixture.position(), "5 (0,0,0) ++++ NO. 5");
    fixture.click({ 18 });
    EXPECT_EQ(session.showPage(6), 2);
    EXPECT_EQ(toUtf8(session.state().pageBox), "【5-8】");
    EXPECT_EQ(session.showPage(13), 1);
    EXPECT_EQ(toUtf8(session.state().pageBox), "【13-16】");
    EXPECT_EQ(session.showPage(21), std::nullopt);
    EXPECT_EQ(session.showPage(-1), std::nullopt);
}

} // namespace pelloric
