// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <string_view>

namespace pelloric {

/// What a file is by the bytes it begins with, where that is none of the kinds that tables are read
/// from, and what to do about it: "this is a PDF file; …".
/// @return  empty: it may be a table
TextView notATable(std::string_view start);

} // namespace pelloric
