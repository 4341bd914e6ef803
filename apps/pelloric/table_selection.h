// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"
#include "grids/table_grid.h"

namespace pelloric::app {

/// The options that say what is taken of a table, for every command that reads one.
OptionTable selectionOptions();

/// How columns are named in options, for the help of those commands.
QString namesDetails();

/// The rows and columns of a table that the options name, in their order: rows are sorted first,
/// then counted, and a column may be sorted by that is not taken.
/// @throws CommandError a column or row that the table does not have
TableGrid selected(TableGrid table, const CommandLine& line);

} // namespace pelloric::app
