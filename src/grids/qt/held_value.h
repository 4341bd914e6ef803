// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/value.h"

#include <QMetaType>
#include <QString>
#include <QVariant>

namespace pelloric::qt {

/// Keeps what a `Value` borrows while the caller looks at it.
class HeldValue {
public:
    /// A variant as a value: texts, numbers, truth values, dates, null; anything else as its text.
    ///
    /// Whole numbers that a double cannot show in full are texts.
    /// @return  a text is borrowed until the next call
    Value hold(const QVariant& variant);

    /// @return  borrowed until the next call
    TextView hold(QString text);

private:
    QString text_;
};

/// A value as a variant of a type, numbers rounded half to even where the type is whole.
///
/// @param type  what the receiver takes; the type of QVariant itself takes anything
/// @throws RunTimeError Overflow: outside a whole type's range; TypeMismatch
QVariant toVariant(const Value& value, QMetaType type);

} // namespace pelloric::qt
