// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>
#include <vector>

namespace pelloric {

class PageDocument;

/// A place where a searched text occurs on a page.
struct TextMatch {
    std::size_t text = 0; ///< index of the text on its page
    std::size_t begin = 0; ///< of the text as it is shown: code units
    std::size_t length = 0; ///< code units

    bool operator==(const TextMatch&) const = default;
};

/// Searches the recorded texts of a document, as single pages show them: "[Pages]" is the page
/// count. Capitals and small letters are the same.
///
/// Pages are searched a few at a time, so that a window stays alive; only how often a page holds
/// the text is kept, and the places are found again when a page is looked at.
class TextSearch {
public:
    TextSearch() = default;

    /// @param document  borrowed; stays as it is until the search is given up
    /// @param searched  an empty text occurs nowhere
    TextSearch(const PageDocument& document, TextView searched);

    /// Searches some pages more. @return false: all are searched
    bool searchPages(int pages);

    bool isDone() const;

    /// How often the text was found on the pages searched so far.
    std::int64_t count() const { return count_; }

    /// How often it was found before a page.
    /// @param page  zero-based; may be the one behind the last
    std::int64_t countBefore(int page) const;

    /// How often a page holds the text; 0: it is not searched yet or does not exist.
    int countOn(int page) const;

    /// The next page that holds the text, from one on and in one direction, and from the other end
    /// again.
    /// @return  zero-based; -1: none does
    int pageWithMatch(int from, bool isForward) const;

    /// The places on a page, in the order of its texts.
    std::vector<TextMatch> matches(int page) const;

private:
    template <typename Found> void searchPage(int page, Found found) const;

    const PageDocument* document_ = nullptr;
    Text searched_; ///< in small letters
    std::vector<std::int32_t> counts_; ///< one for each page that was searched
    std::int64_t count_ = 0;
};

} // namespace pelloric
