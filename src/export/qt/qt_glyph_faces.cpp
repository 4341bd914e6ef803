// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/qt_glyph_faces.h"

#include "export/qt/qt_font_program.h"
#include "export/qt/text_shaper.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_text.h"

#include <QGlyphRun>
#include <QTextLayout>

namespace pelloric::qt {

namespace {

/// Shaped texts kept before the table of them is emptied.
constexpr std::size_t MostTexts = 4096;

} // namespace

class QtGlyphFaces::Face final : public pdf::GlyphFace {
public:
    Face(QtGlyphFaces& faces, QtFace& face)
        : faces_(faces)
        , face_(face)
        , font_(face.font(ShapingPixels))
    {
    }

    double ascent() const override { return face_.ascent(); }
    FaceMetrics& metrics() override { return face_; }

    pdf::CharacterGlyph glyphOf(char32_t character) override
    {
        // Without its shaper the toolkit finds no other font for some characters.
        QFont shaping = font_;
        shaping.setStyleStrategy(QFont::PreferAntialias);
        for (const QFont& font : { font_, shaping }) {
            QTextLayout layout(QString::fromUcs4(&character, 1), font);
            layOut(layout);
            const QList<QGlyphRun> runs = layout.glyphRuns();
            if (!runs.isEmpty() && !runs.first().glyphIndexes().isEmpty())
                return { drawn(runs.first().rawFont()), runs.first().glyphIndexes().first() };
        }
        return { drawn(QRawFont::fromFont(font_)), 0 };
    }

    const pdf::ShapedText& shaped(TextView text) override
    {
        if (texts_.size() >= MostTexts)
            texts_.clear();
        const auto [known, isNew] = texts_.try_emplace(Text(text));
        if (isNew)
            known->second = shape(text, font_, [&](const QRawFont& font) { return drawn(font); });
        return known->second;
    }

private:
    pdf::DrawnFont drawn(const QRawFont& font)
    {
        return faces_.drawnFont(font, font_.bold(), font_.italic());
    }

    QtGlyphFaces& faces_;
    QtFace& face_;
    QFont font_;
    std::unordered_map<Text, pdf::ShapedText> texts_;
};

QtGlyphFaces::QtGlyphFaces(QtFonts& fonts)
    : fonts_(fonts)
{
}

QtGlyphFaces::~QtGlyphFaces() = default;

pdf::GlyphFace& QtGlyphFaces::face(TextView name, bool bold, bool italic)
{
    QtFace& measured = fonts_.face(name, bold, italic);
    auto& face = faces_[&measured];
    if (!face)
        face = std::make_unique<Face>(*this, measured);
    return *face;
}

pdf::DrawnFont QtGlyphFaces::drawnFont(const QRawFont& font, bool bold, bool italic)
{
    QtFontProgram& program = programOf(font);
    return { &program, bold && !program.isBold(), italic && !program.isItalic() };
}

/// The toolkit hands out a font once for each weight and slant, though the file is the same.
QtFontProgram& QtGlyphFaces::programOf(const QRawFont& font)
{
    for (const ChosenFont& chosen : chosen_) {
        if (chosen.font == font)
            return *chosen.program;
    }
    auto& program = programs_[QtFontProgram::fingerprintOf(font)];
    if (!program)
        program = std::make_unique<QtFontProgram>(font);
    chosen_.push_back({ font, program.get() });
    return *program;
}

} // namespace pelloric::qt
