// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/held_value.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QDateTime>

#include <limits>

namespace pelloric::qt {

namespace {

/// From here on the general form of a number has an exponent and loses digits.
constexpr qint64 LongestNumber = 1'000'000'000'000'000;

std::int64_t calendarMs(const QDateTime& moment)
{
    return QDateTime(moment.date(), moment.time(), Qt::UTC).toMSecsSinceEpoch();
}

/// Rounds into the range of a whole type.
double wholeIn(double number, double smallest, double largest)
{
    const double rounded = roundHalfEven(number);
    if (!(rounded >= smallest && rounded <= largest))
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"%1 is past what the member holds", { formatNumber(number) }));
    return rounded;
}

template <typename Whole> QVariant wholeVariant(double number)
{
    using Limits = std::numeric_limits<Whole>;
    const double rounded = wholeIn(number, Limits::min(), Limits::max());
    return QVariant::fromValue(static_cast<Whole>(rounded));
}

/// The largest 64-bit number has no double; the next smaller double is taken as the limit.
QVariant longVariant(double number)
{
    constexpr double Largest = 9223372036854774784.0;
    return QVariant(static_cast<qlonglong>(wholeIn(number, -Largest, Largest)));
}

/// The variant that says what the value is.
QVariant plainVariant(const Value& value)
{
    switch (value.kind()) {
    case ValueKind::Null:
        return {};
    case ValueKind::Truth:
        return QVariant(value.number() != 0);
    case ValueKind::Number:
        return QVariant(value.number());
    case ValueKind::Date:
        return QVariant(
            QDateTime::fromMSecsSinceEpoch(static_cast<qint64>(value.number()), Qt::UTC));
    case ValueKind::Text:
        return QVariant(toQString(value.text()));
    case ValueKind::Object:
    case ValueKind::Rows:
        break;
    }
    throw RunTimeError(ErrorNumber::TypeMismatch, phrase(u"an object is no plain value"));
}

} // namespace

Value HeldValue::hold(const QVariant& variant)
{
    if (variant.isNull())
        return {};
    switch (variant.typeId()) {
    case QMetaType::QString:
        return Value::ofText(hold(variant.toString()));
    case QMetaType::Bool:
        return Value::ofTruth(variant.toBool());
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::Short:
    case QMetaType::UShort:
    case QMetaType::Char:
    case QMetaType::SChar:
    case QMetaType::UChar:
    case QMetaType::Float:
    case QMetaType::Double:
        return Value::ofNumber(variant.toDouble());
    case QMetaType::Long:
    case QMetaType::LongLong: {
        const qint64 number = variant.toLongLong();
        if (number > -LongestNumber && number < LongestNumber)
            return Value::ofNumber(static_cast<double>(number));
        return Value::ofText(hold(QString::number(number)));
    }
    case QMetaType::ULong:
    case QMetaType::ULongLong: {
        const quint64 number = variant.toULongLong();
        if (number < static_cast<quint64>(LongestNumber))
            return Value::ofNumber(static_cast<double>(number));
        return Value::ofText(hold(QString::number(number)));
    }
    case QMetaType::QDate:
        return Value::ofDate(calendarMs(variant.toDate().startOfDay(Qt::UTC)));
    case QMetaType::QDateTime:
        return Value::ofDate(calendarMs(variant.toDateTime()));
    default:
        return Value::ofText(hold(variant.toString()));
    }
}

TextView HeldValue::hold(QString text)
{
    text_ = std::move(text);
    return viewOf(text_);
}

QVariant toVariant(const Value& value, QMetaType type)
{
    switch (type.id()) {
    case QMetaType::Int:
        return wholeVariant<int>(value.toNumber());
    case QMetaType::UInt:
        return wholeVariant<unsigned>(value.toNumber());
    case QMetaType::Short:
        return wholeVariant<short>(value.toNumber());
    case QMetaType::UShort:
        return wholeVariant<unsigned short>(value.toNumber());
    case QMetaType::LongLong:
        return longVariant(value.toNumber());
    case QMetaType::Double:
        return QVariant(value.toNumber());
    case QMetaType::Float:
        return QVariant(static_cast<float>(value.toNumber()));
    case QMetaType::Bool:
        return QVariant(value.toNumber() != 0);
    default:
        break;
    }
    QVariant variant = plainVariant(value);
    if (type.id() != QMetaType::QVariant && variant.metaType() != type && !variant.convert(type))
        throw RunTimeError(ErrorNumber::TypeMismatch,
            phrase(u"\"%1\" is no %2",
                { toText(plainVariant(value).toString()), fromUtf8(type.name()) }));
    return variant;
}

} // namespace pelloric::qt
