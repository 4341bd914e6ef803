// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

namespace pelloric::qt {

/// Lets scripts of any engine in the process use the controls: their objects are grids, and errors
/// of a member are thrown in the script instead of shown in a box.
///
/// A host that gives its own engine a control calls this first; `ScriptHost` does so itself.
void letScriptsCall();

} // namespace pelloric::qt
