// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/shaped_report.h"

#include "platform/cell_look.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "support/errors.h"
#include "support/recorded_pages.h"
#include "support/report_world.h"
#include "support/show_document.h"

#include <gtest/gtest.h>

#include <cmath>
#include <map>
#include <random>

namespace pelloric {

namespace {

/// A table of texts that also shows its cells in some way.
class ShownGrid final : public AutomationObject, public CellLooks {
public:
    explicit ShownGrid(TableGrid grid)
        : grid_(std::move(grid))
    {
    }

    std::optional<MemberId> findMember(TextView name) override { return grid_.findMember(name); }
    const void* memberTable() const override { return grid_.memberTable(); }

    Value get(MemberId member, std::span<const Value> arguments) override
    {
        return grid_.get(member, arguments);
    }

    void put(MemberId member, std::span<const Value> arguments, const Value& value) override
    {
        grid_.put(member, arguments, value);
    }

    CellLooks* cellLooks() override { return this; }

    CellLook& look(std::int32_t row, std::int32_t column) { return looks_[{ row, column }]; }

    GridLook grid {};
    std::vector<std::int32_t> marked;

private:
    GridLook gridLook() override { return grid; }

    void readLook(std::int32_t row, std::int32_t column, CellLook& look) override
    {
        const auto found = looks_.find({ row, column });
        look = found != looks_.end() ? found->second : CellLook {};
    }

    TextView text(std::int32_t row, std::int32_t column) override
    {
        return grid_.cell(row - 1, column);
    }

    CellAlignment titleAlignment(std::int32_t) override { return CellAlignment::Right; }

    bool isMarked(std::int32_t row) override
    {
        return std::find(marked.begin(), marked.end(), row) != marked.end();
    }

    std::optional<double> number(std::int32_t, std::int32_t) override { return std::nullopt; }

    TableGrid grid_;
    std::map<std::pair<std::int32_t, std::int32_t>, CellLook> looks_;
};

class ShapedReportTest : public testing::Test, protected ReportWorld {
protected:
    ShapedReportTest() { canvas.m_PrintObj = PrintObjKind::MSFlexGrid; }

    /// The texts of a page, in the order in which they were recorded.
    std::string page(int number) { return textsOf(canvas.document(), number - 1); }

    Twips widthOf(const TextRecord& text)
    {
        const Font& font = canvas.document().style(text.style).font;
        FaceMetrics& face = services().metrics.face(font.name, font.bold, font.italic);
        return roundToInt32(textWidth(face.advanceOf(text.text()), font.size));
    }

    std::vector<TextRecord> textsOn(int number)
    {
        const auto texts = canvas.document().texts(number - 1);
        return { texts.begin(), texts.end() };
    }
};

std::vector<TableColumn> columnsOf(int count, Twips width)
{
    std::vector<TableColumn> columns;
    for (int column = 1; column <= count; ++column)
        columns.push_back({ u"C" + decimal(column), width });
    return columns;
}

} // namespace

TEST_F(ShapedReportTest, IsThePlainReportWhereItIsAskedForNothingThatShows)
{
    struct Case {
        TableGrid grid;
        std::vector<Change> settings;
    };
    std::vector<Case> cases;
    cases.push_back({ gridOf(columnsOf(3, 2000), numberedRows(7, 3)), {} });
    cases.push_back({ gridOf(columnsOf(12, 2100), numberedRows(100, 12)), {} });
    cases.push_back({ gridOf(columnsOf(2, 700),
                          { { u"a wide text of words", u"x\ny" }, { u"", u"★ typed" },
                              { u"  blanks ", u"中文 text that is wrapped" } }),
        {} });
    cases.push_back({ gridOf(columnsOf(3, 5000),
                          { { u"A", u"A", u"B" }, { u"A", u"C", u"C" }, { u"B", u"C", u"C" } }),
        { { u"GridMerge", u"1" } } });
    cases.push_back({ gridOf(columnsOf(2, 2000), numberedRows(60, 2)),
        { { u"ShowHeaders", u"0" }, { u"HeaderLeft", u"[Page #]" }, { u"GridVer", u"0" },
            { u"FooterRight", u"foot" } } });
    cases.push_back({ gridOf(columnsOf(2, 2000), {}), { { u"ShowHeaders", u"1" } } });
    for (Case& one : cases) {
        set(one.settings);
        canvas.options = {};
        canvas.doPreview(one.grid);
        const std::string plain = showDocument(canvas.document());
        canvas.options.keepsGroups = true; // without groups
        canvas.doPreview(one.grid);
        EXPECT_EQ(showDocument(canvas.document()), plain);
        canvas.options = {};
        canvas.options.pageOrder = PageOrder::DownThenAcross;
        canvas.doPreview(one.grid);
        if (canvas.table()->ColumnBands.size() == 1) {
            EXPECT_EQ(showDocument(canvas.document()), plain);
        }
    }
}

TEST(ReportOptions, AreAllOffAtFirst)
{
    const ReportOptions options;
    EXPECT_FALSE(options.choosesCells());
    EXPECT_FALSE(options.shapesPages(true));
    EXPECT_FALSE(options.watermark.isAsked());
    EXPECT_TRUE(options.logo.imageFile.empty());
}

TEST_F(ShapedReportTest, RepeatsKeyColumnsAtTheLeftOfEveryBand)
{
    TableGrid grid = gridOf(columnsOf(6, 3000), numberedRows(2, 6));
    canvas.options.keyColumns = 1;
    canvas.doPreview(grid);
    ASSERT_EQ(canvas.Totalpages(), 3);
    EXPECT_EQ(page(1), "C1|C2|C3|r1c1|r1c2|r1c3|r2c1|r2c2|r2c3");
    EXPECT_EQ(page(2), "C1|C4|C5|r1c1|r1c4|r1c5|r2c1|r2c4|r2c5");
    EXPECT_EQ(page(3), "C1|C6|r1c1|r1c6|r2c1|r2c6");
    canvas.options = {};
    canvas.options.keyColumnNames = { u"C3" };
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C3|C1|C2|r1c3|r1c1|r1c2|r2c3|r2c1|r2c2");
}

TEST_F(ShapedReportTest, ABandHoldsAColumnBesideItsKeys)
{
    TableGrid grid = gridOf(columnsOf(4, 6000), numberedRows(1, 4));
    canvas.options.keyColumns = 2;
    canvas.doPreview(grid);
    ASSERT_EQ(canvas.Totalpages(), 2);
    EXPECT_EQ(page(1), "C1|C2|C3|r1c1|r1c2|r1c3");
    EXPECT_EQ(page(2), "C1|C2|C4|r1c1|r1c2|r1c4");
}

TEST_F(ShapedReportTest, NarrowsColumnsThatWouldLeaveThePaper)
{
    struct Case {
        std::vector<Twips> widths;
        int keys;
        bool isFitted;
        int pages;
        std::vector<Twips> edges; ///< of the first page's vertical lines
    };
    // 11907 wide with 680 at the sides: 10547 are left, less one so that a table fits.
    const std::vector<Case> cases {
        { { 30000 }, 0, true, 1, { 680, 11226 } },
        { { 30000 }, 0, false, 1, { -9046, 20954 } }, // the plain page
        { { 2000, 30000 }, 0, true, 2, { 4954, 6954 } },
        { { 30000, 2000 }, 1, false, 1, { 680, 9226, 11226 } },
        { { 2000, 30000 }, 1, false, 1, { 680, 2680, 11226 } },
        { { 3000, 9000, 6000, 500 }, 2, false, 2, { 680, 3317, 5953, 11226 } },
        { { 30000, 500 }, 2, false, 1, { 680, 10726, 11226 } }, // all are keys
    };
    for (const Case& expected : cases) {
        std::vector<TableColumn> columns;
        for (const Twips width : expected.widths)
            columns.push_back({ u"C" + decimal(std::ssize(columns) + 1), width });
        TableGrid grid = gridOf(columns, numberedRows(1, static_cast<int>(columns.size())));
        canvas.options = {};
        canvas.options.keyColumns = expected.keys;
        canvas.options.fit.toSheet = expected.isFitted;
        canvas.doPreview(grid);
        SCOPED_TRACE(expected.widths[0]);
        EXPECT_EQ(canvas.fit().pagesAcross, expected.pages);
        EXPECT_EQ(canvas.Totalpages(), expected.pages);
        EXPECT_EQ(canvas.fit().rule, expected.isFitted ? FitRule::Bands : FitRule::NotAsked);
        std::vector<Twips> edges;
        for (std::size_t at = 0; at < canvas.document().lines(0).size(); ++at) {
            const Lineobj line = canvas.document().line(0, at);
            if (line.pt1.x == line.pt2.x && std::ranges::find(edges, line.pt1.x) == edges.end())
                edges.push_back(line.pt1.x);
        }
        EXPECT_EQ(edges.size(), expected.edges.size());
        for (std::size_t at = 0; at < std::min(edges.size(), expected.edges.size()); ++at)
            EXPECT_NEAR(edges[at], expected.edges[at], 1);
    }
}

TEST_F(ShapedReportTest, IsFittedWithOneRowAndWithNone)
{
    for (const int rows : { 1, 0 }) {
        TableGrid grid = gridOf(columnsOf(5, 2900), numberedRows(rows, 5));
        canvas.options = {};
        canvas.options.fit.toSheet = true;
        canvas.options.keyColumns = 1;
        canvas.options.totals = { { u"C2", AggregateFunction::Count } };
        canvas.doPreview(grid);
        EXPECT_EQ(canvas.Totalpages(), 1);
        EXPECT_EQ(canvas.fit(), (FitResult { FitRule::Landscape, 1, true, 1 }));
        EXPECT_EQ(canvas.printedRows(), rows);
        EXPECT_EQ(page(1),
            rows == 0 ? "C1|C2|C3|C4|C5"
                      : "C1|C2|C3|C4|C5|r1c1|r1c2|r1c3|r1c4|r1c5|Total: Count|1");
    }
}

TEST_F(ShapedReportTest, PrintsTitlesAloneWhereNothingIsChosen)
{
    ShownGrid grid(gridOf(columnsOf(2, 2900), numberedRows(5, 2)));
    canvas.options.whereColumn = u"C1";
    canvas.options.whereText = u"nowhere";
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C1|C2");
    EXPECT_EQ(canvas.printedRows(), 0);
    canvas.options = {};
    canvas.options.rows = RowChoice::Range;
    canvas.options.firstRow = 9;
    canvas.options.lastRow = 12;
    canvas.doPreview(grid);
    EXPECT_EQ(canvas.printedRows(), 0);
    canvas.options.firstRow = -3;
    canvas.options.lastRow = 1;
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C1|C2|r1c1|r1c2");
}

TEST_F(ShapedReportTest, TellsColumnsOfOneTitleApartAndNamesThoseThereAre)
{
    TableGrid grid
        = gridOf({ { u"A", 2000 }, { u"A", 2000 }, { u"", 2000 } }, { { u"1", u"2", u"3" } });
    canvas.options.columns = { u"A1", u"NULL2", u"A", u"A1" };
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "A1|NULL2|A|2|3|1");
    canvas.options = {};
    canvas.options.keyColumnNames = { u"B" };
    try {
        canvas.doPreview(grid);
        FAIL() << "there is no such column";
    } catch (const RunTimeError& error) {
        EXPECT_NE(
            toUtf8(error.text()).find("the grid prints no column \"B\"; there are: A, A1, NULL2"),
            std::string::npos)
            << toUtf8(error.text());
    }
}

TEST_F(ShapedReportTest, GoesDownBeforeItGoesAcross)
{
    TableGrid grid = gridOf(columnsOf(2, 8000), numberedRows(60, 2));
    canvas.doPreview(grid);
    const int pages = canvas.Totalpages();
    ASSERT_EQ(pages % 2, 0);
    std::vector<std::string> across;
    for (int number = 1; number <= pages; ++number)
        across.push_back(page(number));
    canvas.options.pageOrder = PageOrder::DownThenAcross;
    canvas.doPreview(grid);
    ASSERT_EQ(canvas.Totalpages(), pages);
    for (int number = 0; number < pages / 2; ++number) {
        EXPECT_EQ(page(number + 1), across[static_cast<std::size_t>(2 * number)]);
        EXPECT_EQ(page(pages / 2 + number + 1), across[static_cast<std::size_t>(2 * number + 1)]);
    }
}

TEST_F(ShapedReportTest, PrintsTheColumnsThatAreNamedInTheirOrder)
{
    TableGrid grid = gridOf(columnsOf(3, 1500), numberedRows(2, 3));
    canvas.options.columns = { u"C3", u"C1" };
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C3|C1|r1c3|r1c1|r2c3|r2c1");
    canvas.options.columns = { u"C9" };
    EXPECT_EQ(errorOf([&] { canvas.doPreview(grid); }), ErrorNumber::InvalidCall);
    EXPECT_EQ(page(1), "C3|C1|r1c3|r1c1|r2c3|r2c1") << "the old document stays";
}

TEST_F(ShapedReportTest, PrintsARangeOfRowsThoseThatAFilterTakesAndThoseThatAreMarked)
{
    ShownGrid grid(gridOf(columnsOf(1, 1500), numberedRows(9, 1)));
    canvas.options.rows = RowChoice::Range;
    canvas.options.firstRow = 3;
    canvas.options.lastRow = 5;
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C1|r3c1|r4c1|r5c1");
    canvas.options.filter = [](std::int64_t row, std::span<const TextView> texts) {
        return row % 2 == 1 && texts[0] != u"r5c1";
    };
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C1|r3c1");
    canvas.options = {};
    canvas.options.rows = RowChoice::Marked;
    try {
        canvas.doPreview(grid);
        FAIL() << "nothing is marked";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::InvalidCall);
        EXPECT_EQ(toUtf8(error.detail()), "no row of the grid is marked; mark rows, or print all");
    }
    grid.marked = { 2, 7 };
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C1|r2c1|r7c1");
}

TEST_F(ShapedReportTest, BringsATableOntoTheSheetByTheFirstRuleThatDoes)
{
    struct Case {
        int columns;
        FitRule rule;
        int pages;
        bool isTurned;
    };
    // The sheet is 11907 x 16840 with 680 at the sides; the body has 9 points, so 6 are two thirds.
    for (const Case& expected :
        { Case { 3, FitRule::AsItIs, 1, false }, Case { 5, FitRule::Landscape, 1, true },
            Case { 7, FitRule::Shrunk, 1, true }, Case { 9, FitRule::Bands, 3, false } }) {
        set({ { u"FontSize", u"9" } });
        TableGrid grid = gridOf(columnsOf(expected.columns, 2900), numberedRows(2, 2));
        canvas.options = {};
        canvas.options.fit.toSheet = true;
        canvas.doPreview(grid);
        EXPECT_EQ(canvas.fit().rule, expected.rule) << expected.columns;
        EXPECT_EQ(canvas.fit().isTurned, expected.isTurned) << expected.columns;
        EXPECT_EQ(canvas.Totalpages(), expected.pages) << expected.columns;
        EXPECT_EQ(canvas.page.myWidth > canvas.page.myHeight, expected.isTurned);
        const float size = canvas.document().style(textsOn(1).back().style).font.size;
        EXPECT_NEAR(size, 9 * canvas.fit().scale, 0.001);
        EXPECT_GE(size, 6);
    }
}

TEST_F(ShapedReportTest, FitsAZoomedReportAnewFromThePaperThatWasChosen)
{
    set({ { u"FontSize", u"9" } });
    TableGrid grid = gridOf(columnsOf(4, 2900), numberedRows(2, 2));
    canvas.options = {};
    canvas.options.fit.toSheet = true;
    canvas.doPreview(grid);
    const std::int16_t upright = 1;
    const auto zoomed = [&](void (Canvas::*zoom)(), int times) {
        for (int time = 0; time < times; ++time)
            (canvas.*zoom)();
        canvas.ReDrawZoom(grid);
        const bool lies = canvas.page.myWidth > canvas.page.myHeight;
        EXPECT_EQ(lies, canvas.fit().isTurned);
        EXPECT_EQ(lies, canvas.style().PagerOrientation != upright);
        return canvas.fit().rule;
    };
    ASSERT_EQ(canvas.fit().rule, FitRule::Landscape);
    EXPECT_EQ(zoomed(&Canvas::Minimum, 0), FitRule::Landscape);
    EXPECT_TRUE(canvas.fit().isTurned);
    EXPECT_EQ(zoomed(&Canvas::Minimum, 2), FitRule::AsItIs);
    EXPECT_EQ(zoomed(&Canvas::Maximum, 2), FitRule::Landscape);
    EXPECT_EQ(zoomed(&Canvas::Maximum, 5), FitRule::Shrunk);
    EXPECT_TRUE(canvas.fit().isTurned);
    canvas.options.fit.toSheet = false;
    EXPECT_EQ(zoomed(&Canvas::Minimum, 7), FitRule::NotAsked);
    canvas.page.myWidth = 16840; // the host chooses lying paper itself
    canvas.page.myHeight = 11907;
    canvas.ReDrawZoom(grid);
    EXPECT_EQ(canvas.page.myWidth, 16840);
}

TEST_F(ShapedReportTest, ShrinksToAsManyPagesAcrossAsAreAskedFor)
{
    TableGrid grid = gridOf(columnsOf(9, 2900), numberedRows(2, 9));
    for (const int pages : { 3, 2 }) {
        canvas.options.fit.pagesAcross = pages;
        canvas.options.fit.leastSize = 1;
        canvas.options.fit.leastScale = 0.1;
        canvas.doPreview(grid);
        EXPECT_EQ(canvas.Totalpages(), pages);
        EXPECT_FALSE(canvas.fit().isTurned);
    }
    EXPECT_EQ(canvas.fit().rule, FitRule::Shrunk);
    canvas.options.fit.leastScale = 0.9;
    canvas.doPreview(grid);
    EXPECT_EQ(canvas.fit().rule, FitRule::Bands);
    EXPECT_EQ(canvas.Totalpages(), 3);
}

TEST_F(ShapedReportTest, AddsTotalsBehindEveryGroupAndAtTheEnd)
{
    TableGrid grid = gridOf({ { u"Kind", 2000 }, { u"Name", 2000 }, { u"Price", 2000 } },
        { { u"fruit", u"pear", u"0.1" }, { u"fruit", u"plum", u"0.2" }, { u"nut", u"", u"n/a" },
            { u"nut", u"pecan", u"3" } });
    canvas.options.groupColumns = { u"Kind" };
    canvas.options.totals = { { u"Price", AggregateFunction::Sum },
        { u"Name", AggregateFunction::Count }, { u"Price", AggregateFunction::Maximum } };
    canvas.doPreview(grid);
    EXPECT_EQ(page(1),
        "Kind|Name|Price|fruit|pear|0.1|fruit|plum|0.2|"
        "fruit: Sum|0.3|fruit: Count|2|fruit: Maximum|0.2|"
        "nut||n/a|nut|pecan|3|nut: Sum|3|nut: Count|1|nut: Maximum|3|"
        "Total: Sum|3.3|Total: Count|3|Total: Maximum|3.0");
}

TEST_F(ShapedReportTest, CallsTotalsAsTheLanguageInForceOrTheHostDoes)
{
    const auto lastTexts = [this](const TotalWords& words) {
        ReportOptions options;
        options.groupColumns = { u"Kind" };
        options.totals = { { u"Pieces" }, { u"Pieces", AggregateFunction::Count } };
        options.totalWords = words;
        canvas.options = options;
        TableGrid grid({ { u"Kind", 3000 }, { u"Pieces", 3000 } });
        grid.addRow(std::vector<TextView> { u"nut", u"3" });
        canvas.doPreview(grid);
        return page(1).substr(std::string("Kind|Pieces|nut|3|").size());
    };
    EXPECT_EQ(lastTexts({}), "nut: Sum|3|nut: Count|1|Total: Sum|3|Total: Count|1");
    usePhraseTranslator(+[](TextView english) { return u"<" + Text(english) + u">"; });
    const std::string translated = lastTexts({});
    const std::string own = lastTexts({ .total = u"Alles", .sum = u"zusammen" });
    usePhraseTranslator(nullptr);
    EXPECT_EQ(translated, "nut: <Sum>|3|nut: <Count>|1|<Total>: <Sum>|3|<Total>: <Count>|1");
    EXPECT_EQ(own, "nut: zusammen|3|nut: <Count>|1|Alles: zusammen|3|Alles: <Count>|1");
}

TEST_F(ShapedReportTest, ReadsAndWritesTheNumbersOfTotalsAsTheTableShowsThem)
{
    struct Case {
        std::vector<Text> cells;
        std::string inPointLocale; ///< sum, mean, minimum and maximum
        std::string inCommaLocale;
    };
    const std::vector<Case> cases {
        { { u"12.50", u"12.50" }, "25.00 12.50 12.50 12.50", "25.00 12.50 12.50 12.50" },
        { { u"12,50", u"0,25" }, "12,75 6,375 0,25 12,50", "12,75 6,375 0,25 12,50" },
        { { u"1,234.50", u"12.5", u"7" }, "1,254.00 418.00 7.00 1,234.50",
            "1,254.00 418.00 7.00 1,234.50" },
        { { u"1.234,50", u"2" }, "1.236,50 618,25 2,00 1.234,50", "1.236,50 618,25 2,00 1.234,50" },
        { { u"1", u"2" }, "3 1.5 1 2", "3 1,5 1 2" },
        { { u"1", u"1", u"2" }, "4 1.33 1 2", "4 1,33 1 2" },
        { { u"1,234", u"1" }, "1,235 617.5 1 1,234", "2,234 1,117 1,000 1,234" },
        { { u"1,234", u"0.5" }, "1,234.5 617.25 0.5 1,234.0", "1,234.5 617.25 0.5 1,234.0" },
        { { u"1,234", u"0,5" }, "1,734 0,867 0,500 1,234", "1,734 0,867 0,500 1,234" },
        { { u"999,999.99", u"0.02" }, "1,000,000.01 500,000.005 0.02 999,999.99",
            "1,000,000.01 500,000.005 0.02 999,999.99" },
        { { u"-0.10", u"0.1" }, "0.00 0.00 -0.10 0.10", "0.00 0.00 -0.10 0.10" },
        { { u"12,50 €", u"(2,50 €)" }, "10,00 5,00 -2,50 12,50", "10,00 5,00 -2,50 12,50" },
    };
    for (const Case& expected : cases) {
        std::vector<std::vector<Text>> rows;
        for (const Text& cell : expected.cells)
            rows.push_back({ u"x", cell });
        TableGrid grid = gridOf({ { u"A", 3000 }, { u"B", 4000 } }, rows);
        canvas.options.totals
            = { { u"B", AggregateFunction::Sum }, { u"B", AggregateFunction::Mean },
                  { u"B", AggregateFunction::Minimum }, { u"B", AggregateFunction::Maximum } };
        for (const char16_t locale : { u'.', u',' }) {
            services().decimalSeparator = locale;
            canvas.doPreview(grid);
            std::string totals;
            const auto texts = textsOn(1);
            for (std::size_t at = texts.size() - 7; at < texts.size(); at += 2)
                totals += (totals.empty() ? "" : " ") + toUtf8(texts[at].text());
            const std::string& wanted
                = locale == u'.' ? expected.inPointLocale : expected.inCommaLocale;
            EXPECT_EQ(totals, wanted) << toUtf8(expected.cells[0]);
            EXPECT_TRUE(canvas.leftOut().empty());
        }
    }
}

TEST_F(ShapedReportTest, CountsWhatTotalsLeaveOutAndLeavesATotalOfNoNumberBlank)
{
    TableGrid grid = gridOf({ { u"A", 2000 }, { u"B", 2000 }, { u"C", 2000 } },
        { { u"1.50", u"x", u"" }, { u"n/a", u"y", u"" }, { u"", u"", u"" },
            { u"12:30", u"12.05.2024", u"" } });
    canvas.options.totals = { { u"A", AggregateFunction::Mean }, { u"B", AggregateFunction::Sum },
        { u"A", AggregateFunction::Sum }, { u"C", AggregateFunction::Maximum },
        { u"B", AggregateFunction::Count } };
    canvas.doPreview(grid);
    EXPECT_NE(page(1).find("Total: Mean 1.50|Total: Sum 1.50|Total: Maximum|Total: Count|3"),
        std::string::npos)
        << page(1);
    EXPECT_EQ(canvas.leftOut(), (std::vector<LeftOut> { { u"A", 2 }, { u"B", 3 } }));
    canvas.options = {};
    canvas.doPreview(grid);
    EXPECT_TRUE(canvas.leftOut().empty());
}

TEST_F(ShapedReportTest, KeepsGroupsTogetherWhereAPageCanHoldThem)
{
    std::vector<std::vector<Text>> rows;
    for (int group = 1; group <= 6; ++group) {
        for (int row = 1; row <= 14; ++row)
            rows.push_back({ u"g" + decimal(group), decimal(row) });
    }
    TableGrid grid = gridOf(columnsOf(2, 2000), rows);
    canvas.doPreview(grid);
    bool isTorn = false;
    for (int number = 2; number <= canvas.Totalpages(); ++number)
        isTorn = isTorn || page(number).find("|1|") != std::string("C1|C2|g1").size();
    EXPECT_TRUE(isTorn) << "the plain report tears groups, or this test shows nothing";
    canvas.options.groupColumns = { u"C1" };
    canvas.options.keepsGroups = true;
    canvas.doPreview(grid);
    std::string all;
    for (int number = 1; number <= canvas.Totalpages(); ++number) {
        const std::string texts = page(number);
        EXPECT_EQ(texts.find("|1|"), std::string("C1|C2|g1").size()) << texts;
        all += texts;
    }
    EXPECT_EQ(std::count(all.begin(), all.end(), 'g'), 6 * 14);
}

TEST_F(ShapedReportTest, PrintsCellsAsTheirViewShowsThem)
{
    ShownGrid grid(gridOf(columnsOf(3, 3000), { { u"left", u"right", u"middle" } }));
    grid.look(1, 1).alignment = CellAlignment::Right;
    grid.look(1, 2).alignment = CellAlignment::Centre;
    grid.look(1, 2).bold = true;
    grid.look(1, 0).foreground = rgb(255, 0, 0);
    grid.look(1, 0).background = rgb(0, 255, 0);
    canvas.options.asShown = true;
    canvas.doPreview(grid);
    const auto texts = textsOn(1);
    ASSERT_EQ(texts.size(), 6U);
    const PageDocument& document = canvas.document();
    const Twips left = 1454; // half of what 9000 twips leave of 11907, rounded half to even
    const auto widthOf = [&](const TextRecord& text) {
        const Font& font = document.style(text.style).font;
        FaceMetrics& face = services().metrics.face(font.name, font.bold, font.italic);
        return textWidth(face.advanceOf(text.text()), font.size);
    };
    EXPECT_EQ(texts[3].pt.x, left + 72);
    EXPECT_EQ(texts[4].pt.x + widthOf(texts[4]), left + 6000 - 72);
    EXPECT_NEAR(texts[5].pt.x + widthOf(texts[5]) / 2.0, left + 7500, 1);
    EXPECT_EQ(texts[0].pt.x + widthOf(texts[0]), left + 3000 - 72) << "titles keep theirs";
    EXPECT_EQ(document.style(texts[3].style).color, rgb(255, 0, 0));
    EXPECT_TRUE(document.style(texts[5].style).font.bold);
    Lineobj box;
    for (std::size_t line = 0; line < document.lines(0).size(); ++line) {
        if (document.line(0, line).FillStyle == SolidFill)
            box = document.line(0, line);
    }
    EXPECT_EQ(box.FillColor, rgb(0, 255, 0));
    EXPECT_EQ(box.pt1.x, left);
    EXPECT_EQ(box.pt2.x, left + 3000);
}

TEST_F(ShapedReportTest, DrawsTheLineAboveAColouredRowOverItsColour)
{
    ShownGrid grid(gridOf(columnsOf(1, 3000), { { u"coloured" } }));
    grid.look(1, 0).background = rgb(0, 255, 0);
    canvas.options.asShown = true;
    canvas.doPreview(grid);
    const PageDocument& document = canvas.document();
    std::optional<Lineobj> box;
    bool isLineOverIt = false;
    for (std::size_t at = 0; at < document.lines(0).size(); ++at) {
        const Lineobj line = document.line(0, at);
        if (line.FillStyle == SolidFill)
            box = line;
        else if (box && line.pt1.y == box->pt1.y && line.pt2.y == box->pt1.y)
            isLineOverIt = line.pt1.x == box->pt1.x && line.pt2.x == box->pt2.x;
    }
    ASSERT_TRUE(box.has_value());
    EXPECT_TRUE(isLineOverIt);
}

TEST_F(ShapedReportTest, DrawsCheckBoxesInPlaceOfTheirCharacters)
{
    ShownGrid grid(gridOf(columnsOf(1, 3000), { { u"☑ done" }, { u"☐" }, { u"☑ text" } }));
    grid.look(1, 0).check = CheckMark::On;
    grid.look(2, 0).check = CheckMark::Off;
    canvas.options.asShown = true;
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C1|done|☑ text") << "the last one is typed";
}

TEST_F(ShapedReportTest, DrawsCheckBoxesBesideTextsThatHaveNoCharacterForThem)
{
    ShownGrid grid(gridOf(columnsOf(1, 3000), { { u"done" }, { u"" } }));
    grid.look(1, 0).check = CheckMark::On;
    grid.look(2, 0).check = CheckMark::Partly;
    canvas.options.asShown = true;
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C1|done");
}

TEST_F(ShapedReportTest, DrawsIconsAtTheHeightOfTheTextBeforeIt)
{
    ShownGrid grid(gridOf(columnsOf(1, 3000), { { u"with" }, { u"without" }, { u"" } }));
    grid.look(1, 0).icon = u"flag.png";
    grid.look(3, 0).icon = u"flag.png";
    canvas.options.asShown = true;
    canvas.doPreview(grid);
    const auto icons = canvas.document().reportPictures(0);
    ASSERT_EQ(icons.size(), 2U);
    const TextRecord text = textsOn(1)[1];
    const Twips plain = textsOn(1)[2].pt.x;
    const float size = canvas.document().style(text.style).font.size;
    const auto line = static_cast<Twips>(size * 24); // of the fake metrics
    EXPECT_EQ(icons[0].file, u"flag.png");
    EXPECT_EQ(icons[0].layer, PictureLayer::Cells);
    EXPECT_EQ(icons[0].size, (Tpoint { line, line }));
    EXPECT_EQ(icons[0].pt, (Tpoint { plain, text.pt.y }));
    EXPECT_NEAR(text.pt.x, plain + 1.2 * line, 1);
    EXPECT_EQ(icons[1].pt.x, plain) << "an icon needs no text";
}

TEST_F(ShapedReportTest, ASpanIsOneBoxThatIsClosedAtThePagesEndAndRepeatedBehindIt)
{
    std::vector<std::vector<Text>> rows;
    for (int row = 1; row <= 90; ++row)
        rows.push_back({ row == 1 ? u"spanning" : u"", u"r" + decimal(row) });
    ShownGrid grid(gridOf(columnsOf(2, 3000), rows));
    for (int row = 1; row <= 90; ++row)
        grid.look(row, 0).box = CellBox { 1, 90, 0, 0 };
    canvas.options.asShown = true;
    canvas.doPreview(grid);
    ASSERT_GE(canvas.Totalpages(), 2);
    for (int number = 1; number <= canvas.Totalpages(); ++number)
        EXPECT_NE(page(number).find("spanning"), std::string::npos) << number;
}

TEST_F(ShapedReportTest, ASpanShowsItsTextThoughTheRowAndColumnThatHoldItAreLeftOut)
{
    ShownGrid grid(gridOf(columnsOf(3, 3000),
        { { u"spanning", u"", u"a" }, { u"", u"", u"b" }, { u"c", u"d", u"e" } }));
    for (int row = 1; row <= 2; ++row) {
        for (int column = 0; column < 2; ++column)
            grid.look(row, column).box = CellBox { 1, 2, 0, 1 };
    }
    canvas.options.asShown = true;
    canvas.options.rows = RowChoice::Range;
    canvas.options.firstRow = 2;
    canvas.options.lastRow = 3;
    canvas.options.columns = { u"C2", u"C3" };
    canvas.doPreview(grid);
    EXPECT_EQ(page(1), "C2|C3|spanning|b|d|e");
}

TEST_F(ShapedReportTest, BreaksBetweenWordsAndCutsWhatAViewCuts)
{
    ShownGrid grid(gridOf(columnsOf(1, 1500),
        { { u"one two three four" }, { u"a text that is much longer than its cell" } }));
    grid.look(2, 0).tooWide = TooWide::CutRight;
    canvas.options.asShown = true;
    canvas.doPreview(grid);
    const std::string texts = page(1);
    EXPECT_EQ(texts.find("|two "), std::string::npos) << texts;
    EXPECT_NE(texts.find("…"), std::string::npos) << texts;
    std::string words;
    for (const TextRecord& text : textsOn(1)) {
        if (text.text().find(u'…') == TextView::npos && text.text() != u"C1")
            words += toUtf8(text.text()) + " ";
    }
    EXPECT_EQ(words, "one two three four ");
}

TEST_F(ShapedReportTest, PutsTheWatermarkBehindOrAboveEveryPageAndChangesNothingElse)
{
    TableGrid grid = gridOf(columnsOf(2, 2000), numberedRows(90, 2));
    canvas.doPreview(grid);
    const std::string plain = showDocument(canvas.document());
    EXPECT_TRUE(canvas.document().reportPictures(0).empty());
    canvas.options.watermark = { .text = u"Draft", .opacity = 0.2 };
    canvas.doPreview(grid);
    EXPECT_EQ(showDocument(canvas.document()), plain);
    ASSERT_GE(canvas.Totalpages(), 2);
    for (int number = 0; number < canvas.Totalpages(); ++number) {
        const auto shown = canvas.document().reportPictures(number);
        ASSERT_EQ(shown.size(), 1U) << number;
        EXPECT_EQ(shown[0].file, u"text Draft 20%");
        EXPECT_EQ(shown[0].layer, PictureLayer::Behind);
        EXPECT_EQ(shown[0].pt, Tpoint());
        EXPECT_EQ(shown[0].size, (Tpoint { 11907, 16840 }));
    }
    canvas.options.watermark = { .imageFile = u"seal.png", .opacity = 1, .isAbove = true };
    canvas.doPreview(grid);
    const PictureRecord seal = canvas.document().reportPictures(0)[0];
    EXPECT_EQ(seal.file, u"seal.png 100%");
    EXPECT_EQ(seal.layer, PictureLayer::Above);
    // Twice as wide as high, and seven tenths of the sheet's width.
    EXPECT_EQ(seal.size, (Tpoint { 8335, 4168 }));
    EXPECT_EQ(seal.pt, (Tpoint { (11907 - 8335) / 2, (16840 - 4168) / 2 }));
    canvas.options.watermark = { .imageFile = u"missing" };
    EXPECT_EQ(errorOf([&] { canvas.doPreview(grid); }), ErrorNumber::FileNotFound);
    EXPECT_EQ(canvas.document().reportPictures(0)[0].file, u"seal.png 100%")
        << "the old document stays";
}

TEST_F(ShapedReportTest, PutsALogoIntoItsSlotAndTheHeaderBelowIt)
{
    set({ { u"HeaderLeft", u"head" } });
    TableGrid grid = gridOf(columnsOf(2, 2000), numberedRows(2, 2));
    canvas.doPreview(grid);
    const Twips head = textsOn(1)[0].pt.y;
    const Twips title = textsOn(1)[1].pt.y;
    struct Case {
        int slot;
        Twips left;
    };
    for (const Case& expected :
        { Case { 0, 680 }, Case { 1, (11907 - 1200) / 2 }, Case { 2, 11907 - 680 - 1200 } }) {
        canvas.options.logo = { .imageFile = u"logo.png", .slot = expected.slot, .height = 600 };
        canvas.doPreview(grid);
        const PictureRecord logo = canvas.document().reportPictures(0)[0];
        EXPECT_EQ(logo.file, u"logo.png 100%");
        EXPECT_EQ(logo.pt, (Tpoint { expected.left, canvas.page.intTop })) << expected.slot;
        EXPECT_EQ(logo.size, (Tpoint { 1200, 600 }));
        EXPECT_EQ(textsOn(1)[0].pt.y, head + 600 + 72);
        EXPECT_EQ(textsOn(1)[1].pt.y, title + 600 + 72);
    }
    EXPECT_EQ(canvas.page.intTop, 907) << "the margin is the host's";
    canvas.options.logo.height = 9000;
    canvas.doPreview(grid);
    EXPECT_EQ(canvas.document().reportPictures(0)[0].size.y, 16840 / 4);
}

TEST_F(ShapedReportTest, EveryChosenCellStandsOncePerBandAndNothingOutsideThePaper)
{
    std::mt19937 dice(14);
    const auto from = [&](int first, int last) {
        return first + static_cast<int>(dice() % static_cast<unsigned>(last - first + 1));
    };
    int cells = 0;
    for (int round = 0; round < 300; ++round) {
        const int columns = from(1, 9);
        const int rows = from(0, 70);
        std::vector<TableColumn> titles;
        for (int column = 1; column <= columns; ++column)
            titles.push_back({ u"T" + decimal(column), from(300, 4000) });
        TableGrid grid = gridOf(titles, numberedRows(rows, columns));
        const int keys = from(0, 2);
        canvas.options = {};
        canvas.options.keyColumns = keys;
        canvas.options.keepsGroups = true;
        canvas.options.fit.toSheet = from(0, 1) == 1;
        canvas.options.fit.pagesAcross = from(0, 3) == 0 ? 2 : 0;
        canvas.options.pageOrder
            = from(0, 1) == 1 ? PageOrder::DownThenAcross : PageOrder::AcrossThenDown;
        const int last = from(0, rows);
        if (from(0, 1) == 1) {
            canvas.options.rows = RowChoice::Range;
            canvas.options.lastRow = last;
        }
        const int printed = canvas.options.rows == RowChoice::Range ? last : rows;
        canvas.doPreview(grid);
        std::map<Text, int> seen;
        Text cell;
        for (int number = 1; number <= canvas.Totalpages(); ++number) {
            for (const TextRecord& text : textsOn(number)) {
                EXPECT_GE(text.pt.x, 0);
                EXPECT_LE(text.pt.x + widthOf(text), canvas.page.myWidth);
                EXPECT_GE(text.pt.y, 0);
                EXPECT_LT(text.pt.y, canvas.page.myHeight);
                cell += Text(text.text());
                // A wrapped text comes in pieces; a cell ends with the number of its column.
                const bool isWhole
                    = cell[0] == u'T' ? cell.size() == 2 : cell.find(u'c') != Text::npos;
                if (isWhole && cell.back() != u'c') {
                    ++seen[cell];
                    cell.clear();
                }
            }
        }
        int singles = 0;
        for (int row = 1; row <= printed; ++row) {
            for (int column = 1; column <= columns; ++column, ++cells) {
                const int count = seen[u"r" + decimal(row) + u"c" + decimal(column)];
                if (column > keys) {
                    EXPECT_EQ(count, 1) << row << " " << column << " of " << round;
                    ++singles;
                } else {
                    EXPECT_EQ(count, canvas.fit().pagesAcross) << row << " " << column;
                }
            }
        }
        EXPECT_EQ(singles, printed * std::max(0, columns - keys));
    }
    std::printf("%d chosen cells looked at\n", cells);
}

TEST_F(ShapedReportTest, TotalsEqualAnIndependentSum)
{
    std::mt19937 dice(2004);
    for (int round = 0; round < 50; ++round) {
        std::vector<std::vector<Text>> rows;
        long long hundredths = 0;
        const int count = 1 + static_cast<int>(dice() % 400);
        for (int row = 0; row < count; ++row) {
            const auto value = static_cast<int>(dice() % 2000000) - 1000000;
            hundredths += value;
            const Text digits = formatNumber(std::abs(value) / 100.0);
            rows.push_back({ u"x", (value < 0 ? u"-" : u"") + digits });
        }
        TableGrid grid = gridOf({ { u"A", 4000 }, { u"B", 4000 } }, rows);
        canvas.options = {};
        canvas.options.totals = { { u"B", AggregateFunction::Sum } };
        canvas.doPreview(grid);
        const Text shown = Text(textsOn(canvas.Totalpages()).back().text());
        EXPECT_NEAR(leadingNumber(shown) * 100, static_cast<double>(hundredths), 0.001);
    }
}

} // namespace pelloric
