// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/qt/qt_platform.h"
#include "print/qt/qt_printer.h"
#include "print/qt/qt_printer_system.h"

namespace pelloric::qt {

/// Gives a platform the printers of the system; must live as long as the platform is used.
class QtPrinting {
public:
    explicit QtPrinting(QtPlatform& platform)
        : printer_(system_, platform.fonts())
    {
        platform.usePrinter(printer_, system_);
        system_.calls().whileWaiting([&loop = platform.loop()] { loop.letLive(); });
    }
    QtPrinting(const QtPrinting&) = delete;
    QtPrinting& operator=(const QtPrinting&) = delete;

    QtPrinter& printer() { return printer_; }
    QtPrinterSystem& system() { return system_; }

private:
    QtPrinterSystem system_;
    QtPrinter printer_;
};

} // namespace pelloric::qt
