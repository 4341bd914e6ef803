// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/printer.h"

#include <QMarginsF>
#include <QPageLayout>
#include <QPageSize>

class QPrinterInfo;

namespace pelloric::qt {

/// The sheet of a printer that pages are put on.
struct Sheet {
    QPageSize paper {}; ///< as the printer names it
    QPageLayout::Orientation orientation = QPageLayout::Portrait;
    QMarginsF edges {}; ///< that the printer leaves free, of the sheet as it lies: points
};

/// The sheet for pages: of the form that their code names, else of their own size where the printer
/// has or takes it, else the printer's default.
Sheet sheetOf(const QPrinterInfo& info, const PaperRequest& pages);

/// Name and size of a sheet as it lies.
PaperForm formOf(const Sheet& sheet);

/// The free edges of a sheet that is turned to lie.
/// @param edges      of the upright sheet
/// @param clockwise  which way its pages are turned to come out upright
QMarginsF turnedEdges(const QMarginsF& edges, bool clockwise);

} // namespace pelloric::qt
