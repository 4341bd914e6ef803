// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/characters.h"
#include "platform/text.h"
#include "platform/units.h"

#include <array>
#include <memory>
#include <unordered_map>

namespace pelloric {

/// The measures of one face at one point: advances of characters, and the height of a line.
///
/// All measuring is linear: the width of a text is the sum of its code points' advances (no
/// kerning, no hinting) times the size, the same at every zoom and on every device. An advance is
/// asked for once and kept in a flat table.
class FaceMetrics {
public:
    /// @param lineHeight  of a text of size 1: twips
    explicit FaceMetrics(double lineHeight);
    virtual ~FaceMetrics() = default;
    FaceMetrics(const FaceMetrics&) = delete;
    FaceMetrics& operator=(const FaceMetrics&) = delete;

    /// Advance of a code unit that is no half of a pair, at size 1: twips.
    double unitAdvance(char16_t unit)
    {
        const float advance = (*advances_)[unit];
        return advance >= 0 ? static_cast<double>(advance) : learnAdvance(unit);
    }

    /// Advance of a character, at size 1: twips.
    double advance(char32_t codePoint)
    {
        return codePoint < 0x10000 ? unitAdvance(static_cast<char16_t>(codePoint))
                                   : pairOf(codePoint).advance;
    }

    /// What is drawn for a character; `Missing`: no installed face has a glyph for it.
    CharacterKind kindOf(char32_t codePoint)
    {
        if (codePoint >= 0x10000)
            return pairOf(codePoint).kind;
        const std::uint8_t kind = (*kinds_)[codePoint];
        return kind != UnknownKind ? static_cast<CharacterKind>(kind) : learnKind(codePoint);
    }

    /// Advance of the character at `position`, at size 1: twips; moves behind it.
    double nextAdvance(TextView text, std::size_t& position);

    /// Sum of the advances of a text at size 1: twips.
    double advanceOf(TextView text);

    /// Height of a line at size 1: twips.
    double lineHeight() const { return lineHeight_; }

protected:
    /// Asks the platform for one advance.
    /// @return  twips at size 1, 0 or more
    virtual double measureAdvance(char32_t codePoint) = 0;

    /// Asks the platform whether the face, or one that fills in for it, has a glyph.
    virtual bool hasGlyph(char32_t) { return true; }

    /// The kind of a character, found out anew.
    CharacterKind askKind(char32_t codePoint);

private:
    /// A character past the first 65536.
    struct Pair {
        float advance = 0;
        CharacterKind kind = CharacterKind::Plain;
    };

    static constexpr std::uint8_t UnknownKind = 0xFF;

    double learnAdvance(char16_t unit);
    CharacterKind learnKind(char32_t codePoint);
    const Pair& pairOf(char32_t codePoint);

    std::unique_ptr<std::array<float, 65536>> advances_; ///< below 0: not asked for yet
    std::unique_ptr<std::array<std::uint8_t, 65536>> kinds_; ///< `UnknownKind`: not asked for yet
    std::unordered_map<char32_t, Pair> pairs_;
    double lineHeight_;
};

/// The measures of a face that is really installed, where the kind of a character decides: a tab is
/// as wide as four blanks, other control characters have no width, and a character that no face has
/// is as wide as the box that is drawn for it.
class InstalledFace : public FaceMetrics {
public:
    using FaceMetrics::FaceMetrics;

protected:
    double measureAdvance(char32_t codePoint) final;

    /// Asks the platform for the advance of a glyph.
    /// @return  twips at size 1; of a missing glyph: of what the face has in its place
    virtual double glyphAdvance(char32_t codePoint) = 0;
};

/// Hands out the measures of faces.
class TextMetrics {
public:
    virtual ~TextMetrics() = default;

    /// The measures of a face; a face that is not installed answers those of its substitute.
    ///
    /// @return  lives as long as the service
    virtual FaceMetrics& face(TextView name, bool bold, bool italic) = 0;
};

/// The width of a text whose advances at size 1 sum up to `advance`: twips.
/// @param size  points; 0 or less measures 0
/// @throws RunTimeError Overflow: outside 32 bits
Twips textWidth(double advance, float size);

/// The height of a line: twips.
/// @param size  points; 0 or less measures 0
/// @throws RunTimeError Overflow: outside 32 bits
Twips textHeight(const FaceMetrics& face, float size);

} // namespace pelloric
