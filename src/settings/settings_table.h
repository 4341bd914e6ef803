// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <pelloric/options.h>

#include <span>
#include <variant>

namespace pelloric {

/// Every setting, in the order in which a report's style is loaded and in which the default file
/// lists them. The seven settings of each font stand together in one order.
enum class SettingKey {
    ShowHeaders,
    GridHor,
    GridVer,
    GridMerge,
    HeaderColor,
    GridLineColor,
    FontName,
    FontSize,
    FontBold,
    FontItalic,
    FontStrikethru,
    FontUnderline,
    FontColor,
    HeaderFontName,
    HeaderFontSize,
    HeaderFontBold,
    HeaderFontItalic,
    HeaderFontStrikethru,
    HeaderFontUnderline,
    HeaderFontColor,
    FooterFontName,
    FooterFontSize,
    FooterFontBold,
    FooterFontItalic,
    FooterFontStrikethru,
    FooterFontUnderline,
    FooterFontColor,
    PagerSize,
    PagerOrientation,
    PagerSizeValue,
    Top,
    Buttom,
    Left,
    Right,
    PagerWidth,
    PagerHeight,
    HeaderLeft,
    HeaderCenter,
    HeaderRight,
    FooterLeft,
    FooterCenter,
    FooterRight,
};

/// What a setting's value counts or names.
enum class SettingUnit { Switch, Color, Points, Millimetres, Code, Text };

/// The numbers that a setting is meant to be, in its unit. Pages are built by many others, too, as
/// far as those fit the numbers of a page; what cannot be used is told by this range.
struct SettingRange {
    double least = 0;
    double most = 0; ///< as `least`: the setting has no range
    bool isAbove = false; ///< `least` itself lies outside

    bool holds(double value) const
    {
        return (isAbove ? value > least : value >= least) && value <= most;
    }
};

/// The member of the settings that a key fills.
using SettingField = std::variant<bool*, double*, std::optional<std::int16_t>*, Text*>;

/// One setting.
struct Setting {
    SettingKey key;
    TextView name; ///< the key as the file spells it
    TextView start; ///< its value in the default file
    SettingUnit unit;
    SettingField (*field)(ReportSettings& settings);
    SettingRange range {};
};

/// All settings, in the order of `SettingKey`.
///
/// A key stands above every other one that contains it, for the first line of the file that holds
/// a key anywhere is the one that is read; the header and footer texts, which may hold any word,
/// stand last.
std::span<const Setting> settingsTable();

const Setting& settingOf(SettingKey key);

/// The key as the file spells it.
TextView settingName(SettingKey key);

/// Whether the numbers of a unit can be so large: a font size is a single, all others are finite.
bool isHeld(SettingUnit unit, double value);

/// Fills a setting with a text as the file holds it.
///
/// A number is the text's leading number, a switch is on when that is not 0. Only the paper code
/// must be a whole number as a whole.
void setSetting(ReportSettings& settings, SettingKey key, TextView text);

/// A setting as the file holds it.
/// @param decimalSeparator  of the user's locale
Text settingText(const ReportSettings& settings, SettingKey key, char16_t decimalSeparator);

/// The fonts of a report.
enum class ReportFont { Body, Header, Footer };

/// A key of one of the three fonts.
/// @param ofBody  the same key of the body font, `FontName` to `FontColor`
SettingKey fontKey(ReportFont font, SettingKey ofBody);

} // namespace pelloric
