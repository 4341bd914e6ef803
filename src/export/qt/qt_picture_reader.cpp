// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/qt_picture_reader.h"

#include "platform/qt/qt_text.h"

#include <QFile>
#include <QImage>

namespace pelloric::qt {

std::optional<pdf::PictureBytes> QtPictureReader::read(TextView path)
{
    const QString name = toQString(path);
    QImage image(name);
    if (image.isNull())
        return {};
    pdf::PictureBytes picture { .width = image.width(), .height = image.height() };
    QFile file(name);
    if (file.open(QIODevice::ReadOnly))
        picture.file = file.readAll().toStdString();
    const bool isOpaque = !image.hasAlphaChannel();
    image.convertTo(QImage::Format_RGBA8888);
    for (int y = 0; y < image.height(); ++y) {
        const auto* pixel = reinterpret_cast<const char*>(image.constScanLine(y));
        for (int x = 0; x < image.width(); ++x, pixel += 4) {
            picture.colors.append(pixel, 3);
            if (!isOpaque)
                picture.opacities += pixel[3];
        }
    }
    return picture;
}

} // namespace pelloric::qt
