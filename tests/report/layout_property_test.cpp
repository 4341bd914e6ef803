// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Lays ten thousand random tables out and checks what must hold for every table.

#include "document/recorder.h"
#include "fakes/fake_platform.h"
#include "platform/run_time_error.h"
#include "report/column_bands.h"
#include "report/layout_engine.h"
#include "report/report_style.h"
#include "report/table_row_set.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <random>

namespace pelloric {

namespace {

constexpr unsigned FirstSeed = 20041023;
constexpr unsigned Tables = 10000;

/// Marks what is no cell: texts of header and footer lines, and titles.
constexpr char16_t HeaderMark = u'H';
constexpr char16_t FooterMark = u'F';
constexpr char16_t TitleMark = u'T';
constexpr Color CellColor = 1;
constexpr Color HeaderColor = 2;
constexpr Color FooterColor = 3;

class Dice {
public:
    explicit Dice(unsigned seed)
        : engine_(seed)
    {
    }

    int from(int first, int last)
    {
        const auto count = static_cast<unsigned>(last - first + 1);
        return first + static_cast<int>(engine_() % count);
    }

    bool once(int in) { return from(1, in) == 1; }

private:
    std::mt19937 engine_;
};

/// A random report: a table, a style and a paper.
struct Report {
    explicit Report(unsigned seed);

    ReportStyle style;
    PageSetup setup;
    std::vector<Text> names;
    std::vector<double> widths;
    std::vector<std::vector<Text>> rows;
    std::vector<ColPos> bands;
};

Text randomText(Dice& dice)
{
    static const std::vector<Text> Pieces { u"a", u"b", u" ", u"0", u"中", u"文", u"\U0001F600",
        u"\n", u"\r\n", u"\r", u"★", u"word ", u"汉字汉字", u"é", u"\t" };
    // Short texts of few characters, so that neighbours are often equal.
    if (dice.once(2)) {
        static const std::vector<Text> Often { u"", u" ", u"x", u" x", u"yy", u"中" };
        return Often[static_cast<std::size_t>(dice.from(0, static_cast<int>(Often.size()) - 1))];
    }
    Text text;
    const int length = dice.once(40) ? dice.from(50, 400) : dice.from(0, 12);
    for (int piece = 0; piece < length; ++piece)
        text += Pieces[static_cast<std::size_t>(dice.from(0, static_cast<int>(Pieces.size()) - 1))];
    return text;
}

SlotTexts randomSlots(Dice& dice, char16_t mark)
{
    SlotTexts slots;
    for (Text& slot : slots) {
        if (dice.once(2))
            slot = Text(1, mark) + (dice.once(2) ? u"[Page # of Pages #]" : u" plain");
    }
    return slots;
}

ColoredFont randomFont(Dice& dice, Color color)
{
    ColoredFont font;
    font.font.size = dice.once(30) ? 0 : static_cast<float>(dice.from(8, 80)) / 4.0F;
    font.font.bold = dice.once(2);
    font.color = color;
    return font;
}

Report::Report(unsigned seed)
{
    Dice dice(seed);
    style.ShowHeaders = dice.once(2);
    style.GridHor = !dice.once(3);
    style.GridVer = !dice.once(3);
    style.GridMerge = dice.once(2);
    style.body = randomFont(dice, CellColor);
    style.header = randomFont(dice, HeaderColor);
    style.footer = randomFont(dice, FooterColor);
    style.headerTexts = randomSlots(dice, HeaderMark);
    style.footerTexts = randomSlots(dice, FooterMark);
    setup.myWidth = dice.once(20) ? dice.from(0, 500) : dice.from(2000, 24000);
    setup.myHeight = dice.once(20) ? dice.from(0, 500) : dice.from(2000, 24000);
    setup.intTop = static_cast<std::int16_t>(dice.from(0, 2000));
    setup.intButtom = static_cast<std::int16_t>(dice.from(0, 2000));
    setup.intLeft = static_cast<std::int16_t>(dice.from(0, 1500));
    setup.intRight = static_cast<std::int16_t>(dice.from(0, 1500));
    setPrintableTenths(style, setup);
    const int columns = dice.from(1, 8);
    for (int column = 0; column < columns; ++column) {
        names.push_back(
            Text(1, TitleMark) + decimal(column) + (dice.once(3) ? u" long title" : u""));
        const double fraction = dice.once(2) ? 0 : dice.from(0, 999) / 1000.0;
        widths.push_back((dice.once(15) ? dice.from(1, 200) : dice.from(145, 4500)) + fraction);
    }
    const int count = dice.once(10) ? 0 : dice.from(1, 14);
    for (int row = 0; row < count; ++row) {
        auto& cells = rows.emplace_back();
        for (int column = 0; column < columns; ++column)
            cells.push_back(
                dice.once(4) && row > 0 ? rows[rows.size() - 2][cells.size()] : randomText(dice));
    }
    bands = cutColumnBands(widths, setup.myWidth, setup.intLeft);
}

/// Makes a row set of a report's cells.
TableRowSet rowSetOf(const Report& report, const std::shared_ptr<TextStore>& store)
{
    TableRowSet rows(store);
    for (const Text& name : report.names)
        rows.appendField(name);
    for (const auto& cells : report.rows) {
        rows.addRecord();
        for (std::size_t column = 0; column < cells.size(); ++column)
            rows.setLast(static_cast<int>(column), Value::ofText(cells[column]));
    }
    return rows;
}

/// Stops a build that goes on past the number of steps that it announced.
struct Steps {
    std::int64_t done = 0;
    std::int64_t total = 0;

    Progress progress()
    {
        return [this](std::int64_t step, std::int64_t steps) {
            done = step;
            total = steps;
            return done <= total;
        };
    }
};

Text cleaned(TextView text)
{
    Text result;
    for (const char16_t unit : text) {
        if (unit != u'\r')
            result.push_back(unit);
    }
    return result;
}

double widthOf(TextView text, double size)
{
    double advance = 0;
    for (std::size_t at = 0; at < text.size();)
        advance += nextCodePoint(text, at) < 0x80 ? 10 : 20;
    return std::nearbyint(advance * size);
}

/// Cuts a line that is too wide: the longest piece that fits, one character at least, and so on.
std::vector<Text> wrappedPieces(TextView line, double room, double size)
{
    std::vector<Text> pieces;
    Text piece;
    for (std::size_t at = 0; at < line.size();) {
        const std::size_t start = at;
        nextCodePoint(line, at);
        const Text longer = piece + Text(line.substr(start, at - start));
        if (piece.empty() || widthOf(longer, size) <= room) {
            piece = longer;
            continue;
        }
        pieces.push_back(piece);
        piece = line.substr(start, at - start);
    }
    pieces.push_back(piece);
    return pieces;
}

/// The lines of a text that is broken at these characters; one at least.
std::vector<Text> linesOf(TextView text, TextView breaks)
{
    std::vector<Text> lines(1);
    for (const char16_t unit : text) {
        if (contains(breaks, TextView(&unit, 1)))
            lines.emplace_back();
        else
            lines.back().push_back(unit);
    }
    return lines;
}

/// The pieces in which a cell's lines are printed, one below the other.
std::vector<Text> piecesOf(TextView text, TextView breaks, double room, double size)
{
    std::vector<Text> pieces;
    for (const Text& line : linesOf(text, breaks)) {
        if (widthOf(line, size) <= room) {
            pieces.push_back(line);
            continue;
        }
        for (const Text& piece : wrappedPieces(line, room, size))
            pieces.push_back(piece);
    }
    return pieces;
}

/// Tells, straight from the rows, whether merging leaves a cell blank.
bool isBlank(const Report& report, std::size_t row, std::size_t column)
{
    if (!report.style.GridMerge)
        return false;
    const auto cell = [&](std::size_t r, std::size_t c) { return trimmed(report.rows[r][c]); };
    return (row > 0 && cell(row - 1, column) == cell(row, column))
        || (column > 0 && cell(row, column - 1) == cell(row, column));
}

/// A text that must stand on a page.
struct Placed {
    double x = 0;
    double y = 0;
    Text text;
};

/// Walks through a document's pages in the order in which rows and bands must come.
class Walk {
public:
    Walk(const Report& report, const PageDocument& document)
        : report_(report)
        , document_(document)
        , size_(static_cast<double>(report.style.body.font.size))
        , lineHeight_(std::nearbyint(24 * size_))
    {
    }

    void check()
    {
        std::size_t firstRow = 0;
        int page = 0;
        do {
            const std::size_t rows = rowsFrom(firstRow);
            const std::size_t bands = report_.rows.empty() ? 1 : report_.bands.size();
            for (std::size_t band = 0; band < bands; ++band) {
                ASSERT_LT(page, document_.pageCount());
                checkPage(page++, band, firstRow, rows);
                if (testing::Test::HasFatalFailure())
                    return;
            }
            firstRow += rows;
        } while (firstRow < report_.rows.size());
        if (lastPageIsFull_)
            checkPage(page++, 0, firstRow, 0);
        ASSERT_EQ(page, document_.pageCount());
    }

private:
    double cellHeight(TextView cell, double width) const
    {
        if (width <= 144)
            return 0;
        const auto pieces = piecesOf(cleaned(trimmed(cell)), u"\n★", width - 144, size_);
        return static_cast<double>(pieces.size()) * lineHeight_;
    }

    double tallest(const std::vector<Text>& cells) const
    {
        double height = 0;
        for (std::size_t column = 0; column < cells.size(); ++column)
            height = std::max(height, cellHeight(cells[column], report_.widths[column]));
        return height;
    }

    double titleTop() const
    {
        const ReportStyle& style = report_.style;
        double top = report_.setup.intTop;
        const auto hasText = [](const Text& slot) { return !slot.empty(); };
        if (std::any_of(style.headerTexts.begin(), style.headerTexts.end(), hasText))
            top += std::nearbyint(24 * static_cast<double>(style.header.font.size));
        return style.ShowHeaders || style.GridHor ? top + 144 : top;
    }

    double bodyTop() const
    {
        return report_.style.ShowHeaders ? titleTop() + 144 + tallest(report_.names) : titleTop();
    }

    /// How many rows a page holds from this row on.
    std::size_t rowsFrom(std::size_t firstRow)
    {
        const PageSetup& setup = report_.setup;
        const double limit = static_cast<double>(setup.myHeight) - setup.intButtom - 72;
        double y = bodyTop();
        lastPageIsFull_ = false;
        std::size_t row = firstRow;
        while (row < report_.rows.size() && !lastPageIsFull_) {
            y += tallest(report_.rows[row++]) + 144;
            lastPageIsFull_ = y > limit;
        }
        return row - firstRow;
    }

    /// Places a cell's lines: each that fits is centred, pieces of others begin at the left.
    void place(std::vector<Placed>& texts, TextView cell, TextView breaks, double left,
        double width, double top) const
    {
        for (const Text& line : linesOf(cell, breaks)) {
            const double lineWidth = widthOf(line, size_);
            if (lineWidth <= width - 144) {
                texts.push_back({ left + 72 + (width - lineWidth) / 2, top, line });
                top += lineHeight_;
                continue;
            }
            for (const Text& piece : wrappedPieces(line, width - 144, size_)) {
                texts.push_back({ left + 72, top, piece });
                top += lineHeight_;
            }
        }
    }

    std::vector<Placed> textsOfPage(std::size_t band, std::size_t firstRow, std::size_t rows) const
    {
        std::vector<Placed> texts;
        const ColPos& columns = report_.bands[band];
        const auto first = static_cast<std::size_t>(columns.StartCol - 1);
        const auto last = static_cast<std::size_t>(columns.EndCol);
        const auto eachColumn = [&](auto action) {
            double left = std::nearbyint((report_.setup.myWidth - bandWidth(band)) / 2);
            for (std::size_t column = first; column < last; ++column) {
                const double width = report_.widths[column];
                if (width > 144)
                    action(column, left, width);
                left += width;
            }
        };
        if (report_.style.ShowHeaders) {
            eachColumn([&](std::size_t column, double left, double width) {
                place(texts, report_.names[column], u"", left, width, titleTop() + 72);
            });
        }
        double top = bodyTop();
        for (std::size_t row = firstRow; row < firstRow + rows; ++row) {
            eachColumn([&](std::size_t column, double left, double width) {
                if (isBlank(report_, row, column))
                    return;
                const Text text = cleaned(trimmed(report_.rows[row][column]));
                const TextView breaks = contains(text, u"\n") ? TextView(u"\n★") : TextView();
                place(texts, text, breaks, left, width, top + 72);
            });
            top += tallest(report_.rows[row]) + 144;
        }
        return texts;
    }

    double bandWidth(std::size_t band) const
    {
        const ColPos& columns = report_.bands[band];
        double width = 0;
        for (int column = columns.StartCol; column <= columns.EndCol; ++column)
            width += report_.widths[static_cast<std::size_t>(column - 1)];
        return width;
    }

    /// Every cell's text stands once on its page, piece by piece, and nothing else does.
    void checkPage(int page, std::size_t band, std::size_t firstRow, std::size_t rows) const
    {
        SCOPED_TRACE("page " + std::to_string(page));
        const std::vector<Placed> wanted = textsOfPage(band, firstRow, rows);
        const bool fits = bandWidth(band) <= report_.setup.myWidth;
        std::size_t at = 0;
        for (const TextRecord text : document_.texts(page)) {
            if (document_.style(text.style).color != CellColor)
                continue;
            ASSERT_LT(at, wanted.size()) << "a text too many";
            const Placed& place = wanted[at++];
            ASSERT_EQ(toUtf8(text.text()), toUtf8(place.text));
            ASSERT_EQ(text.pt.x, std::nearbyint(place.x));
            ASSERT_EQ(text.pt.y, place.y);
            if (fits)
                checkSide(text.pt);
        }
        ASSERT_EQ(at, wanted.size()) << "a cell is missing";
        for (const LineRecord line : document_.lines(page)) {
            if (fits) {
                checkSide(line.pt1);
                checkSide(line.pt2);
            }
        }
        checkSlots(page);
    }

    void checkSide(Tpoint point) const
    {
        ASSERT_GE(point.x, 0);
        ASSERT_LE(point.x, report_.setup.myWidth);
    }

    /// Header and footer texts stand once on every page, and a page number is the page's own.
    void checkSlots(int page) const
    {
        std::size_t count = 0;
        for (const TextRecord text : document_.texts(page)) {
            if (document_.style(text.style).color == CellColor)
                continue;
            ++count;
            const Text number = decimal(page + 1) + u" of [Pages]";
            ASSERT_TRUE(text.text().substr(1) == u" plain" || text.text().substr(1) == number)
                << toUtf8(text.text());
        }
        std::size_t wanted = 0;
        for (const SlotTexts& slots : { report_.style.headerTexts, report_.style.footerTexts }) {
            for (const Text& slot : slots)
                wanted += slot.empty() ? 0 : 1;
        }
        ASSERT_EQ(count, wanted);
    }

    const Report& report_;
    const PageDocument& document_;
    double size_;
    double lineHeight_;
    bool lastPageIsFull_ = false;
};

} // namespace

TEST(LayoutProperty, HoldsForTenThousandRandomTables)
{
    FakePlatform platform;
    std::int64_t pages = 0;
    for (unsigned seed = FirstSeed; seed < FirstSeed + Tables; ++seed) {
        SCOPED_TRACE("seed " + std::to_string(seed));
        const Report report(seed);
        PageDocument document;
        const auto store = std::make_shared<TextStore>();
        document.shareStore(store);
        TableRowSet rows = rowSetOf(report, store);
        Recorder recorder(document, platform.metrics);
        LayoutEngine engine({ report.style, report.setup, rows, report.widths, report.bands },
            platform.services(), document, recorder);
        Steps steps;
        engine.build(steps.progress());
        EXPECT_EQ(steps.done, static_cast<std::int64_t>(report.rows.size() * report.bands.size()));
        EXPECT_EQ(steps.total, std::max<std::int64_t>(1, steps.done));
        Walk(report, document).check();
        pages += document.pageCount();
        if (HasFailure())
            return;
    }
    EXPECT_GT(pages, Tables);
}

} // namespace pelloric
