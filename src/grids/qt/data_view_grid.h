// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/qt/model_row_set.h"
#include "platform/automation_object.h"

#include <QPointer>

#include <memory>

class QTableView;

namespace pelloric::qt {

class TableViewGrid;

/// A table view as a data grid: `DataSource`, `Columns`, `col`; for a host that wants the data
/// grid's reader, which prints hidden columns too.
///
/// The record set is the view's model walked in place, in the order and with the filter that the
/// view shows; its hidden rows are left out. Reading `DataSource` lets the model fetch all its rows
/// and takes order and rows anew. `Columns` counts from 0, in the order in which columns are seen;
/// a hidden one has width 0 and is shown when it is given a width.
class DataViewGrid final : public AutomationObject {
public:
    /// @param view  borrowed; once it is gone, its members are the object-missing error
    explicit DataViewGrid(QTableView& view);
    ~DataViewGrid() override;

    std::optional<MemberId> findMember(TextView name) override;
    const void* memberTable() const override;
    Value get(MemberId member, std::span<const Value> arguments) override;
    void put(MemberId member, std::span<const Value> arguments, const Value& value) override;

    /// Whether reading a member takes the rows and columns of the view anew.
    static bool takesRows(MemberId member);

    /// Those of the records and columns as they stand now.
    CellLooks* cellLooks() override;

private:
    class Columns;

    QTableView& view() const;
    RowSet& takeRows();
    int column() const;
    void setColumn(int column);

    QPointer<QTableView> view_;
    std::unique_ptr<Columns> columns_;
    ModelRowSet rows_;
    std::unique_ptr<TableViewGrid> shown_; ///< tells how cells look; null: nobody asked yet
    int column_ = 0; ///< what `col` was set to
};

} // namespace pelloric::qt
