// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <memory>
#include <vector>

namespace pelloric {

/// Keeps texts without an allocation for each; a text that was added stays where it is as long as
/// the store lives. A row set and the document that is built from it share one.
class TextStore {
public:
    /// Copies a text into the store.
    TextView add(TextView text);

    /// Bytes that the store holds, unused ends of its blocks included.
    std::size_t capacityBytes() const { return capacityBytes_; }

private:
    struct Block {
        std::unique_ptr<char16_t[]> units;
        std::size_t size = 0;
    };

    char16_t* grow(std::size_t units);

    std::vector<Block> blocks_;
    char16_t* free_ = nullptr;
    std::size_t freeUnits_ = 0;
    std::size_t capacityBytes_ = 0;
};

} // namespace pelloric
