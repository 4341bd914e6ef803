// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/collection.h"

#include "platform/member_names.h"

#include <iterator>

namespace pelloric {

namespace {

enum Member { Count, Item, MemberCount };

constexpr TextView Names[] = { u"Count", u"Item" };
static_assert(std::size(Names) == MemberCount);

} // namespace

std::optional<MemberId> Collection::findMember(TextView name)
{
    return findMemberName(Names, name);
}

const void* Collection::memberTable() const { return Names; }

Value Collection::get(MemberId member, std::span<const Value> arguments)
{
    switch (member) {
    case Count:
        return Value::ofNumber(count());
    case Item:
        return item(arguments);
    default:
        refuseMember(Names, member);
    }
}

void Collection::put(MemberId member, std::span<const Value>, const Value&)
{
    refuseMember(Names, member);
}

Value Collection::item(std::span<const Value> arguments)
{
    return Value::ofObject(
        itemAt(indexArgument(arguments, 0, first_, first_ + count() - 1) - first_));
}

} // namespace pelloric
