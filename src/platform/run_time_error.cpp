// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/run_time_error.h"

#include "platform/numbers.h"
#include "platform/phrase.h"

namespace pelloric {

namespace {

struct ErrorRow {
    ErrorNumber number;
    TextView text;
};

constexpr ErrorRow Errors[] = {
    { ErrorNumber::InvalidCall, phraseText(u"Invalid procedure call or argument") },
    { ErrorNumber::Overflow, phraseText(u"Overflow") },
    { ErrorNumber::SubscriptOutOfRange, phraseText(u"Subscript out of range") },
    { ErrorNumber::DivisionByZero, phraseText(u"Division by zero") },
    { ErrorNumber::TypeMismatch, phraseText(u"Type mismatch") },
    { ErrorNumber::FileNotFound, phraseText(u"File not found") },
    { ErrorNumber::WriteFailed, phraseText(u"The file cannot be written") },
    { ErrorNumber::DiskFull, phraseText(u"Disk full") },
    { ErrorNumber::PermissionDenied, phraseText(u"Permission denied") },
    { ErrorNumber::ObjectMissing, phraseText(u"Object variable not set") },
    { ErrorNumber::NoSuchMember, phraseText(u"Object doesn't support this property or method") },
    { ErrorNumber::Cancelled, phraseText(u"Cancel was selected") },
};

Text describe(ErrorNumber number, TextView detail)
{
    Text text = phrase(errorText(number));
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
    return phraseText(u"Error");
}

Text noSuchItem(TextView what, std::int64_t number, std::int64_t count)
{
    return phrase(
        count == 1 ? phraseText(u"%1 %2; there is %3") : phraseText(u"%1 %2; there are %3"),
        { what, decimal(number), decimal(count) });
}

Text outsideLimits(double number, std::int64_t least, std::int64_t most)
{
    return phrase(
        u"%1 is not between %2 and %3", { formatNumber(number), decimal(least), decimal(most) });
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
    // The number's text may be one of another language; none holds a colon.
    const std::size_t colon = text_.find(u": ");
    return colon != Text::npos ? TextView(text_).substr(colon + 2) : TextView();
}

RunTimeError::~RunTimeError() = default;

} // namespace pelloric
