// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/paper_fit.h"

#include "document/page_document.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/units.h"

#include <algorithm>
#include <cmath>

namespace pelloric {

namespace {

bool isSameLength(double mm, Twips twips)
{
    return std::abs(mm - twips / TwipsPerMm) < SamePaperMm;
}

Text wholeMm(double mm) { return decimal(roundToInt32(std::clamp(mm, 0.0, 100000.0))); }

Text sizeText(double widthMm, double heightMm)
{
    return wholeMm(widthMm) + u" x " + wholeMm(heightMm) + u" mm";
}

} // namespace

bool isPaperOf(const PaperForm& paper, Twips width, Twips height)
{
    const auto [narrow, wide] = std::minmax(paper.widthMm, paper.heightMm);
    return isSameLength(narrow, std::min(width, height))
        && isSameLength(wide, std::max(width, height));
}

Text paperWarning(const PaperRequest& pages, const std::optional<PaperForm>& sheet)
{
    if (!sheet || pages.width <= 0 || pages.height <= 0)
        return {};
    if (isSameLength(sheet->widthMm, pages.width) && isSameLength(sheet->heightMm, pages.height))
        return {};
    const double width = pages.width / TwipsPerMm;
    const double height = pages.height / TwipsPerMm;
    const bool isLost
        = width > sheet->widthMm + SamePaperMm || height > sheet->heightMm + SamePaperMm;
    return phrase(isLost
            ? phraseText(
                u"The pages are %1, the printer's sheet is %2 (%3): what does not fit on it is "
                u"lost.")
            : phraseText(u"The pages are %1, the printer's sheet is %2 (%3)."),
        { sizeText(width, height), sheet->name, sizeText(sheet->widthMm, sheet->heightMm) });
}

} // namespace pelloric
