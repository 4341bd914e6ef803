// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/pdf_file.h"
#include "export/pdf_pictures.h"
#include "export/pdf_surface.h"
#include "export/pdf_tags.h"

#include <optional>

namespace pelloric::pdf {

/// What a PDF file is made with.
struct PdfServices {
    ByteSink& sink;
    Deflater& deflater;
    GlyphFaces& faces;
    PictureReader& pictures;
};

/// What a PDF file says about itself.
struct PdfInfo {
    Text title {};
    Text language {}; ///< as "zh-CN"; empty: unknown
    bool isTagged = false; ///< says what the parts of its pages are, and has an outline
    bool isArchive = false; ///< PDF/A-2b, which can be read for good; needs `colorProfile`
    std::string colorProfile {}; ///< ICC profile of red, green and blue
    std::string created {}; ///< local time as YYYYMMDDHHMMSS and its distance from UTC: "+01'00"
};

/// The paper of a page: twips.
struct Paper {
    Twips width = 0;
    Twips height = 0;
    Tpoint origin {}; ///< of the records, from the top left corner
};

/// Writes a PDF file page by page.
///
/// A page goes out as it ends, so that memory grows with the fonts and a few bytes a page only.
class PdfWriter {
public:
    /// @param services  borrowed
    /// @param pixel     what pens are measured in: twips
    PdfWriter(const PdfServices& services, PdfInfo info, double pixel);
    PdfWriter(const PdfWriter&) = delete;
    PdfWriter& operator=(const PdfWriter&) = delete;

    /// Begins a page.
    /// @return  what it is drawn on, until it ends
    DrawingSurface& beginPage(const Paper& paper) { return beginPage(paper, {}, 0); }

    /// Begins a page of which it is known what its texts are.
    /// @param structure  borrowed until the page ends
    /// @param page       of the structure, from 0
    DrawingSurface& beginPage(const Paper& paper, const PageStructure& structure, int page);

    /// Ends the page and writes it.
    void endPage();

    /// Writes what all pages share and ends the file.
    void finish();

private:
    /// A branch of the tree of pages.
    struct Branch {
        int object = 0;
        std::string pages {};
        int count = 0;
    };

    void closeBranch();
    int writeRoot();
    int writeOutputIntent();
    int writeMetadata();
    int writeInfo();
    std::string identifier() const;

    PdfFile file_;
    PdfFonts fonts_;
    PdfPictures pictures_;
    PdfContent content_;
    PdfSurface surface_;
    PdfInfo info_;
    double pixel_;
    int resources_; ///< object number
    int root_; ///< of the tree of pages: object number
    std::optional<PdfTags> tags_;
    Paper paper_;
    int page_ = 0; ///< object number
    std::vector<int> pages_; ///< object numbers
    std::vector<Branch> branches_;
};

} // namespace pelloric::pdf
