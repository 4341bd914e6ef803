// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

#include <QMetaMethod>
#include <QMetaObject>
#include <QMetaProperty>
#include <QVariant>

#include <memory>
#include <vector>

namespace pelloric::qt {

/// One method of a class, ready to be called.
class ObjectMethod {
public:
    explicit ObjectMethod(const QMetaMethod& method);

    std::size_t argumentCount() const { return types_.size(); }

    /// Calls the method.
    ///
    /// @param value  the last argument, behind the others; null: there is none
    /// @return       what it answers; not valid when it answers nothing
    /// @throws RunTimeError TypeMismatch, Overflow: an argument does not fit; or the method's own
    QVariant call(QObject& object, std::span<const Value> arguments, const Value* value) const;

private:
    int index_;
    QMetaType result_;
    std::vector<QMetaType> types_;
};

/// What a name means in a class: a property, the methods of that name and those that write it.
struct ObjectMember {
    QByteArray name;
    QMetaProperty property; ///< not valid: there is none
    std::vector<ObjectMethod> methods;
    std::vector<ObjectMethod> setters; ///< "set" and the name

    /// The method of the name with so many arguments, or null.
    const ObjectMethod* method(std::size_t arguments) const;
    const ObjectMethod* setter(std::size_t arguments) const;
};

/// The members of a class of objects, looked up by name once each.
///
/// An id is the property's or the first method's place in the class, so that it means the same
/// wherever the class is looked at.
class ObjectClass {
public:
    explicit ObjectClass(const QMetaObject& meta);

    const QMetaObject& meta() const { return meta_; }

    /// The id of a published name, or nothing.
    std::optional<MemberId> find(const QByteArray& name);

    /// @throws RunTimeError NoSuchMember: no id of this class
    const ObjectMember& member(MemberId member);

private:
    QByteArray nameOf(MemberId member) const;
    std::unique_ptr<ObjectMember> describe(const QByteArray& name) const;
    std::vector<ObjectMethod> methodsNamed(const QByteArray& name) const;

    const QMetaObject& meta_;
    std::vector<std::unique_ptr<ObjectMember>> members_; ///< by id; null: not looked at yet
};

/// The place of the first method of a class that may be called by a name, or -1.
int firstMethodNamed(const QMetaObject& meta, const QByteArray& name);

} // namespace pelloric::qt
