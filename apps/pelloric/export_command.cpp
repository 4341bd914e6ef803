// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "controls/canvas.h"
#include "document/ostl_format.h"
#include "document/ostl_writer.h"
#include "export/qt/page_export.h"
#include "headless.h"
#include "interruption.h"
#include "platform/platform.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "progress_line.h"
#include "report_builder.h"
#include "report_options.h"
#include "table_selection.h"
#include "table_source.h"

#include <QFileInfo>

#include <algorithm>
#include <array>
#include <memory>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "o", "OUT", "where to: a name that ends in .pdf, .png, .svg or .ostl" },
    { "pages", "LIST", "only these pages: 1,3,5-12" },
    { "dpi", "N", "pixels an inch of .png images (150)" },
});

constexpr double LeastDpi = 10;
constexpr double MostDpi = 2400;

/// What is exported, and what it takes.
struct Export {
    const PageDocument& document;
    const PageSetup& setup;
    qt::QtPlatform& platform;
    qt::ExportOptions options;
    std::filesystem::path path;
};

void writePdf(const Export& job)
{
    qt::exportPdf(job.document, job.setup, job.platform.fonts(), job.options, job.path);
}

void writePngs(const Export& job)
{
    qt::exportPngs(job.document, job.setup, job.platform.fonts(), job.options, job.path);
}

void writeSvg(const Export& job)
{
    qt::exportSvg(job.document, job.setup, job.platform.fonts(), job.options, job.path);
}

void writeDocument(const Export& job)
{
    const Platform platform = job.platform.record();
    qt::exportOstl(job.document, job.setup, { platform.codec, platform.decimalSeparator },
        job.options, job.path);
    const int leftOut = job.document.Totalpages - 1 - ostl::LastPageIndex;
    if (leftOut > 0)
        tell(QStringLiteral("a document file holds %1 pages; the last %2 were left out")
                 .arg(ostl::LastPageIndex + 1)
                 .arg(leftOut));
}

/// A kind of file that can be made.
struct Format {
    const char* extension;
    void (*write)(const Export& job);
    bool takesPages;
    bool takesDpi;
};

constexpr auto Formats = std::to_array<Format>({
    { "pdf", writePdf, true, false },
    { "png", writePngs, true, true },
    { "svg", writeSvg, true, false },
    { "ostl", writeDocument, false, false },
});

const Format& formatOf(const QString& out)
{
    const QString extension = QFileInfo(out).suffix().toLower();
    for (const Format& format : Formats) {
        if (extension == QLatin1String(format.extension))
            return format;
    }
    throw CommandError(
        QStringLiteral("%1: the name must end in .pdf, .png, .svg or .ostl").arg(out), WrongUsage);
}

/// What the options say, checked before anything is read.
struct Order {
    explicit Order(const CommandLine& line)
        : file(line.file(0))
        , out(line.value("o"))
    {
        if (out.isEmpty())
            throw CommandError(
                QStringLiteral("say where to export to: -o OUT.pdf, .png, .svg or .ostl"),
                WrongUsage);
        format = &formatOf(out);
        if (line.has("pages") && !format->takesPages)
            throw CommandError(
                QStringLiteral("--pages is for .pdf, .png and .svg; a document file holds all"),
                WrongUsage);
        if (line.has("dpi") && !format->takesDpi)
            throw CommandError(QStringLiteral("--dpi is for .png images"), WrongUsage);
        if (line.has("dpi"))
            dpi = static_cast<int>(numberOf("dpi", line.value("dpi"), LeastDpi, MostDpi, true));
    }

    QString file;
    QString out;
    const Format* format = nullptr;
    int dpi = qt::ExportOptions().dpi;
};

void exportPages(const Order& order, const CommandLine& line, const PageDocument& document,
    const PageSetup& setup, qt::QtPlatform& platform, ProgressLine& progress)
{
    qt::ExportOptions options;
    options.pages = pagesOf(line.value("pages"), document.Totalpages);
    options.dpi = order.dpi;
    options.title = qt::toText(line.has("title") ? line.value("title") : plainName(order.file));
    options.progress = [&](int done, int total) {
        progress.show("Writing", static_cast<double>(done) / std::max(1, total));
        return Interruption::mayGoOn();
    };
    order.format->write({ document, setup, platform, options, pathOf(order.out) });
}

/// A saved document: its pages are put out as they are.
void exportDocument(
    const Order& order, const CommandLine& line, qt::QtPlatform& platform, ProgressLine& progress)
{
    const SavedDocument saved = readDocument(order.file, line, platform.record());
    exportPages(order, line, saved.document, saved.setup, platform, progress);
}

void exportTable(
    const Order& order, const CommandLine& line, qt::QtPlatform& platform, ProgressLine& progress)
{
    auto grid = std::make_unique<TableGrid>(readTable(order.file, line, progress));
    const PrivateSettings settings(platform, line);
    Platform record = platform.record();
    Canvas canvas(record);
    buildReport(canvas, *grid, line, progress);
    grid.reset();
    exportPages(order, line, canvas.document(), canvas.page, platform, progress);
}

} // namespace

int runExport(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, exportOptions(), 1);
    const Order order(line);
    if (isSameFile(order.file, order.out))
        throw CommandError(
            QStringLiteral("%1 is the file that is read; export to another one").arg(order.out));
    const HeadlessApplication application(invocation);
    qt::QtPlatform platform;
    qt::StreamMessages messages;
    platform.useMessages(messages);
    const Interruption interruption(platform.loop());
    ProgressLine progress;
    if (isDocumentName(order.file))
        exportDocument(order, line, platform, progress);
    else
        exportTable(order, line, platform, progress);
    return messages.exitStatus();
}

QString exportDetails()
{
    return QStringLiteral(
        "FILE is a CSV or TSV file, whose first row holds the titles, an SQLite database\n"
        "(db.sqlite:table, or db.sqlite with --query), or a saved document (.ostl).\n"
        "Several pages as .png or .svg become OUT-001, OUT-002 and so on.\n");
}

OptionTables exportOptions()
{
    return { Options, sourceOptions(), selectionOptions(), reportOptions() };
}

} // namespace pelloric::app
