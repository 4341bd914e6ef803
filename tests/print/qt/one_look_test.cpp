// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/sorvane.h"
#include "controls/qt/sorvane_world.h"
#include "document/page_document.h"
#include "document/recorder.h"
#include "export/qt/page_export.h"
#include "print/qt/print_test.h"

#include <QImage>
#include <QWidget>

#include <algorithm>
#include <cstdlib>

namespace pelloric::qt {

namespace {

constexpr int Dpi = 150;

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

QImage grey(const QImage& image) { return image.convertToFormat(QImage::Format_Grayscale8); }

/// What a program makes of a file.
QImage picture(const QString& program, const QStringList& arguments, const QString& file)
{
    const ProgramResult result = runProgram(program, arguments);
    EXPECT_EQ(result.status, 0) << program.toStdString() << ": " << result.errors.toStdString();
    return grey(QImage(file));
}

QImage pdfPicture(const QString& document, const QString& name)
{
    return picture(QStringLiteral("pdftoppm"),
        { QStringLiteral("-r"), QString::number(Dpi), QStringLiteral("-png"),
            QStringLiteral("-gray"), QStringLiteral("-singlefile"), document, name },
        name + QStringLiteral(".png"));
}

int shadeAt(const QImage& image, int x, int y) { return image.constScanLine(y)[x]; }

/// Whether a pixel of one picture is found in the other within a pixel's distance, for every
/// renderer rounds the places of glyphs in its own way.
bool isFound(const QImage& one, const QImage& other, int x, int y)
{
    const int shade = shadeAt(one, x, y);
    for (int nearY = std::max(0, y - 1); nearY <= std::min(other.height() - 1, y + 1); ++nearY) {
        for (int nearX = std::max(0, x - 1); nearX <= std::min(other.width() - 1, x + 1); ++nearX) {
            if (std::abs(shadeAt(other, nearX, nearY) - shade) <= SameShade)
                return true;
        }
    }
    return false;
}

/// The part of the ink of one picture that the other has not, or the other way round.
double differenceOf(const QImage& one, const QImage& other)
{
    int ink = 0;
    int different = 0;
    const QSize size = one.size().boundedTo(other.size());
    for (int y = 0; y < size.height(); ++y) {
        for (int x = 0; x < size.width(); ++x) {
            if (shadeAt(one, x, y) >= InkShade && shadeAt(other, x, y) >= InkShade)
                continue;
            ++ink;
            different += isFound(one, other, x, y) && isFound(other, one, x, y) ? 0 : 1;
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
};

} // namespace

TEST_F(OneLook, ShowsAwkwardTextsAlikeOnScreenInPicturesAndInFiles)
{
    SorvaneWorld world;
    Canvas& canvas = world.canvas;
    canvas.clear();
    recordTexts(canvas.recorder());
    QtFonts& fonts = world.platform.fonts();

    exportPngs(canvas.document(), canvas.page, { .dpi = Dpi }, pathOf("page.png"));
    const QImage image = grey(QImage(file("page.png")));

    canvas.setDispScale(static_cast<float>(Dpi) / static_cast<float>(world.sorvane.logicalDpiX()));
    canvas.showPage();
    const QImage screen = grey(world.paper(0)->grab().toImage());

    exportPdf(canvas.document(), canvas.page, fonts, {}, pathOf("page.pdf"));
    const QImage pdf = pdfPicture(file("page.pdf"), file("pdf"));

    exportSvg(canvas.document(), canvas.page, fonts, {}, pathOf("page.svg"));
    const QImage svg = picture(QStringLiteral("rsvg-convert"),
        { QStringLiteral("-z"), QString::number(Dpi / 96.0), QStringLiteral("-o"), file("svg.png"),
            file("page.svg") },
        file("svg.png"));

    ASSERT_EQ(image.size(), QSize(1240, 1754));
    struct Output {
        const char* name;
        const QImage& picture;
    };
    const Output outputs[] = { { "screen", screen }, { "pdf", pdf }, { "svg", svg } };
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
    const QImage shifted = image.copy(0, 3, image.width(), image.height() - 3);
    EXPECT_GT(differenceOf(image, shifted), MostDifference) << "nothing is told apart";
}

} // namespace pelloric::qt
