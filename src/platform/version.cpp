// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/version.h>

namespace pelloric {

static_assert(PELLORIC_VERSION_MAJOR == PELLORIC_PROJECT_MAJOR
        && PELLORIC_VERSION_MINOR == PELLORIC_PROJECT_MINOR
        && PELLORIC_VERSION_PATCH == PELLORIC_PROJECT_PATCH,
    "the version of the project and of its header differ");

const char* version() { return PELLORIC_PROJECT_VERSION; }

} // namespace pelloric
