// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

namespace pelloric::qt {

/// What the script finds besides the language itself: a function of the global object, the
/// `ScriptHost` and the script's arguments, to be called once.
///
/// It answers a function that tells the reasons of the promises that were rejected and that nobody
/// looked after, and how many promises have been settled by then.
extern const char ScriptPrelude[];

/// Stands for a file in the frames of errors.
extern const char ScriptPreludeName[];

} // namespace pelloric::qt
