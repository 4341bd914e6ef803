// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/page_export.h"
#include "fakes/temp_folder.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_text.h"
#include "platform/qt/uming.h"
#include "platform/run_time_error.h"
#include "support/qt/font_copies.h"
#include "support/qt/pictures.h"
#include "support/recorded_pages.h"

#include <QColor>
#include <QRegularExpression>

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

QString nameOf(const std::filesystem::path& path) { return QString::fromStdString(path.string()); }

/// How dark a colour is on a page of its own.
int shadeOf(QColor color)
{
    QImage image(1, 1, QImage::Format_RGB32);
    image.fill(color);
    return shadeAt(image.convertToFormat(QImage::Format_Grayscale8), 0, 0);
}

class PdfExportTest : public testing::Test {
protected:
    void SetUp() override { ASSERT_TRUE(loadUming()); }

    void add(TextView text, TextView family = u"DejaVu Sans", Tpoint point = { 1000, 1000 })
    {
        addText(document_, point, text, { .font = { .name = Text(family), .size = 14 } });
    }

    QString pdf(const ExportOptions& options = {})
    {
        const auto path = folder_.file("a.pdf");
        because_ = exportPdf(document_, setup_, fonts_, options, path).byToolkitBecause;
        return nameOf(path);
    }

    QString answer(const QString& program, const QStringList& arguments)
    {
        const ProgramResult result = runProgram(program, arguments);
        EXPECT_EQ(result.status, 0) << program.toStdString() << result.errors.toStdString();
        return result.output;
    }

    /// The text of the only line, as poppler reads it, without marks of direction.
    std::string popplersText()
    {
        QString text = answer(QStringLiteral("pdftotext"), { pdf(), QStringLiteral("-") });
        static const QRegularExpression marks(QStringLiteral("[\\x{202A}-\\x{202E}\\f]"));
        return text.remove(marks).trimmed().toStdString();
    }

    /// The same as mupdf reads it.
    std::string mupdfsText()
    {
        return answer(QStringLiteral("mutool"),
            { QStringLiteral("draw"), QStringLiteral("-q"), QStringLiteral("-F"),
                QStringLiteral("txt"), pdf() })
            .trimmed()
            .toStdString();
    }

    /// The file unpacked.
    std::string unpacked()
    {
        const QString path = nameOf(folder_.file("unpacked.pdf"));
        answer(QStringLiteral("qpdf"),
            { QStringLiteral("--qdf"), QStringLiteral("--object-streams=disable"), pdf(), path });
        return folder_.read("unpacked.pdf");
    }

    TempFolder folder_;
    PageDocument document_;
    PageSetup setup_;
    QtFonts fonts_;
    Text because_;
};

} // namespace

TEST_F(PdfExportTest, ArabicIsReadInItsOrderAndAsLetters)
{
    add(u"السلام عليكم");
    EXPECT_EQ(popplersText(), "السلام عليكم");
    EXPECT_EQ(because_, u"");
}

TEST_F(PdfExportTest, HebrewBesideNumbersIsReadInItsOrder)
{
    add(u"שלום 123 abc");
    const std::string text = popplersText();
    EXPECT_NE(text.find("שלום"), std::string::npos) << text;
    EXPECT_NE(text.find("123"), std::string::npos) << text;
    EXPECT_NE(text.find("abc"), std::string::npos) << text;
}

TEST_F(PdfExportTest, CombiningMarksStayWithTheirLetters)
{
    add(u"e\u0301a\u0308 n\u0303");
    EXPECT_EQ(popplersText(), toUtf8(u"e\u0301a\u0308 n\u0303"));
    EXPECT_EQ(mupdfsText(), toUtf8(u"e\u0301a\u0308 n\u0303"));
}

TEST_F(PdfExportTest, CharactersThatShareAGlyphAreReadAsTheyWere)
{
    add(u"A\u0391\u0410 -\u2010K\u212A"); // three capital letters, two hyphens, two Ks
    EXPECT_EQ(mupdfsText(), toUtf8(u"A\u0391\u0410 -\u2010K\u212A"));
}

TEST_F(PdfExportTest, EmojiAndRareHanAreRead)
{
    add(u"\U0001F600 ok", Uming);
    EXPECT_EQ(popplersText(), "\U0001F600 ok");
}

TEST_F(PdfExportTest, EmbedsOnePartOfAFontForAllItsGuises)
{
    for (const bool bold : { false, true }) {
        for (const bool italic : { false, true })
            addText(document_, { 1000, 1000 }, u"北京",
                { .font = { .name = Text(Uming), .bold = bold, .italic = italic } });
    }
    const QString list = answer(QStringLiteral("pdffonts"), { pdf() });
    EXPECT_EQ(list.count(QStringLiteral("UMing")), 1) << list.toStdString();
    EXPECT_TRUE(list.contains(
        QRegularExpression(QStringLiteral("[A-Z]{6}\\+\\S+ +CID TrueType +Custom +yes +yes +yes"))))
        << list.toStdString();
}

TEST_F(PdfExportTest, EmbedsOutlinesOfTheCffKind)
{
    ASSERT_TRUE(loadCffFont());
    add(u"Nimbus fifteen", u"Curved Roman");
    const std::string fonts = answer(QStringLiteral("pdffonts"), { pdf() }).toStdString();
    EXPECT_NE(fonts.find("CID Type 0C"), std::string::npos) << fonts;
    EXPECT_EQ(toUtf8(because_), "");
    EXPECT_EQ(popplersText(), "Nimbus fifteen");
    EXPECT_EQ(mupdfsText(), "Nimbus fifteen");
}

TEST_F(PdfExportTest, SaysWhichPaperTitleAndLanguageAFileHas)
{
    setup_.myWidth = 8001;
    setup_.myHeight = 6013;
    add(u"x");
    const QString facts = answer(
        QStringLiteral("pdfinfo"), { pdf({ .title = u"总表 (1)", .language = u"zh-CN" }) });
    EXPECT_TRUE(facts.contains(QStringLiteral("400.05 x 300.65 pts"))) << facts.toStdString();
    EXPECT_TRUE(facts.contains(QRegularExpression(QStringLiteral("Title: +总表 \\(1\\)\\n"))));
    EXPECT_TRUE(facts.contains(QRegularExpression(QStringLiteral("Creator: +Pelloric\\n"))));
    EXPECT_TRUE(facts.contains(QRegularExpression(QStringLiteral("CreationDate: +\\w+"))));
    EXPECT_NE(unpacked().find("/Lang"), std::string::npos);
}

TEST_F(PdfExportTest, ManyPagesHangOnATreeThatReadersWalk)
{
    for (int page = 0; page < 200; ++page) {
        if (page > 0)
            document_.newPage();
        add(u"page" + decimal(page + 1));
    }
    const QString text = answer(QStringLiteral("pdftotext"), { pdf(), QStringLiteral("-") });
    EXPECT_EQ(text.count(u'\f'), 200);
    EXPECT_TRUE(text.contains(QStringLiteral("page200\n")));
    answer(QStringLiteral("qpdf"), { QStringLiteral("--check"), pdf() });
}

TEST_F(PdfExportTest, EveryReaderOpensIt)
{
    addSampleRecords(document_);
    for (std::int16_t fill = 0; fill < 8; ++fill)
        addLine(document_, { 1000 + 900 * fill, 3000 }, { 1700 + 900 * fill, 3500 },
            { .LineStyle = 2, .FillStyle = fill, .FillColor = rgb(200, 40, 80) });
    add(u"北京 Ж مرحبا é");
    const QString path = pdf();
    answer(QStringLiteral("qpdf"), { QStringLiteral("--check"), path });
    const ProgramResult ghostscript = runProgram(QStringLiteral("gs"),
        { QStringLiteral("-q"), QStringLiteral("-dNOPAUSE"), QStringLiteral("-dBATCH"),
            QStringLiteral("-dPDFSTOPONWARNING"), QStringLiteral("-sDEVICE=nullpage"), path });
    EXPECT_EQ(ghostscript.status, 0);
    EXPECT_EQ((ghostscript.output + ghostscript.errors).toStdString(), "");
    const ProgramResult mupdf = runProgram(QStringLiteral("mutool"),
        { QStringLiteral("draw"), QStringLiteral("-o"), nameOf(folder_.file("m.png")), path });
    EXPECT_EQ(mupdf.status, 0);
    const QString warnings
        = QString(mupdf.errors).remove(QStringLiteral("warning: ICC support is not available"));
    EXPECT_FALSE(warnings.contains(QStringLiteral("warning"))) << warnings.toStdString();
}

TEST_F(PdfExportTest, PassesPicturesOnAndKeepsWhatIsTransparent)
{
    QImage image(4, 4, QImage::Format_ARGB32);
    image.fill(QColor(255, 0, 0));
    image.save(nameOf(folder_.file("red.jpg")), "JPG");
    image.convertToFormat(QImage::Format_RGB32).save(nameOf(folder_.file("red.png")));
    image.fill(QColor(0, 0, 255, 128));
    image.save(nameOf(folder_.file("half.png")));
    for (const char* const name : { "red.jpg", "red.png", "half.png", "missing.png" }) {
        document_.placePicture(document_.currentPage,
            { 1000, 1000, 2000, 2000, u"", toText(nameOf(folder_.file(name))) });
        document_.newPage();
    }
    const QString path = pdf();
    EXPECT_NE(unpacked().find("/DCTDecode"), std::string::npos);
    EXPECT_NE(unpacked().find("/SMask"), std::string::npos);
    const QString folder = nameOf(folder_.path());
    const int red = shadeOf(QColor(255, 0, 0));
    EXPECT_NEAR(shadeAt(paperPicture(path, folder, 1), 200, 200), red, 3);
    EXPECT_NEAR(shadeAt(paperPicture(path, folder, 2), 200, 200), red, 1);
    EXPECT_NEAR(
        shadeAt(paperPicture(path, folder, 3), 200, 200), shadeOf(QColor(127, 127, 255)), 2);
    EXPECT_EQ(shadeAt(paperPicture(path, folder, 4), 200, 200), 255);
}

TEST_F(PdfExportTest, AFontThatMayNotBeEmbeddedLeavesTheFileToTheToolkitAndIsNamed)
{
    ASSERT_TRUE(loadLockedFont());
    add(u"first page");
    document_.newPage();
    add(u"second page", u"Locked Sans");
    const QString text = answer(QStringLiteral("pdftotext"), { pdf(), QStringLiteral("-") });
    EXPECT_EQ(toUtf8(because_), "the font Locked Sans may not be embedded");
    EXPECT_TRUE(text.contains(QStringLiteral("first page"))) << text.toStdString();
    EXPECT_EQ(folder_.names(), std::vector<std::string> { "a.pdf" });
    const QImage page = paperPicture(pdf(), nameOf(folder_.path()), 2);
    EXPECT_FALSE(inkOf(page).isEmpty()) << "its characters are drawn as shapes";
}

/// Several formats of these families are installed; the toolkit would take the old one.
TEST_F(PdfExportTest, AFamilyOfSeveralFormatsIsEmbeddedInTheOneThatFilesCanHold)
{
    for (const TextView name : { u"Nimbus Sans", u"Arial", u"Times New Roman", u"Courier New" }) {
        for (const int guise : { 0, 1, 2, 3 })
            addText(document_, { 1000, 1000 }, u"Quick brown fox",
                { .font = { .name = Text(name), .bold = guise % 2 == 1, .italic = guise > 1 } });
    }
    const QString fonts = answer(QStringLiteral("pdffonts"), { pdf() });
    EXPECT_EQ(toUtf8(because_), "");
    for (const char* const face : { "NimbusSans-Regular", "NimbusSans-BoldItalic",
             "NimbusRoman-Bold", "NimbusMonoPS-Italic" })
        EXPECT_TRUE(fonts.contains(QLatin1String(face))) << face << "\n" << fonts.toStdString();
}

TEST_F(PdfExportTest, CancellingLeavesNothing)
{
    for (int page = 0; page < 5; ++page)
        document_.newPage();
    const ExportOptions options { .progress = [](int done, int) { return done < 3; } };
    EXPECT_THROW(pdf(options), RunTimeError);
    EXPECT_TRUE(folder_.names().empty());
}

} // namespace pelloric::qt
