// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/page_structure.h"

namespace pelloric {

void PageStructure::clear() { *this = PageStructure(); }

void PageStructure::addText(int page)
{
    if (!row_.empty()) {
        ++row_.back().texts;
        return;
    }
    Part& part = partOf(page);
    if (part.titles == 0 && part.rowCount == 0)
        ++part.headerTexts;
}

void PageStructure::endTitles(int page) { partOf(page).titles = takePattern(); }

void PageStructure::endRow(int page)
{
    Part& part = partOf(page);
    if (part.rowCount == 0)
        part.firstRow = static_cast<std::uint32_t>(rows_.size());
    rows_.push_back(takePattern());
    ++part.rowCount;
}

bool PageStructure::isTable(int page) const
{
    return part(page).titles != 0 || part(page).rowCount != 0;
}

std::size_t PageStructure::memoryBytes() const
{
    std::size_t bytes = parts_.capacity() * sizeof(Part) + rows_.capacity() * sizeof(rows_[0]);
    for (const auto& pattern : patterns_)
        bytes += 2 * pattern.capacity() * sizeof(CellTexts);
    return bytes;
}

const PageStructure::Part& PageStructure::part(int page) const
{
    static constexpr Part Nothing;
    const auto at = static_cast<std::size_t>(page);
    return page >= 0 && at < parts_.size() ? parts_[at] : Nothing;
}

PageStructure::Part& PageStructure::partOf(int page)
{
    const auto at = static_cast<std::size_t>(page);
    if (at >= parts_.size())
        parts_.resize(at + 1);
    return parts_[at];
}

/// The number of the pattern of the row; neighbouring rows mostly share one.
std::uint32_t PageStructure::takePattern()
{
    if (patterns_[last_] != row_) {
        const std::string bytes(
            reinterpret_cast<const char*>(row_.data()), row_.size() * sizeof(CellTexts));
        const auto [known, isNew]
            = numbers_.try_emplace(bytes, static_cast<std::uint32_t>(patterns_.size()));
        if (isNew)
            patterns_.push_back(row_);
        last_ = known->second;
    }
    row_.clear();
    return last_;
}

} // namespace pelloric
