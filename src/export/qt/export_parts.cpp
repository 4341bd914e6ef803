// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/export_parts.h"

#include "document/page_document.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <algorithm>
#include <numeric>

namespace pelloric::qt {

namespace {

constexpr Twips LargestPaper = 288000; ///< 200 inches, which is all that a PDF page can measure

} // namespace

void checkPaper(const PageSetup& setup)
{
    const auto fits = [](Twips length) { return length > 0 && length <= LargestPaper; };
    if (!fits(setup.myWidth) || !fits(setup.myHeight))
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"paper of %1 by %2 twips cannot be written; each side is 1 to %3 twips (200 "
                   u"inches)",
                { decimal(setup.myWidth), decimal(setup.myHeight), decimal(LargestPaper) }));
}

std::vector<int> pagesOf(const PageDocument& document, const ExportOptions& options)
{
    std::vector<int> pages = options.pages;
    if (pages.empty()) {
        pages.resize(static_cast<std::size_t>(
            std::clamp<int>(document.Totalpages, 0, document.pageCount())));
        std::iota(pages.begin(), pages.end(), 0);
    }
    if (pages.empty())
        throw RunTimeError(
            ErrorNumber::SubscriptOutOfRange, phrase(u"the document has no page to write"));
    for (const int page : pages) {
        if (!document.hasPage(page))
            throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
                noSuchItem(phrase(u"page"), std::int64_t { page } + 1, document.pageCount()));
    }
    return pages;
}

} // namespace pelloric::qt
