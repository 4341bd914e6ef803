// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <algorithm>
#include <array>
#include <cstring>

namespace pelloric {

/// Copies the beginning and the end of a text, which meet or overlap.
/// @param text  as many bytes as a `Piece` at least, and twice as many at most
template <typename Piece> void copyBothEnds(TextView text, char16_t* out)
{
    constexpr std::size_t Units = sizeof(Piece) / sizeof(char16_t);
    Piece head;
    Piece tail;
    std::memcpy(&head, text.data(), sizeof(Piece));
    std::memcpy(&tail, text.data() + text.size() - Units, sizeof(Piece));
    std::memcpy(out, &head, sizeof(Piece));
    std::memcpy(out + text.size() - Units, &tail, sizeof(Piece));
}

/// Copies the text of a cell into room that is there.
///
/// Texts of cells are short. The C library's function copies them by wide registers, after which
/// code that uses narrow ones, as the toolkit's does, waits: that costs ten times the copying.
/// @return  behind the copy
inline char16_t* putText(char16_t* out, TextView text)
{
    const std::size_t units = text.size();
    if (units > 32)
        return std::copy(text.begin(), text.end(), out);
    if (units > 16)
        copyBothEnds<std::array<std::uint64_t, 4>>(text, out);
    else if (units > 8)
        copyBothEnds<std::array<std::uint64_t, 2>>(text, out);
    else if (units > 4)
        copyBothEnds<std::uint64_t>(text, out);
    else if (units > 1)
        copyBothEnds<std::uint32_t>(text, out);
    else if (units == 1)
        *out = text.front();
    return out + units;
}

} // namespace pelloric
