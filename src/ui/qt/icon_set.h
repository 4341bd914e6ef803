// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QIcon>

class QPalette;

namespace pelloric::qt {

/// One of the library's own pictures, drawn in the colours of a palette at every size.
///
/// @param name     of the picture's file without its extension, such as "zoom-in"
/// @param palette  gives the colour of buttons' texts, enabled and disabled
/// @return         a null icon when there is no such picture
QIcon libraryIcon(const QString& name, const QPalette& palette);

} // namespace pelloric::qt
