// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/qt_pdf_writer.h"

#include "export/qt/qt_glyph_faces.h"
#include "platform/qt/qt_text.h"

#include <QDateTime>
#include <QFile>
#include <QLocale>

#include <cstdlib>

namespace pelloric::qt {

namespace {

/// The time as PDF files write it.
std::string stampOf(const QDateTime& time)
{
    constexpr int Decimal = 10;
    const int minutes = time.offsetFromUtc() / 60;
    const QString stamp = time.toString(QStringLiteral("yyyyMMddHHmmss"))
        + (minutes < 0 ? QLatin1Char('-') : QLatin1Char('+'))
        + QStringLiteral("%1'%2'")
              .arg(std::abs(minutes) / 60, 2, Decimal, QLatin1Char('0'))
              .arg(std::abs(minutes) % 60, 2, Decimal, QLatin1Char('0'));
    return stamp.toStdString();
}

} // namespace

void FileSink::write(std::string_view bytes)
{
    const auto size = static_cast<qint64>(bytes.size());
    if (file_.write(bytes.data(), size) != size)
        throw Full();
}

pdf::PdfInfo pdfInfoOfNow(TextView title, TextView language)
{
    return { .title = Text(title),
        .language = language.empty() ? toText(QLocale().bcp47Name()) : Text(language),
        .created = stampOf(QDateTime::currentDateTime()) };
}

bool writePdf(QFile& file, QtGlyphFaces& faces, const pdf::PdfInfo& info, double pixel,
    const std::function<void(pdf::PdfWriter& writer)>& pages)
{
    try {
        FileSink sink(file);
        ZlibDeflater deflater;
        QtPictureReader pictures;
        pdf::PdfWriter writer({ sink, deflater, faces, pictures }, info, pixel);
        pages(writer);
        writer.finish();
        return true;
    } catch (const FileSink::Full&) {
        return false;
    }
}

} // namespace pelloric::qt
