// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/font_program.h"

#include <functional>

class QFont;
class QRawFont;
class QTextLayout;

namespace pelloric::qt {

/// The em of fonts whose glyphs are asked for: pixels. At this size advances are exact.
inline constexpr int ShapingPixels = 2048;

/// Lays a text out on one line.
void layOut(QTextLayout& layout);

/// Shapes a text as the toolkit draws it, and says which glyphs stand for which characters.
///
/// @param font   `ShapingPixels` large
/// @param drawn  the font that files draw with, for one that the toolkit chose
pdf::ShapedText shape(
    TextView text, QFont font, const std::function<pdf::DrawnFont(const QRawFont&)>& drawn);

} // namespace pelloric::qt
