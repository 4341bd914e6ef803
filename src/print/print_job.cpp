// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/print_job.h"

#include "document/page_document.h"
#include "platform/phrase.h"
#include "platform/printer.h"
#include "platform/run_time_error.h"
#include "view/page_renderer.h"

#include <vector>

namespace pelloric {

namespace {

void applySettings(Printer& printer, std::int16_t paperSize, std::int16_t orientation)
{
    printer.applyPaperSize(paperSize);
    printer.applyOrientation(orientation);
}

/// The zero-based pages of one copy, in the order in which they are sent.
std::vector<int> pagesOfCopy(const PageDocument& document, const PrintJob& job)
{
    std::vector<int> pages;
    if (job.allPages) {
        for (int page = 0; page < document.Totalpages && document.hasPage(page); ++page)
            pages.push_back(page);
        return pages;
    }
    for (const std::int16_t number : job.pages) {
        if (number <= document.Totalpages && document.hasPage(number - 1))
            pages.push_back(number - 1);
    }
    return pages;
}

Text documentTitle(TextView name, int page)
{
    Text title(name);
    if (!title.empty())
        title += u" – ";
    return title + u"page " + decimal(page + 1);
}

/// The printer's error with the number of pages that it took before.
RunTimeError errorAfter(const RunTimeError& error, std::int64_t sent, std::int64_t wanted)
{
    Text detail(error.detail());
    if (!detail.empty())
        detail.append(u", ");
    detail += phrase(u"after %1 of %2 pages", { decimal(sent), decimal(wanted) });
    return RunTimeError(error.number(), detail);
}

std::int64_t printCopies(
    const PageDocument& document, const PrintJob& job, const Font& defaultFont, Printer& printer)
{
    const std::vector<int> pages = pagesOfCopy(document, job);
    const std::int64_t wanted = static_cast<std::int64_t>(pages.size()) * job.copies;
    std::int64_t sent = 0;
    printer.endDoc(); // what another program part began is no part of this job
    for (int copy = 1; copy <= job.copies; ++copy) {
        for (const int page : pages) {
            try {
                printer.setDocumentTitle(documentTitle(job.documentName, page));
                printPage(document, page, defaultFont, printer);
            } catch (const RunTimeError& error) {
                throw errorAfter(error, sent, wanted);
            }
            tell(job.progress, ++sent, wanted);
        }
    }
    return sent;
}

} // namespace

void printPage(const PageDocument& document, int page, const Font& defaultFont, Printer& printer)
{
    PageRenderer(document).replay(page, paperReplay(defaultFont), printer);
    printer.endDoc();
}

std::int64_t pagesToSend(const PageDocument& document, const PrintJob& job)
{
    if (job.copies < 1)
        return 0;
    return static_cast<std::int64_t>(pagesOfCopy(document, job).size()) * job.copies;
}

std::int64_t doPrint(
    const PageDocument& document, const PrintJob& job, const Font& defaultFont, Printer& printer)
{
    const std::int16_t paperSize = printer.paperSize();
    const std::int16_t orientation = printer.orientation();
    std::int64_t sent = 0;
    const auto restore = [&] {
        printer.setPageSize(0, 0);
        applySettings(printer, paperSize, orientation);
    };
    try {
        printer.setPageSize(job.pageWidth, job.pageHeight);
        applySettings(printer, job.paperSize, job.orientation);
        sent = printCopies(document, job, defaultFont, printer);
    } catch (...) {
        restore();
        throw;
    }
    restore();
    return sent;
}

} // namespace pelloric
