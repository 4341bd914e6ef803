// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <filesystem>
#include <iosfwd>

namespace pelloric {

class PageDocument;
class TextCodec;
struct PageSetup;

/// Of a pipe or a device, which may have no end, no more bytes are read.
inline constexpr std::size_t MostPipedOstlBytes = 1U << 30U;

/// How the reading of a document file ended.
enum class OstlResult {
    Opened,
    BadHeader, ///< the tag, the width or the height is missing; nothing has been changed
};

/// Reads a document file into a document that has just been cleared.
///
/// The reader is lenient. Numbers are taken as far as a line begins with one and rounded half to
/// even. Every page number above 0 adds a page, whatever it is; any other goes on with the current
/// page. A file that ends inside a record loses that record and nothing else. A font's name is the
/// number that its line begins with, turned back into text, so most names come back as "0"; that
/// is kept. Texts lose the blanks at both ends.
/// @param setup   gets width and height as soon as both have been read
/// @throws RunTimeError Overflow: a number is too large for what it says, a line holds more than
///         268435456 bytes, or there are more than 32767 pages; what was read before stays
OstlResult readOstl(
    const TextCodec& codec, std::istream& stream, PageDocument& document, PageSetup& setup);

/// The same for a file.
/// @throws RunTimeError FileNotFound, with the path: it is missing or cannot be read; Overflow: it
///         is no ordinary file and holds more than `MostPipedOstlBytes`; or as above
OstlResult readOstl(const TextCodec& codec, const std::filesystem::path& path,
    PageDocument& document, PageSetup& setup);

} // namespace pelloric
