// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/report.h>

#include "fakes/temp_folder.h"
#include "platform/run_time_error.h"
#include "support/errors.h"

#include <pelloric/export.h>
#include <pelloric/grids.h>
#include <pelloric/printing.h>

#include <QHeaderView>
#include <QProcess>
#include <QRegularExpression>
#include <QSortFilterProxyModel>
#include <QStandardItemModel>
#include <QTableWidget>

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

QString nameIn(const TempFolder& folder, const char* name)
{
    return QString::fromStdString(folder.file(name).string());
}

/// A report with settings of its own, so that no file of the user's is read.
Report reportOf(int rows)
{
    MemoryGrid grid({ { "Article", 4000 }, { "Pieces", 1500 } });
    for (int row = 1; row <= rows; ++row)
        grid.addRow({ QStringLiteral("A%1").arg(row), QString::number(row) });
    Report report;
    report.useSettings(ReportSettings());
    report.build(grid);
    return report;
}

} // namespace

TEST(Report, IsBuiltFromATableInMemoryAndFromAView)
{
    const Report fromTable = reportOf(3);
    QTableWidget view(3, 2);
    view.setHorizontalHeaderLabels({ "Article", "Pieces" });
    for (int row = 0; row < 3; ++row) {
        view.setItem(row, 0, new QTableWidgetItem(QStringLiteral("A%1").arg(row + 1)));
        view.setItem(row, 1, new QTableWidgetItem(QString::number(row + 1)));
    }
    Report fromView;
    fromView.useSettings(ReportSettings());
    fromView.build(view);
    EXPECT_EQ(fromTable.pageCount(), 1);
    EXPECT_EQ(fromTable.pageText(1).toStdString(), "Article\nPieces\nA1\n1\nA2\n2\nA3\n3\n1 of 1");
    EXPECT_EQ(fromView.pageText(1), fromTable.pageText(1));
    EXPECT_EQ(fromTable.pageWidth(), 11907);
    EXPECT_EQ(fromTable.pageHeight(), 16840);
}

TEST(Report, CountsItsPagesAndRefusesOneThatIsNot)
{
    const Report report = reportOf(200);
    EXPECT_GT(report.pageCount(), 2);
    EXPECT_EQ(errorOf([&] { report.pageText(0); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { report.pageText(report.pageCount() + 1); }),
        ErrorNumber::SubscriptOutOfRange);
}

TEST(Report, RefusesAGridWithoutAColumnToPrint)
{
    MemoryGrid grid({ { "Left out", 0 } });
    grid.addRow({ "x" });
    Report report;
    report.useSettings(ReportSettings());
    try {
        report.build(grid);
        ADD_FAILURE() << "no error";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::ObjectMissing);
        EXPECT_EQ(error.detail(), u"no column of the grid is wide enough to be printed");
    }
}

TEST(Report, IsExportedPageByPageAndOpenedAgain)
{
    const TempFolder folder;
    const Report report = reportOf(200);
    exportPdf(report, { .path = nameIn(folder, "a.pdf") });
    exportOstl(report, { .path = nameIn(folder, "a.ostl") });
    EXPECT_EQ(
        exportPng(report, { .path = nameIn(folder, "a.png"), .pageNumbers = { 2 }, .dpi = 30 }),
        QStringList { nameIn(folder, "a.png") });
    const QStringList drawings
        = exportSvg(report, { .path = nameIn(folder, "a.svg"), .pageNumbers = { 1, 2 } });
    EXPECT_EQ(drawings, (QStringList { nameIn(folder, "a-001.svg"), nameIn(folder, "a-002.svg") }));
    EXPECT_EQ(folder.names().size(), 5U);
    EXPECT_EQ(folder.read("a.pdf").substr(0, 5), "%PDF-");
    Report opened;
    opened.open(nameIn(folder, "a.ostl"));
    EXPECT_EQ(opened.pageCount(), report.pageCount());
    EXPECT_EQ(errorOf([&] { opened.open(nameIn(folder, "a.pdf")); }), ErrorNumber::TypeMismatch);
    EXPECT_EQ(errorOf([&] { opened.open(nameIn(folder, "none")); }), ErrorNumber::FileNotFound);
}

TEST(LiveView, IsExportedInOneCallWithOptions)
{
    const TempFolder folder;
    QTableWidget view(3, 5);
    view.setHorizontalHeaderLabels({ "Article", "Price", "C", "D", "E" });
    const char* const prices[] = { "1,234.50", "0.5", "none" };
    for (int row = 0; row < 3; ++row) {
        view.setItem(row, 0, new QTableWidgetItem(QStringLiteral("A%1").arg(row + 1)));
        view.setItem(row, 1, new QTableWidgetItem(QString::fromLatin1(prices[row])));
    }
    for (int column = 0; column < 5; ++column)
        view.setColumnWidth(column, 190);
    ExportRequest request { .path = nameIn(folder, "live.pdf") };
    request.settings = ReportSettings();
    const ExportResult plain = exportPdf(view, request);
    EXPECT_EQ(plain.pageCount, 2);
    EXPECT_EQ(plain.fit, (FitResult { .pagesAcross = 2 }));
    request.options.fit.toSheet = true;
    request.options.asShown = true;
    request.options.totals = { { u"Price" } };
    const ExportResult fitted = exportPdf(view, request);
    EXPECT_EQ(fitted.files, QStringList { nameIn(folder, "live.pdf") });
    EXPECT_EQ(fitted.pageCount, 1);
    EXPECT_EQ(fitted.fit.rule, FitRule::Landscape);
    EXPECT_TRUE(fitted.fit.isTurned);
    EXPECT_EQ(fitted.fit.pagesAcross, 1);
    EXPECT_EQ(fitted.leftOutOfTotals, (std::vector<LeftOut> { { u"Price", 1 } }));
    QProcess process;
    process.start(QStringLiteral("pdftotext"), { request.path, QStringLiteral("-") });
    ASSERT_TRUE(process.waitForFinished());
    EXPECT_TRUE(process.readAllStandardOutput().contains("1,235.00"));
    request.path = nameIn(folder, "live.png");
    EXPECT_EQ(exportPng(view, request).files, QStringList { request.path });
    request.path = nameIn(folder, "live.svg");
    EXPECT_EQ(exportSvg(view, request).files, QStringList { request.path });
    request.path = nameIn(folder, "live.ostl");
    EXPECT_FALSE(exportOstl(view, request).ostlLosses.any());
    request.options.watermark.text = u"Draft";
    EXPECT_EQ(exportOstl(view, request).ostlLosses, (OstlLosses { .pictures = true }));
    request.options.columns = { u"Nothing" };
    EXPECT_EQ(errorOf([&] { exportPdf(view, request); }), ErrorNumber::InvalidCall);
    EXPECT_EQ(folder.names().size(), 4U);
}

TEST(LiveView, AddsUpTheRowsThatItShowsInTheirOrder)
{
    struct Part {
        const char* kind;
        double price;
    };
    constexpr Part Parts[] = { { "bolt", 0.25 }, { "nut", 1.5 }, { "bolt", 10 }, { "left out", 99 },
        { "nut", 0.125 }, { "bolt", 2 } };
    QStandardItemModel model(0, 2);
    model.setHorizontalHeaderLabels({ "Kind", "Price" });
    for (const Part& part : Parts) {
        auto* const price = new QStandardItem;
        price->setData(part.price, Qt::DisplayRole);
        model.appendRow({ new QStandardItem(QString::fromLatin1(part.kind)), price });
    }
    QSortFilterProxyModel proxy;
    proxy.setSourceModel(&model);
    proxy.setFilterKeyColumn(0);
    proxy.setFilterRegularExpression(QStringLiteral("bolt|nut"));
    proxy.sort(1, Qt::DescendingOrder); // 10, 2, 1.5, 0.25, 0.125
    proxy.sort(0, Qt::DescendingOrder); // the nuts first
    QTableView view;
    view.setModel(&proxy);
    view.horizontalHeader()->moveSection(1, 0);
    view.setRowHidden(3, true); // of the bolts
    view.setColumnWidth(1, 300);
    ReportOptions options;
    options.groupColumns = { u"Kind" };
    options.totals = { { u"Price" }, { u"Price", AggregateFunction::Minimum } };
    Report report;
    report.useSettings(ReportSettings());
    report.setReportOptions(options);
    report.build(view);
    double bolts = 0;
    double least = 1000;
    for (const int row : { 2, 4 }) {
        EXPECT_EQ(proxy.index(row, 0).data().toString(), "bolt");
        bolts += proxy.index(row, 1).data().toDouble();
        least = std::min(least, proxy.index(row, 1).data().toDouble());
    }
    const QStringList lines = report.pageText(1).split(u'\n');
    const auto follows = [&](const char* name, double number) {
        const auto at = lines.indexOf(
            QRegularExpression(u'^' + QString::fromLatin1(name) + QStringLiteral(".*")));
        EXPECT_GE(at, 0) << name;
        EXPECT_EQ(lines.value(at).section(u' ', -1).toDouble(), number) << name;
    };
    follows("nut: Sum", 1.625);
    follows("nut: Minimum", 0.125);
    follows("bolt: Sum", bolts);
    follows("bolt: Minimum", least);
    follows("Total: Sum", bolts + 1.625);
    EXPECT_LT(lines.indexOf(QRegularExpression("^nut: Sum.*")),
        lines.indexOf(QRegularExpression("^bolt: Sum.*")));
    EXPECT_EQ(lines.count(QStringLiteral("bolt")), 2);
}

TEST(LiveView, HasTicksThatKeepTheirShareOfTheBoxAtEveryResolution)
{
    const TempFolder folder;
    QTableWidget view(1, 1);
    view.setShowGrid(false);
    view.setItem(0, 0, new QTableWidgetItem);
    view.item(0, 0)->setCheckState(Qt::Checked);
    ExportRequest request { .path = nameIn(folder, "tick.png") };
    request.settings = ReportSettings();
    request.settings->showHeaders = false;
    request.settings->footerTexts = {};
    request.settings->paperWidthMm = request.settings->paperHeightMm = 100;
    request.settings->body.size = 20;
    request.options.asShown = true;
    struct Seen {
        double side = 0; ///< of the box: of an inch
        double ink = 0; ///< part of the box that is dark
        double frame = 0; ///< thickness of its left side: part of the box
        double tick = 0; ///< thickness of the rising stroke: part of the box
    };
    const auto look = [&](int dpi) {
        request.dpi = dpi;
        exportPng(view, request);
        const QImage image = QImage(request.path).convertToFormat(QImage::Format_Grayscale8);
        const auto isDark = [&](int x, int y) { return qGray(image.pixel(x, y)) < 128; };
        QRect box;
        qint64 dark = 0;
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                if (isDark(x, y)) {
                    box |= QRect(x, y, 1, 1);
                    ++dark;
                }
            }
        }
        const double side = box.width();
        const auto runFrom = [&](double part, int x) {
            const int y = box.top() + static_cast<int>(part * side);
            while (x < image.width() && !isDark(x, y))
                ++x;
            const int first = x;
            while (x < image.width() && isDark(x, y))
                ++x;
            return (x - first) / side;
        };
        EXPECT_NEAR(box.height(), side, 1);
        return Seen { side / dpi, static_cast<double>(dark) / (side * side),
            runFrom(0.3, box.left()), runFrom(0.4, box.left() + box.width() / 5) };
    };
    const Seen coarse = look(150);
    const Seen fine = look(600);
    EXPECT_NEAR(coarse.side, fine.side, 0.01);
    // Pens are a pixel wide, and that much every stroke is wider than its share: a frame of a 32nd,
    // and strokes that rise 0.26 and 0.54 of the box, 0.16 wide, with a triangle in common where
    // they meet.
    const auto exactInk = [](double pixel) {
        const double box = 1 - pixel;
        const double hollow = 1 - 2 * (box / 32 + pixel);
        const double stroke = 0.16 * box + pixel;
        const double narrowing = 0.21 / 0.26 + 0.37 / 0.54; // of the triangle, as it rises
        return 1 - hollow * hollow + (0.26 + 0.54) * box * stroke
            - stroke * stroke / (2 * narrowing);
    };
    EXPECT_NEAR(coarse.ink, exactInk(1 / (coarse.side * 150)), 0.02);
    EXPECT_NEAR(fine.ink, exactInk(1 / (fine.side * 600)), 0.02);
    EXPECT_NEAR(fine.tick, 0.16, 0.03);
    EXPECT_NEAR(coarse.tick, fine.tick, 0.06);
    EXPECT_NEAR(fine.frame, 1.0 / 32, 0.012);
    EXPECT_NEAR(coarse.frame, fine.frame, 0.04);
}

TEST(Report, RefusesPagesThatDoNotExistAndAPathThatCannotBeWritten)
{
    const TempFolder folder;
    const Report report = reportOf(1);
    EXPECT_EQ(errorOf([&] {
        exportPdf(report, { .path = nameIn(folder, "a.pdf"), .pageNumbers = { 9 } });
    }),
        ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { exportPdf(report, { .path = nameIn(folder, "none/a.pdf") }); }),
        ErrorNumber::WriteFailed);
    EXPECT_EQ(errorOf([&] { printPages(report, { .printer = "no such printer" }); }),
        ErrorNumber::InvalidCall);
    EXPECT_EQ(folder.names().size(), 0U);
}

TEST(MemoryGrid, HoldsItsRowsForGridsThatOutliveIt)
{
    auto grid = std::make_unique<MemoryGrid>(QList<MemoryGrid::Column> { { "A" }, { "B" } });
    grid->addRow({ "1", "2" });
    grid->addRow({ "3" });
    EXPECT_EQ(grid->rowCount(), 2);
    EXPECT_EQ(grid->columnCount(), 2);
    EXPECT_EQ(grid->cell(0, 1), "2");
    EXPECT_EQ(grid->cell(1, 1), "");
    EXPECT_EQ(errorOf([&] { grid->addRow({ "1", "2", "3" }); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { grid->cell(2, 0); }), ErrorNumber::SubscriptOutOfRange);
}

} // namespace pelloric::qt
