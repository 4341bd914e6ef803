// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/progress.h"

#include "platform/run_time_error.h"

namespace pelloric {

void tell(const Progress& progress, std::int64_t done, std::int64_t total)
{
    if (progress && !progress(done, total))
        throw RunTimeError(ErrorNumber::Cancelled);
}

} // namespace pelloric
