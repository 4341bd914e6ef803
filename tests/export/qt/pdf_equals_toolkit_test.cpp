// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"
#include "export/qt/page_export.h"
#include "fakes/temp_folder.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/qt/uming.h"
#include "settings/default_settings.h"
#include "support/qt/font_copies.h"
#include "support/qt/pictures.h"
#include "support/qt/sample_grids.h"
#include "support/recorded_pages.h"

#include <gtest/gtest.h>

#include <random>
#include <string>
#include <string_view>

namespace pelloric::qt {

namespace {

/// The part of all pixels in which the pages of the two writers may differ: another antialiasing.
constexpr double SameInk = 0.0015;

/// Italics that are made up lean by 12 degrees, as on screen, and by 17 in the toolkit's: tangents
/// as they stand in the pages, the second one as long as the first.
constexpr std::string_view OwnSlant = "1 0 .2126 1 ";
constexpr std::string_view ToolkitsSlant = "1 0 .3    1 ";
static_assert(OwnSlant.size() == ToolkitsSlant.size());

/// The toolkit rounds pages up to whole points: pixels.
constexpr int OnePoint = 3;

/// How far the edges of all ink may lie apart: pixels.
constexpr int SameEdge = 2;

/// Ink of one picture is no lighter than this in the other, by another antialiasing.
constexpr int FaintShade = 240;

/// How far the ink of a picture stands out of that of another: pixels, 0 when it does not.
int standingOut(const QImage& one, const QImage& other)
{
    const QRect ink = inkOf(one);
    const QRect all = inkOf(other, FaintShade);
    return ink.isEmpty() ? 0 : farthestEdge(all, all.united(ink));
}

QString nameOf(const std::filesystem::path& path) { return QString::fromStdString(path.string()); }

class PdfEqualsToolkit : public testing::Test {
protected:
    void SetUp() override
    {
        ASSERT_TRUE(loadUming());
        ASSERT_TRUE(loadCffFont());
    }

    /// Writes a document by both writers and compares their pages.
    void expectEqual(const PageDocument& document, const PageSetup& setup)
    {
        const ExportOptions options { .title = u"both" };
        const PdfExport made = exportPdf(document, setup, fonts_, options, own());
        EXPECT_EQ(toUtf8(made.byToolkitBecause), "");
        exportPdfByToolkit(document, setup, fonts_, options, toolkits());
        expectClean();
        EXPECT_EQ(textOf(own()).toStdString(), textOf(toolkits()).toStdString());
        leanAsToolkits();
        for (int page = 1; page <= document.pageCount(); ++page)
            expectSamePicture(page);
    }

    void expectSamePicture(int page)
    {
        const QString folder = nameOf(folder_.path());
        const QImage one = paperPicture(nameOf(leaning()), folder, page);
        const QImage whole = paperPicture(nameOf(toolkits()), folder, page);
        const QSize more = whole.size() - one.size();
        ASSERT_TRUE(more.width() >= 0 && more.width() <= OnePoint) << more.width();
        ASSERT_TRUE(more.height() >= 0 && more.height() <= OnePoint) << more.height();
        const QImage other = whole.copy(one.rect());
        const double difference = differenceOf(one, other);
        greatest_ = std::max(greatest_, difference);
        EXPECT_LT(difference, SameInk) << "page " << page;
        EXPECT_LE(standingOut(one, other), SameEdge) << "page " << page;
        EXPECT_LE(standingOut(other, one), SameEdge) << "page " << page;
    }

    /// What a check of the file's structure says.
    void expectClean()
    {
        const ProgramResult check
            = runProgram(QStringLiteral("qpdf"), { QStringLiteral("--check"), nameOf(own()) });
        EXPECT_EQ(check.status, 0) << check.output.toStdString() << check.errors.toStdString();
    }

    /// Leaves another slant out of the comparison of pictures: copies the file with that of the
    /// toolkit in its pages.
    void leanAsToolkits()
    {
        const ProgramResult unpacked = runProgram(QStringLiteral("qpdf"),
            { QStringLiteral("--stream-data=uncompress"), nameOf(own()), nameOf(leaning()) });
        ASSERT_EQ(unpacked.status, 0) << unpacked.errors.toStdString();
        std::string bytes = TempFolder::bytesOf(leaning());
        for (std::size_t at = bytes.find(OwnSlant); at != std::string::npos;
             at = bytes.find(OwnSlant, at))
            bytes.replace(at, OwnSlant.size(), ToolkitsSlant);
        folder_.write(LeaningName, bytes);
    }

    QString textOf(const std::filesystem::path& path)
    {
        return runProgram(QStringLiteral("pdftotext"),
            { QStringLiteral("-raw"), nameOf(path), QStringLiteral("-") })
            .output;
    }

    std::filesystem::path own() const { return folder_.file("own.pdf"); }
    std::filesystem::path toolkits() const { return folder_.file("toolkit.pdf"); }
    std::filesystem::path leaning() const { return folder_.file(LeaningName); }

    static constexpr std::string_view LeaningName = "leaning.pdf";

    TempFolder folder_;
    QtFonts fonts_;
    double greatest_ = 0; ///< difference seen so far
};

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
    QtPlatform platform;
    platform.folders().setSystemDirectory(folder_.path());
    deployDefaultSettings(platform.record());
    Platform services = platform.record();
    Canvas canvas(services);
    TableGrid grid = gridOf(GetParam());
    canvas.doPreview(grid);
    ASSERT_GE(canvas.document().pageCount(), 4);
    expectEqual(canvas.document(), canvas.page);
    RecordProperty("greatestDifferencePpm", static_cast<int>(greatest_ * 1e6));
}

INSTANTIATE_TEST_SUITE_P(Files, SampleReports,
    testing::Values(Sample { "countries-zh.csv", u',' }, Sample { "wine.csv", u',' },
        Sample { "time-zones.tsv", u'\t' }));

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
