// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_drawing_surface.h"

#include "platform/qt/qt_fonts.h"
#include "platform/qt/uming.h"

#include <QBuffer>
#include <QDir>
#include <QImage>
#include <QPainter>
#include <QPdfWriter>
#include <QTemporaryDir>
#include <QtMath>

#include <gtest/gtest.h>

#include <array>
#include <functional>

namespace pelloric::qt {

namespace {

constexpr int Inch = 1440;

/// Its capital letters stand on the baseline.
constexpr TextView Latin = u"DejaVu Sans";

class QtDrawingSurfaceTest : public testing::Test {
protected:
    void SetUp() override { ASSERT_TRUE(loadUming()); }

    /// An image of 4 by 1 inches, drawn at some pixels an inch.
    QImage drawn(
        double dpi, const SurfaceOptions& options, const std::function<void(DrawingSurface&)>& draw)
    {
        QImage image(qCeil(4 * dpi), qCeil(dpi), QImage::Format_RGB32);
        image.fill(Qt::white);
        QPainter painter(&image);
        painter.scale(dpi / Inch, dpi / Inch);
        QtDrawingSurface surface(painter, fonts_, options);
        draw(surface);
        return image;
    }

    QImage drawn(const std::function<void(DrawingSurface&)>& draw) { return drawn(96, {}, draw); }

    static void setFont(DrawingSurface& surface, float size, bool bold = false)
    {
        surface.setFontName(Uming);
        surface.setFontSize(size);
        surface.setFontBold(bold);
        surface.setFontItalic(false);
        surface.setForeColor(0);
    }

    QtFonts fonts_;
};

/// The box around everything that is not white.
QRect inkOf(const QImage& image)
{
    QRect ink;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixel(x, y) != qRgb(255, 255, 255))
                ink |= QRect(x, y, 1, 1);
        }
    }
    return ink;
}

/// How black an image is: the sum of what each pixel lacks of white.
double inkAmount(const QImage& image)
{
    double amount = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            amount += 255 - qGray(image.pixel(x, y));
    }
    return amount;
}

int pixelsOf(const QImage& image, QRgb color)
{
    int count = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            count += image.pixel(x, y) == color ? 1 : 0;
    }
    return count;
}

} // namespace

TEST_F(QtDrawingSurfaceTest, TextsEndWhereTheyWereMeasuredAtEveryZoom)
{
    const TextView text = u"Quantity 数量国";
    for (const double zoom : { 0.5, 0.67, 1.0, 1.3, 2.0, 4.0 }) {
        for (const float size : { 9.0F, 9.9F, 10.5F, 7.2900004F }) {
            const auto print = [&](float given) {
                return [&, given](DrawingSurface& surface) {
                    setFont(surface, given);
                    surface.setCurrentX(300);
                    surface.setCurrentY(300);
                    surface.print(text);
                };
            };
            const auto divisor = static_cast<float>(1 / zoom);
            const QRect ink
                = inkOf(drawn(96 * zoom, { .divisor = divisor }, print(size / divisor)));
            const double scale = 96 * zoom / Inch;
            const double width
                = fonts_.face(Uming, false, false).advanceOf(text) * static_cast<double>(size);
            // Ink stands up to a tenth of an em within the ends of the run.
            const double bearing = 0.1 * static_cast<double>(size) * 20 * scale;
            EXPECT_NEAR(ink.left(), 300 * scale + bearing / 2, bearing / 2 + 1);
            EXPECT_NEAR(ink.right() + 1, (300 + width) * scale - bearing / 2, bearing / 2 + 1)
                << zoom << " " << size;
        }
    }
}

TEST_F(QtDrawingSurfaceTest, TheBaselineIsTheAscentBelowTheCurrentPoint)
{
    const QImage image = drawn(960, {}, [&](DrawingSurface& surface) {
        setFont(surface, 20);
        surface.setFontName(Latin);
        surface.setCurrentX(100);
        surface.setCurrentY(200);
        surface.print(u"EHH");
    });
    const double baseline = 200 + fonts_.face(Latin, false, false).ascent() * 20;
    EXPECT_NEAR(inkOf(image).bottom() + 1, baseline * 960 / Inch, 2);
}

TEST_F(QtDrawingSurfaceTest, PrintingBreaksTheLine)
{
    const QImage image = drawn([&](DrawingSurface& surface) {
        setFont(surface, 10);
        surface.setCurrentX(2000);
        surface.setCurrentY(100);
        surface.print(u"");
        surface.print(u"H");
    });
    EXPECT_LT(inkOf(image).right(), 10);
    EXPECT_GT(inkOf(image).top(), (100 + 209) * 96 / Inch);
}

TEST_F(QtDrawingSurfaceTest, EveryLineOfATextBeginsAtItsX)
{
    const QImage whole = drawn([&](DrawingSurface& surface) {
        setFont(surface, 10);
        surface.setCurrentX(720);
        surface.setCurrentY(100);
        surface.print(u"ab\r\ncd\n\nef");
    });
    const Twips line = textHeight(fonts_.face(Uming, false, false), 10);
    const QImage parts = drawn([&](DrawingSurface& surface) {
        setFont(surface, 10);
        const std::pair<TextView, int> rows[] = { { u"ab", 0 }, { u"cd", 1 }, { u"ef", 3 } };
        for (const auto& [text, row] : rows) {
            surface.setCurrentX(720);
            surface.setCurrentY(100 + row * line);
            surface.print(text);
        }
    });
    EXPECT_EQ(whole, parts);
    EXPECT_GT(inkAmount(whole), 0);
}

TEST_F(QtDrawingSurfaceTest, TabsAreGapsAndOtherControlCharactersNothing)
{
    const auto shown = [&](TextView text, Twips x = 720) {
        return drawn([&](DrawingSurface& surface) {
            setFont(surface, 10);
            surface.setCurrentX(x);
            surface.print(text);
        });
    };
    EXPECT_EQ(shown(u"a\tb"), shown(u"a    b"));
    EXPECT_EQ(shown(u"\tb"), shown(u"b", 720 + 400));
    const Text controls { u'a', 0, 1, 0x1B, 0x7F, 0x85, 0x200B, 0xFEFF, u'b' };
    EXPECT_EQ(shown(controls), shown(u"ab"));
}

TEST_F(QtDrawingSurfaceTest, ACharacterThatNoFaceHasIsAHollowBoxUnlikeTheBallotBox)
{
    const auto shown = [&](TextView text) {
        return drawn(300, {}, [&](DrawingSurface& surface) {
            setFont(surface, 30);
            surface.setFontName(Latin);
            surface.setCurrentX(720);
            surface.print(text);
        });
    };
    const QImage thai = shown(u"\u0E01");
    const QRect box = inkOf(thai);
    ASSERT_FALSE(box.isEmpty());
    EXPECT_EQ(thai.pixel(box.center()), qRgb(255, 255, 255));
    EXPECT_LT(qGray(thai.pixel(box.left() + 3, box.center().y())), 64);
    EXPECT_LT(qGray(thai.pixel(box.center().x(), box.bottom() - 3)), 64);
    EXPECT_GT(box.bottom(), inkOf(shown(u"\u2610")).bottom() + 5) << "it reaches below the line";
    const double advance = fonts_.face(Latin, false, false).unitAdvance(0x0E01) * 30 * 300 / Inch;
    EXPECT_LE(box.width(), advance);
    EXPECT_GT(box.width(), advance / 2);
    EXPECT_NEAR(inkOf(shown(u"\u0E01\u0E02")).right() - box.right(), advance, 1.5);
}

TEST_F(QtDrawingSurfaceTest, AMadeUpBoldIsBlackerButNoWider)
{
    const auto print = [&](bool bold) {
        return drawn(192, {}, [&](DrawingSurface& surface) {
            setFont(surface, 12, bold);
            surface.print(u"Bold 粗体字");
        });
    };
    const QImage regular = print(false);
    const QImage bold = print(true);
    EXPECT_GT(inkAmount(bold), 1.3 * inkAmount(regular));
    EXPECT_LE(inkOf(bold).right(), inkOf(regular).right() + 2);
}

TEST_F(QtDrawingSurfaceTest, AnOpaqueTextHidesWhatIsBehindIt)
{
    for (const bool transparent : { true, false }) {
        const QImage image = drawn([&](DrawingSurface& surface) {
            surface.setFillStyle(SolidFill);
            surface.setFillColor(rgb(255, 0, 0));
            surface.box({ 0, 0 }, { 4 * Inch, Inch }, rgb(255, 0, 0));
            setFont(surface, 12);
            surface.setFontTransparent(transparent);
            surface.setCurrentX(100);
            surface.setCurrentY(100);
            surface.print(u" H ");
        });
        EXPECT_EQ(pixelsOf(image, qRgb(255, 255, 255)) > 50, !transparent);
    }
}

TEST_F(QtDrawingSurfaceTest, PensAreDevicePixelsAtEveryZoom)
{
    for (const double dpi : { 48.0, 96.0, 384.0 }) {
        for (const auto width : std::to_array<std::int16_t>({ 1, 2, 3 })) {
            const QImage image = drawn(dpi, {}, [&](DrawingSurface& surface) {
                surface.setForeColor(rgb(0, 0, 255));
                surface.setDrawWidth(width);
                surface.line({ Inch, Inch / 2 }, { 2 * Inch, Inch / 2 });
            });
            EXPECT_EQ(inkOf(image).height(), width) << dpi;
            EXPECT_NEAR(inkOf(image).width(), dpi, width);
            EXPECT_EQ(image.pixel(inkOf(image).center()), qRgb(0, 0, 255));
        }
    }
}

TEST_F(QtDrawingSurfaceTest, ALineWithoutLengthIsADotOfThePenWidth)
{
    for (const auto width : std::to_array<std::int16_t>({ 1, 3 })) {
        const QImage image = drawn([&](DrawingSurface& surface) {
            surface.setDrawStyle(2);
            surface.setDrawWidth(width);
            surface.line({ 720, 720 }, { 720, 720 });
        });
        EXPECT_EQ(inkOf(image).size(), QSize(width, width));
    }
}

TEST_F(QtDrawingSurfaceTest, DrawStylesLeaveGaps)
{
    const auto inked = [&](std::int16_t style) {
        return pixelsOf(drawn([&](DrawingSurface& surface) {
            surface.setDrawStyle(style);
            surface.line({ 0, 720 }, { 4 * Inch, 720 });
        }),
            qRgb(0, 0, 0));
    };
    const int solid = inked(0);
    EXPECT_GT(solid, 380);
    for (const auto style : std::to_array<std::int16_t>({ 1, 2, 3, 4 })) {
        EXPECT_LT(inked(style), solid * 9 / 10) << style;
        EXPECT_GT(inked(style), solid / 10) << style;
    }
    EXPECT_EQ(inked(5), 0);
    EXPECT_EQ(inked(6), solid);
    EXPECT_EQ(inked(99), solid);
}

TEST_F(QtDrawingSurfaceTest, BoxesHaveTheirOwnOutlineAndFill)
{
    const QImage image = drawn([&](DrawingSurface& surface) {
        surface.setFillStyle(SolidFill);
        surface.setFillColor(rgb(224, 224, 224));
        surface.setForeColor(rgb(0, 255, 0));
        surface.box({ 1440, 720 }, { 720, 300 }, rgb(255, 0, 0));
    });
    EXPECT_EQ(image.pixel(72, 34), qRgb(224, 224, 224));
    EXPECT_EQ(image.pixel(inkOf(image).topLeft()), qRgb(255, 0, 0));
    EXPECT_EQ(pixelsOf(image, qRgb(0, 255, 0)), 0);
}

TEST_F(QtDrawingSurfaceTest, HatchesKeepTheirPixelsAtEveryZoom)
{
    for (const auto style : std::to_array<std::int16_t>({ 2, 3, 4, 5, 6, 7 })) {
        for (const double dpi : { 96.0, 384.0 }) {
            const QImage image = drawn(dpi, {}, [&](DrawingSurface& surface) {
                surface.setDrawStyle(5);
                surface.setFillStyle(style);
                surface.setFillColor(0);
                surface.box({ 0, 0 }, { 4 * Inch, Inch }, 0);
            });
            const double part
                = static_cast<double>(pixelsOf(image, qRgb(0, 0, 0))) / (4 * dpi * dpi);
            EXPECT_GT(part, 0.08) << style << " " << dpi;
            EXPECT_LT(part, 0.4) << style << " " << dpi;
        }
    }
}

TEST_F(QtDrawingSurfaceTest, AnUpwardDiagonalRunsUpToTheRight)
{
    const auto hatched = [&](std::int16_t style) {
        return drawn([&](DrawingSurface& surface) {
            surface.setDrawStyle(5);
            surface.setFillStyle(style);
            surface.box({ 0, 0 }, { Inch, Inch }, 0);
        });
    };
    const auto follows = [](const QImage& image, int step) {
        int joined = 0;
        for (int y = 10; y < 60; ++y) {
            for (int x = 10; x < 60; ++x) {
                const bool both = image.pixel(x, y) == qRgb(0, 0, 0)
                    && image.pixel(x + 1, y + step) == qRgb(0, 0, 0);
                joined += both ? 1 : 0;
            }
        }
        return joined;
    };
    EXPECT_GT(follows(hatched(4), -1), 4 * follows(hatched(4), 1));
    EXPECT_GT(follows(hatched(5), 1), 4 * follows(hatched(5), -1));
}

TEST_F(QtDrawingSurfaceTest, ClearingMakesThePageWhite)
{
    const QImage image = drawn(96, { .page = QRectF(0, 0, 2 * Inch, Inch) }, [&](auto& surface) {
        surface.setFillStyle(SolidFill);
        surface.box({ 0, 0 }, { 4 * Inch, Inch }, 0);
        surface.clear();
    });
    EXPECT_EQ(image.pixel(100, 50), qRgb(255, 255, 255));
    EXPECT_EQ(image.pixel(300, 50), qRgb(0, 0, 0));
}

TEST_F(QtDrawingSurfaceTest, NothingIsDrawnOutsideWhatIsVisible)
{
    const auto draw = [&](DrawingSurface& surface) {
        setFont(surface, 10);
        for (const Twips y : { 0, 720 }) {
            surface.setCurrentX(0);
            surface.setCurrentY(y);
            surface.print(u"HHHH");
            surface.line({ 0, y }, { Inch, y });
        }
    };
    const QImage all = drawn(draw);
    const QImage top = drawn(96, { .visible = QRectF(0, 0, 4 * Inch, 400) }, draw);
    EXPECT_GT(inkOf(all).bottom(), 48);
    EXPECT_LT(inkOf(top).bottom(), 30);
    EXPECT_EQ(all.copy(0, 0, 384, 26), top.copy(0, 0, 384, 26));
}

TEST_F(QtDrawingSurfaceTest, PicturesFillTheirRectangle)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("blue 图.png"));
    QImage blue(3, 3, QImage::Format_RGB32);
    blue.fill(Qt::blue);
    ASSERT_TRUE(blue.save(path));
    const QImage image = drawn([&](DrawingSurface& surface) {
        surface.picture(path.toStdU16String(), { 720, 300 }, { 720, 720 });
        surface.picture(u"/no/such/file.png", { 0, 0 }, { 720, 720 });
    });
    EXPECT_EQ(inkOf(image), QRect(48, 20, 48, 48));
}

TEST_F(QtDrawingSurfaceTest, ArabicIsShapedWithinTheMeasuredRun)
{
    const TextView text = u"السلام";
    const QImage image = drawn(192, {}, [&](DrawingSurface& surface) {
        setFont(surface, 20);
        surface.setCurrentX(720);
        surface.print(text);
    });
    const double width = fonts_.face(Uming, false, false).advanceOf(text) * 20;
    EXPECT_FALSE(inkOf(image).isEmpty());
    EXPECT_GE(inkOf(image).left(), 720 * 192 / Inch - 4);
    EXPECT_LE(inkOf(image).right(), (720 + width) * 192 / Inch + 4);
}

TEST_F(QtDrawingSurfaceTest, ATextWithoutSizeIsNotDrawn)
{
    const QImage image = drawn([&](DrawingSurface& surface) {
        for (const float size : { 0.0F, -3.0F }) {
            setFont(surface, size);
            surface.print(u"H");
        }
    });
    EXPECT_TRUE(inkOf(image).isEmpty());
}

TEST_F(QtDrawingSurfaceTest, PaperTakesABoldTextOnce)
{
    const auto bytesOf = [&](bool bold) {
        QByteArray bytes;
        QBuffer buffer(&bytes);
        buffer.open(QIODevice::WriteOnly);
        QPdfWriter writer(&buffer);
        writer.setResolution(600);
        QPainter painter(&writer);
        painter.scale(600.0 / Inch, 600.0 / Inch);
        QtDrawingSurface surface(painter, fonts_);
        setFont(surface, 12, bold);
        for (int line = 0; line < 400; ++line)
            surface.print(u"Bold 粗体字");
        painter.end();
        return bytes.size();
    };
    EXPECT_LT(static_cast<double>(bytesOf(true)), 1.5 * static_cast<double>(bytesOf(false)));
}

/// The toolkit draws boxes for fonts of more than some ten thousand pixels.
TEST_F(QtDrawingSurfaceTest, PrintsTheLargestTextsAsItPrintsSmallOnes)
{
    constexpr int Side = 300; // pixels
    const auto inkAt = [&](float size, bool bold) {
        QImage image(Side, Side, QImage::Format_RGB32);
        image.fill(Qt::white);
        QPainter painter(&image);
        const double scale = Side / (static_cast<double>(size) * 20 * 1.3);
        painter.scale(scale, scale);
        QtDrawingSurface surface(painter, fonts_, {});
        setFont(surface, size, bold);
        surface.print(u"东");
        return image;
    };
    for (const bool bold : { false, true }) {
        const QImage small = inkAt(100, bold);
        const QRect ink = inkOf(small);
        EXPECT_GT(ink.width(), Side / 2);
        for (const float size : { 1000.0F, 4000.0F, 16000.0F, 50000.0F }) {
            const QImage large = inkAt(size, bold);
            int other = 0;
            for (int at = 0; at < Side * Side; ++at) {
                const auto grey = [at](const QImage& image) {
                    return qGray(image.pixel(at % Side, at / Side));
                };
                other += std::abs(grey(small) - grey(large)) > 128 ? 1 : 0;
            }
            EXPECT_LT(other, Side) << size << (bold ? " bold" : "");
        }
    }
}

TEST_F(QtDrawingSurfaceTest, PrintsAnyCharacterInBoldAtAnySize)
{
    Text units;
    for (char16_t unit = 0; unit < 0x180; ++unit)
        units.push_back(unit);
    units += u"\u0301\u200D\u202E\u2028\uFEFF\uFFFD\uFFFF宋★";
    units += { 0xD83D, 0xDE00 };
    for (const float size : { 0.01F, 1.0F, 9.0F, 72.0F, 1000.0F, 1e6F }) {
        for (const char16_t unit : units) {
            for (const Text& text : { Text(1, unit), Text { u'宋', unit } }) {
                drawn([&](DrawingSurface& surface) {
                    setFont(surface, size, true);
                    surface.print(text);
                });
            }
        }
    }
}

} // namespace pelloric::qt
