// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <QFontDatabase>

namespace pelloric::qt {

/// A Song-style family with half-em Latin and whole-em Han characters, and no bold face.
inline constexpr TextView Uming = u"AR PL UMing CN";

/// Makes sure that the family is there; the package fonts-arphic-uming brings it.
inline bool loadUming()
{
    const QString family = QStringLiteral("AR PL UMing CN");
    return QFontDatabase::hasFamily(family)
        || QFontDatabase::addApplicationFont(
               QStringLiteral("/usr/share/fonts/truetype/arphic/uming.ttc"))
        >= 0;
}

} // namespace pelloric::qt
