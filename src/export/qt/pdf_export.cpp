// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/page_document.h"
#include "export/qt/export_parts.h"
#include "export/qt/pending_files.h"
#include "export/qt/qt_glyph_faces.h"
#include "export/qt/qt_pdf_writer.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "view/joined_lines.h"
#include "view/page_renderer.h"

#include <QColorSpace>

namespace pelloric::qt {

namespace {

/// A pixel of 600 an inch: the thinnest line is fine, and seen everywhere.
constexpr double Pixel = 2.4;

pdf::PdfInfo infoOf(const ExportOptions& options)
{
    pdf::PdfInfo info = pdfInfoOfNow(options.title, options.language);
    info.isTagged = options.isTagged;
    info.isArchive = options.isArchive;
    if (options.isArchive)
        info.colorProfile = QColorSpace(QColorSpace::SRgb).iccProfile().toStdString();
    return info;
}

void drawPages(const PageDocument& document, const PageSetup& setup, const ExportOptions& options,
    pdf::PdfWriter& writer)
{
    const std::vector<int> pages = pagesOf(document, options);
    const PageRenderer renderer(document);
    const std::int64_t total = std::ssize(pages);
    std::int64_t done = 0;
    for (const int page : pages) {
        tell(options.progress, done++, total);
        const pdf::Paper paper { .width = setup.myWidth, .height = setup.myHeight };
        JoinedLines joined(writer.beginPage(paper, document.structure, page));
        renderer.replay(page, {}, joined);
        joined.finish();
        writer.endPage();
    }
    tell(options.progress, total, total);
}

} // namespace

PdfExport exportPdf(const PageDocument& document, const PageSetup& setup, QtFonts& fonts,
    const ExportOptions& options, const std::filesystem::path& path)
{
    checkPaper(setup);
    pagesOf(document, options);
    try {
        PendingFiles files;
        files.write(path, [&](QFile& file) {
            QtGlyphFaces faces(fonts);
            return writePdf(file, faces, infoOf(options), Pixel,
                [&](pdf::PdfWriter& writer) { drawPages(document, setup, options, writer); });
        });
        files.putInPlace();
        return {};
    } catch (const pdf::CannotEmbed& obstacle) {
        const Text reason = phrase(obstacle.reason, { obstacle.font });
        if (options.isTagged || options.isArchive)
            throw RunTimeError(ErrorNumber::InvalidCall, reason);
        exportPdfByToolkit(document, setup, fonts, options, path);
        return { reason };
    }
}

} // namespace pelloric::qt
