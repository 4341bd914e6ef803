// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/column_bands.h"

#include "platform/numbers.h"

#include <algorithm>

namespace pelloric {

double tableWidthOf(std::span<const double> widths)
{
    double sum = 0;
    for (const double width : widths)
        sum += width;
    return sum;
}

double widthCap(std::vector<double> widths, double room)
{
    std::ranges::sort(widths);
    double left = room;
    for (std::size_t at = 0; at < widths.size(); ++at) {
        const double share = left / static_cast<double>(widths.size() - at);
        if (widths[at] > share)
            return share;
        left -= widths[at];
    }
    return room;
}

std::vector<ColPos> cutColumnBands(std::span<const double> widths, double paper, double left)
{
    const auto last = narrowToInt16(static_cast<std::int64_t>(widths.size()));
    if (tableWidthOf(widths) < paper - 2 * left)
        return { { 1, last } };
    std::vector<ColPos> bands;
    std::int16_t start = 1;
    double running = 2 * left;
    for (int column = 1; column <= last; ++column) {
        const double width = widths[static_cast<std::size_t>(column - 1)];
        running += width;
        if (running >= paper && column > start) {
            bands.push_back({ start, static_cast<std::int16_t>(column - 1) });
            start = static_cast<std::int16_t>(column);
            running = 2 * left + width;
        }
    }
    bands.push_back({ start, last });
    return bands;
}

} // namespace pelloric
