// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <filesystem>
#include <string>

namespace pelloric {

/// A path as a person reads it; what is no character becomes U+FFFD.
Text pathText(const std::filesystem::path& path);

/// All bytes of a file.
/// @param most  bytes that are read
/// @throws RunTimeError FileNotFound, with the path: it is missing or cannot be read; Overflow,
/// with
///         the path: it is larger, or endless
std::string readFileBytes(const std::filesystem::path& path, std::size_t most = std::string::npos);

/// The first bytes of a file; none of what is no ordinary file, for reading takes them out of a
/// pipe.
std::string firstFileBytes(const std::filesystem::path& path, std::size_t most);

} // namespace pelloric
