// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// Pages on paper, without a dialog.
///
/// @code
/// printPages(report, { .printer = pelloric::qt::printers().first(), .pages = "1,3,5-12" });
/// @endcode

#include <pelloric/version.h>

#include <QString>
#include <QStringList>

namespace pelloric::qt {

class Report;
class Sorvane;

/// What is printed, and where.
struct PrintRequest {
    QString printer {}; ///< one of `printers()`; empty: the current one
    QString pages {}; ///< page numbers and ranges, "1,3,5-12"; empty: all pages
    int copies = 1; ///< whole copies one after the other, 0 to 32,767
    QString title {}; ///< in the printer's queue
};

/// The names of the system's printers; needs a QGuiApplication.
PELLORIC_EXPORT QStringList printers();

/// Sends pages to a printer, each as a document of its own; page numbers that do not exist are
/// passed over.
/// @throws RunTimeError InvalidCall, naming the printer: it is unknown, or takes no jobs; Overflow:
///         more copies than 32,767; or the printer's own, with the number of pages that were sent
PELLORIC_EXPORT void printPages(const Report& report, const PrintRequest& request = {});
/// The same of the pages that a control shows.
PELLORIC_EXPORT void printPages(Sorvane& canvas, const PrintRequest& request = {});

} // namespace pelloric::qt
