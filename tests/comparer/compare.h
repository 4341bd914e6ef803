// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <nlohmann/json.hpp>

#include <filesystem>
#include <optional>
#include <string>

namespace pelloric {
class TextCodec;
}

namespace pelloric::cases {

/// The first difference: where it is and what stands on both sides; nothing when there is none.
using Difference = std::optional<std::string>;

/// Compares the dump of a case with what the case expects.
///
/// There is no tolerance. Whole numbers are equal when they are the same number. Font sizes and
/// divisors are singles and are compared as such; any other number with a fraction is compared in
/// its form of 15 significant digits. A truth value is no number. Keys may stand in any order, but
/// none may be missing and none may be there beyond the expected ones. The list of results may be
/// left out on either side when all of them are null. The saved file is not looked at.
Difference compareDump(const nlohmann::json& description, const nlohmann::json& dump);

/// Compares a saved file with its expected lines, each with CR LF behind it, and its hash.
///
/// @param expected  "lines" and "sha256"
Difference compareFile(
    const nlohmann::json& expected, const std::string& bytes, const TextCodec& codec);

/// Compares all that the runner wrote for a case: the dump, and the file when one is expected.
///
/// @param casePath  the case's file
/// @param out       the folder of the dumps
Difference compareCase(const std::filesystem::path& casePath, const std::filesystem::path& out,
    const TextCodec& codec);

} // namespace pelloric::cases
