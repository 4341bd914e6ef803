// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

class QTableView;

namespace pelloric::qt {

class SectionMap;

/// A cell of a table view's model.
struct ModelCell {
    int row = 0;
    int column = 0;

    bool operator==(const ModelCell&) const = default;
};

/// One box over several cells of a table view: rows and columns of the model, both ends included.
struct CellSpan {
    ModelCell first; ///< the cell whose content is shown
    ModelCell last;
    ModelCell shown; ///< the first cell of the box that is not hidden, as they are seen
    ModelCell firstPlace; ///< where that cell is seen: from 0
    ModelCell lastPlace; ///< where the last cell is seen that is not hidden
};

/// The spans of a table view.
class CellSpans {
public:
    /// Nothing spans anything.
    CellSpans() = default;

    /// Takes the spans of a view.
    ///
    /// @param rows     those that are not hidden, in the order in which they are seen
    /// @param columns  all, in the order in which they are seen
    CellSpans(const QTableView& view, const SectionMap& rows, const SectionMap& columns);

    bool isEmpty() const { return spans_.empty(); }

    /// The span that holds a cell, or null.
    const CellSpan* at(ModelCell cell) const;

private:
    /// A span's share of one column.
    struct Stretch {
        int lastRow = 0;
        std::size_t span = 0;
    };

    const Stretch* stretchAt(ModelCell cell) const;
    void findSpans(const QTableView& view, int rowCount, int columnCount);
    void findShown(const QTableView& view, const SectionMap& rows, const SectionMap& columns);

    std::vector<CellSpan> spans_;
    std::vector<std::vector<Stretch>> columns_; ///< of the model; the stretches from top to bottom
};

} // namespace pelloric::qt
