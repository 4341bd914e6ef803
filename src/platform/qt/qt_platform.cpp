// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_platform.h"

#include <QLocale>

namespace pelloric::qt {

QtPlatform::QtPlatform()
    : metrics_(fonts_)
    , messages_(&boxes_)
    , printer_(&noPrinter_)
    , printers_(&noPrinters_)
{
    QtFonts::installSubstitutions();
}

void QtPlatform::useMessages(MessageService& messages) { messages_ = &messages; }

void QtPlatform::usePrinter(Printer& printer, PrinterSystem& printers)
{
    printer_ = &printer;
    printers_ = &printers;
}

Platform QtPlatform::record()
{
    const QString point = QLocale().decimalPoint();
    return { .metrics = metrics_,
        .codec = codec_,
        .messages = *messages_,
        .loop = loop_,
        .clock = clock_,
        .folders = folders_,
        .files = files_,
        .printer = *printer_,
        .printers = *printers_,
        .library = library_,
        .decimalSeparator = point.isEmpty() ? u'.' : point.front().unicode(),
        .pictures = &pictures_ };
}

} // namespace pelloric::qt
