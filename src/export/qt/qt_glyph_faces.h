// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/font_program.h"

#include <QByteArray>
#include <QFont>
#include <QRawFont>

#include <map>
#include <memory>
#include <unordered_map>

namespace pelloric::qt {

class QtFace;
class QtFontProgram;
class QtFonts;

/// The installed fonts as files hold them, with the glyphs that the screen shows.
class QtGlyphFaces final : public pdf::GlyphFaces {
public:
    /// @param fonts  borrowed
    explicit QtGlyphFaces(QtFonts& fonts);
    ~QtGlyphFaces() override;
    QtGlyphFaces(const QtGlyphFaces&) = delete;
    QtGlyphFaces& operator=(const QtGlyphFaces&) = delete;

    pdf::GlyphFace& face(TextView name, bool bold, bool italic) override;

    /// The program of a font that the toolkit chose, as a bold or italic face uses it.
    /// @throws CannotEmbed
    pdf::DrawnFont drawnFont(const QRawFont& font, bool bold, bool italic);

private:
    class Face;
    struct ChosenFont {
        QRawFont font;
        QtFontProgram* program;
    };

    QtFontProgram& programOf(const QRawFont& font);

    QtFonts& fonts_;
    std::map<QByteArray, std::unique_ptr<QtFontProgram>> programs_; ///< by their fingerprints
    std::vector<ChosenFont> chosen_;
    std::map<QtFace*, std::unique_ptr<Face>> faces_;
};

} // namespace pelloric::qt
