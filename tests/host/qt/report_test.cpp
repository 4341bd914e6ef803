// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/report.h>

#include "fakes/temp_folder.h"
#include "support/errors.h"

#include <pelloric/export.h>
#include <pelloric/grids.h>
#include <pelloric/printing.h>

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
    EXPECT_EQ(errorOf([&] { report.build(grid); }), ErrorNumber::ObjectMissing);
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
