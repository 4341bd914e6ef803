// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/row_set.h"

#include "platform/phrase.h"
#include "platform/run_time_error.h"

namespace pelloric {

void requireCellLength(TextView text, std::int64_t record, int field)
{
    if (text.size() <= MostCellUnits)
        return;
    throw RunTimeError(ErrorNumber::Overflow,
        phrase(u"row %1, column %2 holds %3 characters, at most %4 can be printed",
            { decimal(record), decimal(field + 1), decimal(static_cast<std::int64_t>(text.size())),
                decimal(std::int64_t { MostCellUnits }) }));
}

} // namespace pelloric
