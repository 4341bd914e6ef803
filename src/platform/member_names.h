// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

namespace pelloric {

/// Finds a name in an object's own list of names: the id is the position in the list.
std::optional<MemberId> findMemberName(std::span<const TextView> names, TextView name);

/// An index that a member was called with, rounded half to even.
///
/// @param position  which of the arguments
/// @param first     the smallest index that is taken
/// @param last      the largest; below `first` when there is nothing to index
/// @throws RunTimeError NoSuchMember: the member was called with fewer indexes;
///         SubscriptOutOfRange; TypeMismatch
int indexArgument(std::span<const Value> arguments, std::size_t position, int first, int last);

/// What an object answers when a member cannot be written, or not in this way.
/// @throws RunTimeError NoSuchMember: always
[[noreturn]] void refuseMember(std::span<const TextView> names, MemberId member);

} // namespace pelloric
