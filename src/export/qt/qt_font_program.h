// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/font_program.h"

#include <QByteArray>
#include <QRawFont>

#include <memory>
#include <unordered_map>

struct hb_face_t;

namespace pelloric::qt {

/// An installed font, read and cut down through its tables.
class QtFontProgram final : public pdf::FontProgram {
public:
    /// @throws CannotEmbed: the font may not be embedded, or has no outlines that files can hold
    explicit QtFontProgram(const QRawFont& font);
    ~QtFontProgram() override;
    QtFontProgram(const QtFontProgram&) = delete;
    QtFontProgram& operator=(const QtFontProgram&) = delete;

    const pdf::FontFacts& facts() const override { return facts_; }
    double advance(std::uint32_t glyph) const override;
    pdf::FontSubset subset(std::span<const std::uint32_t> glyphs) override;

    /// Whether the font itself is bold, or leans.
    bool isBold() const { return isBold_; }
    bool isItalic() const { return isItalic_; }

    /// What tells a font from all others.
    static QByteArray fingerprintOf(const QRawFont& font);

private:
    QByteArray outlines(std::uint32_t tag) const;
    const QByteArray& table(std::uint32_t tag) const;
    void refuseUnlessEmbeddable();
    void readFacts();
    void readStyle();
    double inThousandths(double units) const { return units * 1000 / unitsPerEm_; }

    QRawFont font_;
    /// Kept as long as the face, which looks into them.
    mutable std::unordered_map<std::uint32_t, QByteArray> tables_;
    struct FreeFace {
        void operator()(hb_face_t* face) const;
    };
    std::unique_ptr<hb_face_t, FreeFace> file_; ///< mapped into memory; null: it is not known
    std::unique_ptr<hb_face_t, FreeFace> face_;
    pdf::FontFacts facts_;
    double unitsPerEm_ = 1000;
    std::uint32_t advanceCount_ = 0;
    bool isSubsettingAllowed_ = true;
    bool isBold_ = false;
    bool isItalic_ = false;
};

} // namespace pelloric::qt
