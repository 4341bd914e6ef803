// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/text_store.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr std::size_t SmallestBlock = 4096; ///< code units
constexpr std::size_t LargestBlock = 1U << 19U; ///< code units

} // namespace

TextView TextStore::add(TextView text)
{
    char16_t* place = text.size() <= freeUnits_ ? free_ : grow(text.size());
    std::copy(text.begin(), text.end(), place);
    if (place == free_) {
        free_ += text.size();
        freeUnits_ -= text.size();
    }
    return { place, text.size() };
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
    if (!alone) {
        free_ = place;
        freeUnits_ = blocks_.back().size;
    }
    return place;
}

} // namespace pelloric
