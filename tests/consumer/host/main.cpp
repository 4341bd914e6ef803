// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// A host that uses every component once; it ends with 0 when all went as it should.

#include <pelloric/pelloric.h>

#include "platform/platform.h"

#include <QApplication>
#include <QJSEngine>
#include <QTableWidget>
#include <QTemporaryDir>

#include <cstdio>

namespace {

int failures = 0;

void expect(bool isTrue, const char* what)
{
    if (isTrue)
        return;
    std::printf("not so: %s\n", what);
    ++failures;
}

/// A report from a table of the host's own, with settings of its own.
void exportReport(const QString& folder)
{
    pelloric::qt::MemoryGrid grid({ { "Article", 4000 }, { "Pieces", 1500 } });
    for (int row = 1; row <= 200; ++row)
        grid.addRow({ QStringLiteral("Article %1").arg(row), QString::number(row) });
    pelloric::qt::Report report;
    pelloric::ReportSettings settings;
    settings.headerTexts[1] = u"Consumer";
    report.useSettings(settings);
    report.build(grid);
    expect(report.pageCount() > 1, "the report has several pages");
    expect(report.pageText(1).contains("Article 1"), "page 1 holds the first row");
    exportPdf(report, { .path = folder + "/a.pdf" });
    exportOstl(report, { .path = folder + "/a.ostl" });
    const QStringList images
        = exportPng(report, { .path = folder + "/a.png", .pageNumbers = { 1, 2 }, .dpi = 30 });
    expect(images.size() == 2, "two pages make two images");
    pelloric::qt::Report opened;
    opened.open(folder + "/a.ostl");
    expect(opened.pageCount() == report.pageCount(), "a saved document has the same pages");
}

void readTables(const QString& folder)
{
    QFile file(folder + "/a.csv");
    expect(file.open(QIODevice::WriteOnly) && file.write("A,B\n1,2\n") > 0, "a file is written");
    file.close();
    const auto grid = pelloric::qt::csvGrid(file.fileName());
    expect(grid->rowCount() == 1 && grid->cell(0, 1) == "2", "the file is read");
    bool isRefused = false;
    try {
        pelloric::qt::sqliteGrid(folder + "/none.sqlite");
    } catch (const pelloric::RunTimeError& error) {
        isRefused = error.number() == pelloric::ErrorNumber::FileNotFound;
    }
    expect(isRefused, "a database that is missing is told as an error of the library");
}

void runScript(pelloric::qt::Sorvane& canvas)
{
    pelloric::qt::letScriptsCall();
    QJSEngine engine;
    QJSEngine::setObjectOwnership(&canvas, QJSEngine::CppOwnership);
    engine.globalObject().setProperty("canvas", engine.newQObject(&canvas));
    const QJSValue number
        = engine.evaluate("try { canvas.intTop = 70000; 0 } catch (error) { error.number }");
    expect(number.toInt() == 6, "a script gets the overflow error");
}

} // namespace

int main(int count, char** arguments)
{
    QApplication application(count, arguments);
    QTemporaryDir folder;
    expect(ownPlatform() == 42, "the host's header is its own");
    expect(QString::fromLatin1(pelloric::version()) == "1.0.0", "the version is the header's");
    exportReport(folder.path());
    readTables(folder.path());
    pelloric::qt::Sorvane canvas;
    canvas.setintTop(600);
    expect(canvas.property("intTop").toInt() == 600, "a member is the same by its name");
    runScript(canvas);
    return failures;
}
