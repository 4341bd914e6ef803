// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <array>
#include <span>
#include <vector>

namespace pelloric {
class FaceMetrics;
}

namespace pelloric::pdf {

/// How the outlines of a font are kept.
enum class Outlines { TrueType, Cff };

/// What a font dictionary says of a font; lengths are thousandths of an em.
struct FontFacts {
    std::string name {}; ///< PostScript name
    Outlines outlines = Outlines::TrueType;
    double ascent = 0;
    double descent = 0; ///< below the baseline: negative
    double capHeight = 0;
    double italicAngle = 0; ///< degrees, negative leans to the right
    double boldness = 80; ///< width of an upright stem
    double underline = 50; ///< thickness of an underline, by which a bold face is made up
    bool isFixedPitch = false;
    std::array<double, 4> box {}; ///< left, bottom, right, top of all glyphs together
};

/// The part of a font file that a document needs.
struct FontSubset {
    std::string bytes {}; ///< a font file, or of CFF outlines their table
    std::vector<std::uint16_t> numbers {}; ///< of the glyphs asked for, in the font that is left
};

/// A font file that may be embedded, or one face of a collection.
class FontProgram {
public:
    virtual ~FontProgram() = default;

    virtual const FontFacts& facts() const = 0;

    /// How far a glyph moves the pen: thousandths of an em.
    virtual double advance(std::uint32_t glyph) const = 0;

    /// Leaves what draws the glyphs.
    /// @throws RunTimeError WriteFailed: the font file is broken
    virtual FontSubset subset(std::span<const std::uint32_t> glyphs) = 0;
};

/// A font program as texts use it: a face that is lacking may be made up from a plainer one.
struct DrawnFont {
    FontProgram* program = nullptr;
    bool isBoldMadeUp = false;
    bool isItalicMadeUp = false;

    bool operator==(const DrawnFont&) const = default;
};

/// The glyph of a character that stands for itself.
struct CharacterGlyph {
    DrawnFont font {};
    std::uint32_t glyph = 0;
};

/// A glyph of a text whose characters are joined, placed on each other or read from the right.
struct ShapedGlyph {
    DrawnFont font {};
    std::uint32_t glyph = 0;
    Text meaning {}; ///< the characters it stands for
    double x = 0; ///< from the start of the text: ems
    double y = 0; ///< above the baseline: ems
};

/// A shaped text, its glyphs from left to right.
struct ShapedText {
    std::vector<ShapedGlyph> glyphs {};
    double advance = 0; ///< ems
};

/// A face as a text asks for it; characters that it lacks come from other fonts.
class GlyphFace {
public:
    virtual ~GlyphFace() = default;

    /// From the top of a line to its baseline at size 1: twips.
    virtual double ascent() const = 0;

    /// What texts were measured with.
    virtual FaceMetrics& metrics() = 0;

    /// @throws CannotEmbed
    virtual CharacterGlyph glyphOf(char32_t character) = 0;

    /// @throws CannotEmbed
    virtual const ShapedText& shaped(TextView text) = 0;
};

/// The faces of the system.
class GlyphFaces {
public:
    virtual ~GlyphFaces() = default;

    /// The face, or its substitute; lives as long as this object.
    virtual GlyphFace& face(TextView name, bool bold, bool italic) = 0;
};

/// Thrown where a text needs a font that must not or cannot be put into a file.
struct CannotEmbed {
    Text font {}; ///< its name
    Text reason {}; ///< in plain English
};

} // namespace pelloric::pdf
