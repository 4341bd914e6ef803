// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>

namespace pelloric {

class AutomationObject;
class RowSet;

/// What a `Value` holds.
enum class ValueKind : std::uint8_t { Null, Truth, Number, Date, Text, Object, Rows };

/// A variant as late-bound members take and answer it: small, copied freely, never allocating.
///
/// A text, an object and a row set are borrowed: they stay valid until the next call on the object
/// that answered them.
class Value {
public:
    /// The null value.
    Value() = default;

    static Value ofNumber(double number);
    static Value ofTruth(bool truth);
    /// @param milliseconds  since 1970-01-01 00:00 of the local calendar
    static Value ofDate(std::int64_t milliseconds);
    static Value ofText(TextView text);
    static Value ofObject(AutomationObject& object);
    static Value ofRows(RowSet& rows);

    ValueKind kind() const { return kind_; }

    /// The number of a number, a truth value (-1 or 0) or a date (milliseconds); else 0.
    double number() const { return number_; }

    /// The text of a text, else the empty text.
    TextView text() const { return TextView(text_, length_); }

    /// A number, or the leading number of a text; null is 0.
    /// @throws RunTimeError TypeMismatch: an object or a row set
    double toNumber() const;

    /// The object that is held.
    /// @throws RunTimeError ObjectMissing: anything else is held
    AutomationObject& toObject() const;

    /// The row set that is held.
    /// @throws RunTimeError TypeMismatch: anything else is held
    RowSet& toRows() const;

private:
    double number_ = 0;
    const char16_t* text_ = nullptr;
    std::size_t length_ = 0;
    void* borrowed_ = nullptr; ///< the object or the row set
    ValueKind kind_ = ValueKind::Null;
};

/// A value as it is printed: a text as it stands, null as the empty text, a number in general
/// form, "True" or "False", a date as YYYY-MM-DD with the time behind it unless it is midnight.
///
/// @param separator  of whole part and fraction
/// @param buffer     holds what had to be formatted; the result may be a view into it
/// @return           valid as long as the value's text and the buffer
TextView displayText(const Value& value, char16_t separator, Text& buffer);

} // namespace pelloric
