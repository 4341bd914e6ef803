// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/progress.h"
#include "platform/text.h"
#include "tables/separated_values.h"

#include <QString>

#include <cstdint>
#include <filesystem>
#include <string>

namespace pelloric::qt {

/// The most that is taken of a pipe, which may have no end.
inline constexpr std::int64_t MostPipeBytes = std::int64_t(4) << 30;

/// A text file that was read.
struct TextFile {
    std::string text; ///< UTF-8, without a byte order mark
    QString encoding; ///< the name of the one that the file has
    bool isGuessed = false; ///< neither the caller nor the file said so, and it is not UTF-8
};

/// How a text file is read.
struct TextFileOptions {
    QString encoding {}; ///< empty: by a byte order mark, else UTF-8, else guessed by the letters
    Progress progress {}; ///< told now and then how many bytes have been read
    std::size_t mostValueBytes = MostValueBytes; ///< of a value, see there
    char delimiter = ','; ///< ends a value, as commas, tabs, semicolons, bars and quotes do
};

/// Reads a text file of any encoding.
///
/// @throws RunTimeError FileNotFound: it is missing or cannot be read, with the path; TypeMismatch,
///         naming the line where there is one: an unknown encoding, bytes that are no text, or a
///         file that begins as no table does, see `notATable`;
///         Overflow: a pipe goes on after `MostPipeBytes`, or a value is too long; Cancelled: the
///         progress said so
TextFile readTextFile(const std::filesystem::path& path, const TextFileOptions& options);

/// "line 3: what": how errors of text files begin.
Text atLine(std::int64_t line, TextView what);

} // namespace pelloric::qt
