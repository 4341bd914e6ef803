// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"

#include "fakes/fake_object.h"
#include "platform/run_time_error.h"
#include "report/table_row_set.h"
#include "support/errors.h"
#include "support/recorded_pages.h"
#include "support/report_world.h"
#include "support/show_document.h"

#include <gtest/gtest.h>

#include <functional>

namespace pelloric {

namespace {

/// Remembers what it was told last of the paper and of the progress bar.
class Observer : public CanvasObserver {
public:
    explicit Observer(Canvas& canvas)
        : canvas_(canvas)
    {
        canvas.observe(*this);
    }

    void viewChanged() override
    {
        paper.push_back(canvas_.view().baseVisible);
        divisor = canvas_.view().divisor;
        building = canvas_.isBuilding();
    }

    void progressChanged() override { bars.push_back(canvas_.progress()); }

    std::vector<bool> paper;
    std::vector<ProgressBar> bars;
    float divisor = 0;
    bool building = false;

private:
    Canvas& canvas_;
};

/// A row set whose record of some number cannot be read.
class BrokenRows : public RowSet {
public:
    int fieldCount() const override { return 1; }
    TextView fieldName(int) const override { return u"A"; }
    std::int64_t recordCount() const override { return 100; }
    std::int64_t position() const override { return position_; }
    void setPosition(std::int64_t position) override { position_ = position; }
    Value value(int) override
    {
        if (position_ == 60)
            throw RunTimeError(ErrorNumber::InvalidCall, u"the record is gone");
        return Value::ofText(u"x");
    }

private:
    std::int64_t position_ = 7;
};

/// A message loop in which the host does something.
class BusyLoop : public MessageLoop {
public:
    void runOnce() override
    {
        if (action)
            action();
    }

    std::function<void()> action;
};

struct CanvasTest : ::testing::Test, ReportWorld {
    /// A canvas of its own whose message-loop passes a host uses.
    struct Busy {
        explicit Busy(FakePlatform& world)
            : platform { world.metrics, world.codec, world.messages, loop, world.clock,
                world.folders, world.files, world.printer, world.printers, world.library }
            , canvas(platform)
        {
        }

        BusyLoop loop;
        Platform platform;
        Canvas canvas;
    };

    TableGrid small() { return gridOf({ { u"A", 1000 }, { u"B", 1000 } }, numberedRows(3, 2)); }

    Observer observer { canvas };
};

} // namespace

TEST_F(CanvasTest, StartsWithOneEmptyPageAndTheStandardValues)
{
    EXPECT_EQ(canvas.page, PageSetup());
    EXPECT_EQ(canvas.Totalpages(), 1);
    EXPECT_EQ(canvas.Currentpage(), 1);
    EXPECT_EQ(canvas.document().pageCount(), 1);
    EXPECT_EQ(canvas.CurrentX(), 0);
    EXPECT_EQ(canvas.CurrentY(), 0);
    EXPECT_FALSE(canvas.bGetText);
    EXPECT_EQ(canvas.m_PrintObj, PrintObjKind::MSHFlexGrid);
    EXPECT_EQ(canvas.strSCliectRect, u"small");
    EXPECT_EQ(canvas.PageHeader, u"");
    EXPECT_EQ(canvas.DispScale(), 1);
    EXPECT_FALSE(canvas.ReSetLeftTop());
    EXPECT_EQ(canvas.WindowPages(), 0);
    EXPECT_EQ(canvas.WindowMinPage(), 0);
    EXPECT_EQ(canvas.WindowMaxPage(), 0);
    EXPECT_EQ(canvas.WindowOrderStyle(), OrderStyle::One);
    EXPECT_EQ(canvas.progress(), ProgressBar());
    EXPECT_EQ(canvas.table(), nullptr);
    EXPECT_FALSE(canvas.isBuilding());
    const ViewState& view = canvas.view();
    EXPECT_TRUE(view.portrait);
    EXPECT_EQ(view.grid, (PageGrid { 1, 1 }));
    EXPECT_FALSE(view.multiPage);
    EXPECT_FALSE(view.pan);
    EXPECT_FALSE(view.baseVisible);
    EXPECT_EQ(canvas.recorder().textFont(), Font());
    EXPECT_EQ(canvas.recorder().textColor(), 0);
}

TEST_F(CanvasTest, ShowsAMessageForAPageBehindTheLastOne)
{
    canvas.newPage();
    canvas.newPage();
    for (const auto page : std::initializer_list<std::int16_t> { 1, 2, 3 }) {
        canvas.setCurrentpage(page);
        EXPECT_EQ(canvas.Currentpage(), page);
    }
    canvas.setCurrentpage(2);
    canvas.setCurrentpage(4);
    EXPECT_EQ(canvas.Currentpage(), 2);
    EXPECT_EQ(messages.take(),
        (std::vector<Message> { { u"无下一页！", std::nullopt, MessageIcon::None } }));
}

TEST_F(CanvasTest, StoresAPageBelowOneAndFailsAtItsNextUse)
{
    canvas.setCurrentpage(0);
    EXPECT_EQ(canvas.Currentpage(), 0);
    EXPECT_EQ(errorOf([&] { canvas.recorder().printText(u"x", true); }),
        ErrorNumber::SubscriptOutOfRange);
    canvas.setCurrentpage(-3);
    EXPECT_EQ(canvas.Currentpage(), -3);
    EXPECT_EQ(errorOf([&] { canvas.showPage(); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { canvas.setCurrentpage(-32768); }), ErrorNumber::Overflow);
    EXPECT_EQ(canvas.Currentpage(), -3);
}

TEST_F(CanvasTest, LetsAHostWriteTotalpages)
{
    canvas.setTotalpages(5);
    canvas.setCurrentpage(5);
    EXPECT_EQ(canvas.Currentpage(), 5);
    EXPECT_EQ(errorOf([&] {
        canvas.recorder().lineTo({ 1, 1 });
    }),
        ErrorNumber::SubscriptOutOfRange);
}

TEST_F(CanvasTest, RefusesPage32768)
{
    for (int page = 1; page < 32767; ++page)
        canvas.newPage();
    EXPECT_EQ(canvas.Totalpages(), 32767);
    EXPECT_EQ(canvas.Currentpage(), 32767);
    EXPECT_EQ(errorOf([&] { canvas.newPage(); }), ErrorNumber::Overflow);
    EXPECT_EQ(canvas.Totalpages(), 32767);
}

TEST_F(CanvasTest, ClearsToOneEmptyPage)
{
    TableGrid grid = gridOf({ { u"A", 1000 } }, numberedRows(200, 1));
    canvas.doPreview(grid);
    ASSERT_GT(canvas.Totalpages(), 1);
    canvas.setCurrentX(5);
    canvas.clear();
    EXPECT_EQ(canvas.Totalpages(), 1);
    EXPECT_EQ(canvas.Currentpage(), 1);
    EXPECT_EQ(canvas.CurrentX(), 0);
    EXPECT_EQ(canvas.CurrentY(), 0);
    EXPECT_TRUE(canvas.document().texts(0).empty());
    EXPECT_FALSE(canvas.view().multiPage);
    ASSERT_NE(canvas.table(), nullptr);
    EXPECT_EQ(canvas.table()->ColumnWidths, (std::vector<double> { 1000 }));
    canvas.ReDrawZoom(grid);
    EXPECT_GT(canvas.Totalpages(), 1);
}

TEST_F(CanvasTest, BuildsWithTheSettingsOfTheMomentAndShowsPageOne)
{
    TableGrid grid = gridOf({ { u"A", 1000 } }, numberedRows(200, 1));
    canvas.doPreview(grid);
    const std::int16_t pages = canvas.Totalpages();
    EXPECT_EQ(canvas.Currentpage(), 1);
    EXPECT_EQ(canvas.WindowPages(), 0);
    EXPECT_EQ(canvas.WindowMinPage(), 0);
    EXPECT_EQ(canvas.WindowMaxPage(), pages - 1);
    EXPECT_EQ(canvas.WindowOrderStyle(), OrderStyle::One);
    EXPECT_TRUE(canvas.view().baseVisible);
    EXPECT_FALSE(canvas.progress().visible);
    ASSERT_EQ(observer.bars.size(), 202U);
    EXPECT_EQ(observer.bars.front(), (ProgressBar { true, 200, 0 }));
    EXPECT_EQ(observer.bars[200], (ProgressBar { true, 200, 200 }));
    EXPECT_FALSE(observer.bars.back().visible);
    EXPECT_FALSE(observer.paper.front());
    EXPECT_TRUE(observer.paper.back());
    EXPECT_EQ(loop.runs, 2);
    set({ { u"PagerHeight", u"600" } });
    canvas.doPreview(grid);
    EXPECT_LT(canvas.Totalpages(), pages);
    EXPECT_EQ(canvas.page.myHeight, 34020);
}

TEST_F(CanvasTest, IgnoresPageHeaderAndKeepsItForTheHost)
{
    canvas.PageHeader = u"a header";
    TableGrid grid = small();
    canvas.doPreview(grid);
    EXPECT_EQ(canvas.PageHeader, u"a header");
    EXPECT_EQ(textsOf(canvas.document(), 0).find("a header"), std::string::npos);
}

TEST_F(CanvasTest, RebuildsWithStyleAndWidthsAsItHoldsThem)
{
    TableGrid grid = small();
    EXPECT_EQ(errorOf([&] { canvas.ReDrawZoom(grid); }), ErrorNumber::ObjectMissing);
    EXPECT_EQ(errorOf([&] { canvas.Minimum(); }), ErrorNumber::ObjectMissing);
    EXPECT_EQ(errorOf([&] { canvas.Maximum(); }), ErrorNumber::ObjectMissing);
    canvas.doPreview(grid);
    canvas.Minimum();
    canvas.Minimum();
    EXPECT_EQ(canvas.style().body.font.size, 7.2900004F);
    EXPECT_EQ(canvas.table()->ColumnWidths, (std::vector<double> { 810, 810 }));
    set({ { u"FontSize", u"20" }, { u"GridHor", u"0" } });
    canvas.ReDrawZoom(grid);
    EXPECT_EQ(canvas.style().body.font.size, 7.2900004F);
    EXPECT_TRUE(canvas.style().GridHor);
    EXPECT_EQ(canvas.table()->tableWidth, 1620);
    EXPECT_EQ(grid.column(0).width, 1000);
    canvas.Maximum();
    EXPECT_EQ(canvas.style().body.font.size, static_cast<float>(7.2900004F * 1.1));
}

TEST_F(CanvasTest, RefusesToRebuildAnotherNumberOfColumns)
{
    TableGrid grid = small();
    canvas.doPreview(grid);
    const std::string before = showDocument(canvas.document());
    TableGrid other = gridOf({ { u"A", 1000 } }, {});
    EXPECT_EQ(errorOf([&] { canvas.ReDrawZoom(other); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(showDocument(canvas.document()), before);
    EXPECT_EQ(canvas.table()->fieldCount(), 2);
}

TEST_F(CanvasTest, LeavesTheDocumentAloneWhenNoColumnIsPrinted)
{
    TableGrid grid = small();
    canvas.doPreview(grid);
    const std::string before = showDocument(canvas.document());
    observer.paper.clear();
    TableGrid none = gridOf({ { u"A", 100 } }, {});
    canvas.doPreview(none);
    EXPECT_EQ(showDocument(canvas.document()), before);
    EXPECT_TRUE(canvas.view().baseVisible);
    EXPECT_EQ(observer.paper, (std::vector<bool> { false, true }));
    EXPECT_FALSE(canvas.isBuilding());
}

TEST_F(CanvasTest, LeavesTheDocumentAloneWhenTheUserCancelsAtEitherPass)
{
    TableGrid grid = small();
    canvas.doPreview(grid);
    canvas.showMuliPage(2);
    const std::string before = showDocument(canvas.document());
    const std::size_t surfaces = canvas.view().surfaces.size();
    for (const int pass : { 1, 2 }) {
        loop.runs = 0;
        loop.cancelAt = pass;
        observer.paper.clear();
        TableGrid other = gridOf({ { u"X", 2000 } }, numberedRows(500, 1));
        EXPECT_EQ(errorOf([&] { canvas.doPreview(other); }), ErrorNumber::Cancelled);
        EXPECT_EQ(showDocument(canvas.document()), before) << pass;
        EXPECT_FALSE(canvas.progress().visible);
        EXPECT_TRUE(canvas.view().baseVisible);
        EXPECT_EQ(canvas.view().surfaces.size(), surfaces);
        EXPECT_TRUE(observer.paper.back());
        EXPECT_FALSE(canvas.isBuilding());
        EXPECT_EQ(canvas.table()->fieldNames.front(), u"A");
    }
    canvas.recorder().printText(u"goes on", true);
    EXPECT_NE(textsOf(canvas.document(), 0).find("goes on"), std::string::npos);
}

TEST_F(CanvasTest, LeavesTheDocumentAloneWhenTheGridFailsOnTheWay)
{
    TableGrid grid = small();
    canvas.doPreview(grid);
    const std::string before = showDocument(canvas.document());
    BrokenRows rows;
    FakeDataGrid broken(Value::ofRows(rows), { 1000 });
    canvas.m_PrintObj = PrintObjKind::datagrid;
    EXPECT_EQ(errorOf([&] { canvas.doPreview(broken); }), ErrorNumber::InvalidCall);
    EXPECT_EQ(showDocument(canvas.document()), before);
    EXPECT_EQ(rows.position(), 7);
    EXPECT_FALSE(canvas.progress().visible);
    EXPECT_FALSE(observer.bars.back().visible);
    EXPECT_TRUE(canvas.view().baseVisible);
    EXPECT_EQ(errorOf([&] { canvas.doPreview(grid); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(showDocument(canvas.document()), before);
}

TEST_F(CanvasTest, KeepsTheDocumentWhenTheSettingsCannotBeLoaded)
{
    TableGrid grid = small();
    canvas.doPreview(grid);
    const std::string before = showDocument(canvas.document());
    set({ { u"Top", u"20" }, { u"PagerSizeValue", u"A4" } });
    EXPECT_EQ(errorOf([&] { canvas.doPreview(grid); }), ErrorNumber::TypeMismatch);
    std::filesystem::remove(folder.file("OstlConfig.ini"));
    EXPECT_EQ(errorOf([&] { canvas.doPreview(grid); }), ErrorNumber::FileNotFound);
    EXPECT_EQ(showDocument(canvas.document()), before);
}

TEST_F(CanvasTest, OverflowsAtPage32768AndLeavesTheDocumentAlone)
{
    TableGrid grid = small();
    canvas.doPreview(grid);
    const std::string before = showDocument(canvas.document());
    set({ { u"PagerHeight", u"1" }, { u"ShowHeaders", u"0" }, { u"GridHor", u"0" },
        { u"GridVer", u"0" } });
    TableGrid endless = gridOf({ { u"A", 1000 } }, numberedRows(32767, 1));
    EXPECT_EQ(errorOf([&] { canvas.doPreview(endless); }), ErrorNumber::Overflow);
    EXPECT_EQ(showDocument(canvas.document()), before);
    TableGrid most = gridOf({ { u"A", 1000 } }, numberedRows(32766, 1));
    canvas.doPreview(most);
    EXPECT_EQ(canvas.Totalpages(), 32767);
}

TEST_F(CanvasTest, ShowsItsPagesWhenTheTableIsGone)
{
    auto grid
        = std::make_unique<TableGrid>(gridOf({ { u"A", 1000 } }, { { u"first" }, { u"second" } }));
    canvas.doPreview(*grid);
    const std::string before = showDocument(canvas.document());
    grid.reset();
    EXPECT_EQ(showDocument(canvas.document()), before);
    EXPECT_EQ(textsOf(canvas.document(), 0), "A|first|second");
    const PageDocument moved = std::move(canvas.document());
    canvas.clear();
    EXPECT_EQ(textsOf(moved, 0), "A|first|second");
}

TEST_F(CanvasTest, PutsTheHostsCursorBackAfterABuild)
{
    canvas.m_PrintObj = PrintObjKind::datagrid;
    TableRowSet rows(std::make_shared<TextStore>());
    rows.appendField(u"A");
    for (int record = 0; record < 5; ++record)
        rows.addRecord();
    FakeDataGrid grid(Value::ofRows(rows), { 1000 });
    for (const std::int64_t position : { 0, 3, 6 }) {
        rows.setPosition(position);
        canvas.doPreview(grid);
        EXPECT_EQ(rows.position(), position);
    }
}

TEST_F(CanvasTest, PutsTheCursorOfALateBoundRowSetBack)
{
    canvas.m_PrintObj = PrintObjKind::datagrid;
    FakeRecords records({ u"A" }, { { u"1" }, { u"2" }, { u"3" } });
    FakeDataGrid grid(Value::ofObject(records), { 1000 });
    records.position = 2;
    canvas.doPreview(grid);
    EXPECT_EQ(textsOf(canvas.document(), 0), "A|1|2|3");
    EXPECT_EQ(records.position, 2);
    EXPECT_EQ(canvas.table()->rows, nullptr);
}

TEST_F(CanvasTest, PutsEveryKindOfLateBoundCursorBackWhereverItStood)
{
    canvas.m_PrintObj = PrintObjKind::datagrid;
    using Cursor = FakeRecords::Cursor;
    for (const Cursor cursor :
        { Cursor::Position, Cursor::Steps, Cursor::StepsWithoutMove, Cursor::Both }) {
        FakeRecords records({ u"A" }, { { u"1" }, { u"2" }, { u"3" }, { u"4" } }, cursor);
        FakeDataGrid grid(Value::ofObject(records), { 1000 });
        for (const int position : { 0, 1, 3, 4, 5 }) {
            records.position = position;
            canvas.doPreview(grid);
            EXPECT_EQ(textsOf(canvas.document(), 0), "A|1|2|3|4");
            EXPECT_EQ(records.position, position) << static_cast<int>(cursor);
        }
    }
}

TEST_F(CanvasTest, PrintsALateBoundRowSetInBandsAndMergedByItsStepsAlone)
{
    canvas.m_PrintObj = PrintObjKind::datagrid;
    set({ { u"GridMerge", u"1" } });
    FakeRecords records({ u"A", u"B" }, { { u"1", u"x" }, { u"1", u"y" }, { u"2", u"y" } },
        FakeRecords::Cursor::Steps);
    FakeDataGrid grid(Value::ofObject(records), { 8000, 8000 });
    canvas.doPreview(grid);
    EXPECT_EQ(textsOf(canvas.document(), 0), "A|1|2");
    EXPECT_EQ(textsOf(canvas.document(), 1), "B|x|y");
    EXPECT_EQ(records.position, 1);
}

TEST_F(CanvasTest, RefusesANestedBuildWithoutAWord)
{
    BusyLoop busy;
    Platform platform { metrics, codec, messages, busy, clock, folders, files, printer, printers,
        library };
    Canvas other(platform);
    TableGrid inner = gridOf({ { u"inner", 1000 } }, {});
    TableGrid outer = gridOf({ { u"outer", 1000 } }, {});
    int refused = 0;
    busy.action = [&] {
        EXPECT_TRUE(other.isBuilding());
        other.doPreview(inner);
        other.ReDrawZoom(inner);
        ++refused;
    };
    other.doPreview(outer);
    EXPECT_EQ(refused, 2);
    EXPECT_EQ(textsOf(other.document(), 0), "outer");
    EXPECT_FALSE(other.isBuilding());
}

TEST_F(CanvasTest, KeepsTheDocumentOfABuildFromItsHostWhileItRuns)
{
    BusyLoop busy;
    Platform platform { metrics, codec, messages, busy, clock, folders, files, printer, printers,
        library };
    Canvas other(platform);
    TableGrid grid = gridOf({ { u"title", 1000 } }, { { u"row" } });
    busy.action = [&] {
        if (!other.isBuilding())
            return;
        other.clear();
        other.newPage();
        other.OpenFile(folder.file("missing.ostl"));
        EXPECT_NO_THROW(other.Maximum());
    };
    other.doPreview(grid);
    EXPECT_EQ(textsOf(other.document(), 0), "title|row");
    EXPECT_EQ(other.Totalpages(), 1);
}

TEST_F(CanvasTest, IsNeitherSavedNorPrintedWhileItBuilds)
{
    Busy busy(*this);
    TableGrid grid = gridOf({ { u"title", 1000 } }, { { u"row" } });
    const auto path = folder.file("half.ostl");
    int passes = 0;
    busy.loop.action = [&] {
        ++passes;
        EXPECT_FALSE(busy.canvas.SaveFile(path));
        busy.canvas.doPrint(true, u"", 1);
        busy.canvas.printPage(1);
    };
    busy.canvas.doPreview(grid);
    EXPECT_EQ(passes, 2);
    EXPECT_FALSE(std::filesystem::exists(path));
    EXPECT_EQ(printer.log(), "");
    busy.loop.action = nullptr;
    EXPECT_TRUE(busy.canvas.SaveFile(path));
}

TEST_F(CanvasTest, LaysOutWithThePaperOfTheBeginningWhateverTheHostWritesMeanwhile)
{
    Busy busy(*this);
    TableGrid grid = gridOf({ { u"A", 1000 } }, numberedRows(200, 1));
    busy.canvas.doPreview(grid);
    const std::string before = showDocument(busy.canvas.document());
    int pass = 0;
    busy.loop.action = [&] {
        if (++pass < 2)
            return;
        busy.canvas.page.myHeight = 3000;
        busy.canvas.setVerticalDir(false);
        busy.canvas.setTotalpages(9);
        busy.canvas.setCurrentpage(0);
        busy.canvas.setCurrentX(1);
        busy.canvas.setCurrentY(1);
        busy.canvas.setPaper(u"A3");
    };
    busy.canvas.doPreview(grid);
    EXPECT_EQ(pass, 2);
    EXPECT_EQ(showDocument(busy.canvas.document()), before);
    EXPECT_TRUE(busy.canvas.view().portrait);
}

TEST_F(CanvasTest, ShowsAllPagesThatThereAreAfterTheMessages)
{
    Busy busy(*this);
    busy.canvas.setViewport(6000, 6000);
    addPages(busy.canvas.document(), 6);
    busy.loop.action = [&] {
        addPages(busy.canvas.document(), 62);
        busy.canvas.setVerticalDir(false);
    };
    busy.canvas.showAllPage();
    const ViewState& view = busy.canvas.view();
    ASSERT_EQ(view.surfaces.size(), 69U);
    EXPECT_EQ(view.surfaces[1].y - view.surfaces[0].y, 11907 + 200);
}

TEST_F(CanvasTest, PlacesTheWindowOfPagesByWhatThereIsAfterTheMessages)
{
    Busy busy(*this);
    addPages(busy.canvas.document(), 6);
    busy.canvas.SetShowStyle(2, 0, 1);
    busy.loop.action = [&] {
        busy.canvas.setVerticalDir(false);
        busy.canvas.SetShowStyle(4, 0, 3);
    };
    busy.canvas.showMuliPage(4);
    const ViewState& view = busy.canvas.view();
    ASSERT_EQ(view.surfaces.size(), 4U);
    EXPECT_EQ(view.surfaces[1].x - view.surfaces[0].x, 16840 + 200);
    EXPECT_EQ(view.surfaces[2].y - view.surfaces[0].y, 11907 + 200);
    // The scale is that of the fit before the messages, for two columns of portrait pages.
    EXPECT_FLOAT_EQ(view.divisor, 1 / std::max((15000.F - 200) / (2 * 11907), 8800.F / 33680));
}

TEST_F(CanvasTest, GoesOnAfterAFontThatIsTooLarge)
{
    TableGrid grid = small();
    for (const char16_t* const key : { u"FontSize", u"HeaderFontSize", u"FooterFontSize" }) {
        set({});
        canvas.doPreview(grid);
        const std::string before = showDocument(canvas.document());
        set({ { key, u"200000000" }, { u"PagerWidth", u"100" } });
        const Font font = canvas.recorder().textFont();
        EXPECT_EQ(errorOf([&] { canvas.doPreview(grid); }), ErrorNumber::Overflow);
        EXPECT_EQ(showDocument(canvas.document()), before);
        EXPECT_EQ(canvas.recorder().textFont(), font);
        EXPECT_EQ(canvas.page.myWidth, 11907);
        EXPECT_EQ(canvas.style().body.font.size, 9);
        set({});
        canvas.doPreview(grid);
        EXPECT_EQ(showDocument(canvas.document()), before);
        ASSERT_TRUE(canvas.SaveFile(folder.file("report.ostl")));
        EXPECT_EQ(errorOf([&] { canvas.clear(); }), std::nullopt);
        EXPECT_EQ(errorOf([&] { canvas.OpenFile(folder.file("report.ostl")); }), std::nullopt);
    }
}

TEST_F(CanvasTest, LeavesWidthsAndFontAloneWhenTheyCannotBeMadeLarger)
{
    TableGrid grid = small();
    canvas.doPreview(grid);
    std::optional<ErrorNumber> error;
    std::vector<double> widths;
    float size = 0;
    for (int step = 0; step < 300 && !error; ++step) {
        widths = canvas.table()->ColumnWidths;
        size = canvas.style().body.font.size;
        error = errorOf([&] { canvas.Maximum(); });
    }
    EXPECT_EQ(error, ErrorNumber::Overflow);
    EXPECT_EQ(canvas.table()->ColumnWidths, widths);
    EXPECT_EQ(canvas.style().body.font.size, size);
    EXPECT_EQ(canvas.recorder().textFont().size, size);
    canvas.doPreview(grid);
    EXPECT_EQ(canvas.style().body.font.size, 9);
    EXPECT_EQ(textsOf(canvas.document(), 0).substr(0, 3), "A|B");
}

TEST_F(CanvasTest, GivesPaperAndStyleBackWhenTheUserCancels)
{
    TableGrid grid = small();
    canvas.doPreview(grid);
    const PageSetup page = canvas.page;
    const ReportStyle style = canvas.style();
    set({ { u"PagerHeight", u"100" }, { u"Top", u"20" }, { u"FontSize", u"20" } });
    for (const int pass : { 1, 2 }) {
        loop.runs = 0;
        loop.cancelAt = pass;
        EXPECT_EQ(errorOf([&] { canvas.doPreview(grid); }), ErrorNumber::Cancelled);
        EXPECT_EQ(canvas.page, page);
        EXPECT_EQ(canvas.style(), style);
    }
}

TEST_F(CanvasTest, EndsAtTheRowAtWhichTheUserCancels)
{
    TableGrid grid = small();
    canvas.doPreview(grid);
    const std::string before = showDocument(canvas.document());
    const PageSetup page = canvas.page;
    set({ { u"PagerHeight", u"100" } });
    TableGrid other = gridOf({ { u"X", 2000 } }, numberedRows(500, 1));
    loop.beats = 0;
    canvas.doPreview(grid);
    const int beatsOfThreeRows = loop.beats;
    EXPECT_GE(beatsOfThreeRows, 3);
    EXPECT_LT(beatsOfThreeRows, 20);
    canvas.doPreview(grid);
    for (const int beat : { 1, 20, 500 }) {
        set({ { u"PagerHeight", u"200" } });
        canvas.doPreview(grid);
        const std::string now = showDocument(canvas.document());
        const PageSetup held = canvas.page;
        set({ { u"PagerHeight", u"100" } });
        loop.beats = 0;
        loop.cancelAtBeat = beat;
        EXPECT_EQ(errorOf([&] { canvas.doPreview(other); }), ErrorNumber::Cancelled);
        loop.cancelAtBeat = 0;
        EXPECT_EQ(showDocument(canvas.document()), now) << beat;
        EXPECT_EQ(canvas.page, held);
        EXPECT_FALSE(canvas.progress().visible);
        EXPECT_FALSE(observer.building);
        EXPECT_FALSE(canvas.isBusy());
    }
    EXPECT_NE(page.myHeight, canvas.page.myHeight);
}

TEST_F(CanvasTest, EndsAPrintJobBetweenTwoPagesWhenTheUserCancels)
{
    addPages(canvas.document(), 4);
    loop.beats = 0;
    loop.cancelAtBeat = 2;
    EXPECT_EQ(errorOf([&] { canvas.doPrint(true, u"", 1); }), ErrorNumber::Cancelled);
    EXPECT_NE(printer.log().find("title page 2"), std::string::npos);
    EXPECT_EQ(printer.log().find("title page 3"), std::string::npos);
    EXPECT_FALSE(canvas.progress().visible);
    EXPECT_FALSE(canvas.isPrinting());
    printer.forget();
    loop.cancelAtBeat = 0;
    loop.beats = 0;
    canvas.doPrint(true, u"", 1);
    EXPECT_EQ(loop.beats, 4); // between the five pages
}

TEST_F(CanvasTest, RefusesMembersThatChangeTheDocumentWhileItPrints)
{
    class PrintingLoop : public MessageLoop {
    public:
        void runOnce() override { }
        void keepAlive() override { action(); }
        std::function<void()> action;
    };
    PrintingLoop printing;
    Platform platform { metrics, codec, messages, printing, clock, folders, files, printer,
        printers, library };
    Canvas other(platform);
    addPages(other.document(), 2);
    TableGrid grid = small();
    int beats = 0;
    printing.action = [&] {
        ++beats;
        EXPECT_TRUE(other.isPrinting());
        other.clear();
        other.newPage();
        other.doPreview(grid);
        other.doPrint(true, u"", 1);
        other.setCurrentpage(1);
        EXPECT_FALSE(other.SaveFile(folder.file("x.ostl")));
    };
    other.doPrint(true, u"", 1);
    EXPECT_EQ(beats, 2);
    EXPECT_EQ(other.Totalpages(), 3);
    EXPECT_EQ(other.Currentpage(), 3);
}

TEST_F(CanvasTest, KeepsTheSizeThatTheViewportGotDuringAFailedBuild)
{
    Busy busy(*this);
    TableGrid grid = small();
    busy.canvas.doPreview(grid);
    busy.loop.action = [&] { busy.canvas.setViewport(7000, 5000); };
    set({ { u"FontSize", u"200000000" } });
    EXPECT_EQ(errorOf([&] { busy.canvas.doPreview(grid); }), ErrorNumber::Overflow);
    EXPECT_EQ(busy.canvas.view().viewportWidth, 7000);
    EXPECT_EQ(busy.canvas.view().viewportHeight, 5000);
}

TEST_F(CanvasTest, SavesAndOpensADocumentAndShowsItsFirstPage)
{
    TableGrid grid = gridOf({ { u"A", 1000 } }, numberedRows(100, 1));
    canvas.doPreview(grid);
    canvas.setCurrentpage(2);
    const auto path = folder.file("report.ostl");
    EXPECT_TRUE(canvas.SaveFile(path));
    EXPECT_FALSE(canvas.progress().visible);
    const std::int16_t pages = canvas.Totalpages();
    canvas.clear();
    canvas.page.intTop = 77;
    canvas.OpenFile(path);
    EXPECT_EQ(canvas.Totalpages(), pages);
    EXPECT_EQ(canvas.Currentpage(), 1);
    EXPECT_EQ(canvas.WindowMaxPage(), pages - 1);
    EXPECT_EQ(canvas.page.intTop, 77);
    EXPECT_EQ(canvas.document().text(0, 0).prnFont.name, u"0");
}

TEST_F(CanvasTest, SavesSilentlyWhereNothingCanBeWritten)
{
    addSampleRecords(canvas.document());
    EXPECT_FALSE(canvas.SaveFile(folder.file("none") / "report.ostl"));
    EXPECT_FALSE(canvas.progress().visible);
}

TEST_F(CanvasTest, ClearsBeforeItOpensAFileThatIsMissingOrBroken)
{
    addSampleRecords(canvas.document());
    EXPECT_EQ(
        errorOf([&] { canvas.OpenFile(folder.file("none.ostl")); }), ErrorNumber::FileNotFound);
    EXPECT_TRUE(canvas.document().texts(0).empty());
    addSampleRecords(canvas.document());
    canvas.OpenFile(folder.write("broken.ostl", "nothing of the kind\r\n"));
    EXPECT_TRUE(canvas.document().texts(0).empty());
    EXPECT_EQ(messages.take(),
        (std::vector<Message> { { u"文件格式不正确，打开失败", u"提示", MessageIcon::Critical } }));
}

TEST_F(CanvasTest, ShowsAMessageForAnUnknownPaper)
{
    canvas.setPaper(u"A4");
    EXPECT_EQ(canvas.page.myHeight, 16440);
    EXPECT_EQ(canvas.page.myWidth, 11507);
    canvas.setPaper(u"a4");
    EXPECT_EQ(messages.take(),
        (std::vector<Message> { { u"非法纸张参数！", std::nullopt, MessageIcon::Critical } }));
    EXPECT_EQ(canvas.page.myWidth, 11507);
}

TEST_F(CanvasTest, HidesTheProgressBarWhenThePrinterFails)
{
    class FailingPrinter : public FakePrinter {
    public:
        void endDoc() override { throw RunTimeError(ErrorNumber::InvalidCall); }
    };
    FailingPrinter failing;
    Platform platform { metrics, codec, messages, loop, clock, folders, files, failing, printers,
        library };
    Canvas other(platform);
    EXPECT_EQ(errorOf([&] { other.doPrint(true, u"", 1); }), ErrorNumber::InvalidCall);
    EXPECT_FALSE(other.progress().visible);
}

TEST_F(CanvasTest, TellsItsObserverOfWhatAFailedMemberLeft)
{
    addPages(canvas.document(), 9999);
    canvas.setDispScale(1);
    observer.divisor = 0;
    // The scroll range of so many pages is too long, but the pages are placed by then.
    EXPECT_EQ(errorOf([&] { canvas.showAllPage(); }), ErrorNumber::Overflow);
    EXPECT_EQ(canvas.view().surfaces.size(), 10'000U);
    EXPECT_EQ(observer.divisor, canvas.view().divisor);
    EXPECT_TRUE(observer.paper.back());

    canvas.document().currentPage = -5;
    observer.paper.clear();
    EXPECT_EQ(errorOf([&] { canvas.showPage(); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(observer.paper.size(), 1U);
}

TEST(Canvas, WithSettingsOfItsOwnReadsNoFileAndTakesItsChanges)
{
    ReportWorld world;
    std::filesystem::remove(world.folder.file("OstlConfig.ini"));
    ReportSettings settings;
    settings.body.name = u"Sans";
    settings.topMm = 20;
    world.canvas.useSettings(settings);
    TableGrid grid = gridOf({ { u"A", 1000 } }, numberedRows(3, 1));
    world.canvas.doPreview(grid);
    EXPECT_EQ(world.canvas.style().body.font.name, u"Sans");
    EXPECT_EQ(world.canvas.page.intTop, 1814);
    world.canvas.ownSettings()->topMm = 10;
    world.canvas.doPreview(grid);
    EXPECT_EQ(world.canvas.page.intTop, 907);
    EXPECT_EQ(world.folder.names().size(), 0U);
    world.canvas.useSettings(std::nullopt);
    EXPECT_EQ(errorOf([&] { world.canvas.doPreview(grid); }), ErrorNumber::FileNotFound);
}

} // namespace pelloric
