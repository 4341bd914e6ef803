// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/no_printer.h"
#include "platform/platform.h"
#include "platform/qt/picture_files.h"
#include "platform/qt/qt_files.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_services.h"
#include "platform/qt/qt_text_codec.h"
#include "platform/qt/qt_text_metrics.h"

namespace pelloric::qt {

/// Owns the Qt services and hands them out as one record; needs a QGuiApplication.
class QtPlatform {
public:
    QtPlatform();
    QtPlatform(const QtPlatform&) = delete;
    QtPlatform& operator=(const QtPlatform&) = delete;

    /// Puts another message service in, as programs without windows do; borrowed.
    void useMessages(MessageService& messages);

    /// Puts the printers in; without them the system has none; borrowed.
    void usePrinter(Printer& printer, PrinterSystem& printers);

    /// The services as they were put in by now; valid as long as this object.
    Platform record();

    QtFonts& fonts() { return fonts_; }
    QtMessageLoop& loop() { return loop_; }
    QtSystemFolders& folders() { return folders_; }
    LibraryState& library() { return library_; }

private:
    QtFonts fonts_;
    QtTextMetrics metrics_;
    QtTextCodec codec_;
    BoxMessages boxes_;
    QtMessageLoop loop_;
    QtClock clock_;
    QtSystemFolders folders_;
    QtFiles files_;
    NoPrinter noPrinter_;
    NoPrinters noPrinters_;
    LibraryState library_;
    QtPictures pictures_;
    MessageService* messages_; ///< never null
    Printer* printer_; ///< never null
    PrinterSystem* printers_; ///< never null
};

} // namespace pelloric::qt
