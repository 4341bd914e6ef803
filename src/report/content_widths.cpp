// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/content_widths.h"

#include "document/cell_lines.h"
#include "grids/table_grid.h"
#include "platform/numbers.h"
#include "platform/services.h"
#include "platform/text_metrics.h"
#include "platform/text_runs.h"
#include "report/column_bands.h"

#include <algorithm>
#include <cmath>

namespace pelloric {

namespace {

constexpr std::int64_t MeasuredRows = 10000;
/// Twips beside the longest text: a centred text stands right of the middle by half the padding,
/// so that half of this is what it keeps from the line on its right.
constexpr Twips Clearance = 100;

/// A column narrower than this is not narrowed further to make a table fit: twips.
constexpr Twips ReadableWidth = 1200;

/// The advance of the longest line that is printed of a text at size 1.
double widestLine(TextView text, FaceMetrics& face)
{
    return longestLineAdvance(trimmed(text), face);
}

/// The row whose text in a column has the most code units.
std::int64_t longestRow(const TableGrid& grid, int column)
{
    std::int64_t longest = 0;
    std::size_t most = 0;
    for (std::int64_t row = 0; row < grid.rowCount(); ++row) {
        const std::size_t length = grid.cell(row, column).size();
        if (length > most) {
            most = length;
            longest = row;
        }
    }
    return longest;
}

double longestAdvance(const TableGrid& grid, int column, FaceMetrics& face)
{
    double longest = widestLine(grid.column(column).title, face);
    const std::int64_t rows = grid.rowCount();
    const std::int64_t step = std::max<std::int64_t>(1, (rows + MeasuredRows - 1) / MeasuredRows);
    for (std::int64_t row = 0; row < rows; row += step)
        longest = std::max(longest, widestLine(grid.cell(row, column), face));
    if (step > 1)
        longest = std::max(longest, widestLine(grid.cell(longestRow(grid, column), column), face));
    return longest;
}

} // namespace

std::vector<Twips> contentWidths(
    const TableGrid& grid, FaceMetrics& body, float size, MessageLoop* loop)
{
    constexpr double Least = NarrowestContent;
    constexpr double Most = WidestContent;
    std::vector<Twips> widths;
    for (int column = 0; column < grid.columnCount(); ++column) {
        if (loop != nullptr)
            loop->keepAlive();
        const double advance = longestAdvance(grid, column, body);
        const double text = std::ceil(advance * std::max(0.0, static_cast<double>(size)));
        widths.push_back(roundToInt32(std::clamp(text + CellPadding + Clearance, Least, Most)));
    }
    return widths;
}

void fitWidths(std::span<Twips> widths, Twips room)
{
    const double cap = std::floor(widthCap({ widths.begin(), widths.end() }, room));
    if (cap < ReadableWidth)
        return;
    for (Twips& width : widths)
        width = std::min(width, roundToInt32(cap));
}

} // namespace pelloric
