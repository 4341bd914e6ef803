// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/options.h>

#include <cstdint>

namespace pelloric {

/// Tells how far a work is.
/// @throws RunTimeError Cancelled: the answer was no
void tell(const Progress& progress, std::int64_t done, std::int64_t total);

} // namespace pelloric
