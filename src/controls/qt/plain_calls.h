// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

namespace pelloric::qt {

/// Makes the published records known by their names to the meta-type system; more than once is
/// harmless.
void registerRecords();

} // namespace pelloric::qt
