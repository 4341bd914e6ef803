// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/page_document.h"
#include "document/records.h"

#include <array>

namespace pelloric {

enum class SettingKey;
struct Platform;
struct SettingsSource;
struct ReportSettings;

/// A font with its colour, which is kept as the number that the settings hold.
struct ColoredFont {
    Font font;
    double color = 0; ///< 0x00BBGGRR once it is rounded

    bool operator==(const ColoredFont&) const = default;
};

/// Left, centre and right text of a header or footer line.
using SlotTexts = std::array<Text, 3>;

/// What shapes a report, as the settings file gives it; paper and margins are in `PageSetup`.
struct ReportStyle {
    bool ShowHeaders = false; ///< the row of column titles on every page
    bool GridHor = false; ///< lines between rows
    bool GridVer = false; ///< lines between columns
    bool GridMerge = false; ///< equal neighbouring cells are printed once
    Color HeaderColor = 0; ///< fill colour that grid lines are recorded with
    Color GridLineColor = 0;
    ColoredFont body;
    ColoredFont header;
    ColoredFont footer;
    Text PagerSize; ///< name of the paper
    std::int16_t PagerOrientation = 0; ///< 1 portrait, 2 landscape
    std::int16_t PagerSizeValue = 0; ///< 1-based place in the list of paper forms
    std::int16_t printableWidthTenth = 0; ///< twips
    std::int16_t printableHeightTenth = 0; ///< twips
    SlotTexts headerTexts;
    SlotTexts footerTexts;

    bool operator==(const ReportStyle&) const = default;
};

/// How much larger than stored a margin is printed.
/// @param margin  `Top`, `Buttom`, `Left` or `Right`; any other is printed as it is stored
double marginFactor(SettingKey margin);

/// Sets the tenths of the area between the margins.
/// @throws RunTimeError Overflow: past 16 bits; nothing has changed
void setPrintableTenths(ReportStyle& style, const PageSetup& setup);

/// Fills style and page set-up from settings.
///
/// Millimetres become twips; the margins are enlarged on the way by 1.6 (top), 1.8 (bottom) and
/// 1.2 (left and right), and one of 0 becomes two centimetres.
/// @param source  named in the texts of errors; null: the settings come from nowhere
/// @throws RunTimeError Overflow: a number past its type; TypeMismatch: there is no paper code. The
///         text names key, value, limit and remedy. What was set before stays set.
void applySettings(const ReportSettings& settings, ReportStyle& style, PageSetup& setup,
    const SettingsSource* source = nullptr);

/// The same from the settings file.
/// @throws RunTimeError FileNotFound: no settings file; or as `applySettings`
void loadReportStyle(ReportStyle& style, PageSetup& setup, const Platform& platform);

} // namespace pelloric
