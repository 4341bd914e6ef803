// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>
#include <functional>
#include <span>

namespace pelloric {

/// A flex grid or list view that answers a whole row at one go, with the texts that `TextMatrix`,
/// or `Text` and `SubItems` of an item, would answer one by one.
class RowCells {
public:
    virtual ~RowCells() = default;

    /// Reads cells of a row.
    ///
    /// @param row      1 the first below the titles, or the first item
    /// @param columns  of the grid, from 0
    /// @param take     told the text of each of them in their order; borrowed until it returns
    /// @throws RunTimeError as those members do
    virtual void readRow(std::int32_t row, std::span<const int> columns,
        const std::function<void(TextView text)>& take)
        = 0;
};

} // namespace pelloric
