// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

#include <QString>
#include <QVariant>

#include <memory>

class QObject;

namespace pelloric::qt {

/// An argument as 16 bits, rounded half to even; a text must be a number as a whole.
/// @throws RunTimeError Overflow: outside the range; TypeMismatch: no number
std::int16_t toInt16(const QVariant& argument);

/// An argument as 32 bits, like `toInt16`.
std::int32_t toInt32(const QVariant& argument);

/// An argument as a single-precision number.
/// @throws RunTimeError Overflow: past its range; TypeMismatch: no number
float toSingle(const QVariant& argument);

/// An argument as a truth value: a number other than 0, or the text "True" or "False".
/// @throws RunTimeError TypeMismatch: anything else
bool toTruth(const QVariant& argument);

/// An argument as a text: a text as it stands, a number in general form, "True" or "False".
/// @throws RunTimeError TypeMismatch: anything else
QString toPlainText(const QVariant& argument);

/// The grid that an argument is: an object of the program or of a script.
///
/// @param control  whose member it was handed to
/// @throws RunTimeError TypeMismatch: no object; ObjectMissing: an object that is gone or null
std::unique_ptr<AutomationObject> toGrid(const QVariant& argument, const QObject& control);

} // namespace pelloric::qt
