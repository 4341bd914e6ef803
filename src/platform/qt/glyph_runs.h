// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text_runs.h"

#include <QGlyphRun>
#include <QList>
#include <QRawFont>
#include <QString>

namespace pelloric::qt {

class QtFace;

/// A made-up bold face is drawn with a pen around its outlines, this part of an underline wide.
inline constexpr double MadeUpBoldStroke = 0.5;

/// Whether a family has a bold face of its own.
bool hasBoldFace(const QString& family);

/// Whether bold glyphs of a font have to be made up; a face that fills in for another may be one
/// that has no bold, too.
bool isBoldMadeUp(const QRawFont& font);

/// The glyphs of a run, by the faces they come from, and how far the run has to be squeezed.
struct ShapedRun {
    QList<QGlyphRun> glyphs; ///< from the left end of the baseline, y growing downwards: pixels
    double squeeze = 1; ///< of the positions and widths across, at most 1
};

/// Looks up or shapes the glyphs of a run, which is no box.
///
/// @param pixels  height of the em, 1 or more
ShapedRun shapeRun(const TextRun& run, const QtFace& face, int pixels);

/// How far a run that takes `shaped` has to be squeezed to keep within its advance.
double squeezeFor(double shaped, double advance);

} // namespace pelloric::qt
