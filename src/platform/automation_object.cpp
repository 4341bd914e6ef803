// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/automation_object.h"

#include "platform/run_time_error.h"

namespace pelloric {

MemberId memberOf(AutomationObject& object, TextView name)
{
    if (const auto member = object.findMember(name))
        return *member;
    throw RunTimeError(ErrorNumber::NoSuchMember, name);
}

Value getMember(AutomationObject& object, TextView name)
{
    return object.get(memberOf(object, name), {});
}

} // namespace pelloric
