// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/member_names.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

namespace pelloric {

std::optional<MemberId> findMemberName(std::span<const TextView> names, TextView name)
{
    for (std::size_t at = 0; at < names.size(); ++at) {
        if (names[at] == name)
            return static_cast<MemberId>(at);
    }
    return std::nullopt;
}

int indexArgument(std::span<const Value> arguments, std::size_t position, int first, int last)
{
    if (position >= arguments.size())
        throw RunTimeError(ErrorNumber::NoSuchMember, phrase(u"an index is missing"));
    const double index = roundHalfEven(arguments[position].toNumber());
    if (!(index >= first && index <= last))
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            phrase(u"index %1", { outsideLimits(index, first, last) }));
    return static_cast<int>(index);
}

void refuseMember(std::span<const TextView> names, MemberId member)
{
    const auto at = static_cast<std::size_t>(member);
    throw RunTimeError(ErrorNumber::NoSuchMember, at < names.size() ? names[at] : TextView());
}

} // namespace pelloric
