// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace pelloric {

/// What a character of a text is to whoever measures or draws it.
enum class CharacterKind : std::uint8_t {
    Plain, ///< a glyph at its advance
    Shaped, ///< a glyph that may be joined to its neighbours, placed on them or told from the right
    Joiner, ///< no glyph and no width; tells how its neighbours are shaped
    Tab, ///< a gap as wide as four blanks
    LineFeed, ///< what follows stands on the next line
    Nothing, ///< any other control character: no glyph and no width
    Missing, ///< no installed face has a glyph: a hollow box
};

/// How many blanks a tab is as wide as.
inline constexpr int BlanksOfTab = 4;

/// The kind of a character that has a glyph; never `Missing`, which a face has to tell.
CharacterKind characterKind(char32_t codePoint);

/// Whether it is half of a surrogate pair, which is no character; U+FFFD is drawn for it.
constexpr bool isHalfPair(char32_t codePoint) { return codePoint >= 0xD800 && codePoint < 0xE000; }

/// What is drawn for bytes that are no character.
inline constexpr char16_t ReplacementCharacter = u'\uFFFD';

} // namespace pelloric
