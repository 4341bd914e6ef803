// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/layout_engine.h"

#include "fakes/fake_object.h"
#include "report/table_row_set.h"
#include "support/golden.h"
#include "support/report_world.h"
#include "support/show_document.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

using Cells = std::vector<std::vector<Text>>;

/// A report on the default paper: A4 with 10 mm margins, texts of size 9 (a character is 90 twips
/// wide, a line 216 high), grid lines and titles.
struct LayoutWorld : ReportWorld {
    using ReportWorld::ReportWorld;

    const PageDocument& build(std::vector<TableColumn> columns, const Cells& rows)
    {
        TableGrid grid = gridOf(std::move(columns), rows);
        canvas.doPreview(grid);
        return canvas.document();
    }
};

/// Columns "T1", "T2", ... of these widths.
std::vector<TableColumn> columnsOf(const std::vector<Twips>& widths)
{
    std::vector<TableColumn> columns;
    for (const Twips width : widths)
        columns.push_back({ u"T" + decimal(static_cast<int>(columns.size()) + 1), width });
    return columns;
}

/// How many lines of the page run down at this x.
int verticalLinesAt(const PageDocument& document, int page, Twips x)
{
    int count = 0;
    for (const LineRecord line : document.lines(page))
        count += line.pt1.x == x && line.pt2.x == x ? 1 : 0;
    return count;
}

/// Whether a line runs across from one point to the other.
bool hasLine(const PageDocument& document, int page, Tpoint from, Tpoint to)
{
    for (const LineRecord line : document.lines(page)) {
        if (line.pt1 == from && line.pt2 == to)
            return true;
    }
    return false;
}

/// Records whose values are counted as they are read.
class CountedRows : public RowSet {
public:
    CountedRows(int fields, std::int64_t records)
        : names_(static_cast<std::size_t>(fields), u"T")
        , records_(records)
    {
    }

    int fieldCount() const override { return static_cast<int>(names_.size()); }
    TextView fieldName(int field) const override { return names_[static_cast<std::size_t>(field)]; }
    std::int64_t recordCount() const override { return records_; }
    std::int64_t position() const override { return position_; }
    void setPosition(std::int64_t position) override { position_ = position; }
    Value value(int field) override
    {
        ++reads;
        text_ = u"r" + decimal(position_) + u"c" + decimal(field);
        return Value::ofText(text_);
    }

    std::int64_t reads = 0;

private:
    std::vector<Text> names_;
    std::int64_t records_;
    std::int64_t position_ = 0;
    Text text_;
};

} // namespace

TEST(LayoutEngine, ReadsEveryValueOnceHoweverManyBandsThereAre)
{
    for (const char16_t* const merge : { u"0", u"1" }) {
        LayoutWorld world({ { u"GridMerge", merge } });
        world.canvas.m_PrintObj = PrintObjKind::datagrid;
        CountedRows rows(40, 200);
        FakeDataGrid grid(Value::ofRows(rows), std::vector<double>(40, 3000));
        world.canvas.doPreview(grid);
        EXPECT_GT(world.canvas.Totalpages(), 40);
        EXPECT_EQ(rows.reads, 40 * 200);
    }
}

TEST(LayoutEngine, CentresATableThatFitsAndRecordsTitlesCellsAndLines)
{
    LayoutWorld world({ { u"FooterCenter", u"[Page # of Pages #]" }, { u"HeaderLeft", u"Left" } });
    const auto shown = showDocument(world.build(columnsOf({ 1500, 2001 }), numberedRows(2, 2)));
    EXPECT_EQ(shown, golden("report/one_band.txt", shown));
}

TEST(LayoutEngine, PrintsEveryPageOfRowsOncePerBand)
{
    LayoutWorld world;
    // Rows are 360 high, and ten of them cross the limit of this paper.
    world.set({ { u"PagerHeight", u"105" } });
    const PageDocument& document
        = world.build(columnsOf({ 9000, 9000, 9000 }), numberedRows(25, 3));
    std::string shown;
    for (int page = 0; page < document.pageCount(); ++page)
        shown += textsOf(document, page) + "\n";
    EXPECT_EQ(shown, golden("report/three_bands_of_25_rows.txt", shown));
    EXPECT_EQ(world.buildBar.bar(), (ProgressBar { true, 75, 75 }));
}

TEST(LayoutEngine, PutsTheFooterUnderTheTableOfAFullPageAndElseAtTheBottomMargin)
{
    LayoutWorld world({ { u"FooterLeft", u"f" }, { u"PagerHeight", u"96" } });
    const PageDocument& document = world.build(columnsOf({ 1000 }), numberedRows(11, 1));
    ASSERT_EQ(document.pageCount(), 2);
    const auto footerOf = [&](int page) { return document.texts(page).back().pt.y; };
    const Twips tableBottom = document.lines(0).back().pt1.y;
    EXPECT_EQ(footerOf(0), tableBottom + 144);
    EXPECT_EQ(footerOf(1), 5443 - 1021 + 144);
}

TEST(LayoutEngine, LeavesARowThatCrossesTheLimitOnItsPage)
{
    LayoutWorld world({ { u"PagerHeight", u"96" } });
    const PageDocument& document = world.build(columnsOf({ 1000 }), numberedRows(30, 1));
    const Twips limit = 5443 - 1021 - 72;
    for (int page = 0; page + 1 < document.pageCount(); ++page) {
        const Twips bottom = document.lines(page).back().pt1.y;
        EXPECT_GT(bottom, limit);
        EXPECT_LE(bottom - 360, limit);
    }
}

TEST(LayoutEngine, CountsPagesAlikeWhateverLinesAreDrawn)
{
    for (const char16_t* hor : { u"0", u"1" }) {
        for (const char16_t* ver : { u"0", u"1" }) {
            LayoutWorld world({ { u"PagerHeight", u"96" }, { u"GridHor", hor }, { u"GridVer", ver },
                { u"ShowHeaders", u"1" } });
            EXPECT_EQ(world.build(columnsOf({ 1000 }), numberedRows(20, 1)).pageCount(), 3);
        }
    }
}

TEST(LayoutEngine, MakesOnePageOfTitlesWhenThereAreNoRows)
{
    LayoutWorld world({ { u"HeaderLeft", u"h" }, { u"FooterLeft", u"f" } });
    const PageDocument& document = world.build(columnsOf({ 9000, 9000 }), {});
    ASSERT_EQ(document.pageCount(), 1);
    EXPECT_EQ(textsOf(document, 0), "h|T1|f");
    EXPECT_EQ(world.buildBar.bar(), (ProgressBar { true, 1, 0 }));
}

TEST(LayoutEngine, GoesOnWithAnEmptyPageWhenTheLastRowFillsTheLastBand)
{
    LayoutWorld world(
        { { u"PagerHeight", u"96" }, { u"HeaderLeft", u"h" }, { u"FooterLeft", u"f" } });
    // With the header line the eighth row crosses the limit.
    const PageDocument& document = world.build(columnsOf({ 1000 }), numberedRows(8, 1));
    ASSERT_EQ(document.pageCount(), 2);
    EXPECT_EQ(textsOf(document, 1), "h|T1|f");
}

TEST(LayoutEngine, StartsTheTableWithoutTitlesByTheSwitches)
{
    const Cells rows = numberedRows(1, 1);
    LayoutWorld bare({ { u"ShowHeaders", u"0" }, { u"GridHor", u"0" }, { u"GridVer", u"0" } });
    EXPECT_EQ(bare.build(columnsOf({ 1000 }), rows).text(0, 0).pt.y, 907 + 72);
    EXPECT_TRUE(bare.canvas.document().lines(0).empty());
    LayoutWorld edge({ { u"ShowHeaders", u"0" }, { u"GridVer", u"0" } });
    const PageDocument& document = edge.build(columnsOf({ 1001 }), rows);
    EXPECT_EQ(document.text(0, 0).pt.y, 907 + 144 + 72);
    // (11907 - 1001) / 2 is 5453.
    EXPECT_TRUE(hasLine(document, 0, { 5453, 1051 }, { 6454, 1051 }));
    EXPECT_TRUE(hasLine(document, 0, { 5453, 1411 }, { 6454, 1411 }));
    EXPECT_EQ(document.lines(0).size(), 2U);
}

TEST(LayoutEngine, RecordsTheBodysColoursWithEveryLine)
{
    LayoutWorld world({ { u"GridLineColor", u"255" }, { u"HeaderColor", u"65280" } });
    const PageDocument& document = world.build(columnsOf({ 1000 }), numberedRows(1, 1));
    for (std::size_t index = 0; index < document.lines(0).size(); ++index) {
        const Lineobj line = document.line(0, index);
        EXPECT_EQ(line.LineColor, 255);
        EXPECT_EQ(line.FillColor, 65280);
        EXPECT_EQ(line.FillStyle, TransparentFill);
        EXPECT_EQ(line.LineStyle, SolidPen);
        EXPECT_EQ(line.LineWidth, 1);
    }
}

TEST(LayoutEngine, ShiftsACentredCell72TwipsToTheRightOfTheMiddle)
{
    LayoutWorld world;
    const PageDocument& document = world.build(columnsOf({ 1007 }), { { u"ab" } });
    // 5450 + 72 + (1007 - 180) / 2 is 5935.5, rounded to even.
    EXPECT_EQ(document.text(0, 1).pt.x, 5936);
}

TEST(LayoutEngine, BreaksAndWrapsCellsAndMakesTheRowAsHighAsItsTallestCell)
{
    LayoutWorld world;
    const auto shown = showDocument(world.build(columnsOf({ 600, 1000, 1000, 1000 }),
        { { u"abcdefghijkl", u"one\r\ntwo\n\nfour", u"a★b", u"  x  " },
            { u"", u"a\rb", u"中文中文中文中文", u"\U0001F600\U0001F600" } }));
    EXPECT_EQ(shown, golden("report/broken_and_wrapped_cells.txt", shown));
}

TEST(LayoutEngine, WrapsATextThatIsOneTwipTooWide)
{
    LayoutWorld world({ { u"ShowHeaders", u"0" } });
    // Three characters are 270 wide.
    EXPECT_EQ(textsOf(world.build(columnsOf({ 270 + 144 }), { { u"abc" } }), 0), "abc");
    EXPECT_EQ(textsOf(world.build(columnsOf({ 270 + 143 }), { { u"abc" } }), 0), "ab|c");
}

TEST(LayoutEngine, GivesARowTheSameHeightInEveryBand)
{
    LayoutWorld world({ { u"ShowHeaders", u"0" } });
    const PageDocument& document
        = world.build(columnsOf({ 9000, 9000 }), { { u"one\ntwo\nthree", u"x" }, { u"y", u"z" } });
    ASSERT_EQ(document.pageCount(), 2);
    EXPECT_EQ(textsOf(document, 1), "x|z");
    const auto below = [&](int page) { return document.texts(page).back().pt.y; };
    EXPECT_EQ(below(0), below(1));
}

TEST(LayoutEngine, MergesEqualCellsBelowEachOther)
{
    LayoutWorld world({ { u"GridMerge", u"1" }, { u"ShowHeaders", u"0" } });
    const PageDocument& document
        = world.build(columnsOf({ 1001 }), { { u"A" }, { u" A " }, { u"B" } });
    EXPECT_EQ(textsOf(document, 0), "A|B");
    EXPECT_FALSE(hasLine(document, 0, { 5453, 1411 }, { 6454, 1411 }));
    EXPECT_TRUE(hasLine(document, 0, { 5453, 1771 }, { 6454, 1771 }));
    EXPECT_TRUE(hasLine(document, 0, { 5453, 2131 }, { 6454, 2131 }));
}

TEST(LayoutEngine, MergesEqualCellsBesideEachOtherAndDropsTheLineBetween)
{
    LayoutWorld world({ { u"GridMerge", u"1" }, { u"ShowHeaders", u"0" } });
    const PageDocument& document = world.build(
        columnsOf({ 1001, 1000, 1000 }), { { u"A", u"A", u"a" }, { u"A", u"B", u"B" } });
    EXPECT_EQ(textsOf(document, 0), "A|a|B");
    const Twips left = 4453;
    EXPECT_EQ(verticalLinesAt(document, 0, left), 2);
    EXPECT_EQ(verticalLinesAt(document, 0, left + 1001), 1);
    EXPECT_EQ(verticalLinesAt(document, 0, left + 2001), 1);
    EXPECT_EQ(verticalLinesAt(document, 0, left + 3001), 2);
}

TEST(LayoutEngine, MergesAcrossBandsButKeepsTheLineOfABandsFirstColumn)
{
    LayoutWorld world({ { u"GridMerge", u"1" }, { u"ShowHeaders", u"0" } });
    const PageDocument& document
        = world.build(columnsOf({ 9000, 9000 }), { { u"A", u"A" }, { u"C", u"D" } });
    EXPECT_EQ(textsOf(document, 0), "A|C");
    EXPECT_EQ(textsOf(document, 1), "D");
    EXPECT_EQ(verticalLinesAt(document, 1, 1454), 2);
}

TEST(LayoutEngine, MergesAcrossPagesAndClosesTheLastRowOfAFullPage)
{
    LayoutWorld world({ { u"GridMerge", u"1" }, { u"PagerHeight", u"96" } });
    const PageDocument& document
        = world.build(columnsOf({ 1001 }), Cells(15, std::vector<Text> { u"A" }));
    ASSERT_EQ(document.pageCount(), 2);
    EXPECT_EQ(textsOf(document, 0), "T1|A");
    EXPECT_EQ(textsOf(document, 1), "T1");
    const LineRecord bottom = document.lines(0).back();
    EXPECT_EQ(bottom.pt1.y, bottom.pt2.y);
    EXPECT_GT(bottom.pt1.y, 5443 - 1021 - 72);
}

TEST(LayoutEngine, MeasuresCellsThatMergingLeavesBlank)
{
    LayoutWorld world({ { u"GridMerge", u"1" }, { u"ShowHeaders", u"0" } });
    const PageDocument& document
        = world.build(columnsOf({ 1000 }), { { u"a\nb" }, { u"a\nb" }, { u"c" } });
    EXPECT_EQ(textsOf(document, 0), "a|b|c");
    EXPECT_EQ(document.texts(0).back().pt.y, 907 + 144 + 2 * 576 + 72);
}

TEST(LayoutEngine, PassesOverColumnsThatScalingMadeTooNarrow)
{
    LayoutWorld world({ { u"ShowHeaders", u"1" } });
    TableGrid grid = gridOf(columnsOf({ 150, 1000 }), numberedRows(1, 2));
    world.canvas.doPreview(grid);
    world.canvas.Minimum();
    world.canvas.ReDrawZoom(grid);
    const PageDocument& document = world.canvas.document();
    EXPECT_EQ(textsOf(document, 0), "T2|r1c2");
    // 135 and 900 twips wide: the left edge is (11907 - 1035) / 2.
    EXPECT_EQ(verticalLinesAt(document, 0, 5436), 2);
    EXPECT_EQ(verticalLinesAt(document, 0, 5571), 2);
    EXPECT_EQ(verticalLinesAt(document, 0, 6471), 2);
}

TEST(LayoutEngine, KeepsTheFractionsOfScaledWidths)
{
    LayoutWorld world;
    TableGrid grid = gridOf(columnsOf({ 1001, 1003, 1007 }), numberedRows(1, 3));
    world.canvas.doPreview(grid);
    for (int step = 0; step < 2; ++step) {
        world.canvas.Minimum();
        world.canvas.ReDrawZoom(grid);
    }
    const auto shown = showDocument(world.canvas.document());
    EXPECT_EQ(shown, golden("report/widths_with_fractions.txt", shown));
}

TEST(LayoutEngine, WrapsATitleThatIsTooWideAndCentresOneThatFits)
{
    LayoutWorld world;
    const auto shown = showDocument(
        world.build({ { u"A title too wide", 800 }, { u"  T  ", 1500 }, { u"", 500 } }, {}));
    EXPECT_EQ(shown, golden("report/titles.txt", shown));
}

TEST(LayoutEngine, PrintsATitleWithLineFeedsLineByLineAsACellIs)
{
    LayoutWorld world;
    const PageDocument& document = world.build({ { u"Unit\r\nprice", 2000 } }, { { u"1\r\n2" } });
    EXPECT_EQ(textsOf(document, 0), "Unit|price|1|2");
}

TEST(LayoutEngine, RemembersWhereTheTitlesWereAskedForUnderAPageHeader)
{
    LayoutWorld plain;
    plain.build(columnsOf({ 1000 }), {});
    EXPECT_EQ(plain.canvas.titleTop(), 0);
    LayoutWorld world({ { u"HeaderRight", u"h" } });
    world.build(columnsOf({ 1000 }), {});
    EXPECT_EQ(world.canvas.titleTop(), 907 + 216);
}

TEST(LayoutEngine, EndsOnPaperOfNoSizeAtAll)
{
    LayoutWorld world({ { u"PagerWidth", u"0" }, { u"PagerHeight", u"0" } });
    const PageDocument& document = world.build(columnsOf({ 1000, 1000 }), numberedRows(5, 2));
    // Every row fills its page, in both bands, and the last one asks for a page more.
    EXPECT_EQ(document.pageCount(), 11);
}

} // namespace pelloric
