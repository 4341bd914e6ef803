// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

namespace pelloric {

/// Converts between text and the bytes of the system's ANSI code page.
///
/// ASCII characters are single bytes of the same value, and no byte below 0x30 is ever the second
/// byte of another character, so lines can be told apart before they are decoded.
class TextCodec {
public:
    virtual ~TextCodec() = default;

    /// Bytes that are no character become U+FFFD.
    virtual Text decode(std::string_view bytes) const = 0;

    /// Appends the text's bytes; a character that has none becomes "?".
    virtual void encode(TextView text, std::string& bytes) const = 0;
};

} // namespace pelloric
