// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <limits>

namespace pelloric {

// Pages and printed columns are published as numbers of 16 bits, so there are at most so many.

inline constexpr std::int16_t MostPages = std::numeric_limits<std::int16_t>::max();
inline constexpr std::int16_t MostColumns = std::numeric_limits<std::int16_t>::max();

} // namespace pelloric
