// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_fonts.h"

#include "export/pdf_file.h"
#include "export/pdf_syntax.h"
#include "platform/text_metrics.h"

#include <algorithm>

namespace pelloric::pdf {

namespace {

constexpr char32_t FirstPair = 0x10000;

Text unitsOf(char32_t character)
{
    if (character < FirstPair)
        return Text(1, static_cast<char16_t>(character));
    const char32_t rest = character - FirstPair;
    return { static_cast<char16_t>(0xD800 + (rest >> 10U)),
        static_cast<char16_t>(0xDC00 + (rest & 0x3FFU)) };
}

} // namespace

PdfFonts::PdfFonts(PdfFile& file)
    : file_(file)
{
}

GlyphCode PdfFonts::code(const DrawnFont& font, std::uint32_t glyph, TextView meaning)
{
    FontUse* use = &useOf(font);
    auto code = use->font->code(glyph, meaning);
    if (!code) {
        use = &addFont(font);
        code = use->font->code(glyph, meaning);
    }
    return { static_cast<std::uint16_t>(use - uses_.data()), code.value_or(0) };
}

void PdfFonts::write() const
{
    for (const PdfFont& font : fonts_)
        font.write(file_);
}

std::string PdfFonts::resources() const
{
    std::string entries;
    for (std::size_t at = 0; at < fonts_.size(); ++at) {
        entries += "/F";
        appendInteger(entries, static_cast<std::int64_t>(at) + 1);
        entries += ' ';
        appendReference(entries, fonts_[at].object());
    }
    return entries;
}

/// The latest use of the font, the only one with free codes.
FontUse& PdfFonts::useOf(const DrawnFont& font)
{
    const auto known = std::find_if(
        uses_.rbegin(), uses_.rend(), [&](const FontUse& use) { return use.drawn == font; });
    if (known != uses_.rend())
        return *known;
    const auto sibling = std::find_if(uses_.rbegin(), uses_.rend(),
        [&](const FontUse& use) { return use.drawn.program == font.program; });
    if (sibling != uses_.rend()) {
        uses_.push_back({ sibling->font, sibling->number, font });
        return uses_.back();
    }
    return addFont(font);
}

FontUse& PdfFonts::addFont(const DrawnFont& font)
{
    fonts_.emplace_back(*font.program, file_.reserve());
    uses_.push_back({ &fonts_.back(), fonts_.size(), font });
    return uses_.back();
}

FaceCodes::FaceCodes(GlyphFace& face, PdfFonts& fonts)
    : face_(face)
    , fonts_(fonts)
{
}

GlyphCode FaceCodes::character(char32_t character)
{
    if (character < FirstPair)
        return unit(static_cast<char16_t>(character));
    GlyphCode& code = pairs_[character];
    if (code.code == 0) {
        const CharacterGlyph glyph = face_.glyphOf(character);
        code = fonts_.code(glyph.font, glyph.glyph, unitsOf(character));
    }
    return code;
}

GlyphCode FaceCodes::learn(char16_t unit)
{
    auto& page = pages_[unit >> 8U];
    if (!page)
        page = std::make_unique<Page>();
    GlyphCode& code = (*page)[unit & 0xFFU];
    if (isHalfPair(unit) || face_.metrics().kindOf(unit) != CharacterKind::Plain) {
        code = { NotPlain, 0 };
    } else {
        const CharacterGlyph glyph = face_.glyphOf(unit);
        code = fonts_.code(glyph.font, glyph.glyph, TextView(&unit, 1));
    }
    return code;
}

} // namespace pelloric::pdf
