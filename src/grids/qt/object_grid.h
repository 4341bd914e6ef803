// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/qt/held_value.h"
#include "platform/automation_object.h"

#include <QPointer>

#include <map>
#include <memory>

class QObject;

namespace pelloric::qt {

class ModelRowSet;
class ObjectClass;

/// What is known of the classes of objects; shared by an object and the objects it answers.
class ObjectClasses {
public:
    ObjectClasses();
    ~ObjectClasses();
    ObjectClasses(const ObjectClasses&) = delete;
    ObjectClasses& operator=(const ObjectClasses&) = delete;

    /// The class; lives as long as this object.
    ObjectClass& of(const QMetaObject& meta);

private:
    std::map<const QMetaObject*, std::unique_ptr<ObjectClass>> classes_;
};

/// Any QObject by its published members: properties, callable methods and slots of exactly that
/// name.
///
/// An indexed member is a method that takes its indexes. Writing one calls the method of the
/// same name with the value as last argument, or else "set" and the name. Objects that a member
/// answers are reached the same way; an item model becomes a row set. A collection can be indexed
/// itself: an index on a member without indexes goes to `Item` of the object that it answers.
/// Names and argument types are looked up once per class.
class ObjectGrid final : public AutomationObject {
public:
    /// @param object  borrowed; once it is gone, its members are the object-missing error
    explicit ObjectGrid(QObject& object);
    /// @param classes  borrowed
    ObjectGrid(QObject& object, ObjectClasses& classes);
    ~ObjectGrid() override;

    /// Whether an object publishes a member of that name.
    static bool publishes(const QObject& object, const char* name);

    std::optional<MemberId> findMember(TextView name) override;
    const void* memberTable() const override;
    Value get(MemberId member, std::span<const Value> arguments) override;
    void put(MemberId member, std::span<const Value> arguments, const Value& value) override;

private:
    /// What a member answered last; kept for the member's next answer.
    struct Answer {
        std::unique_ptr<ObjectGrid> object;
        std::unique_ptr<ModelRowSet> rows;
    };

    void pointAt(QObject& object);
    QObject& alive() const;
    Value answer(MemberId member, const QVariant& result);

    std::unique_ptr<ObjectClasses> ownClasses_; ///< null in an object that a member answered
    ObjectClasses& classes_;
    QPointer<QObject> object_;
    ObjectClass* class_ = nullptr; ///< never null
    std::map<MemberId, Answer> answers_;
    HeldValue held_;
};

} // namespace pelloric::qt
