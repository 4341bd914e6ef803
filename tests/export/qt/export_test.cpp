// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/page_export.h"

#include "document/ostl_writer.h"
#include "fakes/temp_folder.h"
#include "platform/qt/qt_files.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_text_codec.h"
#include "platform/qt/uming.h"
#include "platform/run_time_error.h"
#include "platform/safe_file.h"
#include "support/errors.h"
#include "support/recorded_pages.h"

#include <QImage>
#include <QPainter>
#include <QProcess>
#include <QRegularExpression>
#include <QSvgRenderer>
#include <QXmlStreamReader>

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

constexpr double Tolerance = 0.2; ///< twips

/// What a tool of poppler writes about a PDF file.
QString ask(const QString& tool, const QStringList& arguments)
{
    QProcess process;
    process.start(tool, arguments);
    process.waitForFinished();
    EXPECT_EQ(process.exitCode(), 0) << tool.toStdString() << ": install poppler-utils";
    return QString::fromUtf8(process.readAllStandardOutput());
}

QString nameOf(const std::filesystem::path& path) { return QString::fromStdString(path.string()); }

class PageExport : public testing::Test {
protected:
    void SetUp() override { ASSERT_TRUE(loadUming()); }

    /// Adds a text of 10 points.
    void add(Tpoint point, TextView text, bool bold = false)
    {
        addText(
            document_, point, text, { .font = { .name = Text(Uming), .size = 10, .bold = bold } });
    }

    /// Three pages with a text and a line each.
    void addThreePages()
    {
        for (int page = 1; page <= 3; ++page) {
            if (page > 1)
                document_.newPage();
            add({ 1000, 2000 }, u"page" + decimal(page) + u"of[Pages]");
            addLine(document_, { 0, 1440 }, { 11907, 1440 });
        }
    }

    std::filesystem::path pdf(const ExportOptions& options = {})
    {
        const auto path = folder_.file("a.pdf");
        exportPdf(document_, setup_, fonts_, options, path);
        return path;
    }

    QString pdfText(const ExportOptions& options = {})
    {
        return ask(QStringLiteral("pdftotext"), { nameOf(pdf(options)), QStringLiteral("-") });
    }

    TempFolder folder_;
    PageDocument document_;
    PageSetup setup_;
    QtFonts fonts_;
};

/// The left edge of a word of a PDF file: twips.
double leftOf(const QString& boxes, const QString& word)
{
    const QRegularExpression pattern(
        QStringLiteral("<word xMin=\"([0-9.]+)\"[^>]*>%1</word>").arg(word));
    const auto match = pattern.match(boxes);
    EXPECT_TRUE(match.hasMatch()) << word.toStdString();
    return match.captured(1).toDouble() * TwipsPerPoint;
}

double topOf(const QString& boxes, const QString& word)
{
    const QRegularExpression pattern(QStringLiteral("yMin=\"([0-9.]+)\"[^>]*>%1</word>").arg(word));
    const auto match = pattern.match(boxes);
    EXPECT_TRUE(match.hasMatch()) << word.toStdString();
    return match.captured(1).toDouble() * TwipsPerPoint;
}

} // namespace

TEST_F(PageExport, PdfTextsStandWhereTheyAreRecorded)
{
    setup_.myWidth = 8001;
    setup_.myHeight = 6013; // neither is whole points
    add({ 1003, 517 }, u"alpha");
    add({ 2501, 1731 }, u"beta");
    add({ 4007, 3333 }, u"北京市");
    const QString boxes = ask(QStringLiteral("pdftotext"),
        { QStringLiteral("-bbox"), nameOf(pdf()), QStringLiteral("-") });
    EXPECT_NEAR(leftOf(boxes, QStringLiteral("alpha")), 1003, Tolerance);
    EXPECT_NEAR(leftOf(boxes, QStringLiteral("beta")), 2501, Tolerance);
    EXPECT_NEAR(leftOf(boxes, QStringLiteral("北京市")), 4007, Tolerance);
    const double first = topOf(boxes, QStringLiteral("alpha"));
    EXPECT_NEAR(topOf(boxes, QStringLiteral("beta")) - first, 1731 - 517, Tolerance);
    EXPECT_NEAR(topOf(boxes, QStringLiteral("北京市")) - first, 3333 - 517, Tolerance);
}

TEST_F(PageExport, PdfPagesHaveExactlyThePapersSize)
{
    setup_.myWidth = 8001;
    setup_.myHeight = 6013;
    addThreePages();
    const QString facts = ask(QStringLiteral("pdfinfo"), { nameOf(pdf({ .title = u"总表" })) });
    EXPECT_TRUE(facts.contains(QStringLiteral("400.05 x 300.65 pts"))) << facts.toStdString();
    EXPECT_TRUE(facts.contains(QRegularExpression(QStringLiteral("Pages: +3\\n"))))
        << facts.toStdString();
    EXPECT_TRUE(facts.contains(QRegularExpression(QStringLiteral("Title: +总表\\n"))))
        << facts.toStdString();
}

TEST_F(PageExport, PdfEmbedsOnlyTheCharactersThatAreUsed)
{
    add({ 1000, 1000 }, u"北京 Beijing");
    EXPECT_LT(std::filesystem::file_size(pdf()), 30000U);
    const QString list = ask(QStringLiteral("pdffonts"), { nameOf(folder_.file("a.pdf")) });
    EXPECT_TRUE(list.contains(QRegularExpression(QStringLiteral("Custom +yes +\\w+ +yes"))))
        << list.toStdString();
}

TEST_F(PageExport, PdfHoldsAMadeUpBoldTextOnce)
{
    add({ 1000, 1000 }, u"加粗Bold", true);
    EXPECT_EQ(pdfText().count(QStringLiteral("Bold")), 1);
}

TEST_F(PageExport, PdfTakesTheChosenPagesInTheirOrder)
{
    addThreePages();
    const QString text = pdfText({ .pages = { 2, 0 } });
    EXPECT_EQ(text.count(QLatin1Char('\f')), 2);
    EXPECT_LT(text.indexOf(QStringLiteral("page3of3")), text.indexOf(QStringLiteral("page1of3")));
    EXPECT_GE(text.indexOf(QStringLiteral("page3of3")), 0);
}

TEST_F(PageExport, RefusesAPageThatDoesNotExistAndWritesNothing)
{
    const auto attempt = [&] { pdf({ .pages = { 7 } }); };
    EXPECT_EQ(errorOf(attempt), ErrorNumber::SubscriptOutOfRange);
    EXPECT_TRUE(folder_.names().empty());
}

TEST_F(PageExport, ImagesHaveThePapersSizeOnWhite)
{
    addThreePages();
    const auto paths = exportPngs(document_, setup_, { .dpi = 96 }, folder_.file("a.png"));
    ASSERT_EQ(paths.size(), 3U);
    EXPECT_EQ(paths.at(2), folder_.file("a-003.png"));
    const QImage image(nameOf(paths.at(2)));
    EXPECT_EQ(image.size(), QSize(794, 1123));
    EXPECT_EQ(image.pixelColor(10, 10), QColor(Qt::white));
    EXPECT_EQ(image.pixelColor(300, 96), QColor(Qt::black));
    EXPECT_EQ(image.dotsPerMeterX(), 3780);
}

TEST_F(PageExport, ASinglePageIsWrittenToThePathItself)
{
    addThreePages();
    const auto path = folder_.file("a.png");
    const ExportOptions options { .pages = { 1, 1 }, .dpi = 30 };
    EXPECT_EQ(exportPngs(document_, setup_, options, path), std::vector { path });
    EXPECT_EQ(folder_.names(), std::vector<std::string> { "a.png" });
}

TEST_F(PageExport, RefusesAnImageThatIsTooLarge)
{
    const auto attempt
        = [&] { exportPngs(document_, setup_, { .dpi = 100000 }, folder_.file("a.png")); };
    EXPECT_EQ(errorOf(attempt), ErrorNumber::Overflow);
}

TEST_F(PageExport, SvgFilesCanBeRead)
{
    addThreePages();
    const auto paths = exportSvg(document_, setup_, fonts_, {}, folder_.file("a.svg"));
    ASSERT_EQ(paths.size(), 3U);
    QSvgRenderer renderer(nameOf(paths.at(1)));
    ASSERT_TRUE(renderer.isValid());
    EXPECT_NEAR(renderer.viewBoxF().width(), setup_.myWidth / 15.0, 0.1);
    QImage image(794, 1123, QImage::Format_RGB32);
    image.fill(Qt::white);
    QPainter painter(&image);
    renderer.render(&painter);
    painter.end();
    EXPECT_LT(image.pixelColor(300, 96).lightness(), 160);
    EXPECT_TRUE(folder_.read("a-002.svg").find("page2of3") != std::string::npos);
}

TEST_F(PageExport, SvgFilesHoldNothingThatXmlForbids)
{
    add({ 100, 100 },
        Text { u'a', 1, 0x1B, u'<', u'&', u'"', 0xD800, 0xFFFE, u'\t', u'b', u'\n', u'c' });
    exportSvg(document_, setup_, fonts_, { .title = u"<&>" }, folder_.file("a.svg"));
    QXmlStreamReader xml(QByteArray::fromStdString(folder_.read("a.svg")));
    QString texts;
    while (!xml.atEnd()) {
        xml.readNext();
        if (xml.isStartElement() && xml.name() == QLatin1String("text"))
            texts += xml.readElementText() + QLatin1Char('|');
    }
    EXPECT_FALSE(xml.hasError()) << xml.errorString().toStdString();
    EXPECT_EQ(texts.toStdString(), "a|<&\"|\xEF\xBF\xBD|b|c|");
}

TEST_F(PageExport, SvgStrokesAndHatchesAreSeenInLibrsvg)
{
    setup_.myWidth = 14400;
    setup_.myHeight = 14400;
    for (std::int16_t style = 0; style < 5; ++style)
        addLine(document_, { 0, 750 + 1500 * style }, { 14400, 750 + 1500 * style },
            { .LineStyle = style, .LineWidth = 3 });
    for (std::int16_t style = 0; style < 8; ++style)
        addLine(document_, { 1800 * style + 300, 9000 }, { 1800 * style + 1500, 12000 },
            { .LineStyle = 5, .FillStyle = style, .FillColor = 0 });
    exportSvg(document_, setup_, fonts_, {}, folder_.file("a.svg"));
    ask(QStringLiteral("rsvg-convert"),
        { QStringLiteral("-o"), nameOf(folder_.file("a.png")), nameOf(folder_.file("a.svg")) });
    const QImage image(nameOf(folder_.file("a.png")));
    ASSERT_EQ(image.size(), QSize(960, 960));
    const auto inkOf = [&](const QRect& area) {
        double ink = 0;
        for (int y = area.top(); y <= area.bottom(); ++y) {
            for (int x = area.left(); x <= area.right(); ++x)
                ink += 1 - qGray(image.pixel(x, y)) / 255.0;
        }
        return ink / (area.width() * area.height());
    };
    // Of a band as high as the pen: all of it, and what the strokes of each style cover.
    const double strokes[] = { 1, 4.0 / 6, 1.0 / 3, 5.0 / 9, 6.0 / 12 };
    for (int style = 0; style < 5; ++style)
        EXPECT_NEAR(inkOf({ 0, 40 + 100 * style, 960, 20 }) * 20 / 3, strokes[style], 0.05)
            << style;
    // Lines of one unit in tiles of eight; a diagonal covers root two of what a level line does.
    const double fills[] = { 1, 0, 1.0 / 8, 1.0 / 8, 0.177, 0.177, 15.0 / 64, 0.33 };
    for (int style = 0; style < 8; ++style)
        EXPECT_NEAR(inkOf({ 120 * style + 28, 608, 64, 184 }), fills[style], 0.03) << style;
}

TEST_F(PageExport, ADocumentFileIsTheSavedOne)
{
    addThreePages();
    const QtTextCodec codec;
    QtFiles files;
    writeOstl(document_, setup_, { codec }, {}, SafeFile(files, folder_.file("saved.ostl")));
    exportOstl(document_, setup_, { codec }, {}, folder_.file("exported.ostl"));
    EXPECT_EQ(folder_.read("exported.ostl"), folder_.read("saved.ostl"));
}

TEST_F(PageExport, AFailureLeavesWhatThereWas)
{
    addThreePages();
    folder_.write("a.pdf", "old");
    folder_.write("a-001.png", "old");
    const ExportOptions options { .dpi = 30, .progress = [](int done, int) { return done < 2; } };
    EXPECT_EQ(errorOf([&] { pdf(options); }), ErrorNumber::Cancelled);
    EXPECT_EQ(errorOf([&] { exportPngs(document_, setup_, options, folder_.file("a.png")); }),
        ErrorNumber::Cancelled);
    EXPECT_EQ(folder_.read("a.pdf"), "old");
    EXPECT_EQ(folder_.read("a-001.png"), "old");
    EXPECT_EQ(folder_.names().size(), 2U);
}

TEST_F(PageExport, AnUnwritablePathIsNamed)
{
    const auto path = folder_.file("missing") / "a.pdf";
    try {
        exportPdf(document_, setup_, fonts_, {}, path);
        FAIL() << "it was written";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::WriteFailed);
        EXPECT_NE(toUtf8(error.text()).find(path.string()), std::string::npos);
    }
}

} // namespace pelloric::qt
