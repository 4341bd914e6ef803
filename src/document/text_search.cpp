// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/text_search.h"

#include "document/page_document.h"

#include <algorithm>
#include <array>
#include <memory>
#include <numeric>

namespace pelloric {

namespace {

/// Capitals whose small letters follow at a distance; a step of 2 is every second of a range.
struct CaseRange {
    char16_t first;
    char16_t last;
    char16_t distance;
    char16_t step = 1;
};

constexpr auto CaseRanges = std::to_array<CaseRange>({
    { u'A', u'Z', 32 },
    { 0x00C0, 0x00D6, 32 },
    { 0x00D8, 0x00DE, 32 },
    { 0x0100, 0x0136, 1, 2 },
    { 0x0139, 0x0147, 1, 2 },
    { 0x014A, 0x0176, 1, 2 },
    { 0x0179, 0x017D, 1, 2 },
    { 0x0391, 0x03A1, 32 },
    { 0x03A3, 0x03AB, 32 },
    { 0x0400, 0x040F, 80 },
    { 0x0410, 0x042F, 32 },
    { 0x0460, 0x0480, 1, 2 },
    { 0x048A, 0x04BE, 1, 2 },
    { 0x0531, 0x0556, 48 },
    { 0x1E00, 0x1E94, 1, 2 },
    { 0x1EA0, 0x1EFE, 1, 2 },
    { 0xFF21, 0xFF3A, 32 },
});

using SmallLetters = std::array<char16_t, 65536>;

std::unique_ptr<const SmallLetters> makeSmallLetters()
{
    auto letters = std::make_unique<SmallLetters>();
    std::iota(letters->begin(), letters->end(), char16_t { 0 });
    for (const CaseRange& range : CaseRanges) {
        for (unsigned letter = range.first; letter <= range.last; letter += range.step)
            (*letters)[letter] = static_cast<char16_t>(letter + range.distance);
    }
    return letters;
}

const SmallLetters& smallLetters()
{
    static const std::unique_ptr<const SmallLetters> letters = makeSmallLetters();
    return *letters;
}

/// The next place of a text in another, or its length.
std::size_t findFrom(
    TextView text, TextView searched, std::size_t from, const SmallLetters& letters)
{
    if (searched.size() > text.size())
        return text.size();
    const std::size_t last = text.size() - searched.size();
    const char16_t first = searched.front();
    for (std::size_t begin = from; begin <= last; ++begin) {
        if (letters[text[begin]] != first)
            continue;
        std::size_t same = 1;
        while (same < searched.size() && letters[text[begin + same]] == searched[same])
            ++same;
        if (same == searched.size())
            return begin;
    }
    return text.size();
}

} // namespace

TextSearch::TextSearch(const PageDocument& document, TextView searched)
    : document_(&document)
    , searched_(searched)
{
    for (char16_t& unit : searched_)
        unit = smallLetters()[unit];
    if (!searched_.empty())
        counts_.reserve(static_cast<std::size_t>(document.pageCount()));
}

template <typename Found> void TextSearch::searchPage(int page, Found found) const
{
    const SmallLetters& letters = smallLetters();
    Text buffer;
    std::size_t index = 0;
    for (const TextRecord& record : document_->texts(page)) {
        TextView text = record.text();
        if (text.find(u'[') != TextView::npos)
            text = withPageCount(text, document_->Totalpages, buffer);
        for (std::size_t at = findFrom(text, searched_, 0, letters); at < text.size();
             at = findFrom(text, searched_, at + searched_.size(), letters))
            found(TextMatch { index, at, searched_.size() });
        ++index;
    }
}

bool TextSearch::searchPages(int pages)
{
    for (; pages > 0 && !isDone(); --pages) {
        std::int32_t found = 0;
        searchPage(static_cast<int>(counts_.size()), [&](const TextMatch&) { ++found; });
        counts_.push_back(found);
        count_ += found;
    }
    return !isDone();
}

bool TextSearch::isDone() const
{
    return document_ == nullptr || searched_.empty()
        || counts_.size() >= static_cast<std::size_t>(document_->pageCount());
}

std::int64_t TextSearch::countBefore(int page) const
{
    const auto last = std::clamp<std::ptrdiff_t>(page, 0, std::ssize(counts_));
    return std::accumulate(counts_.begin(), counts_.begin() + last, std::int64_t { 0 });
}

int TextSearch::countOn(int page) const
{
    return page < 0 || page >= std::ssize(counts_) ? 0 : counts_[static_cast<std::size_t>(page)];
}

int TextSearch::pageWithMatch(int from, bool isForward) const
{
    const int pages = static_cast<int>(counts_.size());
    for (int passed = 0; passed < pages; ++passed) {
        const int page = ((isForward ? from + passed : from - passed) % pages + pages) % pages;
        if (countOn(page) > 0)
            return page;
    }
    return -1;
}

std::vector<TextMatch> TextSearch::matches(int page) const
{
    std::vector<TextMatch> found;
    if (document_ != nullptr && !searched_.empty() && document_->hasPage(page))
        searchPage(page, [&](const TextMatch& match) { found.push_back(match); });
    return found;
}

} // namespace pelloric
