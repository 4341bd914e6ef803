// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <array>

namespace pelloric {

/// Every key of the settings file, in the order in which a report's style is loaded.
///
/// The order puts every key above the keys that contain it, for the first line that holds a key
/// anywhere is the one that is read.
inline constexpr auto SettingsKeys = std::to_array<TextView>({
    u"ShowHeaders",
    u"GridHor",
    u"GridVer",
    u"GridMerge",
    u"HeaderColor",
    u"GridLineColor",
    u"FontName",
    u"FontSize",
    u"FontBold",
    u"FontItalic",
    u"FontStrikethru",
    u"FontUnderline",
    u"FontColor",
    u"HeaderFontName",
    u"HeaderFontSize",
    u"HeaderFontBold",
    u"HeaderFontItalic",
    u"HeaderFontStrikethru",
    u"HeaderFontUnderline",
    u"HeaderFontColor",
    u"FooterFontName",
    u"FooterFontSize",
    u"FooterFontBold",
    u"FooterFontItalic",
    u"FooterFontStrikethru",
    u"FooterFontUnderline",
    u"FooterFontColor",
    u"PagerSize",
    u"PagerOrientation",
    u"PagerSizeValue",
    u"Top",
    u"Buttom",
    u"Left",
    u"Right",
    u"PagerWidth",
    u"PagerHeight",
    u"HeaderLeft",
    u"HeaderCenter",
    u"HeaderRight",
    u"FooterLeft",
    u"FooterCenter",
    u"FooterRight",
});
static_assert(SettingsKeys.size() == 42);

} // namespace pelloric
