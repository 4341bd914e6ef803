// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QString>

namespace pelloric::app {

/// The manual page of the program, in the language of man.
QString manualPage();

/// What makes a shell complete the program's commands, options and files.
/// @param shell  "bash", "zsh" or "fish"
/// @return       empty: another shell
QString completionOf(const QString& shell);

} // namespace pelloric::app
