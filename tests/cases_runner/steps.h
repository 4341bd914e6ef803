// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "json.h"

namespace pelloric::cases {

class World;

/// Takes one step: [name, argument, ...].
///
/// @return  the step's result; an error of the library is an object that names its kind
/// Throws `std::exception` for a step that is unknown or has other arguments.
Json takeStep(World& world, const Json& step);

/// Dumps a section of the end state. Throws `std::exception` for an unknown one.
Json dumpSection(World& world, const std::string& name);

} // namespace pelloric::cases
