// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/text_store.h"

#include "platform/text_copy.h"

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

/// Texts are mostly looked for in the order in which they were copied.
std::optional<std::uint64_t> TextStore::placeOf(TextView text, std::size_t& block) const
{
    std::size_t at = block < blocks_.size() ? block : 0;
    for (std::size_t looked = 0; looked < blocks_.size();
         ++looked, at = at + 1 < blocks_.size() ? at + 1 : 0) {
        const auto first = reinterpret_cast<std::uintptr_t>(blocks_[at].units.get());
        const auto units = reinterpret_cast<std::uintptr_t>(text.data());
        if (units < first || units >= first + blocks_[at].size * sizeof(char16_t))
            continue;
        block = at;
        const std::uint64_t inBlock = (units - first) / sizeof(char16_t);
        if (inBlock > BlockMask)
            return std::nullopt;
        return (std::uint64_t { at } << BlockBits) | inBlock;
    }
    return std::nullopt;
}

/// An empty text has a place, too.
char16_t* TextStore::copy(TextView text)
{
    char16_t* const place = room(text.size());
    putText(place, text);
    return place;
}

char16_t* TextStore::room(std::size_t units)
{
    const bool fits = units <= freeUnits_ && freeUnits_ > 0;
    char16_t* const place = fits ? free_ : grow(units);
    if (place == free_) {
        free_ += units;
        freeUnits_ -= units;
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
