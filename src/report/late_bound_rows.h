// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"
#include "platform/row_set.h"

#include <optional>
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

/// A row set that is itself a late-bound object: `RecordCount`, `Fields` (`Count`, `Item(i)` from
/// 0, each with `Name` and `Value`), and a cursor.
///
/// The cursor is `AbsolutePosition` (from 1, also written) or, where there is none, `BOF`, `EOF`,
/// `MoveFirst`, `MoveNext`, `MovePrevious` and, if published, `Move(records)`. Where such a cursor
/// stands is counted by walking back to the first record once. The object's cursor follows every
/// `setPosition`; before the first and behind the last record it goes where the object's members
/// let it.
class LateBoundRows final : public RowSet {
public:
    /// @param object  borrowed, outlives the row set
    /// @throws RunTimeError NoSuchMember: it is no row set; InvalidCall: its cursor never comes to
    ///         the first record
    explicit LateBoundRows(AutomationObject& object);

    int fieldCount() const override { return static_cast<int>(names_.size()); }
    TextView fieldName(int field) const override;
    std::int64_t recordCount() const override { return records_; }
    std::int64_t position() const override { return position_; }
    void setPosition(std::int64_t position) override;
    Value value(int field) override;

private:
    /// The members that move a cursor step by step.
    struct Steps {
        MemberId first = 0;
        MemberId next = 0;
        MemberId previous = 0;
        std::optional<MemberId> relative; ///< `Move`
        MemberId isBeforeFirst = 0; ///< `BOF`
        MemberId isAfterLast = 0; ///< `EOF`
    };

    std::optional<Steps> findSteps();
    std::int64_t startPosition();
    std::int64_t countedPosition();
    bool isTrue(MemberId member);
    void writePosition(double position);
    void returnBeside();
    void walk(std::int64_t from, std::int64_t to);
    void call(MemberId member) { object_.get(member, {}); }

    AutomationObject& object_;
    std::optional<MemberId> positionMember_; ///< `AbsolutePosition`
    std::optional<Steps> steps_;
    MemberId fieldsMember_;
    MemberOfItems item_ { u"Item" };
    MemberOfItems value_ { u"Value" };
    std::vector<Text> names_;
    std::int64_t records_ = 0;
    std::int64_t position_ = 0;
    double startMark_ = 0; ///< what `AbsolutePosition` answered before the first move
    std::int64_t start_ = 0; ///< where the cursor stood then
};

} // namespace pelloric
