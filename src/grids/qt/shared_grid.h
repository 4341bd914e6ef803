// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

#include <memory>

namespace pelloric::qt {

/// A grid that hands every call on to one that others use too.
std::unique_ptr<AutomationObject> shareGrid(std::shared_ptr<AutomationObject> grid);

} // namespace pelloric::qt
