// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QByteArray>

class QImage;

namespace pelloric::qt {

/// A picture as the bytes of a PNG file, packed for speed: pages are mostly white, so that the best
/// packing would save little. A picture without colours is kept as shades of grey.
///
/// @param image  of the format RGB32; its resolution is written too
/// @return       empty: there is no memory for it
QByteArray pngBytes(const QImage& image);

} // namespace pelloric::qt
