// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/pdf_writer.h"
#include "export/qt/qt_picture_reader.h"
#include "export/qt/zlib_deflater.h"

#include <QString>

#include <functional>

class QFile;

namespace pelloric::qt {

class QtGlyphFaces;

/// Writes to a file that is open.
class FileSink final : public pdf::ByteSink {
public:
    /// Thrown when the file takes no more; it knows why.
    struct Full { };

    /// @param file  borrowed
    explicit FileSink(QFile& file)
        : file_(file)
    {
    }

    void write(std::string_view bytes) override;

private:
    QFile& file_;
};

/// What a PDF file says about itself when it is made now.
/// @param language  empty: the locale's
pdf::PdfInfo pdfInfoOfNow(TextView title, TextView language = {});

/// Writes a PDF file with the fonts and the image formats of this system.
///
/// @param file   open for writing
/// @param pixel  what pens are measured in: twips
/// @param pages  draws all pages
/// @return       whether the file took everything
/// @throws CannotEmbed; or what drawing throws
bool writePdf(QFile& file, QtGlyphFaces& faces, const pdf::PdfInfo& info, double pixel,
    const std::function<void(pdf::PdfWriter& writer)>& pages);

} // namespace pelloric::qt
