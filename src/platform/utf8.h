// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace pelloric {

/// What stands for a sequence that is no character.
inline constexpr char32_t NoCharacter = 0xFFFD;

/// UTF-8 to UTF-16, into room that is there; a sequence that is no character becomes U+FFFD.
///
/// @param out  room for as many units as there are bytes: there are never more
/// @return     behind what was put
char16_t* putUtf8(char16_t* out, std::string_view bytes);

} // namespace pelloric
