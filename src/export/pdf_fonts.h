// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/pdf_font.h"

#include <deque>
#include <map>
#include <memory>

namespace pelloric::pdf {

class PdfFile;

/// A glyph as content streams write it.
struct GlyphCode {
    std::uint16_t use = 0; ///< which font in which guise, see `PdfFonts::use`
    std::uint16_t code = 0; ///< 0: none
};

/// A font of the file in one guise.
struct FontUse {
    PdfFont* font = nullptr;
    std::size_t number = 0; ///< of the font's name in content streams
    DrawnFont drawn {};
};

/// The fonts of a PDF file, each of which is embedded once.
class PdfFonts {
public:
    /// @param file  borrowed
    explicit PdfFonts(PdfFile& file);

    /// The code of a glyph that stands for some characters.
    GlyphCode code(const DrawnFont& font, std::uint32_t glyph, TextView meaning);

    const FontUse& use(std::uint16_t number) const { return uses_[number]; }

    /// Writes all fonts.
    void write() const;

    /// The entries of the dictionary of fonts: "/F1 7 0 R".
    std::string resources() const;

private:
    FontUse& useOf(const DrawnFont& font);
    FontUse& addFont(const DrawnFont& font);

    PdfFile& file_;
    std::deque<PdfFont> fonts_;
    std::vector<FontUse> uses_;
};

/// The glyph codes of one face's characters, each asked for once.
class FaceCodes {
public:
    /// @param face   borrowed
    /// @param fonts  borrowed
    FaceCodes(GlyphFace& face, PdfFonts& fonts);

    GlyphFace& face() const { return face_; }

    /// The code of a code unit that is a plain character; none: it is no such unit.
    GlyphCode unit(char16_t unit)
    {
        const auto& page = pages_[unit >> 8U];
        const GlyphCode known = page ? (*page)[unit & 0xFFU] : GlyphCode();
        return known.code != 0 || known.use == NotPlain ? known : learn(unit);
    }

    /// The code of a plain character.
    GlyphCode character(char32_t character);

private:
    using Page = std::array<GlyphCode, 256>;

    static constexpr std::uint16_t NotPlain = 0xFFFF;

    GlyphCode learn(char16_t unit);

    GlyphFace& face_;
    PdfFonts& fonts_;
    std::array<std::unique_ptr<Page>, 256> pages_ {};
    std::map<char32_t, GlyphCode> pairs_;
};

} // namespace pelloric::pdf
