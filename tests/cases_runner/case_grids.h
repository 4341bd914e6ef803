// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "json.h"

#include "platform/automation_object.h"
#include "platform/row_set.h"

#include <memory>
#include <vector>

namespace pelloric::cases {

/// A host's grid made of a case's JSON.
class CaseGrid : public AutomationObject {
public:
    /// The widths of all columns as the grid holds them now.
    virtual std::vector<double> widths() const = 0;

    /// The row set of a data grid, or null.
    virtual RowSet* source() { return nullptr; }
};

/// Makes the grid that a case describes; throws `std::exception` for one of an unknown type.
std::unique_ptr<CaseGrid> makeGrid(const Json& grid);

/// A row set that stands on its one record.
std::unique_ptr<RowSet> makeRecord(const Json& fields, const Json& record);

} // namespace pelloric::cases
