// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "script/qt/script_object.h"

#include "grids/qt/grid_for.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QDateTime>
#include <QJSManagedValue>
#include <QJSValueList>

namespace pelloric::qt {

namespace {

/// Collections whose items count from 1, whatever the script's arrays do.
bool countsFromOne(const QString& name)
{
    return name == QLatin1String("ColumnHeaders") || name == QLatin1String("ListItems");
}

QJSValue toScript(const Value& value)
{
    switch (value.kind()) {
    case ValueKind::Text:
        return toQString(value.text());
    case ValueKind::Number:
    case ValueKind::Date:
        return value.number();
    case ValueKind::Truth:
        return value.number() != 0;
    case ValueKind::Null:
        return QJSValue(QJSValue::NullValue);
    case ValueKind::Object:
    case ValueKind::Rows:
        break;
    }
    throw RunTimeError(ErrorNumber::TypeMismatch,
        phrase(u"an object of the library cannot be handed to a script's grid"));
}

bool isPlain(const QJSValue& value)
{
    return value.isBool() || value.isNumber() || value.isString() || value.isVariant();
}

/// What a script's own function threw goes on as an error of the object's.
[[noreturn]] void refuse(const QJSValue& thrown)
{
    QString text = thrown.toString();
    if (thrown.isError())
        text += QStringLiteral(" (line %1)")
                    .arg(thrown.property(QStringLiteral("lineNumber")).toString());
    throw RunTimeError(ErrorNumber::InvalidCall, toText(text));
}

const QJSValue& checked(const QJSValue& result)
{
    if (result.isError())
        refuse(result);
    return result;
}

} // namespace

ScriptObject::ScriptObject(QJSValue value, QJSEngine* engine, int firstItem)
    : value_(std::move(value))
    , engine_(engine)
    , firstItem_(firstItem)
{
}

ScriptObject::~ScriptObject() = default;

std::optional<MemberId> ScriptObject::findMember(TextView name)
{
    const QString wanted = toQString(name);
    for (std::size_t id = 0; id < members_.size(); ++id) {
        if (members_[id]->name == wanted)
            return static_cast<MemberId>(id);
    }
    const bool ofArray
        = value_.isArray() && (wanted == QLatin1String("Count") || wanted == QLatin1String("Item"));
    if (!ofArray && !value_.hasProperty(wanted))
        return std::nullopt;
    auto member = std::make_unique<Member>();
    member->name = wanted;
    const QJSValue property = propertyOf(*member);
    if (property.isCallable())
        member->function = property;
    members_.push_back(std::move(member));
    return static_cast<MemberId>(members_.size() - 1);
}

Value ScriptObject::get(MemberId member, std::span<const Value> arguments)
{
    Member& named = *members_.at(static_cast<std::size_t>(member));
    if (value_.isArray() && !value_.hasProperty(named.name))
        return arrayMember(named, arguments);
    if (named.function.isCallable())
        return answer(named, call(named, arguments, nullptr));
    QJSValue result = propertyOf(named);
    if (!arguments.empty())
        result = itemAt(result, arguments.front(), countsFromOne(named.name) ? 1 : 0);
    for (const Value& index : arguments.subspan(arguments.empty() ? 0 : 1))
        result = itemAt(result, index, 0);
    return answer(named, result);
}

void ScriptObject::put(MemberId member, std::span<const Value> arguments, const Value& value)
{
    const Member& named = *members_.at(static_cast<std::size_t>(member));
    if (named.function.isCallable()) {
        checked(call(named, arguments, &value));
        return;
    }
    if (arguments.empty()) {
        value_.setProperty(named.name, toScript(value));
        return;
    }
    QJSValue array = value_.property(named.name);
    itemAt(array, arguments.front(), 0);
    array.setProperty(
        static_cast<quint32>(roundToInt32(arguments.front().toNumber())), toScript(value));
}

Value ScriptObject::arrayMember(Member& member, std::span<const Value> arguments)
{
    if (member.name == QLatin1String("Count"))
        return Value::ofNumber(value_.property(QStringLiteral("length")).toNumber());
    if (arguments.empty())
        throw RunTimeError(ErrorNumber::NoSuchMember, phrase(u"Item needs an index"));
    return answer(member, itemAt(value_, arguments.front(), firstItem_));
}

Value ScriptObject::answer(Member& member, const QJSValue& result)
{
    checked(result);
    if (result.isUndefined() || result.isNull())
        return {};
    if (result.isDate())
        return member.held.hold(result.toDateTime());
    if (isPlain(result))
        return member.held.hold(result.toVariant());
    if (!result.isObject())
        throw RunTimeError(ErrorNumber::TypeMismatch, phrase(u"a symbol is no value"));
    member.answer = objectOfScript(result, engine_, countsFromOne(member.name) ? 1 : 0);
    return Value::ofObject(*member.answer);
}

QJSValue ScriptObject::call(
    const Member& member, std::span<const Value> arguments, const Value* value)
{
    QJSValueList list;
    for (const Value& argument : arguments)
        list.append(toScript(argument));
    if (value != nullptr)
        list.append(toScript(*value));
    if (!engine_)
        return member.function.callWithInstance(value_, list);
    const QJSValue result
        = QJSManagedValue(member.function, engine_).callWithInstance(value_, list);
    checkThrown();
    return result;
}

/// A property may be read by a function of the script.
QJSValue ScriptObject::propertyOf(const Member& member) const
{
    if (!engine_)
        return value_.property(member.name);
    const QJSValue result = QJSManagedValue(value_, engine_).property(member.name);
    checkThrown();
    return result;
}

/// Anything at all may have been thrown, a text or null for example.
void ScriptObject::checkThrown() const
{
    if (engine_->hasError())
        refuse(engine_->catchError());
}

QJSValue ScriptObject::itemAt(const QJSValue& array, const Value& index, int first) const
{
    if (!array.isArray())
        throw RunTimeError(ErrorNumber::NoSuchMember, phrase(u"only an array takes an index"));
    const int position = roundToInt32(index.toNumber()) - first;
    if (position < 0 || position >= array.property(QStringLiteral("length")).toInt())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"item"), std::int64_t { position } + first,
                array.property(QStringLiteral("length")).toInt()));
    return array.property(static_cast<quint32>(position));
}

std::unique_ptr<AutomationObject> objectOfScript(
    const QJSValue& value, QJSEngine* engine, int firstItem)
{
    if (value.isQObject() && value.toQObject() != nullptr)
        return gridFor(*value.toQObject());
    if (!value.isObject())
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"an object was expected"));
    return std::make_unique<ScriptObject>(value, engine, firstItem);
}

} // namespace pelloric::qt
