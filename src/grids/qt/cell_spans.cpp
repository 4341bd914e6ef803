// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/cell_spans.h"

#include "grids/qt/view_sections.h"

#include <QAbstractItemModel>
#include <QTableView>

#include <algorithm>
#include <limits>

namespace pelloric::qt {

namespace {

constexpr int NotSeen = std::numeric_limits<int>::max();

/// The place at which each section of a model is seen; `NotSeen` for the others.
std::vector<int> placesOf(const SectionMap& sections, int modelCount)
{
    std::vector<int> places(static_cast<std::size_t>(modelCount), NotSeen);
    for (int place = 0; place < sections.count(); ++place) {
        const int logical = sections.logical(place);
        if (logical < modelCount)
            places[static_cast<std::size_t>(logical)] = place;
    }
    return places;
}

/// The sections between two, both included, that are seen.
struct SeenRange {
    int firstSection = 0; ///< the first of all where none is seen
    int firstPlace = 0;
    int lastPlace = 0;
};

SeenRange seenBetween(const std::vector<int>& places, int first, int last)
{
    SeenRange range { first, NotSeen, -1 };
    const int end = std::min(static_cast<int>(places.size()) - 1, last);
    for (int section = first; section <= end; ++section) {
        const int place = places[static_cast<std::size_t>(section)];
        if (place == NotSeen)
            continue;
        if (place < range.firstPlace)
            range = { section, place, std::max(range.lastPlace, place) };
        range.lastPlace = std::max(range.lastPlace, place);
    }
    return range;
}

} // namespace

CellSpans::CellSpans(const QTableView& view, const SectionMap& rows, const SectionMap& columns)
{
    const QAbstractItemModel& model = *view.model();
    findSpans(view, model.rowCount(view.rootIndex()), model.columnCount(view.rootIndex()));
    if (!isEmpty())
        findShown(view, rows, columns);
}

const CellSpan* CellSpans::at(ModelCell cell) const
{
    const Stretch* const stretch = stretchAt(cell);
    return stretch ? &spans_[stretch->span] : nullptr;
}

const CellSpans::Stretch* CellSpans::stretchAt(ModelCell cell) const
{
    const auto column = static_cast<std::size_t>(cell.column);
    if (cell.column < 0 || column >= columns_.size())
        return nullptr;
    const std::vector<Stretch>& stretches = columns_[column];
    const auto found = std::lower_bound(stretches.begin(), stretches.end(), cell.row,
        [](const Stretch& stretch, int row) { return stretch.lastRow < row; });
    if (found == stretches.end() || spans_[found->span].first.row > cell.row)
        return nullptr;
    return &*found;
}

/// A view tells only how large the box is that a cell belongs to. Going down a column, the first
/// cell of a larger box is in its top row; the column to the left tells whether it began there.
void CellSpans::findSpans(const QTableView& view, int rowCount, int columnCount)
{
    columns_.resize(static_cast<std::size_t>(columnCount));
    for (int column = 0; column < columnCount; ++column) {
        std::vector<Stretch>& stretches = columns_[static_cast<std::size_t>(column)];
        for (int row = 0; row < rowCount;) {
            const int height = std::max(1, view.rowSpan(row, column));
            const int width = std::max(1, view.columnSpan(row, column));
            if (height > 1 || width > 1) {
                const ModelCell last { std::min(row + height, rowCount) - 1,
                    std::min(column + width, columnCount) - 1 };
                const Stretch* const left = stretchAt({ row, column - 1 });
                const bool goesOn = left && spans_[left->span].last.column >= column;
                if (!goesOn)
                    spans_.push_back({ { row, column }, last, { row, column }, {}, {} });
                stretches.push_back({ last.row, goesOn ? left->span : spans_.size() - 1 });
            }
            row += height;
        }
    }
    if (spans_.empty())
        columns_.clear();
}

void CellSpans::findShown(const QTableView& view, const SectionMap& rows, const SectionMap& columns)
{
    const QAbstractItemModel& model = *view.model();
    const auto rowPlaces = placesOf(rows, model.rowCount(view.rootIndex()));
    std::vector<int> columnPlaces = placesOf(columns, model.columnCount(view.rootIndex()));
    for (std::size_t column = 0; column < columnPlaces.size(); ++column) {
        if (view.isColumnHidden(static_cast<int>(column)))
            columnPlaces[column] = NotSeen;
    }
    for (CellSpan& span : spans_) {
        const SeenRange ofRows = seenBetween(rowPlaces, span.first.row, span.last.row);
        const SeenRange ofColumns = seenBetween(columnPlaces, span.first.column, span.last.column);
        span.shown = { ofRows.firstSection, ofColumns.firstSection };
        span.firstPlace = { ofRows.firstPlace, ofColumns.firstPlace };
        span.lastPlace = { ofRows.lastPlace, ofColumns.lastPlace };
    }
}

} // namespace pelloric::qt
