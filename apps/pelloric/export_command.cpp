// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "controls/canvas.h"
#include "document/append_pages.h"
#include "document/ostl_format.h"
#include "document/ostl_losses.h"
#include "document/ostl_writer.h"
#include "export/qt/page_export.h"
#include "font_notes.h"
#include "headless.h"
#include "interruption.h"
#include "outcome.h"
#include "platform/platform.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "progress_line.h"
#include "report_builder.h"
#include "report_options.h"
#include "shape_options.h"
#include "table_selection.h"
#include "table_source.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

#include <algorithm>
#include <array>
#include <memory>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "o", "OUT",
        phraseText(u"where to: a name that ends in .pdf, .png, .svg or .ostl; a folder; or -") },
    { "join", nullptr, phraseText(u"several inputs into one file, one behind the other") },
    { "format", "NAME", phraseText(u"pdf, png, svg or ostl, for a folder or - (pdf)") },
    { "pages", "LIST", phraseText(u"only these pages: 1,3,5-12") },
    { "dpi", "N", phraseText(u"pixels an inch of .png images (150)") },
    { "jobs", "N", phraseText(u"pages of .png images made at a time (one for each processor)") },
    { "tagged", nullptr,
        phraseText(u"a .pdf file that says its tables, for readers who do not see it") },
    { "pdfa", nullptr, phraseText(u"a .pdf file for archives (PDF/A-2b)") },
    { "language", "TAG", phraseText(u"of the texts of a .pdf file: zh-CN (the locale's)") },
});

/// The name that stands for the standard output.
const QString StandardOutput = QStringLiteral("-");

constexpr double LeastDpi = 10;
constexpr double MostDpi = 2400;
constexpr double MostJobs = 256;

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
    const qt::PdfExport made
        = qt::exportPdf(job.document, job.setup, job.platform.fonts(), job.options, job.path);
    if (!made.byToolkitBecause.empty())
        tell(qt::phrased(u"%1; its characters are drawn as shapes")
                 .arg(qt::toQString(made.byToolkitBecause)));
}

void writePngs(const Export& job)
{
    qt::exportPngs(job.document, job.setup, job.options, job.path);
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
    const OstlLosses losses = ostlLosses(job.document, platform.codec);
    if (losses.pages > 0)
        note(qt::phrased(u"a document file holds %1 pages; the last %2 were left out")
                 .arg(ostl::LastPageIndex + 1)
                 .arg(losses.pages));
    if (losses.pictures)
        note(qt::phrased(u"a document file holds no pictures; watermark and logo were left out"));
    if (losses.icons)
        note(qt::phrased(u"a document file holds no icons of cells; they were left out"));
    if (losses.texts > 0)
        note(qt::phrased(u"a document file has no code for some characters; %1 of its texts "
                         u"show \"?\" for them")
                 .arg(losses.texts));
}

/// A kind of file that can be made.
struct Format {
    const char* extension;
    void (*write)(const Export& job);
    bool takesPages;
    bool takesDpi;
    bool isPdf;
};

constexpr auto Formats = std::to_array<Format>({
    { "pdf", writePdf, true, false, true },
    { "png", writePngs, true, true, false },
    { "svg", writeSvg, true, false, false },
    { "ostl", writeDocument, false, false, false },
});

const Format* findFormat(const QString& name)
{
    for (const Format& format : Formats) {
        if (name.compare(QLatin1String(format.extension), Qt::CaseInsensitive) == 0)
            return &format;
    }
    return nullptr;
}

/// @param name  empty: the first of all
const Format& formatNamed(const QString& name)
{
    const Format* const format = name.isEmpty() ? &Formats.front() : findFormat(name);
    if (!format)
        throw CommandError(
            qt::phrased(u"--format takes pdf, png, svg or ostl, not \"%1\"").arg(name), WrongUsage);
    return *format;
}

bool isFolderName(const QString& name)
{
    std::error_code ignored;
    return std::filesystem::is_directory(pathOf(name), ignored);
}

const Format& formatOf(const QString& out)
{
    const Format* const format = findFormat(QFileInfo(out).suffix());
    if (!format)
        throw CommandError(
            qt::phrased(u"%1: the name must end in .pdf, .png, .svg or .ostl").arg(out),
            WrongUsage);
    return *format;
}

/// What the options say, checked before anything is read.
struct Order {
    explicit Order(const CommandLine& line)
        : files(line.files())
        , out(line.value("o"))
        , isJoined(line.has("join"))
    {
        if (out.isEmpty())
            throw CommandError(
                qt::phrased(u"say where to export to: -o OUT.pdf, .png, .svg or .ostl"),
                WrongUsage);
        if (files.size() > 1 && !isJoined && out != StandardOutput && !isFolderName(out)
            && findFormat(QFileInfo(out).suffix()))
            throw CommandError(
                qt::phrased(
                    u"%1 is one input more; several go into a folder, or with --join into one "
                    u"file, and %2 is no folder; quote names with blanks")
                    .arg(files.at(1), out),
                WrongUsage);
        if (line.has("format") || isFolder() || out == StandardOutput)
            format = &formatNamed(line.has("format") ? line.value("format") : QString());
        else
            format = &formatOf(out);
        if (line.has("pages") && !format->takesPages)
            throw CommandError(
                qt::phrased(u"--pages is for .pdf, .png and .svg; a document file holds all"),
                WrongUsage);
        if (line.has("dpi") && !format->takesDpi)
            throw CommandError(qt::phrased(u"--dpi is for .png images"), WrongUsage);
        if (line.has("jobs") && !format->takesDpi)
            throw CommandError(qt::phrased(u"--jobs is for .png images"), WrongUsage);
        if (line.has("jobs"))
            jobs = static_cast<int>(numberOf("jobs", line.value("jobs"), 1, MostJobs, true));
        for (const char* const option : { "tagged", "pdfa", "language" }) {
            if (line.has(option) && !format->isPdf)
                throw CommandError(
                    qt::phrased(u"--%1 is for .pdf files").arg(QLatin1String(option)), WrongUsage);
        }
        if (line.has("dpi"))
            dpi = static_cast<int>(numberOf("dpi", line.value("dpi"), LeastDpi, MostDpi, true));
        if (out == StandardOutput && line.has("json"))
            throw CommandError(
                qt::phrased(u"-o - and --json both want the standard output"), WrongUsage);
    }

    /// Whether every input gets a file of its own in the folder `out`.
    bool isFolder() const
    {
        return !isJoined
            && (files.size() > 1 || out.endsWith(QLatin1Char('/')) || isFolderName(out));
    }

    QStringList files;
    QString out;
    bool isJoined;
    const Format* format = nullptr;
    int dpi = qt::ExportOptions().dpi;
    int jobs = qt::ExportOptions().jobs;
};

/// Laid-out pages and what is told of them.
struct Laid {
    PageDocument document;
    PageSetup setup;
    QJsonObject facts;
};

/// The pages of a saved document as they are, or of a table.
Laid layOut(
    const QString& file, const CommandLine& line, qt::QtPlatform& platform, ProgressLine& progress)
{
    if (isDocumentName(file)) {
        SavedDocument saved = readDocument(file, line, platform.record());
        return { std::move(saved.document), saved.setup, {} };
    }
    Platform record = platform.record();
    Canvas canvas(record);
    canvas.useSettings(settingsFor(line, record, SettingsBase::Defaults));
    canvas.options = shapeOf(line);
    auto grid = std::make_unique<TableGrid>(readTable(file, line, progress));
    const auto rows = static_cast<qint64>(grid->rowCount());
    buildReport(canvas, *grid, line, progress);
    QJsonObject facts = shapeFacts(canvas);
    facts.insert(QStringLiteral("rows"), rows);
    facts.insert(QStringLiteral("columns"), grid->columnCount());
    return { std::move(canvas.document()), canvas.page, facts };
}

void write(const Order& order, const CommandLine& line, const Laid& laid, const QString& title,
    const QString& out, qt::QtPlatform& platform, ProgressLine& progress)
{
    tellFonts(laid.document, platform);
    qt::ExportOptions options;
    options.pages = pagesOf(line.value("pages"), laid.document.Totalpages);
    options.dpi = order.dpi;
    options.jobs = order.jobs;
    options.isTagged = line.has("tagged");
    options.isArchive = line.has("pdfa");
    options.language = qt::toText(line.value("language"));
    options.title = qt::toText(line.has("title") ? line.value("title") : title);
    options.progress = progress.of(phraseText(u"Writing"));
    order.format->write({ laid.document, laid.setup, platform, options, pathOf(out) });
}

void refuseOverwriting(const QString& file, const QString& out)
{
    if (isSameFile(file, out))
        throw CommandError(
            qt::phrased(u"%1 is the file that is read; export to another one").arg(out));
}

void tellMade(const Outcome& outcome, const Order& order, const QString& input, const QString& out,
    const Laid& laid)
{
    QJsonObject facts = laid.facts;
    facts.insert(QStringLiteral("input"), input);
    facts.insert(QStringLiteral("file"), out);
    facts.insert(QStringLiteral("format"), QLatin1String(order.format->extension));
    facts.insert(QStringLiteral("pages"), laid.document.Totalpages);
    outcome.tellMade(facts);
}

/// The file of an input in the folder; a second one of the same name gets a number.
QString placeIn(
    const QString& folder, const QString& name, const Format& format, QStringList& taken)
{
    const QString suffix = QLatin1Char('.') + QLatin1String(format.extension);
    QString file = name + suffix;
    for (int number = 2; taken.contains(file); ++number)
        file = QStringLiteral("%1-%2").arg(name).arg(number) + suffix;
    taken.append(file);
    return QDir(folder).filePath(file);
}

void exportEach(const Order& order, const CommandLine& line, qt::QtPlatform& platform,
    ProgressLine& progress, const Outcome& outcome)
{
    std::error_code error;
    if (order.isFolder() && !std::filesystem::create_directories(pathOf(order.out), error) && error)
        throw CommandError(qt::phrased(u"%1: the folder cannot be made: %2",
            { order.out, QString::fromStdString(error.message()) }));
    QStringList taken;
    for (const QString& file : order.files) {
        const QString name = plainName(file);
        const QString out
            = order.isFolder() ? placeIn(order.out, name, *order.format, taken) : order.out;
        refuseOverwriting(file, out);
        const Laid laid = layOut(file, line, platform, progress);
        write(order, line, laid, name, out, platform, progress);
        tellMade(outcome, order, file, out, laid);
    }
}

void exportJoined(const Order& order, const CommandLine& line, qt::QtPlatform& platform,
    ProgressLine& progress, const Outcome& outcome)
{
    Laid joined;
    bool isFirst = true;
    for (const QString& file : order.files) {
        refuseOverwriting(file, order.out);
        const Laid laid = layOut(file, line, platform, progress);
        if (!isFirst
            && (laid.setup.myWidth != joined.setup.myWidth
                || laid.setup.myHeight != joined.setup.myHeight))
            throw CommandError(
                qt::phrased(u"%1 has pages of another size; --join wants one size").arg(file));
        joined.setup = laid.setup;
        appendPages(joined.document, laid.document, isFirst);
        isFirst = false;
    }
    write(order, line, joined, plainName(order.files.front()), order.out, platform, progress);
    tellMade(outcome, order, order.files.join(QLatin1Char(' ')), order.out, joined);
}

/// What is written for the standard output is complete before the first byte goes there.
void exportToOutput(Order order, const CommandLine& line, qt::QtPlatform& platform,
    ProgressLine& progress, const Outcome& outcome)
{
    const QTemporaryDir folder;
    if (!folder.isValid())
        throw CommandError(
            qt::phrased(u"%1; check the folder of temporary files").arg(folder.errorString()));
    order.out = folder.filePath(QStringLiteral("out.") + QLatin1String(order.format->extension));
    if (order.files.size() > 1)
        exportJoined(order, line, platform, progress, outcome);
    else
        exportEach(order, line, platform, progress, outcome);
    QFile file(order.out);
    if (!file.open(QIODevice::ReadOnly))
        throw CommandError(qt::phrased(u"several pages as .%1 do not go into one output; name a "
                                       u"file, or a page with --pages")
                               .arg(QLatin1String(order.format->extension)),
            WrongUsage);
    QFile output;
    const QByteArray bytes = file.readAll();
    if (!output.open(stdout, QIODevice::WriteOnly) || output.write(bytes) != bytes.size()
        || !output.flush())
        throw CommandError(
            qt::phrased(u"standard output cannot be written: %1", { output.errorString() }));
}

} // namespace

int runExport(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, exportOptions(), OneOrMore);
    const Order order(line);
    const Outcome outcome(line);
    const HeadlessApplication application(invocation);
    qt::QtPlatform platform;
    qt::StreamMessages messages;
    platform.useMessages(messages);
    const Interruption interruption(platform.loop());
    ProgressLine progress;
    if (order.out == StandardOutput)
        exportToOutput(order, line, platform, progress, outcome);
    else if (order.isJoined)
        exportJoined(order, line, platform, progress, outcome);
    else
        exportEach(order, line, platform, progress, outcome);
    return messages.exitStatus();
}

QString exportDetails()
{
    return fileDetails()
        + qt::phrased(
            u"Several pages as .png or .svg become OUT-001, OUT-002 and so on.\n"
            u"FILE - is the standard input, OUT - the standard output. Several FILEs become one\n"
            u"file each in the folder OUT, or with --join one file.\n")
        + textsDetails() + namesDetails();
}

OptionTables exportOptions()
{
    return { Options, sourceOptions(), selectionOptions(), reportOptions(), shapeOptions(),
        outcomeOptions() };
}

} // namespace pelloric::app
