// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/services.h"

class QImage;

namespace pelloric::qt {

/// Keeps a picture in a file of its own until the program ends; equal pictures share a file.
///
/// @return  the file's path
/// @throws RunTimeError WriteFailed: there is no room for temporary files
Text keepPicture(const QImage& picture);

/// The picture in an image file; null: it cannot be read. One that `keepPicture` wrote is read
/// once. May be called on any thread.
QImage loadPicture(TextView file);

/// Watermarks and logos by the toolkit's images.
class QtPictures final : public PictureService {
public:
    std::optional<Tpoint> pixelSize(TextView file) override;
    Text kept(TextView file, double opacity) override;
    Text writtenAcross(TextView text, Tpoint size, double opacity) override;
};

} // namespace pelloric::qt
