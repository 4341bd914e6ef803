// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// What is drawn of a cell beside its text: check box, icon, branches of a tree, strokes.

#include "platform/numbers.h"
#include "report/report_style.h"
#include "report/shaped_layout.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr double BoxEdge = 1.0 / 32; ///< of a check box's side: how thick its frame is
constexpr double TickWidth = 0.16; ///< of its side: how wide the tick's strokes are
constexpr double StrokeStep = 2; ///< twips between the lines of a stroke: less than a printer's dot

} // namespace

/// Draws check box and icon. @return  how far the text moves to the right: twips
double ShapedLayout::printMarks(const CellLook& look, const Area& area)
{
    const double line = rows_.lineHeight();
    double left = area.left;
    if (look.check != CheckMark::None) {
        const double side = line * 0.7;
        drawCheckMark(look.check, left, area.top + (line - side) / 2, side);
        left += line;
    }
    if (!look.icon.empty()) {
        const Twips side = roundToInt32(line);
        document_.addPicture(document_.currentPage,
            { PictureLayer::Cells, { roundToInt32(left), roundToInt32(area.top) }, { side, side },
                keptIcon(look.icon) });
    }
    return rows_.marksWidth(look);
}

/// The name of an icon's file, once in the document's store however many cells show it.
TextView ShapedLayout::keptIcon(TextView file)
{
    TextView& kept = icons_[file.data()];
    if (kept.empty())
        kept = document_.store().add(file);
    return kept;
}

/// Pens are as wide as a pixel of whatever the page is drawn on: strokes that keep their share of
/// the box on every printer are made of lines beside each other.
void ShapedLayout::drawCheckMark(CheckMark mark, double left, double top, double side)
{
    const auto at = [&](double x, double y) {
        return Tpoint { roundToInt32(left + x * side), roundToInt32(top + y * side) };
    };
    usePen({ .LineColor = 0 });
    const int frames = std::max(1, roundToInt32(BoxEdge * side / StrokeStep));
    for (int frame = 0; frame < frames; ++frame) {
        const double inset = frame * StrokeStep / side;
        const double rest = 1 - inset;
        drawLine(at(inset, inset), at(rest, inset));
        drawLine(at(rest, inset), at(rest, rest));
        drawLine(at(rest, rest), at(inset, rest));
        drawLine(at(inset, rest), at(inset, inset));
    }
    if (mark == CheckMark::Partly)
        fillBox(
            { left + 0.28 * side, left + 0.72 * side, top + 0.28 * side, top + 0.72 * side }, 0);
    if (mark != CheckMark::On)
        return;
    usePen({ .LineColor = 0 });
    const int lines = 1 + roundToInt32(TickWidth * side / StrokeStep);
    for (int line = 0; line < lines; ++line) {
        const double shift = (line - (lines - 1) / 2.0) * StrokeStep / side;
        drawLine(at(0.22 + shift, 0.5), at(0.43 + shift, 0.76));
        drawLine(at(0.43 + shift, 0.76), at(0.8 + shift, 0.22));
    }
}

/// Draws how a row of a tree hangs below the rows above it.
void ShapedLayout::drawBranches(const CellLook& look, const Area& area)
{
    if (look.level == 0)
        return;
    const double step = static_cast<double>(look.indent) / (look.level + 1);
    const double middle = (area.top + area.bottom) / 2;
    usePen({ .LineColor = rgb(160, 160, 160) });
    for (int level = 1; level <= look.level; ++level) {
        const double x = area.left + padding_ + (level - 0.5) * step;
        const bool goesOn = level < 64 && ((look.goesOn >> static_cast<unsigned>(level)) & 1U) != 0;
        const bool isOwn = level == look.level;
        if (!goesOn && !isOwn)
            continue;
        const double end = goesOn ? area.bottom : middle;
        drawLine(
            { roundToInt32(x), roundToInt32(area.top) }, { roundToInt32(x), roundToInt32(end) });
        if (isOwn)
            drawLine({ roundToInt32(x), roundToInt32(middle) },
                { roundToInt32(x + 0.8 * step), roundToInt32(middle) });
    }
}

/// Strokes in the text's colour, a fifteenth of its height thick.
void ShapedLayout::underline(const CellLook& look, const CellLine& line, Tpoint at)
{
    const MeasuredFont& face = rows_.font(look.bold, look.italic);
    const Color color = look.foreground.value_or(roundToInt32(source_.style.body.color));
    const double height = face.lineHeight;
    const auto stroke = [&](double place) {
        const double top = at.y + place * height;
        fillBox({ static_cast<double>(at.x), static_cast<double>(at.x) + line.width, top,
                    top + height / 24 },
            color);
    };
    if (look.underline)
        stroke(0.88);
    if (look.strikethrough)
        stroke(0.55);
}

} // namespace pelloric
