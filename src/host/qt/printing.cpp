// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/printing.h>

#include "controls/qt/default_platform.h"
#include "host/qt/host_canvas.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/platform.h"
#include "platform/printer.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "print/page_list.h"

#include <algorithm>

namespace pelloric::qt {

namespace {

void choosePrinter(const QString& name)
{
    PrinterSystem& system = defaultPlatform().record().printers;
    const Text wanted = name.isEmpty() ? system.currentPrinter() : toText(name);
    const std::vector<Text> names = system.printerNames();
    if (std::ranges::find(names, wanted) == names.end())
        throw RunTimeError(ErrorNumber::InvalidCall,
            wanted.empty() ? phrase(u"there is no printer")
                           : phrase(u"there is no printer %1", { wanted }));
    if (!system.opens(wanted))
        throw RunTimeError(
            ErrorNumber::InvalidCall, phrase(u"the printer %1 takes no jobs", { wanted }));
    system.makeCurrent(wanted);
}

void print(Canvas& canvas, const PrintRequest& request)
{
    choosePrinter(request.printer);
    const Text earlier = canvas.documentName;
    if (!request.title.isEmpty())
        canvas.documentName = toText(request.title);
    try {
        canvas.doPrint(request.pages.trimmed().isEmpty(), pageListOf(toText(request.pages)),
            roundToInt16(request.copies));
    } catch (...) {
        canvas.documentName = earlier;
        throw;
    }
    canvas.documentName = earlier;
}

} // namespace

QStringList printers()
{
    QStringList names;
    for (const Text& name : defaultPlatform().record().printers.printerNames())
        names.append(toQString(name));
    return names;
}

void printPages(const Report& report, const PrintRequest& request)
{
    print(canvasOf(report), request);
}

void printPages(Sorvane& canvas, const PrintRequest& request) { print(canvasOf(canvas), request); }

} // namespace pelloric::qt
