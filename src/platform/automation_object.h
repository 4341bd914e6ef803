// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/value.h"

#include <optional>
#include <span>

namespace pelloric {

class CellLooks;

/// Stands for one member of one class of objects; what it means is the object's own business.
using MemberId = int;

/// An object that is reached only through the names of its members.
///
/// A name is looked up once; after that a member is called by its id with a span of arguments, so
/// that no call needs a look-up or an allocation of its own.
class AutomationObject {
public:
    virtual ~AutomationObject() = default;

    /// The id of the member of exactly that name (case told apart), or nothing.
    virtual std::optional<MemberId> findMember(TextView name) = 0;

    /// Tells whose ids these are: objects that answer the same value, not null, share all ids.
    virtual const void* memberTable() const = 0;

    /// Reads a property, with its indexes, or calls a method that answers something.
    ///
    /// @return  its text, object or row set is borrowed until the next call on this object
    /// @throws RunTimeError NoSuchMember, SubscriptOutOfRange, TypeMismatch, or the member's own
    virtual Value get(MemberId member, std::span<const Value> arguments) = 0;

    /// Writes a property, with its indexes.
    /// @throws RunTimeError NoSuchMember: it cannot be written; or as `get`
    virtual void put(MemberId member, std::span<const Value> arguments, const Value& value) = 0;

    /// How its cells are shown, for a grid that is a view; null: that is not known. Lives as long
    /// as the object and follows its rows and columns.
    virtual CellLooks* cellLooks() { return nullptr; }
};

/// Looks a member up.
/// @throws RunTimeError NoSuchMember: the object has none of that name
MemberId memberOf(AutomationObject& object, TextView name);

/// Reads a member that takes no arguments.
/// @throws RunTimeError as `memberOf` and `AutomationObject::get`
Value getMember(AutomationObject& object, TextView name);

} // namespace pelloric
