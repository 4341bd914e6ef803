// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"

#include <pelloric/options.h>

namespace pelloric::app {

/// The options that arrange rows and columns on pages.
OptionTable shapeOptions();

/// The first of these options that was given, or null.
const char* firstShapeOption(const CommandLine& line);

/// What the options ask for; everything is off that was not given.
/// @throws CommandError a value that is none
ReportOptions shapeOf(const CommandLine& line);

} // namespace pelloric::app
