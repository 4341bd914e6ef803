// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/row_set.h"

#include "platform/run_time_error.h"

namespace pelloric {

void requireCellLength(TextView text, std::int64_t record, int field)
{
    if (text.size() <= MostCellUnits)
        return;
    throw RunTimeError(ErrorNumber::Overflow,
        u"row " + decimal(record) + u", column " + decimal(field + 1) + u" holds "
            + decimal(static_cast<std::int64_t>(text.size())) + u" characters, at most "
            + decimal(std::int64_t { MostCellUnits }) + u" can be printed");
}

} // namespace pelloric
