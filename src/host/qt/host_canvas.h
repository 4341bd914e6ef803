// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"

#include <pelloric/report.h>
#include <pelloric/sorvane.h>

namespace pelloric::qt {

/// What is worked on, whether it has a window or not.
inline Canvas& canvasOf(const Report& report) { return report.canvas(); }
inline const Canvas& canvasOf(const Sorvane& control) { return control.canvas(); }
inline Canvas& canvasOf(Sorvane& control) { return control.canvas(); }

} // namespace pelloric::qt
