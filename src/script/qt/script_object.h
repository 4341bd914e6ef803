// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/qt/held_value.h"
#include "platform/automation_object.h"

#include <QJSEngine>
#include <QJSValue>
#include <QPointer>

#include <map>
#include <memory>
#include <vector>

namespace pelloric::qt {

/// An object of a script as a late-bound object: its properties and functions of exactly that name.
///
/// An indexed member is a function that takes its indexes, or an array; writing one calls the
/// function with the value as last argument. An array is a collection with `Count` and `Item(i)`,
/// whose items count from 1 in `ColumnHeaders` and `ListItems` and from 0 everywhere else. An
/// object of the host that the script holds is reached by its own members.
class ScriptObject final : public AutomationObject {
public:
    /// @param value      an object; it is kept alive
    /// @param engine     its engine, through which all that the object's functions throw is told
    ///                   from what they answer; null: only errors are
    /// @param firstItem  what the items of an array count from
    explicit ScriptObject(QJSValue value, QJSEngine* engine = nullptr, int firstItem = 0);
    ~ScriptObject() override;

    std::optional<MemberId> findMember(TextView name) override;
    /// Null: two objects of a script have nothing in common.
    const void* memberTable() const override { return nullptr; }
    Value get(MemberId member, std::span<const Value> arguments) override;
    void put(MemberId member, std::span<const Value> arguments, const Value& value) override;

private:
    struct Member {
        QString name;
        QJSValue function; ///< what the name stood for when it was looked up, if it was a function
        std::unique_ptr<AutomationObject> answer; ///< the object answered last
        HeldValue held;
    };

    Value arrayMember(Member& member, std::span<const Value> arguments);
    Value answer(Member& member, const QJSValue& result);
    QJSValue call(const Member& member, std::span<const Value> arguments, const Value* value);
    QJSValue itemAt(const QJSValue& array, const Value& index, int first) const;
    QJSValue propertyOf(const Member& member) const;
    void checkThrown() const;

    QJSValue value_;
    QPointer<QJSEngine> engine_;
    int firstItem_;
    std::vector<std::unique_ptr<Member>> members_; ///< by id
};

/// The object that a value of a script stands for: the host's object itself, or the script's own.
///
/// @throws RunTimeError ObjectMissing: the value is no object
std::unique_ptr<AutomationObject> objectOfScript(
    const QJSValue& value, QJSEngine* engine = nullptr, int firstItem = 0);

} // namespace pelloric::qt
