// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/text_store.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr std::size_t SmallestBlock = 4096; ///< code units
constexpr std::size_t LargestBlock = 1U << 19U; ///< code units: as many as a place can tell

} // namespace

std::uint64_t TextStore::place(TextView text)
{
    const char16_t* const units = copy(text);
    const auto inBlock = static_cast<std::uint64_t>(units - blocks_[lastBlock_].units.get());
    return (std::uint64_t { lastBlock_ } << BlockBits) | inBlock;
}

/// An empty text has a place, too.
char16_t* TextStore::copy(TextView text)
{
    const bool fits = text.size() <= freeUnits_ && freeUnits_ > 0;
    char16_t* const place = fits ? free_ : grow(text.size());
    std::copy(text.begin(), text.end(), place);
    if (place == free_) {
        free_ += text.size();
        freeUnits_ -= text.size();
        lastBlock_ = freeBlock_;
    }
    return place;
}

/// A text that does not fit the current block begins a new one, or gets one of its own when it is
/// so large that the rest of the current block would be wasted.
char16_t* TextStore::grow(std::size_t units)
{
    const std::size_t usual = std::clamp(capacityBytes_ / 8, SmallestBlock, LargestBlock);
    const bool alone = units > usual / 4;
    Block block { std::make_unique_for_overwrite<char16_t[]>(alone ? units : usual),
        alone ? units : usual };
    char16_t* place = block.units.get();
    capacityBytes_ += block.size * sizeof(char16_t);
    blocks_.push_back(std::move(block));
    lastBlock_ = blocks_.size() - 1;
    if (!alone) {
        free_ = place;
        freeUnits_ = blocks_.back().size;
        freeBlock_ = lastBlock_;
    }
    return place;
}

} // namespace pelloric
