// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/joined_lines.h"

#include <utility>

namespace pelloric {

namespace {

std::uint64_t keyOf(Tpoint point)
{
    return (std::uint64_t { static_cast<std::uint32_t>(point.x) } << 32U)
        | static_cast<std::uint32_t>(point.y);
}

} // namespace

JoinedLines::JoinedLines(DrawingSurface& target)
    : target_(target)
{
}

void JoinedLines::finish()
{
    if (held_.empty())
        return;
    usePen(heldPen_);
    for (const Segment& segment : held_)
        target_.line(segment.from, segment.to);
    held_.clear();
    upright_.clear();
    level_.clear();
    target_.setCurrentX(current_.x);
    target_.setCurrentY(current_.y);
}

void JoinedLines::clear()
{
    finish();
    target_.clear();
}

void JoinedLines::setCurrentX(Twips x)
{
    finish();
    target_.setCurrentX(x);
}

void JoinedLines::setCurrentY(Twips y)
{
    finish();
    target_.setCurrentY(y);
}

void JoinedLines::line(Tpoint from, Tpoint to)
{
    if (pen_ != heldPen_)
        finish();
    heldPen_ = pen_;
    const bool isUpright = from.x == to.x;
    const bool isLevel = from.y == to.y;
    if (pen_.style != SolidPen || isUpright == isLevel) {
        beforeDrawing();
        target_.line(from, to);
        return;
    }
    current_ = to;
    if (from.x > to.x || from.y > to.y)
        std::swap(from, to);
    hold(from, to, isUpright ? upright_ : level_);
}

void JoinedLines::box(Tpoint corner, Tpoint opposite, Color outline)
{
    beforeDrawing();
    target_.box(corner, opposite, outline);
}

void JoinedLines::print(TextView text)
{
    beforeDrawing();
    target_.print(text);
}

void JoinedLines::picture(TextView filePath, Tpoint topLeft, Tpoint size)
{
    beforeDrawing();
    target_.picture(filePath, topLeft, size);
}

void JoinedLines::usePen(const Pen& pen)
{
    target_.setForeColor(pen.color);
    target_.setDrawWidth(pen.width);
    target_.setDrawStyle(pen.style);
}

void JoinedLines::hold(Tpoint from, Tpoint to, Ends& ends)
{
    std::size_t at = held_.size();
    const auto before = ends.find(keyOf(from));
    if (before != ends.end()) {
        at = before->second;
        held_[at].to = to;
        ends.erase(before);
    } else {
        held_.push_back({ from, to });
    }
    ends[keyOf(to)] = at;
}

void JoinedLines::beforeDrawing()
{
    finish();
    usePen(pen_);
}

} // namespace pelloric
