// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/records.h>

#include <cstdint>

namespace pelloric {

/// Twips of a centimetre, as every conversion of this library takes it.
inline constexpr std::int16_t TwipsPerCm = 567;

/// Twips of a millimetre by the same conversion.
inline constexpr double TwipsPerMm = TwipsPerCm / 10.0;

/// Twips of an inch and of a point, a 72nd of an inch; where a device or a font counts in these.
inline constexpr double TwipsPerInch = 1440;
inline constexpr double TwipsPerPoint = 20;

inline constexpr double MmPerInch = 25.4;

/// Millimetres as twips, not yet rounded.
constexpr double twipsOfMm(double millimetres) { return millimetres * TwipsPerCm / 10; }

/// The colour of three channels, 0 to 255 each.
constexpr Color rgb(int red, int green, int blue) { return red | (green << 8) | (blue << 16); }

} // namespace pelloric
