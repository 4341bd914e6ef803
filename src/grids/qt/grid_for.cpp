// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/grid_for.h"

#include "grids/qt/held_grid.h"
#include "grids/qt/object_grid.h"
#include "grids/qt/table_view_grid.h"
#include "grids/qt/tree_view_grid.h"

#include <pelloric/grids.h>

#include <QListView>
#include <QTableView>
#include <QTreeView>

#include <algorithm>
#include <array>

namespace pelloric::qt {

namespace {

/// Each of them makes an object a grid of its own.
constexpr auto GridMembers
    = std::to_array<const char*>({ "TextMatrix", "ColumnHeaders", "DataSource" });

bool isGridItself(const QObject& object)
{
    return std::any_of(GridMembers.begin(), GridMembers.end(),
        [&](const char* name) { return ObjectGrid::publishes(object, name); });
}

} // namespace

std::unique_ptr<AutomationObject> gridFor(QObject& object)
{
    if (const auto* const held = qobject_cast<HeldGrid*>(&object))
        return held->share();
    if (const auto* const memory = qobject_cast<MemoryGrid*>(&object))
        return memory->share();
    if (isGridItself(object))
        return std::make_unique<ObjectGrid>(object);
    if (auto* const table = qobject_cast<QTableView*>(&object))
        return std::make_unique<TableViewGrid>(*table);
    if (auto* const tree = qobject_cast<QTreeView*>(&object))
        return std::make_unique<TreeViewGrid>(*tree);
    if (auto* const list = qobject_cast<QListView*>(&object))
        return std::make_unique<TreeViewGrid>(*list);
    return std::make_unique<ObjectGrid>(object);
}

} // namespace pelloric::qt
