// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/grid_style.h"

#include "controls/messages.h"
#include "platform/platform.h"
#include "ui/font_description.h"

#include <algorithm>

namespace pelloric {

namespace {

/// The switches' keys, in the order of `GridSwitch`.
constexpr auto SwitchKeys = std::to_array<SettingKey>(
    { SettingKey::ShowHeaders, SettingKey::GridHor, SettingKey::GridVer, SettingKey::GridMerge });
static_assert(SwitchKeys.size() == GridSwitchCount);

/// The fonts, in the order of `GridFont`.
constexpr auto Fonts
    = std::to_array<ReportFont>({ ReportFont::Body, ReportFont::Header, ReportFont::Footer });
static_assert(Fonts.size() == GridFontCount);

} // namespace

GridStyleState::GridStyleState(const Platform& platform, ReportSettings* own)
    : platform_(platform)
    , own_(own)
{
    const LenientSettings settings(platform, own);
    for (std::size_t which = 0; which < SwitchKeys.size(); ++which)
        switches_[which] = settings.number(SwitchKeys[which]).value_or(0) != 0 ? 1 : 0;
    headerColor = settings.number(SettingKey::HeaderColor).value_or(0);
    gridLineColor = settings.number(SettingKey::GridLineColor).value_or(0);
    for (std::size_t which = 0; which < Fonts.size(); ++which)
        fonts_[which] = settings.font(Fonts[which]);
}

Text GridStyleState::description(GridFont which) const { return fontDescription(font(which).font); }

std::optional<std::size_t> GridStyleState::selectedFont() const
{
    const auto row = std::find(FontRows.begin(), FontRows.end(), selectedRow_);
    if (row == FontRows.end())
        return std::nullopt;
    return static_cast<std::size_t>(row - FontRows.begin());
}

std::variant<Message, ColoredFont> GridStyleState::pressChangeFont() const
{
    const auto selected = selectedFont();
    if (!selected)
        return messageOf(Notice::NoFontRow);
    return fonts_[*selected];
}

void GridStyleState::setChosenFont(const ColoredFont& answer)
{
    if (const auto selected = selectedFont())
        fonts_[*selected] = chosenFont(answer);
}

SaveOutcome GridStyleState::save() const
{
    SettingChanges changes(platform_, own_);
    for (std::size_t which = 0; which < SwitchKeys.size(); ++which)
        changes.addNumber(SwitchKeys[which], switches_[which]);
    changes.addNumber(SettingKey::HeaderColor, headerColor);
    changes.addNumber(SettingKey::GridLineColor, gridLineColor);
    for (std::size_t which = 0; which < Fonts.size(); ++which)
        changes.addFont(Fonts[which], fonts_[which]);
    return changes.save(FailurePolicy::SkipStep);
}

} // namespace pelloric
