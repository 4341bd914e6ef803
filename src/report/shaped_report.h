// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/progress.h"
#include "report/layout_engine.h"

#include <pelloric/options.h>

#include <vector>

namespace pelloric {

class GridTable;

/// What a report is made of and where its pages go; all of it is borrowed.
struct ReportTarget {
    ReportStyle& style; ///< its orientation follows a sheet that is turned
    PageSetup& setup; ///< likewise its size
    const Platform& platform;
    PageDocument& document; ///< from its current, empty page on
    Recorder& recorder;
};

/// What came out of a layout.
struct ReportOutcome {
    FitResult fit;
    std::int64_t records = 0; ///< that are printed
    std::vector<LeftOut> leftOut; ///< of the totals
    double titleTop = 0; ///< where the titles of the last page were asked for: twips
};

/// Lays a table out: plainly where the options ask for nothing, else as they ask.
///
/// @throws RunTimeError as `LayoutEngine::build`; InvalidCall: the options name a column that is
///         not printed, or marked rows where none is marked
ReportOutcome layOutReport(GridTable& table, const ReportOptions& options,
    const ReportTarget& target, const Progress& progress);

} // namespace pelloric
