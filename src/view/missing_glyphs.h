// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <vector>

namespace pelloric {

class MessageLoop;
class PageDocument;
class TextMetrics;

/// Characters of one script that no installed face has; each is printed as a hollow box.
struct MissingScript {
    Text script; ///< its English name
    Text package; ///< the Debian package whose fonts have it
    std::int64_t count = 0; ///< of characters in the document, repeated ones counted each time

    bool operator==(const MissingScript&) const = default;
};

/// Counts the characters of a document that no installed face has, the most frequent script first.
///
/// @param loop  lets windows live meanwhile; null: nothing does
/// @throws RunTimeError Cancelled: the loop said so
std::vector<MissingScript> missingGlyphs(
    const PageDocument& document, TextMetrics& metrics, MessageLoop* loop = nullptr);

/// What a person is told about them, in one sentence; empty: nothing is missing.
Text missingGlyphsText(const std::vector<MissingScript>& scripts);

} // namespace pelloric
