// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/published_values.h"

#include "controls/qt/script_caller.h"
#include "grids/qt/grid_for.h"
#include "grids/qt/held_value.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QObject>

namespace pelloric::qt {

namespace {

/// @param wanted  the phrase that says what the member takes
[[noreturn]] void refuseType(const QVariant& argument, TextView wanted)
{
    const bool isText = argument.typeId() == QMetaType::QString;
    const QString given = isText ? QStringLiteral("\"%1\"").arg(argument.toString())
                                 : QString::fromLatin1(argument.metaType().name());
    throw RunTimeError(ErrorNumber::TypeMismatch, phrase(wanted, { toText(given) }));
}

bool isScriptValue(const QVariant& argument)
{
    return scriptCaller() != nullptr && scriptCaller()->isScriptValue(argument);
}

/// What a script handed over, as a plain variant.
QVariant plain(const QVariant& argument)
{
    return isScriptValue(argument) ? scriptCaller()->plainValue(argument) : argument;
}

/// Numbers, truth values and texts; an object, a list or nothing at all is refused.
Value simple(const QVariant& argument, HeldValue& held)
{
    const QVariant value = plain(argument);
    switch (value.typeId()) {
    case QMetaType::Bool:
    case QMetaType::Char:
    case QMetaType::SChar:
    case QMetaType::UChar:
    case QMetaType::Short:
    case QMetaType::UShort:
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::Long:
    case QMetaType::ULong:
    case QMetaType::LongLong:
    case QMetaType::ULongLong:
    case QMetaType::Float:
    case QMetaType::Double:
    case QMetaType::QString:
        return held.hold(value);
    default:
        break;
    }
    if (value.metaType().flags() & QMetaType::IsEnumeration)
        return Value::ofNumber(value.toInt());
    refuseType(value, phraseText(u"%1 was given where a plain value is wanted"));
}

double numberOf(const QVariant& argument)
{
    HeldValue held;
    const Value value = simple(argument, held);
    if (value.kind() == ValueKind::Text && !isNumber(value.text()))
        refuseType(plain(argument), phraseText(u"%1 was given where a number is wanted"));
    return value.toNumber();
}

} // namespace

std::int16_t toInt16(const QVariant& argument) { return roundToInt16(numberOf(argument)); }

std::int32_t toInt32(const QVariant& argument) { return roundToInt32(numberOf(argument)); }

float toSingle(const QVariant& argument) { return pelloric::toSingle(numberOf(argument)); }

bool toTruth(const QVariant& argument)
{
    HeldValue held;
    const Value value = simple(argument, held);
    if (value.kind() == ValueKind::Text && (value.text() == u"True" || value.text() == u"False"))
        return value.text() == u"True";
    return numberOf(argument) != 0;
}

QString toPlainText(const QVariant& argument)
{
    HeldValue held;
    Text buffer;
    return toQString(displayText(simple(argument, held), u'.', buffer));
}

std::unique_ptr<AutomationObject> toGrid(const QVariant& argument, const QObject& control)
{
    if (isScriptValue(argument))
        return scriptCaller()->object(argument, control);
    const QVariant value = plain(argument);
    if (value.typeId() == QMetaType::Nullptr)
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"no grid was given"));
    if (!(value.metaType().flags() & QMetaType::PointerToQObject))
        refuseType(value, phraseText(u"%1 was given where a grid is wanted"));
    auto* const object = value.value<QObject*>();
    if (!object)
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"no grid was given"));
    return gridFor(*object);
}

} // namespace pelloric::qt
