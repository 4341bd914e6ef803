// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <functional>
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

/// Told before a page is written: its index, and the index of the last page of the file.
using OstlProgress = std::function<void(int page, int last)>;

/// Writes a document as lines of text that end in CR LF, the first and the last a lone quote.
///
/// Pages 0 to `Totalpages` - 1 are written, 130 being the last index that a file holds. Every
/// `PageCountToken` becomes `Totalpages`. Texts stand as they are: a line break or a quote in one
/// breaks the file's structure. A page that `Totalpages` counts but that does not exist is passed
/// over.
/// @param progress  may be empty
void writeOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const OstlProgress& progress, std::ostream& stream);

/// Saves a document to a file and puts it into its place.
///
/// A save that fails, or that `progress` ends with an error, changes nothing.
/// @param file  takes the bytes; write `SafeFile(files, path)`
/// @throws RunTimeError WriteFailed, DiskFull or PermissionDenied, with the path
void writeOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const OstlProgress& progress, SafeFile file);

} // namespace pelloric
