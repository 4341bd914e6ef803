// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/shared_grid.h"

#include <utility>

namespace pelloric::qt {

namespace {

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

    CellLooks* cellLooks() override { return grid_->cellLooks(); }

private:
    std::shared_ptr<AutomationObject> grid_;
};

} // namespace

std::unique_ptr<AutomationObject> shareGrid(std::shared_ptr<AutomationObject> grid)
{
    return std::make_unique<SharedGrid>(std::move(grid));
}

} // namespace pelloric::qt
