// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/qt/qt_platform.h"

namespace pelloric::qt {

/// The services of controls that are made without any, as a form designer and scripts make them.
///
/// Made at the first call, gone with the application; needs a QGuiApplication.
QtPlatform& defaultPlatform();

} // namespace pelloric::qt
