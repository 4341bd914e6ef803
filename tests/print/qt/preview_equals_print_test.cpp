// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"
#include "grids/table_grid.h"
#include "platform/qt/qt_drawing_surface.h"
#include "platform/qt/qt_text.h"
#include "print/qt/print_test.h"
#include "settings/default_settings.h"
#include "support/test_paths.h"
#include "view/page_renderer.h"

#include <QFile>
#include <QImage>
#include <QPainter>

#include <algorithm>
#include <array>
#include <cstdlib>

namespace pelloric::qt {

namespace {

constexpr int Dpi = 150;

/// Shades that differ by less are the same ink, drawn by another anti-aliasing.
constexpr int SameShade = 96;

/// Darker than this is ink; the thinnest lines on paper are grey.
constexpr int InkShade = 224;

struct Sample {
    const char* file;
    QChar separator;
};

/// The margins of the printer's A4 paper: points.
constexpr double LeftMargin = 18;
constexpr double TopMargin = 30;

std::ostream& operator<<(std::ostream& stream, const Sample& sample)
{
    return stream << sample.file;
}

/// The cells of a line; a cell in double quotes may hold the separator.
std::vector<Text> cellsOf(const QString& line, QChar separator)
{
    std::vector<Text> cells(1);
    bool isQuoted = false;
    for (const QChar character : line) {
        if (character == u'"')
            isQuoted = !isQuoted;
        else if (character == separator && !isQuoted)
            cells.emplace_back();
        else
            cells.back().push_back(character.unicode());
    }
    return cells;
}

TableGrid gridOf(const Sample& sample)
{
    QFile file(QString::fromUtf8(PELLORIC_TESTS_DIR "/../samples/") + QLatin1String(sample.file));
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    QStringList lines = QString::fromUtf8(file.readAll()).remove(u'\r').split(u'\n');
    std::vector<TableColumn> columns;
    for (const Text& title : cellsOf(lines.takeFirst(), sample.separator))
        columns.push_back({ title, 1600 });
    TableGrid grid(columns);
    for (const QString& line : lines) {
        if (line.isEmpty())
            continue;
        const std::vector<Text> cells = cellsOf(line, sample.separator);
        grid.addRow(std::vector<TextView>(cells.begin(), cells.end()));
    }
    return grid;
}

/// The page as a screen of that size shows it, set in by the margins of the paper.
QImage screenPicture(const PageDocument& document, int page, QSize size, QtFonts& fonts)
{
    QImage image(size, QImage::Format_RGB32);
    image.fill(Qt::white);
    QPainter painter(&image);
    painter.translate(LeftMargin / 72 * Dpi, TopMargin / 72 * Dpi);
    painter.scale(Dpi / 1440.0, Dpi / 1440.0);
    QtDrawingSurface surface(painter, fonts);
    PageRenderer(document).replay(page, {}, surface);
    return image.convertToFormat(QImage::Format_Grayscale8);
}

QImage paperPicture(const QString& document, const QString& folder)
{
    const QString file = folder + QStringLiteral("/page");
    const ProgramResult result = runProgram(QStringLiteral("pdftoppm"),
        { QStringLiteral("-r"), QString::number(Dpi), QStringLiteral("-png"),
            QStringLiteral("-singlefile"), document, file });
    EXPECT_EQ(result.status, 0) << result.errors.toStdString();
    return QImage(file + QStringLiteral(".png")).convertToFormat(QImage::Format_Grayscale8);
}

int shadeAt(const QImage& image, int x, int y) { return image.constScanLine(y)[x]; }

QRect inkOf(const QImage& image)
{
    QRect ink;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (shadeAt(image, x, y) < InkShade)
                ink |= QRect(x, y, 1, 1);
        }
    }
    return ink;
}

/// Whether a pixel of one picture is found in the other within a pixel's distance.
bool isFound(const QImage& one, const QImage& other, int x, int y)
{
    const int shade = shadeAt(one, x, y);
    for (int nearY = std::max(0, y - 1); nearY <= std::min(one.height() - 1, y + 1); ++nearY) {
        for (int nearX = std::max(0, x - 1); nearX <= std::min(one.width() - 1, x + 1); ++nearX) {
            if (std::abs(shadeAt(other, nearX, nearY) - shade) < SameShade)
                return true;
        }
    }
    return false;
}

/// The part of all pixels that one picture has and the other has not.
double differenceOf(const QImage& one, const QImage& other)
{
    int different = 0;
    for (int y = 0; y < one.height(); ++y) {
        for (int x = 0; x < one.width(); ++x)
            different += isFound(one, other, x, y) && isFound(other, one, x, y) ? 0 : 1;
    }
    return static_cast<double>(different) / (one.width() * one.height());
}

int farthestEdge(const QRect& one, const QRect& other)
{
    return std::max({ std::abs(one.left() - other.left()), std::abs(one.top() - other.top()),
        std::abs(one.right() - other.right()), std::abs(one.bottom() - other.bottom()) });
}

class PreviewEqualsPrint : public PrintTest, public testing::WithParamInterface<Sample> {
protected:
    void SetUp() override
    {
        PrintTest::SetUp();
        platform.folders().setSystemDirectory(settings_.path());
        deployDefaultSettings(platform.record());
    }

private:
    TempFolder settings_;
};

} // namespace

TEST_P(PreviewEqualsPrint, PictureForPicture)
{
    Platform services = platform.record();
    Canvas canvas(services);
    TableGrid grid = gridOf(GetParam());
    canvas.doPreview(grid);
    ASSERT_GE(canvas.Totalpages(), 4);
    canvas.doPrint(false, u"1,2", 1);
    ASSERT_EQ(cups.jobs().size(), 2U);
    for (int page = 0; page < 2; ++page) {
        const QImage paper = paperPicture(cups.documentOf(page + 1), cups.folder());
        const QImage screen
            = screenPicture(canvas.document(), page, paper.size(), platform.fonts());
        const double difference = differenceOf(screen, paper);
        const QRect screenInk = inkOf(screen);
        const QRect paperInk = inkOf(paper);
        RecordProperty("differencePpm", static_cast<int>(difference * 1e6));
        RecordProperty("farthestEdge", farthestEdge(screenInk, paperInk));
        EXPECT_LT(difference, 0.005);
        EXPECT_LE(farthestEdge(screenInk, paperInk), 2);
        EXPECT_FALSE(paperInk.isEmpty());
        const QImage other
            = screenPicture(canvas.document(), 2 + page, paper.size(), platform.fonts());
        EXPECT_GT(differenceOf(other, paper), 0.005) << "other pages are not told apart";
    }
}

INSTANTIATE_TEST_SUITE_P(Samples, PreviewEqualsPrint,
    testing::Values(Sample { "countries-zh.csv", u',' }, Sample { "wine.csv", u',' },
        Sample { "time-zones.tsv", u'\t' }));

} // namespace pelloric::qt
