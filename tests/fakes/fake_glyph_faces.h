// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/font_program.h"
#include "export/pdf_file.h"
#include "export/pdf_pictures.h"
#include "fakes/fake_metrics.h"

#include <map>

namespace pelloric {

/// A font whose glyphs have the numbers of their characters; those of ASCII are half an em wide.
class FakeProgram : public pdf::FontProgram {
public:
    explicit FakeProgram(std::string name) { facts_.name = std::move(name); }

    const pdf::FontFacts& facts() const override { return facts_; }
    double advance(std::uint32_t glyph) const override { return glyph < 0x80 ? 500 : 1000; }

    /// The glyphs that are left have the numbers 1, 2 and so on in the order asked for.
    pdf::FontSubset subset(std::span<const std::uint32_t> glyphs) override
    {
        pdf::FontSubset subset { .bytes = "program of " + facts_.name };
        for (std::size_t at = 1; at <= glyphs.size(); ++at)
            subset.numbers.push_back(static_cast<std::uint16_t>(at));
        return subset;
    }

    pdf::FontFacts& change() { return facts_; }

private:
    pdf::FontFacts facts_;
};

/// One face: Han characters come from a second font; "a" and "A" share a glyph; a shaped text is
/// drawn backwards, each character an em wide.
class FakeGlyphFace : public pdf::GlyphFace {
public:
    FakeGlyphFace(FakeProgram& latin, FakeProgram& han, bool bold, bool italic)
        : latin_ { &latin, bold, italic }
        , han_ { &han, bold, false }
    {
    }

    double ascent() const override { return 16; }
    FaceMetrics& metrics() override { return metrics_; }

    pdf::CharacterGlyph glyphOf(char32_t character) override
    {
        ++asked;
        if (character == U'A')
            character = U'a';
        return { character < 0x2E80 ? latin_ : han_, character };
    }

    const pdf::ShapedText& shaped(TextView text) override
    {
        shaped_ = {};
        for (std::size_t at = 0; at < text.size(); ++at) {
            const char16_t unit = text[text.size() - 1 - at];
            shaped_.glyphs.push_back({ latin_, unit, Text(1, unit), static_cast<double>(at), 0 });
        }
        shaped_.advance = static_cast<double>(text.size());
        return shaped_;
    }

    int asked = 0; ///< how often a glyph was asked for

private:
    pdf::DrawnFont latin_;
    pdf::DrawnFont han_;
    FakeFace metrics_;
    pdf::ShapedText shaped_;
};

/// Faces of two fonts, which have neither bold nor italic of their own.
class FakeGlyphFaces : public pdf::GlyphFaces {
public:
    pdf::GlyphFace& face(TextView, bool bold, bool italic) override
    {
        return faces_.try_emplace({ bold, italic }, latin, han, bold, italic).first->second;
    }

    FakeProgram latin { "Latin" };
    FakeProgram han { "Han" };

private:
    std::map<std::pair<bool, bool>, FakeGlyphFace> faces_;
};

/// Keeps what is written.
class StringSink : public pdf::ByteSink {
public:
    void write(std::string_view bytes) override { this->bytes += bytes; }

    std::string bytes;
};

/// Leaves bytes as they are, so that tests can read them.
class NoDeflater : public pdf::Deflater {
public:
    std::string_view deflate(std::string_view bytes) override { return bytes; }
};

/// Knows a picture of one pixel, "half.png", that is half opaque.
class FakePictures : public pdf::PictureReader {
public:
    std::optional<pdf::PictureBytes> read(TextView path) override
    {
        ++asked;
        if (path != u"half.png")
            return {};
        return pdf::PictureBytes { 1, 1, "", "RGB", "\x80" };
    }

    int asked = 0;
};

} // namespace pelloric
