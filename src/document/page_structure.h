// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <unordered_map>
#include <vector>

namespace pelloric {

/// How many of a page's texts make a cell.
struct CellTexts {
    std::uint32_t field = 0; ///< column of the table, from 0
    std::uint32_t texts = 0; ///< 0: the cell is blank

    bool operator==(const CellTexts&) const = default;
};

/// What the texts of the pages are to a reader who does not see them: the page header comes first,
/// then the titles, then the rows cell by cell, and what is left is the page footer.
///
/// Rows whose cells hold equally many texts share a pattern, so that a row takes four bytes.
class PageStructure {
public:
    /// Forgets everything.
    void clear();

    /// The next texts of a page belong to a cell.
    void beginCell(int field) { row_.push_back({ static_cast<std::uint32_t>(field), 0 }); }

    /// A text is recorded on a page.
    void addText(int page);

    /// The cells begun so far were the titles.
    void endTitles(int page);

    /// The cells begun so far were a row.
    void endRow(int page);

    /// Whether the page has titles or rows; else nothing is known of its texts.
    bool isTable(int page) const;

    /// Texts in front of titles and rows.
    std::uint32_t headerTexts(int page) const { return part(page).headerTexts; }

    /// The cells of the titles; empty: the page has none.
    std::span<const CellTexts> titles(int page) const { return pattern(part(page).titles); }

    std::size_t rowCount(int page) const { return part(page).rowCount; }

    /// The cells of a row of a page, from 0.
    std::span<const CellTexts> row(int page, std::size_t row) const
    {
        return pattern(rows_[part(page).firstRow + row]);
    }

    /// Bytes held.
    std::size_t memoryBytes() const;

private:
    struct Part {
        std::uint32_t headerTexts = 0;
        std::uint32_t titles = 0; ///< number of a pattern
        std::uint32_t firstRow = 0;
        std::uint32_t rowCount = 0;
    };

    const Part& part(int page) const;
    Part& partOf(int page);
    std::span<const CellTexts> pattern(std::uint32_t number) const { return patterns_[number]; }
    std::uint32_t takePattern();

    std::vector<Part> parts_; ///< by page
    std::vector<std::uint32_t> rows_; ///< numbers of patterns, page by page
    std::vector<std::vector<CellTexts>> patterns_ { {} }; ///< the first has no cells
    std::unordered_map<std::string, std::uint32_t> numbers_; ///< of the patterns, by their bytes
    std::uint32_t last_ = 0;
    std::vector<CellTexts> row_; ///< that is being recorded
};

} // namespace pelloric
