// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/run_time_error.h"

#include "platform/numbers.h"

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
    { ErrorNumber::DiskFull, u"Disk full" },
    { ErrorNumber::PermissionDenied, u"Permission denied" },
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

Text noSuchItem(TextView what, std::int64_t number, std::int64_t count)
{
    Text text(what);
    text.append(u" ").append(decimal(number)).append(u"; there ");
    text.append(count == 1 ? TextView(u"is ") : TextView(u"are ")).append(decimal(count));
    return text;
}

Text outsideLimits(double number, std::int64_t least, std::int64_t most)
{
    Text text = formatNumber(number);
    text.append(u" is not between ").append(decimal(least));
    return text.append(u" and ").append(decimal(most));
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

std::u16string_view RunTimeError::detail() const
{
    const std::size_t plain = errorText(number_).size();
    return text_.size() > plain ? TextView(text_).substr(plain + 2) : TextView();
}

RunTimeError::~RunTimeError() = default;

} // namespace pelloric
