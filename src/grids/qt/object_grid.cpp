// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/object_grid.h"

#include "grids/qt/model_row_set.h"
#include "grids/qt/object_class.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QAbstractItemModel>
#include <QObject>

namespace pelloric::qt {

namespace {

[[noreturn]] void refuse(const ObjectMember& member)
{
    throw RunTimeError(ErrorNumber::NoSuchMember, fromUtf8(member.name.toStdString()));
}

QVariant read(QObject& object, const ObjectMember& member, std::span<const Value> arguments)
{
    if (const ObjectMethod* method = member.method(arguments.size()))
        return method->call(object, arguments, nullptr);
    if (!arguments.empty() || !member.property.isReadable())
        refuse(member);
    return member.property.read(&object);
}

void write(QObject& object, const ObjectMember& member, const Value& value)
{
    const QMetaProperty& property = member.property;
    if (!property.isWritable())
        refuse(member);
    if (!property.write(&object, toVariant(value, property.metaType())))
        throw RunTimeError(ErrorNumber::TypeMismatch, fromUtf8(member.name.toStdString()));
}

} // namespace

ObjectClasses::ObjectClasses() = default;

ObjectClasses::~ObjectClasses() = default;

ObjectClass& ObjectClasses::of(const QMetaObject& meta)
{
    auto& known = classes_[&meta];
    if (!known)
        known = std::make_unique<ObjectClass>(meta);
    return *known;
}

ObjectGrid::ObjectGrid(QObject& object)
    : ownClasses_(std::make_unique<ObjectClasses>())
    , classes_(*ownClasses_)
{
    pointAt(object);
}

ObjectGrid::ObjectGrid(QObject& object, ObjectClasses& classes)
    : classes_(classes)
{
    pointAt(object);
}

ObjectGrid::~ObjectGrid() = default;

bool ObjectGrid::publishes(const QObject& object, const char* name)
{
    const QMetaObject& meta = *object.metaObject();
    return meta.indexOfProperty(name) >= 0 || firstMethodNamed(meta, name) >= 0;
}

std::optional<MemberId> ObjectGrid::findMember(TextView name)
{
    return class_->find(borrowed(name).toUtf8());
}

const void* ObjectGrid::memberTable() const { return &class_->meta(); }

Value ObjectGrid::get(MemberId member, std::span<const Value> arguments)
{
    QObject& object = alive();
    const ObjectMember& named = class_->member(member);
    const bool isOwnIndex = arguments.empty() || named.method(arguments.size());
    const QVariant result = read(object, named, isOwnIndex ? arguments : std::span<const Value>());
    const Value value = answer(member, result);
    if (isOwnIndex)
        return value;
    if (value.kind() != ValueKind::Object)
        refuse(named);
    AutomationObject& collection = value.toObject();
    return collection.get(memberOf(collection, u"Item"), arguments);
}

void ObjectGrid::put(MemberId member, std::span<const Value> arguments, const Value& value)
{
    QObject& object = alive();
    const ObjectMember& named = class_->member(member);
    const std::size_t count = arguments.size() + 1;
    const ObjectMethod* method = named.method(count);
    if (!method && !(arguments.empty() && named.property.isWritable()))
        method = named.setter(count);
    if (method)
        method->call(object, arguments, &value);
    else if (arguments.empty())
        write(object, named, value);
    else
        refuse(named);
}

void ObjectGrid::pointAt(QObject& object)
{
    if (object_ == &object)
        return;
    object_ = &object;
    class_ = &classes_.of(*object.metaObject());
    answers_.clear();
}

QObject& ObjectGrid::alive() const
{
    if (!object_)
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"the object is gone"));
    return *object_;
}

Value ObjectGrid::answer(MemberId member, const QVariant& result)
{
    if (!(result.metaType().flags() & QMetaType::PointerToQObject))
        return held_.hold(result);
    auto* const object = qvariant_cast<QObject*>(result);
    if (!object)
        return {};
    Answer& kept = answers_[member];
    if (auto* const model = qobject_cast<QAbstractItemModel*>(object)) {
        if (!kept.rows)
            kept.rows = std::make_unique<ModelRowSet>();
        kept.rows->take(*model);
        return Value::ofRows(*kept.rows);
    }
    if (kept.object)
        kept.object->pointAt(*object);
    else
        kept.object = std::make_unique<ObjectGrid>(*object, classes_);
    return Value::ofObject(*kept.object);
}

} // namespace pelloric::qt
