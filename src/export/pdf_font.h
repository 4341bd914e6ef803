// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/font_program.h"

#include <optional>
#include <unordered_map>

namespace pelloric::pdf {

class PdfFile;

/// Whether a code is written as two bytes.
constexpr bool isLongCode(std::uint16_t code) { return code > 0xFF; }

/// A font of a PDF file: hands out codes as texts need glyphs, and is written when all is known.
///
/// Glyphs are written as codes, handed out at first use, none of which needs escaping in a string:
/// letters of alphabets as one byte, as far as there are any left, others as two. A glyph that
/// stands for different characters has a code for each, so that texts are found and copied as they
/// were.
class PdfFont {
public:
    /// @param program  borrowed
    /// @param object   its number in the file
    PdfFont(FontProgram& program, int object);

    /// The code of a glyph that stands for some characters.
    /// @param meaning  may be empty: the glyph adds nothing to the text
    /// @return         nothing: there are no codes left
    std::optional<std::uint16_t> code(std::uint32_t glyph, TextView meaning);

    FontProgram& program() const { return program_; }
    int object() const { return object_; }

    /// Writes the font with the glyphs that were used.
    void write(PdfFile& file) const;

private:
    struct Entry {
        std::uint16_t code = 0;
        std::uint32_t glyph = 0;
        Text meaning;
    };

    std::string taggedName() const;
    std::optional<std::uint16_t> nextCode(TextView meaning);
    static std::string cids(std::span<const Entry> entries, const FontSubset& subset);
    std::string widths(std::span<const std::uint32_t> glyphs, const FontSubset& subset) const;
    static std::string toUnicode(std::span<const Entry> entries);
    int writeProgram(PdfFile& file, const FontSubset& subset, const std::string& name) const;
    int writeDescendant(PdfFile& file, const FontSubset& subset, const std::string& name,
        const std::string& widthList) const;

    FontProgram& program_;
    int object_;
    std::vector<Entry> entries_; ///< in the order of their first use
    std::unordered_map<Text, std::uint16_t> known_; ///< codes by glyph and meaning
    std::size_t shortCodes_ = 0; ///< of one byte that are handed out
    std::size_t longCodes_ = 0; ///< of two bytes that are handed out
};

} // namespace pelloric::pdf
