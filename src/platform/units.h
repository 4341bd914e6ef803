// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace pelloric {

/// A length or position on paper: 1440 twips are an inch.
using Twips = std::int32_t;

/// A colour as 0x00BBGGRR.
using Color = std::int32_t;

/// Twips of a centimetre, as every conversion of this library takes it.
inline constexpr std::int16_t TwipsPerCm = 567;

inline constexpr double TwipsPerInch = 1440;
inline constexpr double MmPerInch = 25.4;

/// Millimetres as twips, not yet rounded.
constexpr double twipsOfMm(double millimetres) { return millimetres * TwipsPerCm / 10; }

/// The colour of three channels, 0 to 255 each.
constexpr Color rgb(int red, int green, int blue) { return red | (green << 8) | (blue << 16); }

/// A position on a page, from the paper's top-left corner.
struct Tpoint {
    Twips x = 0;
    Twips y = 0;

    bool operator==(const Tpoint&) const = default;
};

} // namespace pelloric
