// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

#include <pelloric/version.h>

#include <memory>

class QObject;

namespace pelloric::qt {

/// The grid that an object is.
///
/// A `HeldGrid` is the grid that it carries. An object that publishes the members of a grid itself
/// is taken by them. A table view is a flex grid, whatever its model, and answers a data grid's
/// members besides; a tree or a list is a list view; any other object is taken by the members that
/// it has. Exported for the component `script`.
/// @param object  borrowed
/// @throws RunTimeError ObjectMissing: a view without a model
PELLORIC_EXPORT std::unique_ptr<AutomationObject> gridFor(QObject& object);

} // namespace pelloric::qt
