// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <nlohmann/json.hpp>

namespace pelloric::cases {

/// A JSON value whose object keys stay in the order in which they were written.
using Json = nlohmann::ordered_json;

/// A JSON text as the library's text.
inline Text textOf(const Json& value) { return fromUtf8(value.get<std::string>()); }

/// A text as a JSON text.
inline Json jsonOf(TextView text) { return toUtf8(text); }

} // namespace pelloric::cases
