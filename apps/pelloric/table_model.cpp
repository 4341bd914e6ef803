// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "table_model.h"

#include "platform/qt/qt_text.h"

#include <algorithm>
#include <limits>

namespace pelloric::app {

TableModel::TableModel(TableGrid table, QObject* parent)
    : QAbstractTableModel(parent)
    , table_(std::move(table))
{
}

int TableModel::rowCount(const QModelIndex& parent) const
{
    constexpr std::int64_t Most = std::numeric_limits<int>::max();
    return parent.isValid() ? 0 : static_cast<int>(std::min(table_.rowCount(), Most));
}

int TableModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : table_.columnCount();
}

QVariant TableModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid() || role != Qt::DisplayRole)
        return {};
    return qt::toQString(table_.cell(index.row(), index.column()));
}

QVariant TableModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation == Qt::Horizontal && role == Qt::DisplayRole && section < columnCount())
        return qt::toQString(table_.column(section).title);
    return QAbstractTableModel::headerData(section, orientation, role);
}

} // namespace pelloric::app
