// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/page_limit.h"

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
    Text text;
    if (rowsThatFit > 0) {
        const double part = static_cast<double>(rows) / static_cast<double>(rowsThatFit);
        text.append(u"the report needs about ")
            .append(grouped(static_cast<std::int64_t>(std::ceil(part * MostPages))))
            .append(u" pages, a document holds ")
            .append(grouped(MostPages))
            .append(u"; print rows 1 to ")
            .append(grouped(rowsThatFit));
    } else {
        text.append(u"not even the first rows fit on the ")
            .append(grouped(MostPages))
            .append(u" pages that a document holds; choose larger paper");
    }
    return text.append(u", or leave out columns");
}

} // namespace pelloric
