// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <vector>

namespace pelloric {

/// Keeps texts without an allocation for each; a text that was added stays where it is as long as
/// the store lives. A row set and the document that is built from it share one.
class TextStore {
public:
    /// Copies a text into the store.
    TextView add(TextView text) { return { copy(text), text.size() }; }

    /// Copies a text into the store.
    /// @return  where it begins, for `at`; less than 2^36 as long as the store holds less than
    ///          128 GB
    std::uint64_t place(TextView text);

    /// The beginning of a text that `place` has copied.
    const char16_t* at(std::uint64_t place) const
    {
        return blocks_[place >> BlockBits].units.get() + (place & BlockMask);
    }

    /// The place of a text that stands in the store; nothing: it does not, or no place tells it.
    /// @param block  where it is looked for first; then where it was found
    std::optional<std::uint64_t> placeOf(TextView text, std::size_t& block) const;

    /// Room for a text, to be filled in.
    char16_t* room(std::size_t units);

    /// Bytes that the store holds, unused ends of its blocks included.
    std::size_t capacityBytes() const { return capacityBytes_; }

private:
    struct Block {
        std::unique_ptr<char16_t[]> units;
        std::size_t size = 0;
    };

    /// A place is the number of a block, and these bits for the units in it; a larger block holds
    /// one text.
    static constexpr unsigned BlockBits = 19;
    static constexpr std::uint64_t BlockMask = (1U << BlockBits) - 1;

    char16_t* copy(TextView text);
    char16_t* grow(std::size_t units);

    std::vector<Block> blocks_;
    std::size_t freeBlock_ = 0; ///< the block that `free_` is in
    std::size_t lastBlock_ = 0; ///< the block of the text that was copied last
    char16_t* free_ = nullptr;
    std::size_t freeUnits_ = 0;
    std::size_t capacityBytes_ = 0;
};

} // namespace pelloric
