// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/settings_access.h"

#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "ui/font_description.h"

#include <array>
#include <cmath>
#include <limits>

namespace pelloric {

namespace {

struct StyleKey {
    TextView key;
    bool Font::*style;
};

/// In the order in which the styles are saved.
constexpr auto StyleKeys = std::to_array<StyleKey>({
    { u"FontBold", &Font::bold },
    { u"FontItalic", &Font::italic },
    { u"FontStrikethru", &Font::strikethrough },
    { u"FontUnderline", &Font::underline },
});

Text prefixed(TextView prefix, TextView key) { return Text(prefix).append(key); }

bool fitsSingle(double value) { return std::fabs(value) <= std::numeric_limits<float>::max(); }

} // namespace

LenientSettings::LenientSettings(const Platform& platform)
{
    try {
        settings_.emplace(platform);
    } catch (const RunTimeError&) {
        settings_.reset(); // every key is passed over then
    }
}

std::optional<Text> LenientSettings::text(TextView key) const
{
    if (!settings_)
        return std::nullopt;
    return settings_->value(key);
}

std::optional<double> LenientSettings::number(TextView key) const
{
    const auto found = text(key);
    if (!found)
        return std::nullopt;
    const double value = leadingNumber(*found);
    return std::isfinite(value) ? std::optional(value) : std::nullopt;
}

ColoredFont LenientSettings::font(TextView prefix) const
{
    ColoredFont result;
    if (const auto name = text(prefixed(prefix, u"FontName")))
        result.font.name = *name;
    if (const auto size = number(prefixed(prefix, u"FontSize")); size && fitsSingle(*size))
        result.font.size = static_cast<float>(*size);
    for (const StyleKey& row : StyleKeys)
        result.font.*row.style = number(prefixed(prefix, row.key)).value_or(0) != 0;
    result.color = number(prefixed(prefix, u"FontColor")).value_or(0);
    return result;
}

SettingChanges::SettingChanges(const Platform& platform)
    : platform_(platform)
{
}

void SettingChanges::addText(TextView key, TextView value)
{
    Text line = replaceAll(value, u"\r\n", u" ");
    for (char16_t& unit : line) {
        if (unit == u'\r' || unit == u'\n')
            unit = u' ';
    }
    entries_.push_back({ Text(key), std::move(line) });
}

void SettingChanges::addNumber(TextView key, double value)
{
    addText(key, formatNumber(value, platform_.decimalSeparator));
}

void SettingChanges::addFont(TextView prefix, const ColoredFont& font)
{
    addText(prefixed(prefix, u"FontName"), font.font.name);
    addText(
        prefixed(prefix, u"FontSize"), formatSingle(font.font.size, platform_.decimalSeparator));
    for (const StyleKey& row : StyleKeys)
        addText(prefixed(prefix, row.key), font.font.*row.style ? u"1" : u"0");
    addNumber(prefixed(prefix, u"FontColor"), font.color);
}

SaveOutcome SettingChanges::save(FailurePolicy policy) const
{
    std::vector<SettingChange> changes;
    for (const Entry& entry : entries_)
        changes.push_back({ entry.key, entry.value });
    return batchWrite(platform_, changes, policy);
}

ColoredFont chosenFont(ColoredFont answer)
{
    if (answer.font.name.empty())
        answer.font.name = FallbackFace;
    return answer;
}

} // namespace pelloric
