// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_fonts.h"

#include "export/pdf_file.h"
#include "fakes/fake_glyph_faces.h"

#include <gtest/gtest.h>

#include <set>

namespace pelloric::pdf {

namespace {

/// Bytes below 128 but 0 and the five that mean something in a string; and pairs of a byte from 128
/// on and one that means nothing.
constexpr std::uint32_t ShortCodes = 127 - 5;
constexpr std::uint32_t LongCodes = 128 * (256 - 5);

class PdfFontTest : public testing::Test {
protected:
    std::string written(const PdfFont& font)
    {
        font.write(file_);
        file_.finish({ 1, 1, "x" });
        return sink_.bytes;
    }

    bool isWritten(const PdfFont& font, std::string_view text)
    {
        return written(font).find(text) != std::string::npos;
    }

    StringSink sink_;
    NoDeflater deflater_;
    PdfFile file_ { sink_, deflater_ };
    FakeProgram program_ { "Latin" };
    PdfFont font_ { program_, file_.reserve() };
};

} // namespace

TEST_F(PdfFontTest, HandsOutCodesThatNeedNoEscapingInStrings)
{
    constexpr std::string_view Special("()\\\r\n");
    std::set<std::uint16_t> codes;
    std::uint32_t glyph = 0;
    while (const auto code = font_.code(glyph++, u"x")) {
        for (const int byte : { *code >> 8, *code & 0xFF })
            EXPECT_EQ(Special.find(static_cast<char>(byte)), std::string_view::npos);
        EXPECT_NE(*code, 0);
        codes.insert(*code);
    }
    EXPECT_EQ(codes.size(), ShortCodes + LongCodes);
}

TEST_F(PdfFontTest, TellsCodesOfOneByteFromThoseOfTwoByTheFirst)
{
    for (std::uint32_t glyph = 0; glyph < ShortCodes + 300; ++glyph) {
        const std::uint16_t code = font_.code(glyph, u"x").value();
        EXPECT_EQ(isLongCode(code), glyph >= ShortCodes) << glyph;
        EXPECT_EQ(isLongCode(code) ? code >> 15 : code >> 7, isLongCode(code) ? 1 : 0) << glyph;
    }
    EXPECT_TRUE(
        isWritten(font_, "2 begincodespacerange\n<00> <7F>\n<8000> <FFFF>\nendcodespacerange"));
}

TEST_F(PdfFontTest, KeepsCodesOfOneByteForTheLettersOfAlphabets)
{
    EXPECT_TRUE(isLongCode(font_.code(1, u"北").value()));
    EXPECT_TRUE(isLongCode(font_.code(2, u"fi").value()));
    EXPECT_TRUE(isLongCode(font_.code(3, u"").value()));
    EXPECT_FALSE(isLongCode(font_.code(4, u"A").value()));
    EXPECT_FALSE(isLongCode(font_.code(5, u"я").value()));
}

TEST_F(PdfFontTest, GivesAGlyphACodeForEachMeaning)
{
    const auto small = font_.code(7, u"a");
    EXPECT_EQ(font_.code(7, u"a"), small);
    EXPECT_NE(font_.code(7, u"A"), small);
    EXPECT_TRUE(isWritten(font_, "<01> <0061>\n<02> <0041>\n"));
}

TEST_F(PdfFontTest, WritesWidthsInRowsAndLeavesTheUsualOneOut)
{
    font_.code('a', u"a");
    font_.code('b', u"b");
    font_.code(0x5317, u"北");
    font_.code('c', u"c");
    EXPECT_TRUE(isWritten(font_, "/DW 1000/W[1[500 500 500]]")); // codes of two bytes come last
}

TEST_F(PdfFontTest, NamesTheGlyphsOfATrueTypeFontByACharacterMap)
{
    font_.code(0x5317, u"北");
    font_.code('a', u"a");
    const std::string file = written(font_);
    EXPECT_NE(file.find("2 begincidchar\n<01> 1\n<8000> 2\nendcidchar"), std::string::npos);
    EXPECT_NE(file.find("/CIDToGIDMap/Identity"), std::string::npos);
    EXPECT_NE(file.find("/FontFile2 "), std::string::npos);
    EXPECT_NE(file.find("+Latin"), std::string::npos);
}

TEST_F(PdfFontTest, NamesTheGlyphsOfACffFontByACharacterMap)
{
    program_.change().outlines = Outlines::Cff;
    font_.code('a', u"a");
    font_.code('a', u"A");
    const std::string file = written(font_);
    EXPECT_NE(file.find("2 begincidchar\n<01> 1\n<02> 2\nendcidchar"), std::string::npos);
    EXPECT_NE(file.find("/Subtype/CIDFontType0C"), std::string::npos);
    EXPECT_EQ(file.find("CIDToGIDMap"), std::string::npos);
}

TEST_F(PdfFontTest, SaysNothingOfAGlyphWithoutMeaning)
{
    font_.code('a', u"");
    EXPECT_EQ(written(font_).find("bfchar"), std::string::npos);
}

TEST_F(PdfFontTest, BeginsAnotherFontWhenTheCodesRunOut)
{
    PdfFonts fonts(file_);
    const DrawnFont drawn { &program_, false, false };
    for (std::uint32_t glyph = 0; glyph < ShortCodes + LongCodes; ++glyph)
        EXPECT_EQ(fonts.code(drawn, glyph, u"x").use, 0);
    const GlyphCode next = fonts.code(drawn, 65000, u"y");
    EXPECT_EQ(next.use, 1);
    EXPECT_EQ(next.code, 1);
    EXPECT_EQ(fonts.code(drawn, 0, u"x").use, 1) << "the first font is full and not asked again";
    EXPECT_EQ(fonts.resources(), "/F1 2 0 R/F2 3 0 R");
}

TEST_F(PdfFontTest, EmbedsAFontOnceForAllItsGuises)
{
    PdfFonts fonts(file_);
    const GlyphCode plain = fonts.code({ &program_, false, false }, 'a', u"a");
    const GlyphCode bold = fonts.code({ &program_, true, false }, 'a', u"a");
    EXPECT_EQ(plain.code, bold.code);
    EXPECT_NE(plain.use, bold.use);
    EXPECT_EQ(fonts.resources(), "/F1 2 0 R");
}

TEST_F(PdfFontTest, AsksForEachCharacterOnce)
{
    PdfFonts fonts(file_);
    FakeProgram han("Han");
    FakeGlyphFace face(program_, han, false, false);
    FaceCodes codes(face, fonts);
    const GlyphCode first = codes.unit(u'a');
    EXPECT_EQ(codes.unit(u'a').code, first.code);
    EXPECT_EQ(codes.character(0x20000).code, codes.character(0x20000).code);
    EXPECT_EQ(face.asked, 2);
    EXPECT_NE(codes.unit(u'A').code, first.code) << "another character with the same glyph";
}

} // namespace pelloric::pdf
