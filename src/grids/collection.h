// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

namespace pelloric {

/// A late-bound collection, which is only read: `Count`, and `Item` by an index.
///
/// One object may stand for all items: it is pointed at the one that is asked for, and means
/// another after the next call.
class Collection : public AutomationObject {
public:
    /// @param first  the index of the first item
    explicit Collection(int first)
        : first_(first)
    {
    }

    std::optional<MemberId> findMember(TextView name) final;
    const void* memberTable() const final;
    Value get(MemberId member, std::span<const Value> arguments) final;
    void put(MemberId member, std::span<const Value> arguments, const Value& value) final;

    /// The item of an index.
    /// @throws RunTimeError as `indexArgument`
    Value item(std::span<const Value> arguments);

protected:
    virtual int count() const = 0;

    /// @param place  from 0
    virtual AutomationObject& itemAt(int place) = 0;

private:
    int first_;
};

} // namespace pelloric
