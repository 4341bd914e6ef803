// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace pelloric::pdf {

/// The character identifiers of the glyphs of a CFF table, by which readers address the glyphs of
/// a font that is keyed by them.
///
/// @param table  any bytes
/// @return       empty: glyphs are addressed by their own numbers, or the table is damaged
std::vector<std::uint16_t> cidsOfCff(std::string_view table);

} // namespace pelloric::pdf
