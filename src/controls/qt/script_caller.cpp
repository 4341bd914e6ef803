// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/script_caller.h"

namespace pelloric::qt {

namespace {

const ScriptCaller* callerInUse = nullptr;

} // namespace

const ScriptCaller* scriptCaller() { return callerInUse; }

void useScriptCaller(const ScriptCaller& caller) { callerInUse = &caller; }

} // namespace pelloric::qt
