// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <span>
#include <vector>

namespace pelloric {

/// A name of a list that a person wrote, such as that of a column.
struct ListedName {
    Text before {}; ///< what stands in front of a quoted name, up to a colon: "sum:"
    Text name {};
    Text after {}; ///< what stands behind a quoted name, from a colon on: ":desc"
    bool isQuoted = false;

    Text whole() const { return before + name + after; }
    bool operator==(const ListedName&) const = default;
};

/// Takes a list of names apart: commas stand between them, and blanks around them mean nothing.
///
/// A name that holds commas stands in double quotes, in which a quote is written twice, as in a CSV
/// file. Quotes begin where a name does or behind its first colon, and end before a comma, a colon
/// or the end; any other quote is text.
/// @return  at least one, which is empty where the list is
std::vector<ListedName> listedNames(TextView list);

/// The names of a list, without the empty ones.
std::vector<Text> namesOf(TextView list);

/// A list from which `namesOf` gives the names back.
Text listOf(std::span<const Text> names);

} // namespace pelloric
