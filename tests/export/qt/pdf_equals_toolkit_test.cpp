// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/pdf_equals_toolkit.h"
#include "support/qt/sample_grids.h"
#include "support/recorded_pages.h"
#include "tables/qt/sqlite_table.h"

#include <gtest/gtest.h>

#include <random>

namespace pelloric::qt {

namespace {

/// Texts that ask something of a writer; those that the toolkit makes unreadable, read from the
/// right or past the first 65536 characters, are looked at elsewhere.
constexpr auto Texts = std::to_array<TextView>({
    u"plain",
    u"Quantity (\\) and [Pages]",
    u"北京市海淀区",
    u"混合 mixed 文字 text 123",
    u"，。、；：？！“”（）《》",
    u"naïve café Ærøskøbing",
    u"Ελληνικά кириллица",
    u"ﬁrst ﬂight: fi fl ffi ffl AVATAR To",
    u"0123456789.,-+%€¥£",
    u"ｆｕｌｌ ｗｉｄｔｈ　ＡＢＣ",
    u"x² + y³ = ½ ± ∞",
    u"  blanks  in  between  ",
    u"\u2603 \u2713 \u25A0",
    u"<>&\"'/%#~^_`|{}",
});

constexpr auto Families = std::to_array<TextView>({ Uming, u"宋体", u"DejaVu Sans", u"DejaVu Serif",
    u"DejaVu Sans Mono", u"Curved Roman", u"no such family" });

/// Pages of lines, rectangles and texts of every kind, the same for the same seed: no two random
/// numbers are arguments of one call, which compilers make out in any order.
class RandomPages {
public:
    explicit RandomPages(unsigned seed)
        : random_(seed)
    {
    }

    PageSetup setup()
    {
        PageSetup setup;
        // Whole points, as the toolkit rounds pages up.
        setup.myWidth = 20 * (below(300) + 700);
        setup.myHeight = 20 * (below(600) + 200);
        return setup;
    }

    PageDocument document(const PageSetup& setup)
    {
        PageDocument document;
        for (int page = 0; page < 2; ++page) {
            if (page > 0)
                document.newPage();
            for (int count = 0; count < 12; ++count)
                addLine(document, setup);
            for (int count = 0; count < 6; ++count)
                addBox(document, setup);
            for (int count = 0; count < 25; ++count)
                addText(document, setup);
        }
        return document;
    }

private:
    int below(int limit) { return static_cast<int>(random_() % static_cast<unsigned>(limit)); }
    std::size_t pick(std::size_t count) { return random_() % count; }

    Tpoint point(const PageSetup& setup) { return { below(setup.myWidth), below(setup.myHeight) }; }

    /// Readers leave out what stands outside of a page, and disagree about its very edge.
    Tpoint textPoint(const PageSetup& setup)
    {
        constexpr Twips LongestText = 11000;
        constexpr Twips HighestText = 1000;
        return { below(setup.myWidth - LongestText), below(setup.myHeight - HighestText) };
    }

    Color color()
    {
        const int blue = below(256);
        const int green = below(256);
        return rgb(below(256), green, blue);
    }

    LinePen pen(bool isFilled)
    {
        const int fill = below(7);
        return { .LineStyle = static_cast<std::int16_t>(below(7)),
            .LineColor = color(),
            .LineWidth = static_cast<std::int16_t>(1 + below(6)),
            .FillStyle = static_cast<std::int16_t>(!isFilled ? TransparentFill
                    : fill == 1                              ? 7
                                                             : fill),
            .FillColor = color() };
    }

    void addLine(PageDocument& document, const PageSetup& setup)
    {
        const LinePen drawnWith = pen(false);
        const Tpoint to = point(setup);
        const Tpoint from = point(setup);
        pelloric::addLine(document, from, to, drawnWith);
    }

    void addBox(PageDocument& document, const PageSetup& setup)
    {
        const Tpoint corner = point(setup);
        const LinePen drawnWith = pen(true);
        const Tpoint size { below(1500), below(900) };
        pelloric::addLine(document, corner, { corner.x + size.x, corner.y + size.y }, drawnWith);
    }

    void addText(PageDocument& document, const PageSetup& setup)
    {
        const TextStyle shown = style();
        const TextView text = Texts[pick(Texts.size())];
        const Tpoint at = textPoint(setup);
        pelloric::addText(document, at, text, shown);
    }

    TextStyle style()
    {
        return { .font = { .name = Text(Families[pick(Families.size())]),
                     .size = static_cast<float>(12 + below(60)) / 3,
                     .bold = below(4) == 0,
                     .italic = below(4) == 0 },
            .color = below(2) == 0 ? 0 : color() };
    }

    std::mt19937 random_;
};

class RandomDocuments : public PdfEqualsToolkit, public testing::WithParamInterface<unsigned> { };

class SampleReports : public PdfEqualsToolkit, public testing::WithParamInterface<Sample> { };

class SampleTables : public PdfEqualsToolkit, public testing::WithParamInterface<const char*> { };

} // namespace

TEST_P(RandomDocuments, EqualTheToolkitsPictureByPictureAndTextByText)
{
    constexpr unsigned Count = 10;
    for (unsigned seed = GetParam() * Count; seed < (GetParam() + 1) * Count; ++seed) {
        SCOPED_TRACE(seed);
        RandomPages pages(seed);
        const PageSetup setup = pages.setup();
        expectEqual(pages.document(setup), setup);
    }
    RecordProperty("greatestDifferencePpm", static_cast<int>(greatest_ * 1e6));
}

INSTANTIATE_TEST_SUITE_P(Tens, RandomDocuments, testing::Range(0U, 10U));

TEST_P(SampleReports, EqualTheToolkitsPictureByPictureAndTextByText)
{
    TableGrid grid = gridOf(GetParam());
    expectEqualReport(grid, {}, 4);
}

INSTANTIATE_TEST_SUITE_P(Files, SampleReports,
    testing::Values(Sample { "countries-zh.csv", u',' }, Sample { "wine.csv", u',' },
        Sample { "time-zones.tsv", u'\t' }));

TEST_P(SampleTables, EqualTheToolkitsPictureByPictureAndTextByText)
{
    TableGrid grid = readSqlite({ .path = PELLORIC_TESTS_DIR "/../samples/samples.sqlite",
        .table = QString::fromUtf8(GetParam()) });
    expectEqualReport(grid, {}, 4);
}

INSTANTIATE_TEST_SUITE_P(
    OfTheDatabase, SampleTables, testing::Values("countries_zh", "wine", "time_zones"));

TEST_F(PdfEqualsToolkit, ForEachAwkwardTextInEachFamilyAndGuise)
{
    PageDocument document;
    PageSetup setup;
    Tpoint point { 300, 300 };
    for (const TextView family : Families) {
        for (const int guise : { 0, 1, 2, 3 }) {
            for (const TextView text : Texts) {
                addText(document, point, text,
                    { .font = { .name = Text(family),
                          .size = 10.5F,
                          .bold = (guise & 1) != 0,
                          .italic = (guise & 2) != 0 } });
                point.y += 320;
            }
            point = guise % 2 == 0 ? Tpoint { 6000, 300 + (point.y - 300) % 16 }
                                   : Tpoint { 300, 300 };
            if (guise % 2 != 0)
                document.newPage();
        }
    }
    expectEqual(document, setup);
    RecordProperty("greatestDifferencePpm", static_cast<int>(greatest_ * 1e6));
}

} // namespace pelloric::qt
