// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "platform/units.h"

#include <cstddef>
#include <cstdint>
#include <iterator>
#include <span>
#include <vector>

namespace pelloric {

/// A line of a page; the pen is the document's, by number.
struct LineRecord {
    Tpoint pt1; ///< twips
    Tpoint pt2; ///< twips
    std::uint32_t pen = 0;

    bool operator==(const LineRecord&) const = default;
};

/// A text of a page: a view into a text store; the style is the document's, by number.
struct TextRecord {
    Tpoint pt; ///< twips
    const char16_t* units = nullptr;
    std::uint32_t length = 0;
    std::uint32_t style = 0;

    TextView text() const { return TextView(units, length); }
};

/// A line of a row of a table; rows of one pattern differ in nothing but top and bottom.
struct PatternLine {
    Twips x1 = 0; ///< twips
    Twips x2 = 0; ///< twips
    bool startsAtBottom = false; ///< of the row; else at its top
    bool endsAtBottom = false; ///< of the row; else at its top
    std::uint32_t pen = 0;

    /// The line in a row that lies there.
    LineRecord in(Twips top, Twips bottom) const
    {
        return { { x1, startsAtBottom ? bottom : top }, { x2, endsAtBottom ? bottom : top }, pen };
    }

    bool operator==(const PatternLine&) const = default;
};

/// The line patterns of a document, by number.
class LinePatterns {
public:
    /// @param lines  in the order in which they are drawn
    /// @return       the number of the pattern
    std::uint32_t add(std::span<const PatternLine> lines);

    std::span<const PatternLine> operator[](std::uint32_t pattern) const
    {
        const std::size_t start = pattern == 0 ? 0 : ends_[pattern - 1];
        return std::span(lines_).subspan(start, ends_[pattern] - start);
    }

    std::size_t memoryBytes() const;

private:
    std::vector<PatternLine> lines_; ///< of all patterns
    std::vector<std::size_t> ends_; ///< where each pattern ends among them
};

/// The lines of a page in recorded order: rows by their pattern, 12 bytes each, others one by one.
class LineList {
public:
    void append(const LineRecord& line);

    /// Appends all lines of a pattern.
    /// @param lines  how many the pattern has, at least 1
    void appendRow(Twips top, Twips bottom, std::uint32_t pattern, std::size_t lines);

    std::size_t size() const { return size_; }

    /// Makes room for as many lines as another page has.
    void reserveLike(const LineList& other);
    void shrinkToFit();
    std::size_t memoryBytes() const;

private:
    friend class LineRange;

    static constexpr std::uint32_t Singles = 0xFFFFFFFFU; ///< stands for lines without a pattern

    /// A row; or lines one by one, where the first of them and their number stand for top and
    /// bottom.
    struct Group {
        Twips top = 0;
        Twips bottom = 0;
        std::uint32_t pattern = 0;
    };

    std::vector<Group> groups_;
    std::vector<LineRecord> singles_;
    std::size_t size_ = 0;
};

/// The lines of a page, to be walked in recorded order; valid until the page changes.
class LineRange {
public:
    class Iterator {
    public:
        using iterator_category = std::input_iterator_tag;
        using value_type = LineRecord;
        using difference_type = std::ptrdiff_t;
        using pointer = void;
        using reference = LineRecord; ///< a value; nothing of the page is referred to

        Iterator(const LineRange& range, std::size_t group)
            : range_(&range)
            , group_(group)
        {
        }

        LineRecord operator*() const { return range_->lineOf(group_, line_); }

        Iterator& operator++()
        {
            if (++line_ == range_->linesOf(group_)) {
                ++group_;
                line_ = 0;
            }
            return *this;
        }

        Iterator operator++(int)
        {
            const Iterator before = *this;
            ++*this;
            return before;
        }

        bool operator==(const Iterator& other) const
        {
            return group_ == other.group_ && line_ == other.line_;
        }

    private:
        const LineRange* range_;
        std::size_t group_;
        std::size_t line_ = 0;
    };

    /// @param list      borrowed
    /// @param patterns  borrowed
    LineRange(const LineList& list, const LinePatterns& patterns)
        : list_(&list)
        , patterns_(&patterns)
    {
    }

    Iterator begin() const { return { *this, 0 }; }
    Iterator end() const { return { *this, list_->groups_.size() }; }
    std::size_t size() const { return list_->size(); }
    bool empty() const { return size() == 0; }
    /// Walks there.
    LineRecord operator[](std::size_t index) const;
    LineRecord back() const { return (*this)[size() - 1]; }

private:
    std::size_t linesOf(std::size_t group) const;
    LineRecord lineOf(std::size_t group, std::size_t line) const;

    const LineList* list_;
    const LinePatterns* patterns_;
};

/// The texts of a page in recorded order: 8 bytes each, and 24 for every run of texts of one style
/// that begin at one height and lie near each other in a text store.
class TextList {
public:
    void append(const TextRecord& text)
    {
        if (!continuesRun(text))
            startRun(text);
        entries_.push_back({ placeInRun(text), text.pt.x });
    }

    std::size_t size() const { return entries_.size(); }

    /// Makes room for as many texts as another page has.
    void reserveLike(const TextList& other);
    void shrinkToFit();
    std::size_t memoryBytes() const;

private:
    friend class TextRange;

    static constexpr std::uint32_t PlaceBits = 16; ///< of the start of a text in its run
    static constexpr std::uint32_t LengthMask = (1U << PlaceBits) - 1;

    struct Run {
        const char16_t* base = nullptr;
        Twips y = 0;
        std::uint32_t style = 0;
        std::uint32_t first = 0; ///< of its texts
        bool isLong = false; ///< one text; its place is its length
    };

    struct Entry {
        std::uint32_t place = 0; ///< start in the run's store, and length
        Twips x = 0;
    };

    /// How far behind the start of the last run a text lies: code units; large when it lies before.
    std::uintptr_t distance(const TextRecord& text) const
    {
        const auto from = reinterpret_cast<std::uintptr_t>(runs_.back().base);
        return (reinterpret_cast<std::uintptr_t>(text.units) - from) / sizeof(char16_t);
    }

    bool continuesRun(const TextRecord& text) const
    {
        if (runs_.empty())
            return false;
        const Run& run = runs_.back();
        return run.y == text.pt.y && run.style == text.style && !run.isLong
            && text.length <= LengthMask && distance(text) <= LengthMask;
    }

    std::uint32_t placeInRun(const TextRecord& text) const
    {
        if (runs_.back().isLong)
            return text.length;
        return (static_cast<std::uint32_t>(distance(text)) << PlaceBits) | text.length;
    }

    void startRun(const TextRecord& text);

    std::vector<Run> runs_;
    std::vector<Entry> entries_;
};

/// The texts of a page, to be walked in recorded order; valid until the page changes.
class TextRange {
public:
    class Iterator {
    public:
        using iterator_category = std::input_iterator_tag;
        using value_type = TextRecord;
        using difference_type = std::ptrdiff_t;
        using pointer = void;
        using reference = TextRecord; ///< a value; nothing of the page is referred to

        Iterator(const TextList& list, std::size_t run, std::size_t text)
            : list_(&list)
            , run_(run)
            , text_(text)
        {
        }

        TextRecord operator*() const { return textOf(*list_, run_, text_); }

        Iterator& operator++()
        {
            ++text_;
            if (run_ + 1 < list_->runs_.size() && list_->runs_[run_ + 1].first == text_)
                ++run_;
            return *this;
        }

        Iterator operator++(int)
        {
            const Iterator before = *this;
            ++*this;
            return before;
        }

        bool operator==(const Iterator& other) const { return text_ == other.text_; }

    private:
        const TextList* list_;
        std::size_t run_;
        std::size_t text_;
    };

    /// @param list  borrowed
    explicit TextRange(const TextList& list)
        : list_(&list)
    {
    }

    Iterator begin() const { return { *list_, 0, 0 }; }
    Iterator end() const { return { *list_, list_->runs_.size(), list_->size() }; }
    std::size_t size() const { return list_->size(); }
    bool empty() const { return size() == 0; }
    TextRecord operator[](std::size_t index) const;
    TextRecord back() const { return (*this)[size() - 1]; }

private:
    static TextRecord textOf(const TextList& list, std::size_t run, std::size_t text);

    const TextList* list_;
};

inline std::size_t LineRange::linesOf(std::size_t group) const
{
    const LineList::Group& lines = list_->groups_[group];
    return lines.pattern == LineList::Singles ? static_cast<std::size_t>(lines.bottom)
                                              : (*patterns_)[lines.pattern].size();
}

inline LineRecord LineRange::lineOf(std::size_t group, std::size_t line) const
{
    const LineList::Group& lines = list_->groups_[group];
    if (lines.pattern == LineList::Singles)
        return list_->singles_[static_cast<std::size_t>(lines.top) + line];
    return (*patterns_)[lines.pattern][line].in(lines.top, lines.bottom);
}

inline TextRecord TextRange::textOf(const TextList& list, std::size_t run, std::size_t text)
{
    const TextList::Run& shared = list.runs_[run];
    const TextList::Entry& entry = list.entries_[text];
    TextRecord record { { entry.x, shared.y }, shared.base, entry.place, shared.style };
    if (!shared.isLong) {
        record.units += entry.place >> TextList::PlaceBits;
        record.length = entry.place & TextList::LengthMask;
    }
    return record;
}

} // namespace pelloric
