// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/version.h>

namespace pelloric {

namespace {

constexpr int ProjectVersion = PELLORIC_VERSION_CHECK(
    PELLORIC_PROJECT_MAJOR, PELLORIC_PROJECT_MINOR, PELLORIC_PROJECT_PATCH);
static_assert(PELLORIC_VERSION_NUMBER == ProjectVersion,
    "the version of the project and of its header differ");

} // namespace

const char* version() { return PELLORIC_PROJECT_VERSION; }

} // namespace pelloric
