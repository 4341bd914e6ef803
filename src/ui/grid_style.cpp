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
constexpr auto SwitchKeys
    = std::to_array<TextView>({ u"ShowHeaders", u"GridHor", u"GridVer", u"GridMerge" });

/// What the keys of the fonts begin with, in the order of `GridFont`.
constexpr auto FontPrefixes = std::to_array<TextView>({ u"", u"Header", u"Footer" });

} // namespace

GridStyleState::GridStyleState(const Platform& platform)
    : platform_(platform)
{
    const LenientSettings settings(platform);
    for (std::size_t which = 0; which < SwitchKeys.size(); ++which)
        switches_[which] = settings.number(SwitchKeys[which]).value_or(0) != 0 ? 1 : 0;
    headerColor = settings.number(u"HeaderColor").value_or(0);
    gridLineColor = settings.number(u"GridLineColor").value_or(0);
    for (std::size_t which = 0; which < FontPrefixes.size(); ++which)
        fonts_[which] = settings.font(FontPrefixes[which]);
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
    SettingChanges changes(platform_);
    for (std::size_t which = 0; which < SwitchKeys.size(); ++which)
        changes.addNumber(SwitchKeys[which], switches_[which]);
    changes.addNumber(u"HeaderColor", headerColor);
    changes.addNumber(u"GridLineColor", gridLineColor);
    for (std::size_t which = 0; which < FontPrefixes.size(); ++which)
        changes.addFont(FontPrefixes[which], fonts_[which]);
    return changes.save(FailurePolicy::SkipStep);
}

} // namespace pelloric
