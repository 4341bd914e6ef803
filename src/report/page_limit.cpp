// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/page_limit.h"

#include "document/limits.h"
#include "document/page_document.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <algorithm>
#include <cmath>

namespace pelloric {

namespace {

/// So many rows are soon read, and when they were laid out it is known exactly how many fit.
constexpr std::int64_t RowsReadAnyway = 1'000'000;

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

/// A page ends behind the first row that crosses its lower limit, which lies above the margin.
std::int64_t mostRowsOnPages(const PageSetup& setup, Twips rowHeight)
{
    const std::int64_t room = std::int64_t { setup.myHeight } - setup.intButtom - setup.intTop;
    return MostPages * (std::max<std::int64_t>(0, room) / rowHeight + 1);
}

void requireRowsToFit(std::int64_t rows, std::int64_t most)
{
    if (rows > std::max(most, RowsReadAnyway))
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"the grid has %1 rows; the %2 pages that a document holds take %3 of them at "
                   u"most, so print fewer rows",
                { grouped(rows), grouped(MostPages), grouped(most) }));
}

} // namespace pelloric
