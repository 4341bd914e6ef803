// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/qt/qt_glyph_faces.h"
#include "platform/drawing_state.h"
#include "platform/printer.h"
#include "print/qt/sheet.h"

#include <memory>
#include <optional>

namespace pelloric::qt {

class QtFonts;
class QtPrinterSystem;

/// The current printer of a printer system.
///
/// A document begins at the first drawing call, or at the first attribute behind a new title, so
/// that a page without records is sent as a blank page. Each document is a job with settings of its
/// own: paper, orientation, one-sided, one copy; the printer's defaults are never touched. Before a
/// document begins the print system is asked whether it takes one, and when it ends, whether it
/// took it. A print system that stays silent is an error after a few seconds. A document that is
/// open when the object goes is dropped. Pages are held until their document ends, for only then it
/// is known whether all fonts that they need can be sent along.
class QtPrinter final : public Printer {
public:
    /// @param system  says which printer is the current one; borrowed
    /// @param fonts   borrowed
    QtPrinter(const QtPrinterSystem& system, QtFonts& fonts);
    ~QtPrinter() override;

    void clear() override;
    void setFontName(TextView name) override;
    void setFontSize(float size) override;
    void setFontBold(bool bold) override;
    void setFontItalic(bool italic) override;
    void setFontTransparent(bool transparent) override;
    void setForeColor(Color color) override;
    void setDrawWidth(std::int16_t width) override;
    void setDrawStyle(std::int16_t style) override;
    void setFillStyle(std::int16_t style) override;
    void setFillColor(Color color) override;
    void setCurrentX(Twips x) override;
    void setCurrentY(Twips y) override;
    void line(Tpoint from, Tpoint to) override;
    void box(Tpoint corner, Tpoint opposite, Color outline) override;
    void print(TextView text) override;
    void picture(TextView filePath, Tpoint topLeft, Tpoint size) override;

    Text deviceName() const override;

    /// The paper of the printer itself until one is applied to it; 0 when it is none of the forms.
    std::int16_t paperSize() const override;
    std::int16_t orientation() const override { return orientation_; }
    void applyPaperSize(std::int16_t code) override;
    void setPageSize(Twips width, Twips height) override;
    void applyOrientation(std::int16_t code) override;
    void setDocumentTitle(TextView title) override;
    void newPage() override;
    void endDoc() override;

private:
    struct Document;

    /// Where documents go, as long as neither printer nor paper change.
    struct Place {
        Text printer;
        Sheet sheet;
        bool asksForPassword = false;
    };

    DrawingSurface& drawing();
    DrawingSurface* attributeSurface();
    std::int16_t appliedPaper(const Text& printer) const;
    PaperRequest pages(const Text& printer) const;
    void requireTaker(const Text& name);
    void begin();
    QString handOver(const Document& document) const;
    void applyAttributes(DrawingSurface& surface) const;

    const QtPrinterSystem& system_;
    QtFonts& fonts_;
    QtGlyphFaces faces_;
    DrawingState attributes_; ///< what a document begins with
    Text title_;
    bool isAnnounced_ = false; ///< a title was set and no document has begun since
    std::int16_t paperSize_ = 0; ///< 0: the printer's own
    Text paperPrinter_; ///< the printer that it was applied to; another one has its own paper
    std::int16_t orientation_ = 1;
    Tpoint pageSize_; ///< 0: the paper's
    std::optional<Place> place_;
    std::unique_ptr<Document> document_; ///< null between documents
};

} // namespace pelloric::qt
