// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"
#include "platform/cell_look.h"
#include "platform/row_cells.h"

#include <memory>

class QAbstractItemView;
class QListView;
class QTreeView;

namespace pelloric::qt {

/// A tree or list view as a list view in report mode: `ColumnHeaders`, `ListItems`.
///
/// `ColumnHeaders` (each with `Width` and `Text`) are the columns in the order in which they are
/// seen, hidden ones with width 0. `ListItems` (each with `Text`, the first column, and
/// `SubItems(p)`, the others from 1) are the rows from top to bottom, whether scrolled into sight
/// or not: those of branches that are open, without hidden rows; what the first column of a row
/// spans is empty. Both count from 1. Reading `ColumnHeaders` takes the columns anew, reading
/// `ListItems` the rows.
class TreeViewGrid final : public AutomationObject, public CellLooks, public RowCells {
public:
    /// @param view  borrowed; once it is gone, its members are the object-missing error
    explicit TreeViewGrid(QTreeView& view);
    /// A list is one column as wide as the view, with a blank as title; the width that is put is
    /// kept here.
    explicit TreeViewGrid(QListView& view);
    ~TreeViewGrid() override;

    std::optional<MemberId> findMember(TextView name) override;
    const void* memberTable() const override;
    Value get(MemberId member, std::span<const Value> arguments) override;
    void put(MemberId member, std::span<const Value> arguments, const Value& value) override;
    CellLooks* cellLooks() override { return this; }

    void readRow(std::int32_t row, std::span<const int> columns,
        const std::function<void(TextView text)>& take) override;

    GridLook gridLook() override;
    void readLook(std::int32_t row, std::int32_t column, CellLook& look) override;
    TextView text(std::int32_t row, std::int32_t column) override;
    CellAlignment titleAlignment(std::int32_t column) override;
    bool isMarked(std::int32_t row) override;
    std::optional<double> number(std::int32_t row, std::int32_t column) override;

private:
    struct Source;
    class Header;
    class Headers;
    class ListItem;
    class Items;

    explicit TreeViewGrid(std::unique_ptr<Source> source);

    std::unique_ptr<Source> source_;
    std::unique_ptr<Headers> headers_;
    std::unique_ptr<Items> items_;
};

} // namespace pelloric::qt
