// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/run_time_error.h"

namespace pelloric {

namespace {

struct ErrorRow {
    ErrorNumber number;
    TextView text;
};

constexpr ErrorRow Errors[] = {
    { ErrorNumber::InvalidCall, u"Invalid procedure call or argument" },
    { ErrorNumber::Overflow, u"Overflow" },
    { ErrorNumber::SubscriptOutOfRange, u"Subscript out of range" },
    { ErrorNumber::DivisionByZero, u"Division by zero" },
    { ErrorNumber::TypeMismatch, u"Type mismatch" },
    { ErrorNumber::FileNotFound, u"File not found" },
    { ErrorNumber::WriteFailed, u"The file cannot be written" },
    { ErrorNumber::ObjectMissing, u"Object variable not set" },
    { ErrorNumber::NoSuchMember, u"Object doesn't support this property or method" },
    { ErrorNumber::Cancelled, u"Cancel was selected" },
};

Text describe(ErrorNumber number, TextView detail)
{
    Text text(errorText(number));
    if (!detail.empty())
        text.append(u": ").append(detail);
    return text;
}

} // namespace

TextView errorText(ErrorNumber number)
{
    for (const ErrorRow& row : Errors) {
        if (row.number == number)
            return row.text;
    }
    return u"Error";
}

RunTimeError::RunTimeError(ErrorNumber number)
    : RunTimeError(number, {})
{
}

RunTimeError::RunTimeError(ErrorNumber number, TextView detail)
    : std::runtime_error(toUtf8(describe(number, detail)))
    , number_(number)
    , text_(describe(number, detail))
{
}

} // namespace pelloric
