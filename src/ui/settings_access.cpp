// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/settings_access.h"

#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "ui/font_description.h"

#include <array>

namespace pelloric {

namespace {

struct StyleKey {
    SettingKey key;
    bool Font::*style;
};

/// In the order in which the styles are saved.
constexpr auto StyleKeys = std::to_array<StyleKey>({
    { SettingKey::FontBold, &Font::bold },
    { SettingKey::FontItalic, &Font::italic },
    { SettingKey::FontStrikethru, &Font::strikethrough },
    { SettingKey::FontUnderline, &Font::underline },
});

} // namespace

LenientSettings::LenientSettings(const Platform& platform, const ReportSettings* own)
    : own_(own)
{
    if (own_ != nullptr)
        return;
    try {
        settings_.emplace(platform);
    } catch (const RunTimeError&) {
        settings_.reset(); // every key is passed over then
    }
}

std::optional<Text> LenientSettings::text(SettingKey key) const
{
    if (own_ != nullptr)
        return settingText(*own_, key, u'.');
    if (!settings_)
        return std::nullopt;
    return settings_->value(settingName(key));
}

std::optional<double> LenientSettings::number(SettingKey key) const
{
    const auto found = text(key);
    if (!found)
        return std::nullopt;
    const double value = leadingNumber(*found);
    return isHeld(settingOf(key).unit, value) ? std::optional(value) : std::nullopt;
}

ColoredFont LenientSettings::font(ReportFont which) const
{
    ColoredFont result;
    if (const auto name = text(fontKey(which, SettingKey::FontName)))
        result.font.name = *name;
    if (const auto size = number(fontKey(which, SettingKey::FontSize)); size)
        result.font.size = static_cast<float>(*size);
    for (const StyleKey& row : StyleKeys)
        result.font.*row.style = number(fontKey(which, row.key)).value_or(0) != 0;
    result.color = number(fontKey(which, SettingKey::FontColor)).value_or(0);
    return result;
}

SettingChanges::SettingChanges(const Platform& platform, ReportSettings* own)
    : platform_(platform)
    , own_(own)
    , decimalSeparator_(own != nullptr ? u'.' : platform.decimalSeparator)
{
}

void SettingChanges::addText(SettingKey key, TextView value)
{
    entries_.push_back({ key, onOneLine(value) });
}

void SettingChanges::addNumber(SettingKey key, double value)
{
    addText(key, formatNumber(value, decimalSeparator_));
}

void SettingChanges::addFont(ReportFont which, const ColoredFont& font)
{
    addText(fontKey(which, SettingKey::FontName), font.font.name);
    addText(fontKey(which, SettingKey::FontSize), formatSingle(font.font.size, decimalSeparator_));
    for (const StyleKey& row : StyleKeys)
        addText(fontKey(which, row.key), font.font.*row.style ? u"1" : u"0");
    addNumber(fontKey(which, SettingKey::FontColor), font.color);
}

SaveOutcome SettingChanges::save(FailurePolicy policy) const
{
    if (own_ != nullptr) {
        for (const Entry& entry : entries_)
            setSetting(*own_, entry.key, trimmed(entry.value));
        return SaveOutcome::Written;
    }
    std::vector<SettingChange> changes;
    for (const Entry& entry : entries_)
        changes.push_back({ settingName(entry.key), entry.value });
    return batchWrite(platform_, changes, policy);
}

ColoredFont chosenFont(ColoredFont answer)
{
    if (answer.font.name.empty())
        answer.font.name = FallbackFace;
    return answer;
}

} // namespace pelloric
