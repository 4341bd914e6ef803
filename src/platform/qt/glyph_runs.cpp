// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/glyph_runs.h"

#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_text.h"
#include "platform/units.h"

#include <QFontDatabase>
#include <QTextLayout>

#include <map>

namespace pelloric::qt {

namespace {

constexpr double WidestLine = 1e7; ///< pixels; nothing is wrapped

} // namespace

bool hasBoldFace(const QString& family)
{
    for (const QString& style : QFontDatabase::styles(family)) {
        if (QFontDatabase::weight(family, style) >= QFont::DemiBold)
            return true;
    }
    return false;
}

bool isBoldMadeUp(const QRawFont& font)
{
    // Asking for the styles of a family takes long, and the same few families come again and again.
    thread_local std::map<QString, bool> known;
    const auto [found, isNew] = known.try_emplace(font.familyName());
    if (isNew)
        found->second = !hasBoldFace(font.familyName());
    return found->second;
}

double squeezeFor(double shaped, double advance)
{
    return shaped > advance && advance > 0 ? advance / shaped : 1;
}

ShapedRun shapeRun(const TextRun& run, const QtFace& face, int pixels)
{
    QFont font = face.installedFont(pixels);
    if (run.kind == RunKind::Shaped)
        font.setStyleStrategy(QFont::PreferAntialias);
    QTextLayout layout(toQString(run.text), font);
    layout.beginLayout();
    QTextLine line = layout.createLine();
    line.setLineWidth(WidestLine);
    layout.endLayout();
    const QPointF baseline(0, line.ascent());
    ShapedRun shaped { .glyphs = line.glyphRuns() };
    for (QGlyphRun& glyphs : shaped.glyphs) {
        QList<QPointF> positions = glyphs.positions();
        for (QPointF& position : positions)
            position -= baseline;
        glyphs.setPositions(positions);
    }
    if (run.kind == RunKind::Shaped)
        shaped.squeeze = squeezeFor(line.horizontalAdvance(), run.advance / TwipsPerPoint * pixels);
    return shaped;
}

} // namespace pelloric::qt
