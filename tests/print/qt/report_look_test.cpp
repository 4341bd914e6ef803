// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/sorvane_world.h"
#include "export/qt/page_export.h"
#include "platform/qt/qt_text.h"
#include "print/print_job.h"
#include "print/qt/print_test.h"
#include "support/qt/pictures.h"

#include <QIcon>
#include <QPainter>
#include <QPixmap>
#include <QTableWidget>

#include <cstdlib>

namespace pelloric::qt {

namespace {

/// The part of all pixels in which two ways to put a page out may differ: another antialiasing.
constexpr double SameInk = 0.005;

QImage grey(const QImage& image) { return image.convertToFormat(QImage::Format_Grayscale8); }

/// A table that shows everything that reports can show of a view.
void fillShown(QTableWidget& table)
{
    table.setHorizontalHeaderLabels({ QStringLiteral("Kind"), QStringLiteral("Name"),
        QStringLiteral("Price"), QStringLiteral("Sold") });
    QPixmap disc(32, 32);
    disc.fill(Qt::transparent);
    QPainter painter(&disc);
    painter.setBrush(Qt::darkGreen);
    painter.drawEllipse(2, 2, 28, 28);
    painter.end();
    for (int row = 0; row < table.rowCount(); ++row) {
        auto* const name = new QTableWidgetItem(QIcon(disc), QStringLiteral("名称 %1").arg(row));
        auto* const price = new QTableWidgetItem(QString::number(row * 1.25));
        price->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
        QFont font;
        font.setBold(row % 2 == 0);
        font.setItalic(row % 3 == 0);
        font.setUnderline(row % 4 == 0);
        font.setStrikeOut(row % 5 == 0);
        price->setFont(font);
        price->setForeground(QColor(row % 2 == 0 ? Qt::darkRed : Qt::darkBlue));
        auto* const sold = new QTableWidgetItem(QStringLiteral("sold"));
        sold->setCheckState(static_cast<Qt::CheckState>(row % 3));
        sold->setBackground(QColor(0xFFE8F0FE));
        table.setItem(row, 1, name);
        table.setItem(row, 2, price);
        table.setItem(row, 3, sold);
    }
    auto* const kind = new QTableWidgetItem(QStringLiteral("one box over all rows"));
    kind->setTextAlignment(Qt::AlignCenter);
    table.setItem(0, 0, kind);
    table.setSpan(0, 0, table.rowCount(), 1);
}

/// A report that asks for all that goes beyond the plain page, put out in every way.
class ReportLook : public PrintTest {
protected:
    void SetUp() override
    {
        PrintTest::SetUp();
        QImage logo(200, 100, QImage::Format_RGB32);
        logo.fill(QColor(30, 90, 160));
        ASSERT_TRUE(logo.save(file("logo.png")));
        ReportOptions options;
        options.asShown = true;
        options.totals = { { u"Price", AggregateFunction::Sum } };
        options.watermark.text = u"Draft";
        options.watermark.opacity = 0.6;
        options.logo = { .imageFile = toText(file("logo.png")), .slot = 2 };
        fillShown(table_);
        world_.sorvane.setReportOptions(options);
        world_.sorvane.doPreview(&table_);
        ASSERT_EQ(world_.canvas.Totalpages(), 1);
        exportPngs(document(), setup(), { .dpi = Dpi }, pathOf("image.png"));
        image_ = grey(QImage(file("image.png")));
        ASSERT_EQ(image_.size(), QSize(1240, 1754));
    }

    QString file(const char* name) const
    {
        return cups.folder() + QLatin1Char('/') + QLatin1String(name);
    }

    std::filesystem::path pathOf(const char* name) const { return file(name).toStdU16String(); }

    const PageDocument& document() const { return world_.canvas.document(); }
    const PageSetup& setup() const { return world_.canvas.page; }

    /// Pictures are kept where the environment says.
    void expectAlike(const char* name, const QImage& other) const
    {
        if (const char* const folder = std::getenv("PELLORIC_PICTURES")) {
            const QString kept = QString::fromUtf8(folder) + QStringLiteral("/report-");
            other.save(kept + QLatin1String(name) + QStringLiteral(".png"));
            image_.save(kept + QStringLiteral("image.png"));
        }
        ASSERT_LE(std::abs(other.width() - image_.width()), 3) << name;
        ASSERT_LE(std::abs(other.height() - image_.height()), 3) << name;
        const QRect both(QPoint(), other.size().boundedTo(image_.size()));
        const double difference = differenceOf(image_.copy(both), other.copy(both));
        RecordProperty(name, std::to_string(difference));
        EXPECT_LT(difference, SameInk) << name;
        EXPECT_LE(farthestEdge(inkOf(image_), inkOf(other)), 3) << name;
    }

    QTableWidget table_ { 12, 4 };
    SorvaneWorld world_;
    QImage image_;
};

} // namespace

TEST_F(ReportLook, IsThatOfThePictureOnScreen)
{
    EXPECT_EQ(document().reportPictures(0).size(), 2U + 12U);
    world_.canvas.setDispScale(
        static_cast<float>(Dpi) / static_cast<float>(world_.sorvane.logicalDpiX()));
    world_.canvas.showPage();
    expectAlike("screen", grey(world_.paper(0)->grab().toImage()));
}

TEST_F(ReportLook, IsThatOfThePictureInFiles)
{
    exportPdf(document(), setup(), world_.platform.fonts(), {}, pathOf("report.pdf"));
    expectAlike("pdf", paperPicture(file("report.pdf"), cups.folder()));
    exportSvg(document(), setup(), world_.platform.fonts(), {}, pathOf("report.svg"));
    const ProgramResult drawn = runProgram(QStringLiteral("rsvg-convert"),
        { QStringLiteral("-z"), QString::number(Dpi / 96.0), QStringLiteral("-o"), file("svg.png"),
            file("report.svg") });
    ASSERT_EQ(drawn.status, 0) << drawn.errors.toStdString();
    expectAlike("svg", grey(QImage(file("svg.png"))));
}

TEST_F(ReportLook, IsThatOfThePictureOnPaper)
{
    useEdgeToEdgePrinter();
    const PrintJob job { .pageWidth = setup().myWidth, .pageHeight = setup().myHeight };
    doPrint(document(), job, Font {}, platform.record().printer);
    ASSERT_EQ(cups.jobs().size(), 1U);
    expectAlike("paper", paperPicture(cups.documentOf(1), cups.folder()));
}

} // namespace pelloric::qt
