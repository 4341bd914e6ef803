// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"
#include "grids/table_grid.h"
#include "platform/qt/qt_drawing_surface.h"
#include "platform/qt/qt_text.h"
#include "print/qt/print_test.h"
#include "settings/default_settings.h"
#include "support/qt/pictures.h"
#include "support/qt/sample_grids.h"
#include "view/page_renderer.h"

#include <QFile>
#include <QImage>
#include <QPainter>

#include <algorithm>
#include <array>
#include <cstdlib>

namespace pelloric::qt {

namespace {

/// The margins of the printer's A4 paper: points.
constexpr double LeftMargin = 18;
constexpr double TopMargin = 30;

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
