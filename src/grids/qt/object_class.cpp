// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/object_class.h"

#include "grids/qt/held_value.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QObject>
#include <QVarLengthArray>

namespace pelloric::qt {

namespace {

/// Arguments that need no memory of their own.
constexpr qsizetype UsualArguments = 4;

bool mayBeCalled(const QMetaMethod& method)
{
    const bool isCallable
        = method.methodType() == QMetaMethod::Method || method.methodType() == QMetaMethod::Slot;
    return isCallable && method.access() == QMetaMethod::Public;
}

const ObjectMethod* withArguments(const std::vector<ObjectMethod>& methods, std::size_t count)
{
    for (const ObjectMethod& method : methods) {
        if (method.argumentCount() == count)
            return &method;
    }
    return nullptr;
}

/// Where a method reads an argument or writes its answer.
void* storageOf(QVariant& variant, QMetaType type)
{
    return type.id() == QMetaType::QVariant ? static_cast<void*>(&variant) : variant.data();
}

} // namespace

ObjectMethod::ObjectMethod(const QMetaMethod& method)
    : index_(method.methodIndex())
    , result_(method.returnMetaType())
{
    for (int at = 0; at < method.parameterCount(); ++at)
        types_.push_back(method.parameterMetaType(at));
}

QVariant ObjectMethod::call(
    QObject& object, std::span<const Value> arguments, const Value* value) const
{
    QVarLengthArray<QVariant, UsualArguments> values;
    for (const Value& argument : arguments)
        values.append(toVariant(argument, types_[static_cast<std::size_t>(values.size())]));
    if (value)
        values.append(toVariant(*value, types_.back()));

    const bool answersVariant = result_.id() == QMetaType::QVariant;
    const bool answers = result_.isValid() && result_.id() != QMetaType::Void;
    QVariant result = answers && !answersVariant ? QVariant(result_) : QVariant();
    QVarLengthArray<void*, UsualArguments + 1> storage;
    storage.append(answers ? storageOf(result, result_) : nullptr);
    for (qsizetype at = 0; at < values.size(); ++at)
        storage.append(storageOf(values[at], types_[static_cast<std::size_t>(at)]));
    QMetaObject::metacall(&object, QMetaObject::InvokeMetaMethod, index_, storage.data());
    return result;
}

const ObjectMethod* ObjectMember::method(std::size_t arguments) const
{
    return withArguments(methods, arguments);
}

const ObjectMethod* ObjectMember::setter(std::size_t arguments) const
{
    return withArguments(setters, arguments);
}

ObjectClass::ObjectClass(const QMetaObject& meta)
    : meta_(meta)
    , members_(static_cast<std::size_t>(meta.propertyCount() + meta.methodCount()))
{
}

std::optional<MemberId> ObjectClass::find(const QByteArray& name)
{
    const int property = meta_.indexOfProperty(name.constData());
    if (property >= 0)
        return property;
    const int method = firstMethodNamed(meta_, name);
    if (method >= 0)
        return meta_.propertyCount() + method;
    return std::nullopt;
}

const ObjectMember& ObjectClass::member(MemberId member)
{
    if (member < 0 || static_cast<std::size_t>(member) >= members_.size())
        throw RunTimeError(ErrorNumber::NoSuchMember,
            noSuchItem(
                phrase(u"member number"), member, static_cast<std::int64_t>(members_.size())));
    auto& known = members_[static_cast<std::size_t>(member)];
    if (!known)
        known = describe(nameOf(member));
    return *known;
}

QByteArray ObjectClass::nameOf(MemberId member) const
{
    const int properties = meta_.propertyCount();
    return member < properties ? QByteArray(meta_.property(member).name())
                               : meta_.method(member - properties).name();
}

std::unique_ptr<ObjectMember> ObjectClass::describe(const QByteArray& name) const
{
    auto member = std::make_unique<ObjectMember>();
    member->name = name;
    const int property = meta_.indexOfProperty(name.constData());
    if (property >= 0)
        member->property = meta_.property(property);
    member->methods = methodsNamed(name);
    member->setters = methodsNamed("set" + name);
    return member;
}

/// The most derived first, so that it hides those of its bases.
std::vector<ObjectMethod> ObjectClass::methodsNamed(const QByteArray& name) const
{
    std::vector<ObjectMethod> methods;
    for (int at = meta_.methodCount() - 1; at >= 0; --at) {
        const QMetaMethod method = meta_.method(at);
        if (mayBeCalled(method) && method.name() == name)
            methods.emplace_back(method);
    }
    return methods;
}

int firstMethodNamed(const QMetaObject& meta, const QByteArray& name)
{
    for (int at = 0; at < meta.methodCount(); ++at) {
        const QMetaMethod method = meta.method(at);
        if (mayBeCalled(method) && method.name() == name)
            return at;
    }
    return -1;
}

} // namespace pelloric::qt
