// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/held_grid.h"

#include "grids/qt/shared_grid.h"

#include <utility>

namespace pelloric::qt {

HeldGrid::HeldGrid(std::shared_ptr<AutomationObject> grid, QObject* parent)
    : QObject(parent)
    , grid_(std::move(grid))
{
}

std::unique_ptr<AutomationObject> HeldGrid::share() const { return shareGrid(grid_); }

} // namespace pelloric::qt
