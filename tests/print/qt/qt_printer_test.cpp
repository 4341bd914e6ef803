// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/qt_printer.h"

#include "platform/qt/qt_text.h"
#include "print/page_list.h"
#include "print/paper_names.h"
#include "print/print_job.h"
#include "print/qt/print_test.h"
#include "support/qt/font_copies.h"

#include <QRectF>
#include <QRegularExpression>

#include <cmath>

namespace pelloric::qt {

namespace {

const Font DefaultFont { .name = u"宋体", .size = 10.5F };

/// Two pages with a text and a line each.
PageDocument twoPages()
{
    PageDocument document;
    addText(document, { 1000, 1000 }, u"first");
    addLine(document, { 1000, 1500 }, { 5000, 1500 });
    addPages(document, 1);
    addText(document, { 2000, 3000 }, u"Page 2 of [Pages]");
    return document;
}

PrintJob jobOf(std::int16_t copies, std::int16_t paperSize = 9, std::int16_t orientation = 1)
{
    PrintJob job;
    job.copies = copies;
    job.paperSize = paperSize;
    job.orientation = orientation;
    job.documentName = u"report";
    return job;
}

struct Word {
    QString text;
    QPointF topLeft; ///< points from the paper's top-left corner
};

/// The words of a PDF file in the order of the file.
std::vector<Word> wordsOf(const QString& path)
{
    static const QRegularExpression pattern(QStringLiteral(
        "<word xMin=\"([-0-9.]+)\" yMin=\"([-0-9.]+)\" xMax=\"[-0-9.]+\" yMax=\"[-0-9.]+\">"
        "([^<]*)</word>"));
    const ProgramResult result = runProgram(
        QStringLiteral("pdftotext"), { QStringLiteral("-bbox"), path, QStringLiteral("-") });
    EXPECT_EQ(result.status, 0) << result.errors.toStdString();
    std::vector<Word> words;
    auto matches = pattern.globalMatch(result.output);
    while (matches.hasNext()) {
        const QRegularExpressionMatch match = matches.next();
        words.push_back(
            { match.captured(3), { match.captured(1).toDouble(), match.captured(2).toDouble() } });
    }
    return words;
}

/// "612 x 792": the width and height of a PDF file's page, in points.
QString pageSizeOf(const QString& path)
{
    static const QRegularExpression pattern(
        QStringLiteral("Page size: +([0-9.]+) x ([0-9.]+) pts"));
    const QRegularExpressionMatch match
        = pattern.match(runProgram(QStringLiteral("pdfinfo"), { path }).output);
    return QStringLiteral("%1 x %2")
        .arg(std::lround(match.captured(1).toDouble()))
        .arg(std::lround(match.captured(2).toDouble()));
}

/// The program that made a PDF file.
QString producerOf(const QString& path)
{
    static const QRegularExpression pattern(QStringLiteral("Producer: +([^\n]+)"));
    return pattern.match(runProgram(QStringLiteral("pdfinfo"), { path }).output).captured(1);
}

std::int16_t codeNamed(const std::vector<PaperForm>& forms, TextView name)
{
    for (std::size_t i = 0; i < forms.size(); ++i) {
        if (forms[i].name == name)
            return static_cast<std::int16_t>(i + 1);
    }
    return 0;
}

/// What lets a printer take sizes of the user's own.
std::vector<PrivateCups::Change> customSizes()
{
    return { { "*DefaultImageableArea: A4",
        "*VariablePaperSize: True\n*MaxMediaWidth: \"2000\"\n*MaxMediaHeight: \"3000\"\n"
        "*HWMargins: 18 24 20 30\n"
        "*NonUIOrderDependency: 10 AnySetup *CustomPageSize\n"
        "*CustomPageSize True: \"pop pop pop <</PageSize[5 -2 roll]>>setpagedevice\"\n"
        "*ParamCustomPageSize Width: 1 points 36 2000\n"
        "*ParamCustomPageSize Height: 2 points 36 3000\n"
        "*ParamCustomPageSize WidthOffset: 3 points 0 0\n"
        "*ParamCustomPageSize HeightOffset: 4 points 0 0\n"
        "*ParamCustomPageSize Orientation: 5 int 0 0\n"
        "*DefaultImageableArea: A4" } };
}

/// A job without a form, for pages of a size in millimetres.
PrintJob exactJob(double widthMm, double heightMm)
{
    PrintJob job = jobOf(1, 0);
    job.pageWidth = static_cast<Twips>(std::lround(widthMm * 56.7));
    job.pageHeight = static_cast<Twips>(std::lround(heightMm * 56.7));
    return job;
}

/// Prints words on a grid of positions and compares where they came to stand.
/// @param margin  of the paper at the left: points
void expectTextsInPlace(const PageDocument& document, const QString& path, double margin)
{
    const std::vector<Word> words = wordsOf(path);
    const auto texts = document.texts(0);
    ASSERT_EQ(words.size(), texts.size());
    for (std::size_t i = 0; i < texts.size(); ++i) {
        EXPECT_EQ(toText(words[i].text), texts[i].text());
        EXPECT_NEAR((words[i].topLeft.x() - margin) * TwipsPerPoint, texts[i].pt.x, 0.2);
        EXPECT_NEAR((words[i].topLeft.y() - words[0].topLeft.y()) * TwipsPerPoint,
            texts[i].pt.y - texts[0].pt.y, 0.2);
    }
}

PageDocument scatteredWords()
{
    PageDocument document;
    for (int i = 0; i < 40; ++i)
        addText(document, { 137 * i + 11, 271 * i + 7 }, u"W" + decimal(i));
    return document;
}

using QtPrinterTest = PrintTest;

} // namespace

TEST_F(QtPrinterTest, SendsThreeCopiesOfTwoPagesAsSixJobsInOrder)
{
    EXPECT_EQ(doPrint(twoPages(), jobOf(3), DefaultFont, printing.printer()), 6);
    const std::vector<SpooledJob> jobs = cups.jobs();
    ASSERT_EQ(jobs.size(), 6U);
    for (std::size_t i = 0; i < jobs.size(); ++i) {
        EXPECT_EQ(jobs[i].number, static_cast<int>(i) + 1);
        EXPECT_EQ(jobs[i].printer, QStringLiteral("T1"));
        EXPECT_EQ(jobs[i].title, QStringLiteral("report – page %1").arg(i % 2 + 1));
        EXPECT_EQ(jobs[i].copies, QStringLiteral("-")) << "the scheduler was asked for copies";
        EXPECT_EQ(jobs[i].sides, QStringLiteral("one-sided"));
        EXPECT_EQ(jobs[i].media, QStringLiteral("A4"));
        EXPECT_EQ(pageSizeOf(cups.documentOf(jobs[i].number)), QStringLiteral("595 x 842"));
        const std::vector<Word> words = wordsOf(cups.documentOf(jobs[i].number));
        ASSERT_FALSE(words.empty());
        EXPECT_EQ(words.back().text, i % 2 == 0 ? QStringLiteral("first") : QStringLiteral("2"));
    }
}

TEST_F(QtPrinterTest, SendsWhatTheWriterOfFilesMakes)
{
    doPrint(twoPages(), jobOf(1), DefaultFont, printing.printer());
    for (const int job : { 1, 2 }) {
        EXPECT_EQ(producerOf(cups.documentOf(job)), QStringLiteral("Pelloric"));
        const ProgramResult check = runProgram(
            QStringLiteral("qpdf"), { QStringLiteral("--check"), cups.documentOf(job) });
        EXPECT_EQ(check.status, 0) << check.output.toStdString() << check.errors.toStdString();
    }
}

TEST_F(QtPrinterTest, LeavesADocumentWhoseFontMayNotBeSentAlongToTheToolkit)
{
    ASSERT_TRUE(loadLockedFont());
    PageDocument document;
    addText(document, { 1000, 1000 }, u"sent along");
    addText(document, { 1000, 2000 }, u"drawn", { .font = { .name = u"Locked Sans", .size = 12 } });
    doPrint(document, jobOf(1), DefaultFont, printing.printer());
    ASSERT_EQ(cups.jobs().size(), 1U);
    EXPECT_TRUE(producerOf(cups.documentOf(1)).startsWith(QStringLiteral("Qt")));
    EXPECT_EQ(pageSizeOf(cups.documentOf(1)), QStringLiteral("595 x 842"));
    EXPECT_EQ(wordsOf(cups.documentOf(1)).front().text, QStringLiteral("sent"));
}

TEST_F(QtPrinterTest, SendsSeveralPagesOfOneDocumentWithTheAttributesThatWereSet)
{
    Printer& printer = printing.printer();
    printer.setFontName(u"宋体");
    printer.setFontSize(10);
    for (const TextView text : { u"one", u"two", u"three" }) {
        if (text != u"one")
            printer.newPage();
        printer.setCurrentX(500);
        printer.setCurrentY(500);
        printer.print(text);
    }
    printer.endDoc();
    ASSERT_EQ(cups.jobs().size(), 1U);
    const std::vector<Word> words = wordsOf(cups.documentOf(1));
    ASSERT_EQ(words.size(), 3U);
    EXPECT_EQ(words[2].text, QStringLiteral("three"));
    EXPECT_EQ(words[2].topLeft, words[0].topLeft);
}

TEST_F(QtPrinterTest, SendsEachJobWithPaperAndOrientationOfItsOwn)
{
    const std::int16_t ownPaper = codeNamed(printing.system().forms(), u"16开");
    ASSERT_GT(ownPaper, 0);
    Printer& printer = printing.printer();
    EXPECT_EQ(printer.paperSize(), 9);
    doPrint(twoPages(), jobOf(1, ownPaper, 2), DefaultFont, printer);
    EXPECT_EQ(printer.paperSize(), 9);
    EXPECT_EQ(printer.orientation(), 1);
    doPrint(twoPages(), jobOf(1, 8, 2), DefaultFont, printer);
    doPrint(twoPages(), jobOf(1, 0, 1), DefaultFont, printer);
    doPrint(twoPages(), jobOf(1, 32767, 1), DefaultFont, printer);
    const std::vector<SpooledJob> jobs = cups.jobs();
    ASSERT_EQ(jobs.size(), 8U);
    const char* const media[] = { "K16", "A3", "A4", "A4" };
    const char* const sizes[] = { "774 x 558", "1191 x 842", "595 x 842", "595 x 842" };
    for (std::size_t i = 0; i < jobs.size(); ++i) {
        EXPECT_EQ(jobs[i].media, QLatin1String(media[i / 2]));
        EXPECT_EQ(pageSizeOf(cups.documentOf(jobs[i].number)), QLatin1String(sizes[i / 2]));
        EXPECT_EQ(jobs[i].sides, QStringLiteral("one-sided"));
    }
}

TEST_F(QtPrinterTest, PrintsOnAPaperThatThePrinterItselfDoesNotOffer)
{
    doPrint(twoPages(), jobOf(1, 11), DefaultFont, printing.printer());
    ASSERT_EQ(cups.jobs().size(), 2U);
    EXPECT_EQ(pageSizeOf(cups.documentOf(1)), QStringLiteral("420 x 595"));
}

TEST_F(QtPrinterTest, PutsTextsWhereTheRecordsStandFromTheCornerOfThePrintableArea)
{
    const PageDocument document = scatteredWords();
    doPrint(document, jobOf(1), DefaultFont, printing.printer());
    doPrint(document, jobOf(1, 8), DefaultFont, printing.printer());
    doPrint(document, jobOf(1, 9, 2), DefaultFont, printing.printer());
    ASSERT_EQ(cups.jobs().size(), 3U);
    expectTextsInPlace(document, cups.documentOf(1), 18);
    expectTextsInPlace(document, cups.documentOf(2), 36);
    expectTextsInPlace(document, cups.documentOf(3), 24);
}

TEST_F(QtPrinterTest, BeginsLyingPagesAtTheTurnedCornerOfThePrintableArea)
{
    ASSERT_TRUE(cups.addPrinter(
        QStringLiteral("Clockwise"), { { "Orientation: Plus90", "Orientation: Minus90" } }));
    PageDocument document;
    addText(document, { 0, 0 }, u"corner");
    const auto corner = [&](int job) { return wordsOf(cups.documentOf(job)).at(0).topLeft; };
    doPrint(document, jobOf(1), DefaultFont, printing.printer());
    doPrint(document, jobOf(1, 9, 2), DefaultFont, printing.printer());
    printing.system().makeCurrent(u"Clockwise");
    doPrint(document, jobOf(1, 9, 2), DefaultFont, printing.printer());
    ASSERT_EQ(cups.jobs().size(), 3U);
    // The free edges of the upright A4 sheet: left 18, top 30, right 20, bottom 24 points.
    const double above = corner(1).y() - 30; // of the face, over its letters
    EXPECT_NEAR(corner(1).x(), 18, 0.1);
    EXPECT_NEAR(corner(2).x(), 24, 0.1);
    EXPECT_NEAR(corner(2).y(), 18 + above, 0.1);
    EXPECT_NEAR(corner(3).x(), 30, 0.1);
    EXPECT_NEAR(corner(3).y(), 20 + above, 0.1);
}

TEST_F(QtPrinterTest, SendsTheExactSizeWhereNoFormIsNamed)
{
    ASSERT_TRUE(cups.addPrinter(QStringLiteral("Any"), customSizes()));
    printing.system().makeCurrent(u"Any");
    Printer& printer = printing.printer();
    const auto sheet = [&](const PrintJob& job) {
        return printing.system()
            .sheetFor({ job.paperSize, job.orientation, job.pageWidth, job.pageHeight })
            .value_or(PaperForm());
    };
    const PrintJob eightK = exactJob(270, 390);
    EXPECT_NEAR(sheet(eightK).widthMm, 270, 0.5);
    EXPECT_NEAR(sheet(eightK).heightMm, 390, 0.5);
    doPrint(twoPages(), eightK, DefaultFont, printer);
    doPrint(twoPages(), exactJob(150, 100), DefaultFont, printer);
    doPrint(twoPages(), exactJob(197, 273), DefaultFont, printer);
    doPrint(twoPages(), exactJob(297, 210), DefaultFont, printer);
    doPrint(twoPages(), jobOf(1, 8), DefaultFont, printer);
    EXPECT_EQ(printer.paperSize(), 9);
    const std::vector<SpooledJob> jobs = cups.jobs();
    ASSERT_EQ(jobs.size(), 10U);
    const char* const sizes[]
        = { "765 x 1106", "425 x 283", "558 x 774", "842 x 595", "842 x 1191" };
    for (std::size_t i = 0; i < jobs.size(); ++i)
        EXPECT_EQ(pageSizeOf(cups.documentOf(jobs[i].number)), QLatin1String(sizes[i / 2]));
    EXPECT_TRUE(jobs[0].media.startsWith(QStringLiteral("Custom."))) << jobs[0].media.toStdString();
    EXPECT_EQ(jobs[4].media, QStringLiteral("K16"));
    EXPECT_EQ(jobs[6].media, QStringLiteral("A4"));
}

TEST_F(QtPrinterTest, TakesItsDefaultSheetForASizeThatItDoesNotTake)
{
    const PrintJob job = exactJob(270, 390);
    const auto sheet = printing.system().sheetFor({ 0, 1, job.pageWidth, job.pageHeight });
    ASSERT_TRUE(sheet);
    EXPECT_EQ(sheet->name, u"A4");
    doPrint(twoPages(), job, DefaultFont, printing.printer());
    ASSERT_EQ(cups.jobs().size(), 2U);
    EXPECT_EQ(pageSizeOf(cups.documentOf(1)), QStringLiteral("595 x 842"));
}

TEST_F(QtPrinterTest, SendsAPageWithoutRecordsAsABlankPage)
{
    const PageDocument document;
    EXPECT_EQ(doPrint(document, jobOf(1), DefaultFont, printing.printer()), 1);
    ASSERT_EQ(cups.jobs().size(), 1U);
    EXPECT_EQ(pageSizeOf(cups.documentOf(1)), QStringLiteral("595 x 842"));
    EXPECT_TRUE(wordsOf(cups.documentOf(1)).empty());
}

TEST_F(QtPrinterTest, EndsNoDocumentThatHasNotBegun)
{
    Printer& printer = printing.printer();
    printer.endDoc();
    printer.setFontName(u"宋体");
    printer.setForeColor(255);
    printer.endDoc();
    doPrint(twoPages(), jobOf(0), DefaultFont, printer);
    EXPECT_TRUE(cups.jobs().empty());
    printer.setCurrentX(500);
    printer.setFontSize(12);
    printer.print(u"begun by drawing");
    printer.newPage();
    printer.print(u"second");
    printer.endDoc();
    ASSERT_EQ(cups.jobs().size(), 1U);
    const std::vector<Word> words = wordsOf(cups.documentOf(1));
    ASSERT_EQ(words.size(), 4U);
    EXPECT_NEAR((words[0].topLeft.x() - 18) * TwipsPerPoint, 500, 0.2);
    EXPECT_NEAR((words[3].topLeft.x() - 18) * TwipsPerPoint, 0, 0.2);
}

TEST_F(QtPrinterTest, ListsTheStandardFormsAndThenThePrintersOwn)
{
    const std::vector<PaperForm> forms = printing.system().forms();
    const std::vector<PaperForm> standard = standardPaperForms();
    ASSERT_EQ(forms.size(), standard.size() + 2);
    EXPECT_TRUE(std::equal(standard.begin(), standard.end(), forms.begin()));
    EXPECT_EQ(forms[8].name, u"A4");
    const PaperForm& own = forms[standard.size()];
    EXPECT_EQ(own.name, u"16开");
    EXPECT_NEAR(own.widthMm, 197, 0.3);
    EXPECT_NEAR(own.heightMm, 273, 0.3);
    EXPECT_EQ(forms[standard.size() + 1].name, u"B5 纸");
}

TEST_F(QtPrinterTest, TakesTheDefaultPrinterAtFirstAndAnotherWhenTold)
{
    ASSERT_TRUE(cups.addPrinter(QStringLiteral("A0")));
    QtPrinterSystem& system = printing.system();
    EXPECT_EQ(system.printerNames(), (std::vector<Text> { u"A0", u"T1" }));
    EXPECT_EQ(system.currentPrinter(), u"T1");
    system.makeCurrent(u"nobody");
    EXPECT_EQ(system.currentPrinter(), u"T1");
    system.makeCurrent(u"A0");
    EXPECT_EQ(system.currentPrinter(), u"A0");
    EXPECT_EQ(printing.printer().deviceName(), u"A0");
    doPrint(twoPages(), jobOf(1), DefaultFont, printing.printer());
    const std::vector<SpooledJob> jobs = cups.jobs();
    ASSERT_EQ(jobs.size(), 2U);
    EXPECT_EQ(jobs[0].printer, QStringLiteral("A0"));
}

TEST_F(QtPrinterTest, LeavesEachPrinterItsOwnPaper)
{
    ASSERT_TRUE(cups.addPrinter(QStringLiteral("A0")));
    ASSERT_TRUE(cups.command(QStringLiteral("lpadmin"),
        { QStringLiteral("-p"), QStringLiteral("A0"), QStringLiteral("-o"),
            QStringLiteral("PageSize=A3") }));
    Printer& printer = printing.printer();
    doPrint(twoPages(), jobOf(1), DefaultFont, printer);
    EXPECT_EQ(printer.paperSize(), 9);
    printing.system().makeCurrent(u"A0");
    EXPECT_EQ(printer.paperSize(), 8);
    doPrint(twoPages(), jobOf(1, 0), DefaultFont, printer);
    const std::vector<SpooledJob> jobs = cups.jobs();
    ASSERT_EQ(jobs.size(), 4U);
    EXPECT_EQ(jobs[1].media, QStringLiteral("A4"));
    EXPECT_EQ(jobs[3].media, QStringLiteral("A3"));
}

TEST_F(QtPrinterTest, PrintsTheRealPagesOfAnEndlessRangeAndSkipsNonsense)
{
    const PageDocument document = twoPages();
    PrintJob job = jobOf(1);
    job.allPages = false;
    job.pages = pageNumbersOf(pageListOf(u"1-1000000"));
    EXPECT_EQ(doPrint(document, job, DefaultFont, printing.printer()), 2);
    job.pages = pageNumbersOf(pageListOf(u"x,,2,-,99999999999,é,2.6,0x1"));
    EXPECT_EQ(doPrint(document, job, DefaultFont, printing.printer()), 1);
    job.pages = pageNumbersOf(pageListOf(u"nothing of this"));
    EXPECT_EQ(doPrint(document, job, DefaultFont, printing.printer()), 0);
    EXPECT_EQ(cups.jobs().size(), 3U);
}

} // namespace pelloric::qt
