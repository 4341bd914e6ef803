// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>
#include <memory>
#include <span>

namespace pelloric {

class TextStore;

/// A flex grid whose cells are texts that stay where they are as long as their store lives, so that
/// who reads it copies none of them.
class KeptCells {
public:
    virtual ~KeptCells() = default;

    /// Where the texts are.
    virtual std::shared_ptr<const TextStore> keptTexts() const = 0;

    /// The texts of a row.
    ///
    /// @param row   1 the first below the titles
    /// @param into  as many as the grid has columns; valid as long as the store
    /// @throws RunTimeError SubscriptOutOfRange: no such row
    virtual void rowTexts(std::int32_t row, std::span<TextView> into) const = 0;
};

} // namespace pelloric
