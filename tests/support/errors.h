// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/run_time_error.h"

#include <functional>
#include <optional>

namespace pelloric {

/// The number of the error that an action throws; nothing when it throws none.
inline std::optional<ErrorNumber> errorOf(const std::function<void()>& action)
{
    try {
        action();
    } catch (const RunTimeError& error) {
        return error.number();
    }
    return std::nullopt;
}

} // namespace pelloric
