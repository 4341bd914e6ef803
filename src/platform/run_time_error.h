// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstdint>
#include <stdexcept>

namespace pelloric {

/// Every number that a `RunTimeError` carries.
enum class ErrorNumber {
    InvalidCall = 5,
    Overflow = 6,
    SubscriptOutOfRange = 9,
    DivisionByZero = 11,
    TypeMismatch = 13,
    FileNotFound = 53,
    WriteFailed = 57,
    DiskFull = 61,
    PermissionDenied = 70,
    ObjectMissing = 91,
    NoSuchMember = 438,
    Cancelled = 32755,
};

/// The plain English text of an error number, without a full stop.
TextView errorText(ErrorNumber number);

/// "page 9; there are 5": the detail of an error about something that is not there.
///
/// @param what    in the singular, as a person calls it
/// @param number  as a person counts it
Text noSuchItem(TextView what, std::int64_t number, std::int64_t count);

/// "40000 is not between -32768 and 32767": the detail of an error about a number past a limit.
Text outsideLimits(double number, std::int64_t least, std::int64_t most);

/// "1e+60 is past what a single-precision number holds".
Text pastSingle(double number);

/// What the core throws; nothing else leaves it on purpose.
class RunTimeError : public std::runtime_error {
public:
    /// An error with the plain text of its number.
    explicit RunTimeError(ErrorNumber number);

    /// @param detail  what went wrong, for a person: names the member, the file or the value
    RunTimeError(ErrorNumber number, TextView detail);

    /// The number, from the one list.
    ErrorNumber number() const { return number_; }

    /// What a message box shows: the number's text, then ": " and the detail when there is one.
    const Text& text() const { return text_; }

    /// What stands behind the number's text; empty when there is nothing more to say.
    TextView detail() const;

private:
    ErrorNumber number_;
    Text text_;
};

} // namespace pelloric
