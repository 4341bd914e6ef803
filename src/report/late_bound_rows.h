// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"
#include "platform/row_set.h"

#include <vector>

namespace pelloric {

/// The id of a member, looked up again only when the object is of another class.
class MemberOfItems {
public:
    explicit MemberOfItems(TextView name)
        : name_(name)
    {
    }

    /// @throws RunTimeError NoSuchMember
    MemberId of(AutomationObject& item);

private:
    TextView name_;
    const void* table_ = nullptr;
    MemberId member_ = 0;
};

/// A row set that is itself a late-bound object with the members `RecordCount`,
/// `AbsolutePosition` (from 1, also written) and `Fields` (`Count`, `Item(i)` from 0, each with
/// `Name` and `Value`).
class LateBoundRows final : public RowSet {
public:
    /// @param object  borrowed, outlives the row set
    /// @throws RunTimeError NoSuchMember: it is no row set
    explicit LateBoundRows(AutomationObject& object);

    int fieldCount() const override { return static_cast<int>(names_.size()); }
    TextView fieldName(int field) const override;
    std::int64_t recordCount() const override { return records_; }
    std::int64_t position() const override { return position_; }
    void setPosition(std::int64_t position) override;
    Value value(int field) override;

private:
    AutomationObject& object_;
    MemberId positionMember_;
    MemberId fieldsMember_;
    MemberOfItems item_ { u"Item" };
    MemberOfItems value_ { u"Value" };
    std::vector<Text> names_;
    std::int64_t records_ = 0;
    std::int64_t position_ = 0;
};

} // namespace pelloric
