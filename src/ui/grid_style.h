// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/services.h"
#include "settings/settings_file.h"
#include "ui/settings_access.h"

#include <array>
#include <cstdint>
#include <variant>

namespace pelloric {

/// Title, tabs and list columns of the dialog.
inline constexpr TextView GridStyleTitle = u"Report Face Designer";
inline constexpr TextView GridStyleTabs[] = { u"Options", u"Colors", u"Fonts" };
inline constexpr TextView FontColumns[] = { u"name", u"value" };

/// The switches, in the order in which they are loaded and saved.
enum class GridSwitch { ShowHeaders, GridHor, GridVer, GridMerge };
inline constexpr std::size_t GridSwitchCount = 4;
static_assert(static_cast<std::size_t>(GridSwitch::GridMerge) + 1 == GridSwitchCount);

/// The fonts, in the order of their rows.
enum class GridFont { Body, Header, Footer };
inline constexpr std::size_t GridFontCount = 3;
static_assert(static_cast<std::size_t>(GridFont::Footer) + 1 == GridFontCount);

/// The rows of the list of fonts.
inline constexpr auto FontRows
    = std::to_array<TextView>({ u"Font", u"Header Font", u"Footer Font" });
static_assert(FontRows.size() == GridFontCount);

/// The grid style dialog without its widgets.
class GridStyleState {
public:
    /// Loads switches, colours and fonts; what cannot be read is passed over.
    /// @param platform  outlives the dialog
    /// @param own  shown and changed instead of the settings file; null: the file
    explicit GridStyleState(const Platform& platform, ReportSettings* own = nullptr);

    double headerColor = 0; ///< 0x00BBGGRR
    double gridLineColor = 0; ///< 0x00BBGGRR

    /// 0 clear, 1 set, 2 grey.
    std::int16_t value(GridSwitch which) const
    {
        return switches_[static_cast<std::size_t>(which)];
    }
    void setValue(GridSwitch which, std::int16_t value)
    {
        switches_[static_cast<std::size_t>(which)] = value;
    }

    const ColoredFont& font(GridFont which) const
    {
        return fonts_[static_cast<std::size_t>(which)];
    }

    /// The value column of a font's row.
    Text description(GridFont which) const;

    /// A row was clicked. @param name  one of `FontRows`
    void selectRow(TextView name) { selectedRow_ = name; }

    /// "Change Font...": the message to show when no row is selected, or else the font with which
    /// the font dialog is preset.
    std::variant<Message, ColoredFont> pressChangeFont() const;

    /// The font dialog's OK: the selected row takes the font; without a row nothing changes.
    void setChosenFont(const ColoredFont& answer);

    /// Rewrites the settings; keys that the file lacks are passed over.
    SaveOutcome save() const;

private:
    /// The selected row's place, or none.
    std::optional<std::size_t> selectedFont() const;

    const Platform& platform_;
    ReportSettings* own_;
    std::array<std::int16_t, GridSwitchCount> switches_ {};
    std::array<ColoredFont, GridFontCount> fonts_;
    Text selectedRow_;
};

} // namespace pelloric
