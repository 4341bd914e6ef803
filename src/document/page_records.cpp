// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/page_records.h"

#include <algorithm>

namespace pelloric {

std::uint32_t LinePatterns::add(std::span<const PatternLine> lines)
{
    lines_.insert(lines_.end(), lines.begin(), lines.end());
    ends_.push_back(lines_.size());
    return static_cast<std::uint32_t>(ends_.size() - 1);
}

std::size_t LinePatterns::memoryBytes() const
{
    return lines_.capacity() * sizeof(PatternLine) + ends_.capacity() * sizeof(std::size_t);
}

void LineList::append(const LineRecord& line)
{
    if (groups_.empty() || groups_.back().pattern != Singles)
        groups_.push_back({ static_cast<Twips>(singles_.size()), 0, Singles });
    singles_.push_back(line);
    ++groups_.back().bottom;
    ++size_;
}

void LineList::appendRow(Twips top, Twips bottom, std::uint32_t pattern, std::size_t lines)
{
    groups_.push_back({ top, bottom, pattern });
    size_ += lines;
}

void LineList::reserveLike(const LineList& other)
{
    groups_.reserve(other.groups_.size());
    singles_.reserve(other.singles_.size());
}

void LineList::shrinkToFit()
{
    groups_.shrink_to_fit();
    singles_.shrink_to_fit();
}

std::size_t LineList::memoryBytes() const
{
    return groups_.capacity() * sizeof(Group) + singles_.capacity() * sizeof(LineRecord);
}

LineRecord LineRange::operator[](std::size_t index) const
{
    std::size_t group = 0;
    for (; index >= linesOf(group); ++group)
        index -= linesOf(group);
    return lineOf(group, index);
}

void TextList::startRun(const TextRecord& text)
{
    runs_.push_back({ text.units, text.pt.y, text.style, static_cast<std::uint32_t>(size()),
        text.length > LengthMask });
}

void TextList::reserveLike(const TextList& other)
{
    runs_.reserve(other.runs_.size());
    entries_.reserve(other.entries_.size());
}

void TextList::shrinkToFit()
{
    runs_.shrink_to_fit();
    entries_.shrink_to_fit();
}

std::size_t TextList::memoryBytes() const
{
    return runs_.capacity() * sizeof(Run) + entries_.capacity() * sizeof(Entry);
}

TextRecord TextRange::operator[](std::size_t index) const
{
    const auto& runs = list_->runs_;
    const auto behind = std::upper_bound(runs.begin(), runs.end(), index,
        [](std::size_t text, const TextList::Run& run) { return text < run.first; });
    return textOf(*list_, static_cast<std::size_t>(behind - runs.begin()) - 1, index);
}

} // namespace pelloric
