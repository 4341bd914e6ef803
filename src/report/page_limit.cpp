// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/page_limit.h"

#include "platform/phrase.h"

#include <cmath>

namespace pelloric {

namespace {

/// "1,440,000".
Text grouped(std::int64_t number)
{
    Text text = decimal(number);
    for (std::size_t end = text.size(); end > 3; end -= 3)
        text.insert(end - 3, 1, u',');
    return text;
}

} // namespace

Text tooManyPages(std::int64_t rowsThatFit, std::int64_t rows)
{
    if (rowsThatFit > 0) {
        const double part = static_cast<double>(rows) / static_cast<double>(rowsThatFit);
        return phrase(
            u"the report needs about %1 pages, a document holds %2; print rows 1 to %3, or "
            u"leave out columns",
            { grouped(static_cast<std::int64_t>(std::ceil(part * MostPages))), grouped(MostPages),
                grouped(rowsThatFit) });
    }
    return phrase(
        u"not even the first rows fit on the %1 pages that a document holds; choose larger "
        u"paper, or leave out columns",
        { grouped(MostPages) });
}

} // namespace pelloric
