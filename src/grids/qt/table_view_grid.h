// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/qt/cell_spans.h"
#include "grids/qt/cell_text.h"
#include "grids/qt/view_looks.h"
#include "grids/qt/view_sections.h"
#include "platform/automation_object.h"
#include "platform/row_cells.h"

#include <QPointer>

#include <memory>

class QTableView;

namespace pelloric::qt {

class DataViewGrid;

/// A table view as the flex grid that it looks like: `Cols`, `Rows`, `ColWidth`, `TextMatrix`.
///
/// Row 0 holds the titles of the horizontal header. Columns stand in the order in which they are
/// seen, hidden ones with width 0; hidden rows are left out. A cell that another one spans is
/// empty. Reading `Cols` lets the model fetch all its rows and takes order and rows anew; until
/// then they stay as they were.
///
/// It answers a data grid's members as `DataViewGrid` does, too, for a host that asks for those.
class TableViewGrid final : public AutomationObject, public CellLooks, public RowCells {
public:
    /// @param view  borrowed; once it is gone, its members are the object-missing error
    explicit TableViewGrid(QTableView& view);
    ~TableViewGrid() override;

    std::optional<MemberId> findMember(TextView name) override;
    const void* memberTable() const override;
    Value get(MemberId member, std::span<const Value> arguments) override;
    void put(MemberId member, std::span<const Value> arguments, const Value& value) override;
    CellLooks* cellLooks() override { return this; }

    /// Takes order, rows and looks of the view anew.
    void takeAnew();

    void readRow(std::int32_t row, std::span<const int> columns,
        const std::function<void(TextView text)>& take) override;

    GridLook gridLook() override;
    void readLook(std::int32_t row, std::int32_t column, CellLook& look) override;
    TextView text(std::int32_t row, std::int32_t column) override;
    CellAlignment titleAlignment(std::int32_t column) override;
    bool isMarked(std::int32_t row) override;
    std::optional<double> number(std::int32_t row, std::int32_t column) override;

private:
    bool hasCell(std::int32_t row, std::int32_t column) const;
    QModelIndex indexOf(std::int32_t row, std::int32_t column) const;
    QTableView& view() const;
    int columnOf(std::span<const Value> arguments, std::size_t position) const;
    TextView title(int column);
    TextView text(const QTableView& table, const QModelIndex& root, ModelCell cell);
    DataViewGrid& dataGrid();

    QPointer<QTableView> view_;
    SectionMap rows_;
    SectionMap columns_;
    CellSpans spans_;
    std::unique_ptr<DataViewGrid> dataGrid_; ///< null: nobody asked for its members yet
    CellText text_;
    ViewLooks looks_;
    QString title_;
};

} // namespace pelloric::qt
