// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"

#include <QAbstractTableModel>

namespace pelloric::app {

/// A table in memory for a view.
class TableModel final : public QAbstractTableModel {
public:
    TableModel(TableGrid table, QObject* parent);

    int rowCount(const QModelIndex& parent = {}) const override;
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    TableGrid table_;
};

} // namespace pelloric::app
