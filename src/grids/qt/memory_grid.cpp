// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/grids.h>

#include "grids/qt/shared_grid.h"
#include "grids/table_grid.h"
#include "platform/qt/qt_text.h"

namespace pelloric::qt {

namespace {

std::vector<TableColumn> columnsOf(const QList<MemoryGrid::Column>& columns)
{
    std::vector<TableColumn> result;
    for (const MemoryGrid::Column& column : columns)
        result.push_back({ toText(column.title), column.width });
    return result;
}

} // namespace

struct MemoryGrid::Parts {
    std::shared_ptr<TableGrid> table; ///< shared with the grids that were handed out
};

MemoryGrid::MemoryGrid(const QList<Column>& columns, QObject* parent)
    : MemoryGrid(TableGrid(columnsOf(columns)), parent)
{
}

MemoryGrid::MemoryGrid(TableGrid table, QObject* parent)
    : QObject(parent)
    , parts_(std::make_unique<Parts>(Parts { std::make_shared<TableGrid>(std::move(table)) }))
{
}

MemoryGrid::~MemoryGrid() = default;

void MemoryGrid::addRow(const QStringList& cells)
{
    std::vector<Text> texts;
    for (const QString& cell : cells)
        texts.push_back(toText(cell));
    parts_->table->addRow(std::vector<TextView>(texts.begin(), texts.end()));
}

qint64 MemoryGrid::rowCount() const { return parts_->table->rowCount(); }

int MemoryGrid::columnCount() const { return parts_->table->columnCount(); }

QString MemoryGrid::cell(qint64 row, int column) const
{
    return toQString(parts_->table->cell(row, column));
}

std::unique_ptr<AutomationObject> MemoryGrid::share() const { return shareGrid(parts_->table); }

} // namespace pelloric::qt
