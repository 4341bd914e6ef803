// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

#include <pelloric/version.h>

#include <QVariant>

#include <memory>

class QObject;

namespace pelloric {

class RunTimeError;

} // namespace pelloric

namespace pelloric::qt {

/// What the controls ask about callers that are scripts; without one no caller is a script.
///
/// The controls know no script engine: whoever brings one puts its knowledge in.
class ScriptCaller {
public:
    virtual ~ScriptCaller() = default;

    /// Whether an argument is a value of a script.
    virtual bool isScriptValue(const QVariant& argument) const = 0;

    /// A script's value as the plain variant it stands for.
    virtual QVariant plainValue(const QVariant& argument) const = 0;

    /// The object that a script's value is.
    /// @param control  whose member it was handed to
    /// @throws RunTimeError ObjectMissing: the value is no object, or one that is gone
    virtual std::unique_ptr<AutomationObject> object(
        const QVariant& argument, const QObject& control) const = 0;

    /// Throws an error into the script that called a control.
    /// @return  false: the control belongs to no script, nothing has been done
    virtual bool raise(const QObject& control, const RunTimeError& error) const = 0;
};

/// The one in use; null where there is none.
const ScriptCaller* scriptCaller();

/// Exported for the component `script`.
/// @param caller  kept for the rest of the process
PELLORIC_EXPORT void useScriptCaller(const ScriptCaller& caller);

} // namespace pelloric::qt
