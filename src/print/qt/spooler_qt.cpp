// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/spooler.h"

#include <QPrinterInfo>

namespace pelloric::qt {

QString refusalOf(const QString& printer)
{
    if (printer.isEmpty())
        return QStringLiteral("there is no printer");
    const QPrinterInfo info = QPrinterInfo::printerInfo(printer);
    if (info.isNull())
        return QStringLiteral("there is no such printer");
    if (info.state() == QPrinter::Error)
        return QStringLiteral("the printer is stopped");
    return {};
}

QString handOverError() { return {}; }

} // namespace pelloric::qt
