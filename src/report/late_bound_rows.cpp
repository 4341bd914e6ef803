// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/late_bound_rows.h"

#include "platform/numbers.h"
#include "platform/run_time_error.h"

#include <algorithm>

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
    , positionMember_(memberOf(object, u"AbsolutePosition"))
    , fieldsMember_(memberOf(object, u"Fields"))
    , records_(wholeMember(object, u"RecordCount"))
{
    position_ = roundToInt32(object_.get(positionMember_, {}).toNumber());
    AutomationObject& fields = object_.get(fieldsMember_, {}).toObject();
    const int count = wholeMember(fields, u"Count");
    Text buffer;
    for (int field = 0; field < count; ++field)
        names_.emplace_back(displayText(getMember(itemOf(fields, field), u"Name"), u'.', buffer));
}

TextView LateBoundRows::fieldName(int field) const
{
    if (field < 0 || field >= fieldCount())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
    return names_[static_cast<std::size_t>(field)];
}

void LateBoundRows::setPosition(std::int64_t position)
{
    position_ = std::clamp<std::int64_t>(position, 0, records_ + 1);
    if (!isBeforeFirst() && !isAfterLast())
        object_.put(positionMember_, {}, Value::ofNumber(static_cast<double>(position_)));
}

Value LateBoundRows::value(int field)
{
    if (isBeforeFirst() || isAfterLast())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
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
