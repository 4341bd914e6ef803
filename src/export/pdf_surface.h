// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/pdf_content.h"
#include "platform/drawing_state.h"
#include "platform/text_runs.h"

namespace pelloric::pdf {

class PdfPictures;
class PdfTags;

/// Where a page's origin is, and how wide its thinnest line.
struct PagePlace {
    Twips height = 0; ///< of the paper: twips
    Tpoint origin {}; ///< of the records, from the paper's top left corner: twips
    double pixel = 2.4; ///< what pens are measured in: twips
};

/// A page of a PDF file: what is drawn becomes operators of the page's content.
class PdfSurface final : public StatefulSurface {
public:
    /// @param content   borrowed
    /// @param faces     borrowed
    /// @param fonts     borrowed
    /// @param pictures  borrowed
    PdfSurface(PdfContent& content, GlyphFaces& faces, PdfFonts& fonts, PdfPictures& pictures);

    /// Where what is drawn from now on stands.
    void setPlace(const PagePlace& place) { place_ = place; }

    /// Tells these, too, what is drawn.
    /// @param tags  borrowed; null: none
    void setTags(PdfTags* tags) { tags_ = tags; }

    void clear() override { state_.current = {}; }
    void setFontName(TextView name) override;
    void setFontSize(float size) override;
    void setFontBold(bool bold) override;
    void setFontItalic(bool italic) override;
    void line(Tpoint from, Tpoint to) override;
    void box(Tpoint corner, Tpoint opposite, Color outline) override;
    void print(TextView text) override;
    void picture(TextView filePath, Tpoint topLeft, Tpoint size) override;

private:
    void announceShape();
    void takeFont();
    ContentPoint pointOf(Tpoint point) const;
    ContentPoint baselineAt(std::size_t line, double fromLeft) const;
    ContentPen penOf(Color color) const;
    bool hasPen() const;
    void drawText(TextView text);
    bool drawAtOnce(TextView text);
    void drawRun(const TextRun& run);
    void drawPlain(const TextRun& run);
    void drawShaped(const TextRun& run);
    void drawBox(const TextRun& run);
    void fillBehind(TextView text);
    double toTwips(double advance) const;

    PdfContent& content_;
    GlyphFaces& faces_;
    PdfFonts& fonts_;
    PdfPictures& pictures_;
    PagePlace place_;
    PdfTags* tags_ = nullptr;

    bool isFontStale_ = true;
    std::map<GlyphFace*, FaceCodes> codes_;
    FaceCodes* face_ = nullptr;
    double em_ = 0; ///< twips
    std::int64_t ascent_ = 0; ///< hundredths of a twip
    Twips lineHeight_ = 0;
    std::vector<TextRun> runs_;
    std::string shown_; ///< codes of a text
};

} // namespace pelloric::pdf
