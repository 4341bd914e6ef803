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

/// Creates a file; a failure leaves none behind.
/// @return  whether all bytes were written
bool createFile(const std::filesystem::path& path, std::string_view bytes);

/// Rewrites an existing file in place; after a failure it holds `oldBytes` again where the disk
/// allows it.
/// @return  whether all bytes were written
bool rewriteFile(
    const std::filesystem::path& path, std::string_view bytes, std::string_view oldBytes);

} // namespace pelloric
