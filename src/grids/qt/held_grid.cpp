// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/held_grid.h"

#include <utility>

namespace pelloric::qt {

namespace {

/// Hands every call on to a grid that others use too.
class SharedGrid final : public AutomationObject {
public:
    explicit SharedGrid(std::shared_ptr<AutomationObject> grid)
        : grid_(std::move(grid))
    {
    }

    std::optional<MemberId> findMember(TextView name) override { return grid_->findMember(name); }
    const void* memberTable() const override { return grid_->memberTable(); }

    Value get(MemberId member, std::span<const Value> arguments) override
    {
        return grid_->get(member, arguments);
    }

    void put(MemberId member, std::span<const Value> arguments, const Value& value) override
    {
        grid_->put(member, arguments, value);
    }

private:
    std::shared_ptr<AutomationObject> grid_;
};

} // namespace

HeldGrid::HeldGrid(std::shared_ptr<AutomationObject> grid, QObject* parent)
    : QObject(parent)
    , grid_(std::move(grid))
{
}

std::unique_ptr<AutomationObject> HeldGrid::share() const
{
    return std::make_unique<SharedGrid>(grid_);
}

} // namespace pelloric::qt
