// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace pelloric::cases {

/// The SHA-256 of bytes, as lower-case hexadecimal digits.
std::string sha256(std::string_view bytes);

} // namespace pelloric::cases
