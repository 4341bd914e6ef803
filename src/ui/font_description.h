// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

namespace pelloric {

struct Font;

/// What the dialogs show of a font: "9 pt. 宋体 [ Bold Italic ]", or without brackets when no style
/// is set. A blank stands behind every style, and the decimal point is always ".".
Text fontDescription(const Font& font);

/// The face that a font takes when the font dialog answers an empty name.
inline constexpr TextView FallbackFace = u"宋体";

} // namespace pelloric
