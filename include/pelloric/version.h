// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// The version of the library, when a host is compiled and when it runs.
///
/// @code
/// static_assert(PELLORIC_VERSION_NUMBER >= PELLORIC_VERSION_CHECK(1, 0, 0));
/// std::puts(pelloric::version());
/// @endcode

/// The version that a host is compiled with: with another one of these, hosts have to be changed.
#define PELLORIC_VERSION_MAJOR 1
/// With another one of these, there is something new.
#define PELLORIC_VERSION_MINOR 0
/// With another one of these, mistakes are mended.
#define PELLORIC_VERSION_PATCH 0

/// A version as one number that can be compared.
#define PELLORIC_VERSION_CHECK(major, minor, patch) ((major) << 16 | (minor) << 8 | (patch))

/// The version that a host is compiled with.
#define PELLORIC_VERSION_NUMBER                                                                    \
    PELLORIC_VERSION_CHECK(PELLORIC_VERSION_MAJOR, PELLORIC_VERSION_MINOR, PELLORIC_VERSION_PATCH)

/// What hosts may use of a shared library; everything else is hidden.
#if defined(_WIN32)
#define PELLORIC_EXPORT
#else
#define PELLORIC_EXPORT __attribute__((visibility("default")))
#endif

namespace pelloric {

/// The version of the library that runs: "1.0.0".
PELLORIC_EXPORT const char* version();

} // namespace pelloric
