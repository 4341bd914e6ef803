// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/late_bound_rows.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <algorithm>
#include <cstdlib>
#include <iterator>

namespace pelloric {

namespace {

std::int32_t wholeMember(AutomationObject& object, TextView name)
{
    return roundToInt32(getMember(object, name).toNumber());
}

AutomationObject& itemOf(AutomationObject& collection, int index)
{
    const Value argument = Value::ofNumber(index);
    return collection.get(memberOf(collection, u"Item"), { &argument, 1 }).toObject();
}

} // namespace

LateBoundRows::LateBoundRows(AutomationObject& object)
    : object_(object)
    , positionMember_(object.findMember(u"AbsolutePosition"))
    , steps_(findSteps())
    , fieldsMember_(memberOf(object, u"Fields"))
    , records_(std::max(0, wholeMember(object, u"RecordCount")))
{
    start_ = startPosition();
    position_ = start_;
    AutomationObject& fields = object_.get(fieldsMember_, {}).toObject();
    const int count = wholeMember(fields, u"Count");
    Text buffer;
    for (int field = 0; field < count; ++field)
        names_.emplace_back(displayText(getMember(itemOf(fields, field), u"Name"), u'.', buffer));
}

/// @return  nothing: a member is missing, but there is `AbsolutePosition`
/// @throws RunTimeError NoSuchMember: a member is missing, and so is `AbsolutePosition`
std::optional<LateBoundRows::Steps> LateBoundRows::findSteps()
{
    constexpr TextView Needed[] = { u"MoveFirst", u"MoveNext", u"MovePrevious", u"BOF", u"EOF" };
    const auto isThere = [&](TextView name) { return object_.findMember(name).has_value(); };
    if (positionMember_ && !std::all_of(std::begin(Needed), std::end(Needed), isThere))
        return std::nullopt;
    return Steps { memberOf(object_, u"MoveFirst"), memberOf(object_, u"MoveNext"),
        memberOf(object_, u"MovePrevious"), object_.findMember(u"Move"), memberOf(object_, u"BOF"),
        memberOf(object_, u"EOF") };
}

std::int64_t LateBoundRows::startPosition()
{
    if (positionMember_)
        startMark_ = object_.get(*positionMember_, {}).toNumber();
    if (records_ == 0)
        return 0;
    if (steps_ && isTrue(steps_->isBeforeFirst))
        return 0;
    if (steps_ && isTrue(steps_->isAfterLast))
        return records_ + 1;
    if (!positionMember_)
        return countedPosition();
    return std::clamp<std::int64_t>(roundToInt32(startMark_), 0, records_ + 1);
}

/// Counts the records back to the first one, and stands where the cursor was again.
std::int64_t LateBoundRows::countedPosition()
{
    std::int64_t position = 0;
    while (!isTrue(steps_->isBeforeFirst)) {
        if (position == records_)
            throw RunTimeError(ErrorNumber::InvalidCall,
                phrase(u"the data source never comes to its first record"));
        call(steps_->previous);
        ++position;
    }
    walk(0, position);
    return position;
}

bool LateBoundRows::isTrue(MemberId member) { return object_.get(member, {}).toNumber() != 0; }

TextView LateBoundRows::fieldName(int field) const
{
    if (field < 0 || field >= fieldCount())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"field"), std::int64_t { field } + 1, fieldCount()));
    return names_[static_cast<std::size_t>(field)];
}

void LateBoundRows::setPosition(std::int64_t position)
{
    const std::int64_t from = position_;
    position_ = std::clamp<std::int64_t>(position, 0, records_ + 1);
    if (records_ == 0)
        return;
    if (!positionMember_) {
        walk(from, position_);
        return;
    }
    const bool isBeside = isBeforeFirst() || isAfterLast();
    if (isBeside && !steps_) {
        returnBeside();
        return;
    }
    writePosition(static_cast<double>(std::clamp<std::int64_t>(position_, 1, records_)));
    if (isBeside)
        call(isBeforeFirst() ? steps_->previous : steps_->next);
}

void LateBoundRows::writePosition(double position)
{
    object_.put(*positionMember_, {}, Value::ofNumber(position));
}

/// A cursor that is only a number gets beside the records no other way than by the number that it
/// answered there.
void LateBoundRows::returnBeside()
{
    if (position_ != start_)
        return;
    try {
        writePosition(startMark_);
    } catch (const RunTimeError&) {
        // The object does not take back what it answered.
    }
}

/// Moves the object's cursor step by step, or in one leap where it can leap.
void LateBoundRows::walk(std::int64_t from, std::int64_t to)
{
    if (to == from)
        return;
    if (to == 0 || to == 1 || from == 0 || from > records_) {
        call(steps_->first);
        from = 1;
        if (to == 0)
            call(steps_->previous);
    }
    if (to == 0)
        return;
    const std::int64_t distance = to - from;
    if (std::abs(distance) > 1 && steps_->relative) {
        const Value records = Value::ofNumber(static_cast<double>(distance));
        object_.get(*steps_->relative, { &records, 1 });
        return;
    }
    for (std::int64_t step = 0; step < std::abs(distance); ++step)
        call(distance > 0 ? steps_->next : steps_->previous);
}

Value LateBoundRows::value(int field)
{
    if (isBeforeFirst() || isAfterLast())
        throw RunTimeError(
            ErrorNumber::SubscriptOutOfRange, noSuchItem(phrase(u"row"), position_, records_));
    AutomationObject& fields = object_.get(fieldsMember_, {}).toObject();
    const Value index = Value::ofNumber(field);
    AutomationObject& item = fields.get(item_.of(fields), { &index, 1 }).toObject();
    return item.get(value_.of(item), {});
}

MemberId MemberOfItems::of(AutomationObject& item)
{
    const void* table = item.memberTable();
    if (table == nullptr || table != table_) {
        member_ = memberOf(item, name_);
        table_ = table;
    }
    return member_;
}

} // namespace pelloric
