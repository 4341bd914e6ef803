// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/value.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <cstdio>

namespace pelloric {

namespace {

constexpr std::int64_t SecondMs = 1000;
constexpr std::int64_t DayMs = 24 * 60 * 60 * SecondMs;

struct CivilDate {
    std::int64_t year;
    int month;
    int day;
};

/// Days since 1970-01-01 as a date of the Gregorian calendar, carried back without end.
CivilDate civilDate(std::int64_t days)
{
    const std::int64_t shifted = days + 719468; // days since 0000-03-01
    const std::int64_t era = (shifted >= 0 ? shifted : shifted - 146096) / 146097;
    const std::int64_t dayOfEra = shifted - era * 146097;
    const std::int64_t yearOfEra
        = (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
    const std::int64_t dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
    const std::int64_t monthFromMarch = (5 * dayOfYear + 2) / 153;
    const auto day = static_cast<int>(dayOfYear - (153 * monthFromMarch + 2) / 5 + 1);
    const auto month
        = static_cast<int>(monthFromMarch < 10 ? monthFromMarch + 3 : monthFromMarch - 9);
    return { yearOfEra + era * 400 + (month <= 2 ? 1 : 0), month, day };
}

Text formatDate(double milliseconds)
{
    const auto whole = static_cast<std::int64_t>(milliseconds);
    std::int64_t days = whole / DayMs;
    std::int64_t rest = whole % DayMs;
    if (rest < 0) {
        rest += DayMs;
        --days;
    }
    const CivilDate date = civilDate(days);
    const auto seconds = static_cast<int>(rest / SecondMs);
    char buffer[64];
    int length = std::snprintf(buffer, sizeof buffer, "%04lld-%02d-%02d",
        static_cast<long long>(date.year), date.month, date.day);
    if (seconds != 0) {
        length = std::snprintf(buffer, sizeof buffer, "%04lld-%02d-%02d %02d:%02d:%02d",
            static_cast<long long>(date.year), date.month, date.day, seconds / 3600,
            seconds / 60 % 60, seconds % 60);
    }
    return { buffer, buffer + length };
}

} // namespace

Value Value::ofNumber(double number)
{
    Value value;
    value.kind_ = ValueKind::Number;
    value.number_ = number;
    return value;
}

Value Value::ofTruth(bool truth)
{
    Value value;
    value.kind_ = ValueKind::Truth;
    value.number_ = truth ? -1 : 0;
    return value;
}

Value Value::ofDate(std::int64_t milliseconds)
{
    Value value;
    value.kind_ = ValueKind::Date;
    value.number_ = static_cast<double>(milliseconds);
    return value;
}

Value Value::ofText(TextView text)
{
    Value value;
    value.kind_ = ValueKind::Text;
    value.text_ = text.data();
    value.length_ = text.size();
    return value;
}

Value Value::ofObject(AutomationObject& object)
{
    Value value;
    value.kind_ = ValueKind::Object;
    value.borrowed_ = &object;
    return value;
}

Value Value::ofRows(RowSet& rows)
{
    Value value;
    value.kind_ = ValueKind::Rows;
    value.borrowed_ = &rows;
    return value;
}

double Value::toNumber() const
{
    switch (kind_) {
    case ValueKind::Text:
        return leadingNumber(text());
    case ValueKind::Object:
    case ValueKind::Rows:
        throw RunTimeError(ErrorNumber::TypeMismatch, phrase(u"an object is no number"));
    case ValueKind::Null:
    case ValueKind::Truth:
    case ValueKind::Number:
    case ValueKind::Date:
        break;
    }
    return number_;
}

AutomationObject& Value::toObject() const
{
    if (kind_ != ValueKind::Object)
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"an object was expected"));
    return *static_cast<AutomationObject*>(borrowed_);
}

RowSet& Value::toRows() const
{
    if (kind_ != ValueKind::Rows)
        throw RunTimeError(ErrorNumber::TypeMismatch, phrase(u"a row set was expected"));
    return *static_cast<RowSet*>(borrowed_);
}

TextView displayText(const Value& value, char16_t separator, Text& buffer)
{
    switch (value.kind()) {
    case ValueKind::Text:
        return value.text();
    case ValueKind::Number:
        buffer = formatNumber(value.number(), separator);
        return buffer;
    case ValueKind::Truth:
        return value.number() != 0 ? TextView(u"True") : TextView(u"False");
    case ValueKind::Date:
        buffer = formatDate(value.number());
        return buffer;
    case ValueKind::Null:
        return {};
    case ValueKind::Object:
    case ValueKind::Rows:
        throw RunTimeError(ErrorNumber::TypeMismatch, phrase(u"an object has no text"));
    }
    return {};
}

} // namespace pelloric
