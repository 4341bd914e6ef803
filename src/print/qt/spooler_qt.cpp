// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/spooler.h"

#include "platform/qt/qt_phrase.h"
#include "print/qt/held_pages.h"

#include <QPrinter>
#include <QPrinterInfo>

namespace pelloric::qt {

namespace {

constexpr int Resolution = 600;

/// The toolkit hands it over when its drawing ends.
class PrinterDocument final : public SpoolDocument {
public:
    explicit PrinterDocument(const SpoolOrder& order)
        : printer_(QPrinterInfo::printerInfo(order.printer), QPrinter::HighResolution)
    {
        const QList<int> resolutions = printer_.supportedResolutions();
        if (resolutions.isEmpty() || resolutions.contains(Resolution))
            printer_.setResolution(Resolution);
        printer_.setDocName(order.title);
        printer_.setFullPage(false);
        printer_.setPageSize(order.sheet.paper);
        printer_.setPageOrientation(order.sheet.orientation);
        printer_.setPageMargins(order.sheet.edges, QPageLayout::Point);
        printer_.setDuplex(QPrinter::DuplexNone);
        printer_.setCopyCount(1);
    }

    bool draw(const std::vector<HeldDrawing>& pages, const SpoolFonts& fonts) override
    {
        return paintHeldPages(pages, printer_, fonts.fonts);
    }

    QString handOver() override { return {}; }

private:
    QPrinter printer_;
};

} // namespace

void prepareCallingThread() { }

QString silenceOfSystem() { return {}; }

QString refusalOf(const QString& printer)
{
    if (printer.isEmpty())
        return phrased(u"there is no printer");
    const QPrinterInfo info = QPrinterInfo::printerInfo(printer);
    if (info.isNull())
        return phrased(u"there is no such printer");
    if (info.state() == QPrinter::Error)
        return phrased(u"the printer is stopped");
    return {};
}

bool asksForPassword(const QString&) { return false; }

bool turnsClockwise(const QString&) { return false; }

std::unique_ptr<SpoolDocument> newSpoolDocument(const SpoolOrder& order)
{
    return std::make_unique<PrinterDocument>(order);
}

} // namespace pelloric::qt
