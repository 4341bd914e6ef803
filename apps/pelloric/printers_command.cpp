// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "headless.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"
#include "print/qt/qt_printer_system.h"

#include <array>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "papers", nullptr, phraseText(u"also list the papers, each with its code and size") },
});

QString millimetres(const PaperForm& form)
{
    return QStringLiteral("%1 x %2 mm").arg(form.widthMm, 0, 'f', 1).arg(form.heightMm, 0, 'f', 1);
}

void listPapers(const qt::QtPrinterSystem& system)
{
    int code = 0;
    for (const PaperForm& form : system.forms())
        print(QStringLiteral("    %1  %2  %3\n")
                  .arg(++code, 3)
                  .arg(qt::toQString(form.name), -24)
                  .arg(millimetres(form)));
}

} // namespace

int runPrinters(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, printersOptions(), 0);
    const HeadlessApplication application(invocation);
    qt::QtPrinterSystem system;
    const Text current = system.currentPrinter();
    if (current.empty())
        throw CommandError(system.refusal({}));
    for (const Text& name : system.printerNames()) {
        const QString refusal = system.refusal(name);
        print(QStringLiteral("%1 %2: %3\n")
                  .arg(QLatin1String(name == current ? "*" : " "), qt::toQString(name),
                      refusal.isEmpty() ? qt::phrased(u"ready") : refusal));
        if (!line.has("papers"))
            continue;
        system.makeCurrent(name);
        listPapers(system);
    }
    return Done;
}

QString printersDetails()
{
    return qt::phrased(u"The printer with the star is used when none is named.\n");
}

OptionTables printersOptions() { return { Options }; }

} // namespace pelloric::app
