// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/margin_sketch.h"

#include <algorithm>
#include <cmath>

namespace pelloric {

namespace {

/// Room that the frame keeps around the sketch, and half of it.
constexpr double FrameRoom = 300;
constexpr double FrameEdge = 150;

/// Further off than any window reaches.
constexpr double FarOff = 30000;

/// Larger than any screen: twips.
constexpr double MostExtent = 1e6;

/// Where the ruled lines of one direction stand, from one margin to the other.
///
/// @param margin  the first line stands one step behind it
/// @param limit   the lines end before it
/// @param extent  of the sketch; what lies further off is left out
std::vector<double> ruledPositions(double margin, double step, double limit, double extent)
{
    std::vector<double> positions;
    double at = margin + step;
    if (at < 0)
        at = std::fmod(at, step);
    const double end = std::min({ limit, extent + step, MostExtent });
    for (; at < end; at += step)
        positions.push_back(at);
    return positions;
}

} // namespace

SketchRect sketchRect(double frameWidth, double frameHeight, bool portrait)
{
    SketchRect rect { .left = FrameEdge, .top = 0, .width = frameWidth - FrameRoom, .height = 0 };
    if (!(frameWidth > 0 && frameHeight > 0))
        return rect;
    const double ratio = frameWidth / frameHeight;
    rect.height = portrait ? rect.width / ratio : rect.width * ratio;
    rect.top = (frameHeight - rect.height) / 2;
    return rect;
}

double toSketchUnits(double millimetres) { return millimetres / 10 * SketchScale; }

double toMillimetres(double sketchUnits) { return sketchUnits / SketchScale * 10; }

void MarginSketch::setMargin(Margin margin, double length)
{
    margins_[index(margin)] = length;
    positions_[index(margin)] = placeOf(margin);
}

void MarginSketch::setSize(double width, double height)
{
    width_ = width;
    height_ = height;
    for (const Margin margin : AllMargins)
        positions_[index(margin)] = placeOf(margin);
}

double MarginSketch::linePosition(Margin margin) const
{
    return std::clamp(positions_[index(margin)], -FarOff, FarOff);
}

double MarginSketch::placeOf(Margin margin) const
{
    const double length = margins_[index(margin)];
    switch (margin) {
    case Margin::Right:
        return width_ - length;
    case Margin::Bottom:
        return height_ - length;
    case Margin::Top:
    case Margin::Left:
        break;
    }
    return length;
}

/// The pointer's place is that inside the line's own picture, which makes the test hold nearly
/// everywhere on the line; that is the rule.
bool MarginSketch::isHover(Margin line, double x, double y) const
{
    const double length = margins_[index(line)];
    switch (line) {
    case Margin::Top:
        return y - length < HoverTolerance;
    case Margin::Right:
        return x - width_ - length < HoverTolerance;
    case Margin::Bottom:
        return y - height_ - length < HoverTolerance;
    case Margin::Left:
        break;
    }
    return x - length < HoverTolerance;
}

bool MarginSketch::isOnSheet(Margin line, double position) const
{
    return position > 0 && position < (isHorizontalLine(line) ? height_ : width_);
}

/// No line is moved past the opposite margin, nor off the sheet.
bool MarginSketch::staysInside(Margin line, double position) const
{
    if (!isOnSheet(line, position))
        return false;
    switch (line) {
    case Margin::Top:
        return position < height_ - margin(Margin::Bottom);
    case Margin::Right:
        return position > margin(Margin::Left);
    case Margin::Bottom:
        return position > margin(Margin::Top);
    case Margin::Left:
        break;
    }
    return position < width_ - margin(Margin::Right);
}

void MarginSketch::mouseMove(Margin line, double x, double y)
{
    pointer_ = SketchPointer::Default;
    overLine_ = isHover(line, x, y);
    if (!overLine_)
        return;
    pointer_ = isHorizontalLine(line) ? SketchPointer::NorthSouth : SketchPointer::WestEast;
    if (!dragging_)
        return;
    double& position = positions_[index(dragLine_)];
    const double moved = position + (isHorizontalLine(dragLine_) ? y : x);
    if (staysInside(dragLine_, moved))
        position = moved;
}

void MarginSketch::mouseDown(Margin line, double x, double y)
{
    if (!overLine_)
        return;
    dragging_ = true;
    dragLine_ = line;
    const double moved = positions_[index(line)] + (isHorizontalLine(line) ? y : x);
    if (isOnSheet(line, moved))
        positions_[index(line)] = moved;
}

std::optional<Margin> MarginSketch::mouseUp()
{
    if (!dragging_)
        return std::nullopt;
    dragging_ = false;
    overLine_ = false;
    const double position = positions_[index(dragLine_)];
    double length = position;
    if (dragLine_ == Margin::Right)
        length = width_ - position;
    if (dragLine_ == Margin::Bottom)
        length = height_ - position;
    margins_[index(dragLine_)] = length;
    return dragLine_;
}

std::vector<SketchLine> MarginSketch::ruledLines() const
{
    const double left = margin(Margin::Left);
    const double top = margin(Margin::Top);
    const double right = width_ - margin(Margin::Right);
    const double bottom = height_ - margin(Margin::Bottom);
    std::vector<SketchLine> lines;
    double lastRow = top;
    for (const double y : ruledPositions(top, SketchRowStep, bottom, height_)) {
        lines.push_back({ left, y, right, y });
        lastRow = y;
    }
    for (const double x : ruledPositions(left, SketchColumnStep, right, width_))
        lines.push_back({ x, top, x, lastRow });
    return lines;
}

} // namespace pelloric
