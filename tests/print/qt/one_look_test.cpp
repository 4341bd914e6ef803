// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/sorvane_world.h"
#include "document/page_document.h"
#include "document/recorder.h"
#include "export/qt/page_export.h"
#include "print/qt/print_test.h"

#include <pelloric/sorvane.h>

#include <QImage>
#include <QImageReader>
#include <QWidget>

#include <algorithm>
#include <cstdlib>
#include <numeric>

namespace pelloric::qt {

namespace {

constexpr int Dpi = 150;

/// How many times finer pages are drawn than they are compared.
constexpr int Fine = 3;

/// The same of PDF files, whose viewer draws every glyph at a whole pixel.
constexpr int PdfFine = 6;

constexpr int MostMegabytes = 512; ///< of a picture of a page

/// A third of the range: less is the same ink, drawn by another anti-aliasing.
constexpr int SameShade = 85;

/// Darker than this is ink.
constexpr int InkShade = 224;

/// Of the ink's pixels.
constexpr double MostDifference = 0.01;

struct Awkward {
    Text text;
    Font font;
};

/// What grids hold besides plain words.
std::vector<Awkward> awkwardTexts()
{
    const Font song { .name = u"宋体", .size = 11 };
    const Font sans { .name = u"DejaVu Sans", .size = 11 };
    const Font serif { .name = u"DejaVu Serif", .size = 9.5F };
    const Font songBold { .name = u"宋体", .size = 12, .bold = true };
    const Font sansBold { .name = u"DejaVu Sans", .size = 12, .bold = true };
    const Font italic { .name = u"DejaVu Sans", .size = 11, .italic = true };
    const Font songItalic { .name = u"宋体", .size = 14, .italic = true };
    const Font large { .name = u"宋体", .size = 28 };
    const Text controls { u'a', 0, 1, 2, 0x1B, u'[', u'3', u'1', u'm', 0x7F, 0x85, 0x9F, u'b' };
    const Text halves { u'<', 0xD800, u'>', 0xDC00, u'&', 0xFFFE, 0xFFFF, u'"' };
    return {
        { u"Total\tprice\t\tsum\t", song },
        { u"Item\tQuantity 12\t3.50", sans },
        { u"\tafter a tab", serif },
        { controls, sans },
        { halves, sans },
        { u"Unit\nprice\r\nper piece", song },
        { u"one\n\nthree", sans },
        { u"☐ ☑ ▯ ballot boxes", sans },
        { u"ไทย Thai ภาษา", sans },
        { u"हिन्दी नमस्ते", song },
        { u"한국어 日本語 漢字 简体 繁體", song },
        { u"日本語 mixed 漢字 Latin", sans },
        { u"السلام عليكم 123", sans },
        { u"שלום עולם", sans },
        { u"Report שלום 12 السلام end", sans },
        { u"e\u0301 n\u0303 A\u030A o\u0308\u0304", sans },
        { u"fi ffl AVATAR To. Wa", sans },
        { u"fi ffl AVATAR To. Wa", serif },
        { u"\u200Eleft\u200B zero\u00ADwidth\uFEFF joiner\u2060s", sans },
        { u"a\u00A0b\u2003c\u3000d", song },
        { u"\U0001F600 \U0001F4A9 \U0001F468\u200D\U0001F469 emoji", sans },
        { u"\U00020000\U0002A6D6 rare", song },
        { u"加粗 Made-up bold 123", songBold },
        { u"Real bold 加粗", sansBold },
        { u"Italic text 斜体", italic },
        { u"Made-up italic 斜体", songItalic },
        { u"Large 大字 ไทย", large },
        { u"αβγ Ελληνικά Кириллица ⅓ ∑ √ €", sans },
        { u"αβγ Ελληνικά Кириллица ⅓ ∑ √ €", song },
    };
}

void recordTexts(Recorder& recorder)
{
    recorder.moveTo({ 1000, 500 });
    for (const Awkward& row : awkwardTexts()) {
        recorder.setCurrentX(1000);
        recorder.setTextFont(row.font, 0);
        recorder.printText(row.text, true);
        recorder.setCurrentY(recorder.currentY() + 100);
    }
}

/// A picture drawn at so many times the resolution, as it is at `Dpi`: every pixel the mean of the
/// ink that falls on it, so that no renderer's rounding of places to its own pixels counts.
QImage atDpi(const QImage& drawn, int fine)
{
    const QImage grey = drawn.convertToFormat(QImage::Format_Grayscale8);
    QImage image(grey.width() / fine, grey.height() / fine, QImage::Format_Grayscale8);
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            int sum = 0;
            for (int row = y * fine; row < (y + 1) * fine; ++row) {
                const uchar* const line = grey.constScanLine(row) + x * fine;
                sum = std::accumulate(line, line + fine, sum);
            }
            image.scanLine(y)[x] = static_cast<uchar>(sum / (fine * fine));
        }
    }
    return image;
}

/// What a program makes of a file.
QImage picture(const QString& program, const QStringList& arguments, const QString& file, int fine)
{
    const ProgramResult result = runProgram(program, arguments);
    EXPECT_EQ(result.status, 0) << program.toStdString() << ": " << result.errors.toStdString();
    return atDpi(QImage(file), fine);
}

QImage pdfPicture(const QString& document, const QString& name)
{
    return picture(QStringLiteral("pdftoppm"),
        { QStringLiteral("-r"), QString::number(Dpi * PdfFine), QStringLiteral("-gray"),
            QStringLiteral("-singlefile"), document, name },
        name + QStringLiteral(".pgm"), PdfFine);
}

/// The part of the ink of one picture that the other has not, or the other way round.
double differenceOf(const QImage& one, const QImage& other)
{
    int ink = 0;
    int different = 0;
    const QSize size = one.size().boundedTo(other.size());
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x) {
            const int left = one.constScanLine(y)[x];
            const int right = other.constScanLine(y)[x];
            if (left >= InkShade && right >= InkShade)
                continue;
            ++ink;
            different += std::abs(left - right) > SameShade ? 1 : 0;
        }
    }
    return ink > 0 ? static_cast<double>(different) / ink : 1;
}

class OneLook : public PrintTest {
protected:
    QString file(const char* name) const
    {
        return cups.folder() + QLatin1Char('/') + QLatin1String(name);
    }

    std::filesystem::path pathOf(const char* name) const { return file(name).toStdU16String(); }

    /// A page as it reaches the spooler, on paper that can be printed on up to its edges.
    QImage paperPicture()
    {
        useEdgeToEdgePrinter();
        Platform services = platform.record();
        Canvas canvas(services);
        canvas.clear();
        recordTexts(canvas.recorder());
        canvas.doPrint(true, u"", 1);
        EXPECT_EQ(cups.jobs().size(), 1U);
        return pdfPicture(cups.documentOf(1), file("paper"));
    }
};

} // namespace

TEST_F(OneLook, ShowsAwkwardTextsAlikeOnScreenOnPaperInPicturesAndInFiles)
{
    QImageReader::setAllocationLimit(MostMegabytes);
    SorvaneWorld world;
    Canvas& canvas = world.canvas;
    canvas.clear();
    recordTexts(canvas.recorder());
    QtFonts& fonts = world.platform.fonts();

    exportPngs(canvas.document(), canvas.page, { .dpi = Dpi * Fine }, pathOf("page.png"));
    const QImage image = atDpi(QImage(file("page.png")), Fine);

    canvas.setDispScale(
        static_cast<float>(Dpi) * Fine / static_cast<float>(world.sorvane.logicalDpiX()));
    canvas.showPage();
    const QImage screen = atDpi(world.paper(0)->grab().toImage(), Fine);

    exportPdf(canvas.document(), canvas.page, fonts, {}, pathOf("page.pdf"));
    const QImage pdf = pdfPicture(file("page.pdf"), file("pdf"));

    exportSvg(canvas.document(), canvas.page, fonts, {}, pathOf("page.svg"));
    const QImage svg = picture(QStringLiteral("rsvg-convert"),
        { QStringLiteral("-z"), QString::number(Dpi * Fine / 96.0), QStringLiteral("-o"),
            file("svg.png"), file("page.svg") },
        file("svg.png"), Fine);
    const QImage paper = paperPicture();

    ASSERT_EQ(image.size(), QSize(1240, 1754));
    struct Output {
        const char* name;
        const QImage& picture;
    };
    const Output outputs[]
        = { { "screen", screen }, { "pdf", pdf }, { "svg", svg }, { "paper", paper } };
    for (const auto& [name, other] : outputs) {
        if (const char* const folder = std::getenv("PELLORIC_PICTURES"))
            other.save(QString::fromUtf8(folder) + QLatin1Char('/') + QLatin1String(name)
                + QStringLiteral(".png"));
        EXPECT_GT(other.width(), image.width() * 0.95) << name;
        EXPECT_GT(other.height(), image.height() * 0.95) << name;
        const double difference = differenceOf(image, other);
        RecordProperty(name, std::to_string(difference));
        EXPECT_LE(difference, MostDifference) << name;
    }
    if (const char* const folder = std::getenv("PELLORIC_PICTURES"))
        image.save(QString::fromUtf8(folder) + QStringLiteral("/image.png"));
    const QImage shifted = image.copy(0, 1, image.width(), image.height() - 1);
    EXPECT_GT(differenceOf(image, shifted), MostDifference) << "nothing is told apart";
}

} // namespace pelloric::qt
