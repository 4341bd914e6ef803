// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/picture_files.h"

#include "platform/file_bytes.h"
#include "platform/files.h"
#include "platform/phrase.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/std_files.h"

#include <QBuffer>
#include <QCache>
#include <QCryptographicHash>
#include <QDir>
#include <QFile>
#include <QFont>
#include <QFontMetricsF>
#include <QImage>
#include <QImageReader>
#include <QPainter>
#include <QTemporaryDir>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <mutex>
#include <numbers>

namespace pelloric::qt {

namespace {

constexpr double WatermarkDpi = 150; ///< a faint text needs no more: pixels per inch
constexpr double TwipsPerInch = 1440;
constexpr double LargestPart = 0.8; ///< of the sheet's diagonal that a text covers
constexpr double TallestPart = 0.25; ///< of the sheet's shorter side that its height takes
constexpr int MostPixels = 4000; ///< of one side
constexpr int MeasuredPixels = 100; ///< height of the font that a text is measured in
constexpr int MostKeptKilobytes = 64 << 10; ///< of pictures that were read

/// Where pictures are kept; gone when the program ends.
QTemporaryDir& folder()
{
    static QTemporaryDir kept;
    return kept;
}

/// @throws RunTimeError WriteFailed, PermissionDenied, DiskFull, with the path; nothing is left
void write(std::string_view bytes, const std::filesystem::path& path)
{
    const OpenedFile made = StdFiles().create(path, {});
    if (made.file && made.file->write(bytes) && made.file->sync())
        return;
    const FileFault fault = made.file ? made.file->fault() : made.fault;
    std::error_code ignored;
    std::filesystem::remove(path, ignored);
    throw RunTimeError(errorNumberOf(fault), pathText(path));
}

/// @param ending  of the file's name
/// @throws RunTimeError the file cannot be written, or there is no folder for it
Text keepFile(const QByteArray& bytes, const QString& ending)
{
    if (!folder().isValid())
        throw RunTimeError(ErrorNumber::WriteFailed,
            phrase(u"pictures cannot be kept in %1: %2",
                { toText(QDir::tempPath()), toText(folder().errorString()) }));
    const QByteArray hash = QCryptographicHash::hash(bytes, QCryptographicHash::Sha1).toHex();
    const QString path = folder().filePath(QString::fromLatin1(hash) + QLatin1Char('.') + ending);
    if (QFile::exists(path))
        return toText(path);
    write({ bytes.constData(), static_cast<std::size_t>(bytes.size()) }, pathOf(path));
    return toText(path);
}

QImage transparentImage(QSize size)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    return image;
}

/// The font in which a text is as large as a sheet of pixels lets it be.
QFont watermarkFont(const QString& text, QSize sheet)
{
    QFont font;
    font.setBold(true);
    font.setPixelSize(MeasuredPixels);
    const double width = std::max(1.0, QFontMetricsF(font).horizontalAdvance(text));
    const double diagonal = std::hypot(sheet.width(), sheet.height());
    const double wide = MeasuredPixels * LargestPart * diagonal / width;
    const double tall = TallestPart * std::min(sheet.width(), sheet.height());
    font.setPixelSize(std::max(1, static_cast<int>(std::min(wide, tall))));
    return font;
}

} // namespace

Text keepPicture(const QImage& picture)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    picture.save(&buffer, "PNG");
    return keepFile(bytes, QStringLiteral("png"));
}

QImage loadPicture(TextView file)
{
    static std::mutex guard;
    static QCache<QString, QImage> read(MostKeptKilobytes);
    const QString path = toQString(file);
    if (!path.startsWith(folder().path()))
        return QImage(path);
    const std::lock_guard lock(guard);
    if (const QImage* const known = read.object(path))
        return *known;
    QImage picture(path);
    if (!picture.isNull())
        read.insert(path, new QImage(picture), static_cast<int>(picture.sizeInBytes() / 1024 + 1));
    return picture;
}

std::optional<Tpoint> QtPictures::pixelSize(TextView file)
{
    const QSize size = QImageReader(toQString(file)).size();
    return size.isEmpty() ? std::nullopt : std::optional<Tpoint>({ size.width(), size.height() });
}

Text QtPictures::kept(TextView file, double opacity)
{
    const QString path = toQString(file);
    QImageReader reader(path);
    const QString format = QString::fromLatin1(reader.format());
    const QImage picture = reader.read();
    QFile source(path);
    if (picture.isNull() || !source.open(QIODevice::ReadOnly))
        throw RunTimeError(ErrorNumber::FileNotFound, file);
    if (opacity >= 1)
        return keepFile(source.readAll(), format);
    QImage faint = transparentImage(picture.size());
    QPainter painter(&faint);
    painter.setOpacity(std::clamp(opacity, 0.0, 1.0));
    painter.drawImage(0, 0, picture);
    painter.end();
    return keepPicture(faint);
}

Text QtPictures::writtenAcross(TextView text, Tpoint size, double opacity)
{
    const auto pixels = [](Twips side) {
        return std::clamp(static_cast<int>(side * WatermarkDpi / TwipsPerInch), 1, MostPixels);
    };
    QImage sheet = transparentImage({ pixels(size.x), pixels(size.y) });
    const QString shown = toQString(text);
    const double diagonal = std::hypot(sheet.width(), sheet.height());
    const double angle = std::atan2(sheet.height(), sheet.width()) * 180 / std::numbers::pi;
    QPainter painter(&sheet);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::TextAntialiasing);
    painter.setOpacity(std::clamp(opacity, 0.0, 1.0));
    painter.setFont(watermarkFont(shown, sheet.size()));
    painter.translate(sheet.width() / 2.0, sheet.height() / 2.0);
    painter.rotate(-angle);
    painter.drawText(
        QRectF(-diagonal, -diagonal, 2 * diagonal, 2 * diagonal), Qt::AlignCenter, shown);
    painter.end();
    return keepPicture(sheet);
}

} // namespace pelloric::qt
