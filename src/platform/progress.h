// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <functional>

namespace pelloric {

/// Is told how many steps of a long work are done and how many there are in all, 0 while nobody
/// knows; answers whether to go on. May be empty.
using Progress = std::function<bool(std::int64_t done, std::int64_t total)>;

/// Tells how far a work is.
/// @throws RunTimeError Cancelled: the answer was no
void tell(const Progress& progress, std::int64_t done, std::int64_t total);

} // namespace pelloric
