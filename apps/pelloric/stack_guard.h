// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

namespace pelloric::app {

/// Makes room for a script that the engine reads and converts by recursion. One that is nested
/// deeper ends the program with a line of words and the status `Failed`.
void guardStack();

} // namespace pelloric::app
