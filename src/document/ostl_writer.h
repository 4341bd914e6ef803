// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/progress.h"
#include "platform/text.h"

#include <iosfwd>

namespace pelloric {

class PageDocument;
class SafeFile;
class TextCodec;
struct PageSetup;

/// How texts and numbers become bytes of a document file.
struct OstlEncoding {
    const TextCodec& codec;
    char16_t decimalSeparator = u'.'; ///< of font sizes
};

/// Writes a document as lines of text that end in CR LF, the first and the last a lone quote.
///
/// Pages 0 to `Totalpages` - 1 are written, 130 being the last index that a file holds. Every
/// `PageCountToken` becomes `Totalpages`. Texts stand as they are: a line break or a quote in one
/// breaks the file's structure. A page that `Totalpages` counts but that does not exist is passed
/// over.
/// @param progress  told before each page how many of the file are written
/// @throws RunTimeError Cancelled: the progress said so
void writeOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const Progress& progress, std::ostream& stream);

/// Saves a document to a file and puts it into its place.
///
/// A save that fails, or that `progress` ends, changes nothing.
/// @param file  takes the bytes; write `SafeFile(files, path)`
/// @throws RunTimeError WriteFailed, DiskFull or PermissionDenied, with the path; Cancelled: the
///         progress said so
void writeOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const Progress& progress, SafeFile file);

} // namespace pelloric
