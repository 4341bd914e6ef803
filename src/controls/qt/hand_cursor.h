// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPixmap>

namespace pelloric::qt {

/// The picture of the cursor of pan mode.
/// @param devicePixelRatio  of the screen it is shown on
QPixmap handPicture(qreal devicePixelRatio);

} // namespace pelloric::qt
