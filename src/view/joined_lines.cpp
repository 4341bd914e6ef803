// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/joined_lines.h"

#include <algorithm>
#include <utility>

namespace pelloric {

namespace {

/// Ends looked at before a segment begins anew.
constexpr std::size_t MostSteps = 64;

} // namespace

std::optional<std::size_t> JoinedLines::Ends::move(Tpoint end, Tpoint newEnd)
{
    const std::size_t steps = std::min(ends_.size(), MostSteps);
    std::size_t at = next_;
    for (std::size_t step = 0; step < steps; ++step, ++at) {
        at = at < ends_.size() ? at : 0;
        if (ends_[at].point == end) {
            ends_[at].point = newEnd;
            next_ = at + 1;
            return ends_[at].segment;
        }
    }
    return {};
}

void JoinedLines::Ends::add(Tpoint end, std::size_t segment)
{
    ends_.push_back({ end, segment });
    next_ = ends_.size();
}

void JoinedLines::Ends::clear()
{
    ends_.clear();
    next_ = 0;
}

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
    if (usedPen_ == pen)
        return;
    usedPen_ = pen;
    target_.setForeColor(pen.color);
    target_.setDrawWidth(pen.width);
    target_.setDrawStyle(pen.style);
}

void JoinedLines::hold(Tpoint from, Tpoint to, Ends& ends)
{
    if (const auto before = ends.move(from, to)) {
        held_[*before].to = to;
        return;
    }
    ends.add(to, held_.size());
    held_.push_back({ from, to });
}

void JoinedLines::beforeDrawing()
{
    finish();
    usePen(pen_);
}

} // namespace pelloric
