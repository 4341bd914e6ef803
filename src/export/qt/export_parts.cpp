// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/export_parts.h"

#include "document/page_document.h"
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
        throw RunTimeError(ErrorNumber::Overflow, u"the paper is no size that can be written");
}

std::vector<int> pagesOf(const PageDocument& document, const ExportOptions& options)
{
    std::vector<int> pages = options.pages;
    if (pages.empty()) {
        pages.resize(static_cast<std::size_t>(
            std::clamp<int>(document.Totalpages, 0, document.pageCount())));
        std::iota(pages.begin(), pages.end(), 0);
    }
    const auto isMissing = [&](int page) { return !document.hasPage(page); };
    if (pages.empty() || std::ranges::any_of(pages, isMissing))
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange, u"there is no such page");
    return pages;
}

void tell(const ExportOptions& options, std::size_t done, std::size_t total)
{
    if (options.progress && !options.progress(static_cast<int>(done), static_cast<int>(total)))
        throw RunTimeError(ErrorNumber::Cancelled);
}

} // namespace pelloric::qt
