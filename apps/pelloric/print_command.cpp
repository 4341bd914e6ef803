// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "controls/canvas.h"
#include "font_notes.h"
#include "headless.h"
#include "interruption.h"
#include "outcome.h"
#include "platform/platform.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "print/page_list.h"
#include "print/paper_fit.h"
#include "print/print_job.h"
#include "print/qt/qt_printing.h"
#include "progress_line.h"
#include "report_builder.h"
#include "report_options.h"
#include "shape_options.h"
#include "table_selection.h"
#include "table_source.h"

#include <algorithm>
#include <array>
#include <limits>
#include <memory>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "printer", "NAME",
        phraseText(u"where to: a name of \"pelloric printers\" (the current one)") },
    { "pages", "LIST", phraseText(u"only these pages: 1,3,5-12") },
    { "copies", "N", phraseText(u"whole copies, one after the other (1)") },
});

constexpr double MostCopies = std::numeric_limits<std::int16_t>::max();

/// What the options say, checked before anything is read.
struct Order {
    explicit Order(const CommandLine& line)
        : file(line.file(0))
        , title(line.has("title") ? line.value("title") : plainName(file))
        , pages(line.value("pages").trimmed())
    {
        if (line.has("copies"))
            copies = static_cast<std::int16_t>(
                numberOf("copies", line.value("copies"), 1, MostCopies, true));
    }

    QString file;
    QString title;
    QString pages;
    std::int16_t copies = 1;
};

/// The printers of this program's run, with the one that the options name.
void choosePrinter(const CommandLine& line, qt::QtPrinting& printing)
{
    qt::QtPrinterSystem& system = printing.system();
    const Text name = qt::toText(line.value("printer"));
    if (line.has("printer")) {
        const std::vector<Text> names = system.printerNames();
        if (std::find(names.begin(), names.end(), name) == names.end())
            throw CommandError(qt::phrased(u"no printer \"%1\"; see \"pelloric printers\"")
                                   .arg(line.value("printer")));
        system.makeCurrent(name);
    }
    if (system.currentPrinter().empty())
        throw CommandError(system.refusal({}));
}

/// The code of the paper that the pages were laid out for; 0: no form has their size.
/// @param wanted  taken where it fits
std::int16_t paperFor(
    const PageSetup& setup, std::int16_t wanted, const std::vector<PaperForm>& forms)
{
    const auto fits = [&setup](const PaperForm& form) {
        return isPaperOf(form, setup.myWidth, setup.myHeight);
    };
    const auto at = static_cast<std::size_t>(wanted) - 1;
    if (wanted >= 1 && at < forms.size() && fits(forms[at]))
        return wanted;
    const auto found = std::find_if(forms.begin(), forms.end(), fits);
    return found == forms.end() ? std::int16_t { 0 }
                                : static_cast<std::int16_t>(found - forms.begin() + 1);
}

/// Asks for the paper of the pages, and tells where the printer has none of their size.
void choosePaper(
    PrintJob& job, const PageSetup& setup, std::int16_t wanted, const qt::QtPrinterSystem& system)
{
    job.paperSize = paperFor(setup, wanted, system.forms());
    job.pageWidth = setup.myWidth;
    job.pageHeight = setup.myHeight;
    const PaperRequest pages { .code = job.paperSize,
        .orientation = job.orientation,
        .width = job.pageWidth,
        .height = job.pageHeight };
    const Text warning = paperWarning(pages, system.sheetFor(pages));
    if (!warning.empty())
        note(qt::toQString(warning));
}

/// Prints the pages and says how many there were.
void printPages(const Order& order, const PageDocument& document, PrintJob job,
    const Font& defaultFont, qt::QtPrinting& printing, ProgressLine& progress,
    const Outcome& outcome)
{
    job.allPages = order.pages.isEmpty();
    if (!job.allPages) {
        pagesOf(order.pages, document.Totalpages); // refuses a list that names no page
        job.pages = pageNumbersOf(pageListOf(qt::toText(order.pages)));
    }
    job.copies = order.copies;
    job.documentName = qt::toText(order.title);
    const std::int64_t total = pagesToSend(document, job);
    job.progress = [&](std::int64_t sent, std::int64_t wanted) {
        progress.show(phraseText(u"Printing"), sent, wanted);
        return Interruption::mayGoOn() || sent == wanted;
    };
    try {
        doPrint(document, job, defaultFont, printing.printer());
    } catch (const RunTimeError& error) {
        if (error.number() != ErrorNumber::InvalidCall)
            throw;
        throw CommandError(detailOf(error));
    }
    progress.clear();
    const QString printer = qt::toQString(printing.system().currentPrinter());
    outcome.tellMade(
        { { QStringLiteral("input"), order.file }, { QStringLiteral("printer"), printer },
            { QStringLiteral("pages"), static_cast<qint64>(total) } },
        qt::phrased(
            total == 1 ? phraseText(u"%1: %2 page sent\n") : phraseText(u"%1: %2 pages sent\n"),
            { printer, QString::number(total) }));
}

void printDocument(const Order& order, const CommandLine& line, qt::QtPlatform& platform,
    qt::QtPrinting& printing, ProgressLine& progress, const Outcome& outcome)
{
    const SavedDocument saved = readDocument(order.file, line, platform.record());
    tellFonts(saved.document, platform);
    PrintJob job;
    job.orientation = saved.setup.myWidth > saved.setup.myHeight ? 2 : 1;
    choosePaper(job, saved.setup, job.paperSize, printing.system());
    printPages(order, saved.document, job, Font {}, printing, progress, outcome);
}

void printTable(const Order& order, const CommandLine& line, qt::QtPlatform& platform,
    qt::QtPrinting& printing, ProgressLine& progress, const Outcome& outcome)
{
    Platform record = platform.record();
    Canvas canvas(record);
    canvas.useSettings(settingsFor(line, record, SettingsBase::Defaults));
    canvas.options = shapeOf(line);
    auto grid = std::make_unique<TableGrid>(readTable(order.file, line, progress));
    buildReport(canvas, *grid, line, progress);
    grid.reset();
    tellFonts(canvas.document(), platform);
    PrintJob job;
    const ReportStyle& style = canvas.style();
    job.orientation = style.PagerOrientation;
    choosePaper(job, canvas.page, style.PagerSizeValue, printing.system());
    printPages(
        order, canvas.document(), job, canvas.recorder().textFont(), printing, progress, outcome);
}

} // namespace

int runPrint(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, printOptions(), 1);
    const Order order(line);
    const Outcome outcome(line);
    const HeadlessApplication application(invocation);
    qt::QtPlatform platform;
    qt::StreamMessages messages;
    platform.useMessages(messages);
    qt::QtPrinting printing(platform);
    choosePrinter(line, printing);
    const Interruption interruption(platform.loop());
    ProgressLine progress;
    if (isDocumentName(order.file))
        printDocument(order, line, platform, printing, progress, outcome);
    else
        printTable(order, line, platform, printing, progress, outcome);
    return messages.exitStatus();
}

QString printDetails()
{
    return fileDetails()
        + qt::phrased(
            u"Every page is a job of its own, one-sided, on the paper it was laid out for.\n")
        + textsDetails() + namesDetails();
}

OptionTables printOptions()
{
    return { Options, sourceOptions(), selectionOptions(), reportOptions(), shapeOptions(),
        outcomeOptions() };
}

} // namespace pelloric::app
