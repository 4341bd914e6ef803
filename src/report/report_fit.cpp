// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/report_fit.h"

#include "document/page_document.h"
#include "report/column_bands.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr double LeastRoom = 1; ///< twips that a table which fits leaves free
constexpr int SearchSteps = 24; ///< halvings of the range in which a scale is looked for

bool isKey(std::span<const int> keys, int column)
{
    return std::find(keys.begin(), keys.end(), column) != keys.end();
}

double roomOf(const PageSetup& setup)
{
    return static_cast<double>(setup.myWidth) - 2.0 * setup.intLeft;
}

/// The smallest scale that the floors allow.
double floorOf(float size, const FitOptions& options)
{
    const double ofSize = size > 0 ? static_cast<double>(options.leastSize / size) : 1;
    return std::clamp(std::max(options.leastScale, ofSize), 0.0, 1.0);
}

std::size_t bandsAt(
    double scale, std::span<const double> widths, std::span<const int> keys, const PageSetup& setup)
{
    std::vector<double> scaled(widths.begin(), widths.end());
    for (double& width : scaled)
        width *= scale;
    return cutKeyedBands(scaled, keys, setup.myWidth, setup.intLeft).size();
}

FitResult fitAcross(std::span<const double> widths, std::span<const int> keys,
    const PageSetup& setup, double floor, std::size_t pages)
{
    if (bandsAt(1, widths, keys, setup) <= pages)
        return { FitRule::AsItIs, 1, false };
    if (bandsAt(floor, widths, keys, setup) > pages)
        return { FitRule::Bands, 1, false };
    double fits = floor;
    double tooLarge = 1;
    for (int step = 0; step < SearchSteps; ++step) {
        const double middle = (fits + tooLarge) / 2;
        (bandsAt(middle, widths, keys, setup) <= pages ? fits : tooLarge) = middle;
    }
    return { FitRule::Shrunk, fits, false };
}

} // namespace

std::vector<BandColumns> cutKeyedBands(
    std::span<const double> widths, std::span<const int> keys, double paper, double left)
{
    const auto count = static_cast<int>(widths.size());
    double keyWidth = 2 * left;
    for (const int key : keys)
        keyWidth += widths[static_cast<std::size_t>(key)];
    const BandColumns start(keys.begin(), keys.end());
    const bool isOne = tableWidthOf(widths) < paper - 2 * left;
    std::vector<BandColumns> bands { start };
    double running = keyWidth;
    for (int column = 0; column < count; ++column) {
        if (isKey(keys, column))
            continue;
        const double width = widths[static_cast<std::size_t>(column)];
        running += width;
        if (!isOne && running >= paper && bands.back().size() > start.size()) {
            bands.push_back(start);
            running = keyWidth + width;
        }
        bands.back().push_back(column);
    }
    return bands;
}

void narrowToSheet(std::span<double> widths, std::span<const int> keys, const PageSetup& setup)
{
    const double room = roomOf(setup) - LeastRoom;
    std::vector<double> keyWidths;
    double widest = 0;
    for (int column = 0; column < static_cast<int>(widths.size()); ++column) {
        const double width = widths[static_cast<std::size_t>(column)];
        if (isKey(keys, column))
            keyWidths.push_back(width);
        else
            widest = std::max(widest, width);
    }
    const double keyWidth = tableWidthOf(keyWidths);
    if (room <= 0 || keyWidth + widest <= room)
        return;
    const double keyRoom = std::min(keyWidth, std::max(room / 2, room - widest));
    const double keyCap = widthCap(std::move(keyWidths), keyRoom);
    for (int column = 0; column < static_cast<int>(widths.size()); ++column) {
        double& width = widths[static_cast<std::size_t>(column)];
        width = std::min(width, isKey(keys, column) ? keyCap : room - keyRoom);
    }
}

FitResult fitReport(std::span<const double> widths, std::span<const int> keys,
    const PageSetup& setup, float size, const FitOptions& options)
{
    if (!options.isAsked())
        return {};
    const double floor = floorOf(size, options);
    if (options.pagesAcross > 0)
        return fitAcross(widths, keys, setup, floor, static_cast<std::size_t>(options.pagesAcross));
    const double table = tableWidthOf(widths);
    if (table < roomOf(setup))
        return { FitRule::AsItIs, 1, false };
    const bool mayTurn = setup.myWidth < setup.myHeight;
    PageSetup wider = setup;
    if (mayTurn)
        std::swap(wider.myWidth, wider.myHeight);
    if (table < roomOf(wider))
        return { FitRule::Landscape, 1, mayTurn };
    const double scale = table > 0 ? (roomOf(wider) - LeastRoom) / table : 1;
    if (scale >= floor)
        return { FitRule::Shrunk, scale, mayTurn };
    return { FitRule::Bands, 1, false };
}

} // namespace pelloric
