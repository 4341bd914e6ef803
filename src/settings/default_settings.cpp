// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/default_settings.h"

#include "platform/file_bytes.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "platform/text_codec.h"
#include "settings/settings_file.h"
#include "settings/settings_keys.h"

#include <algorithm>
#include <array>
#include <optional>

namespace pelloric {

namespace {

constexpr auto Defaults = std::to_array<DefaultSetting>({
    { u"ShowHeaders", u"1" },
    { u"GridHor", u"1" },
    { u"GridVer", u"1" },
    { u"GridMerge", u"0" },
    { u"HeaderColor", u"14737632" },
    { u"GridLineColor", u"0" },
    { u"FontName", u"宋体" },
    { u"FontSize", u"9" },
    { u"FontBold", u"0" },
    { u"FontItalic", u"0" },
    { u"FontStrikethru", u"0" },
    { u"FontUnderline", u"0" },
    { u"FontColor", u"0" },
    { u"HeaderFontName", u"宋体" },
    { u"HeaderFontSize", u"9" },
    { u"HeaderFontBold", u"0" },
    { u"HeaderFontItalic", u"0" },
    { u"HeaderFontStrikethru", u"0" },
    { u"HeaderFontUnderline", u"0" },
    { u"HeaderFontColor", u"0" },
    { u"FooterFontName", u"宋体" },
    { u"FooterFontSize", u"9" },
    { u"FooterFontBold", u"0" },
    { u"FooterFontItalic", u"0" },
    { u"FooterFontStrikethru", u"0" },
    { u"FooterFontUnderline", u"0" },
    { u"FooterFontColor", u"0" },
    { u"PagerSize", u"A4" },
    { u"PagerOrientation", u"1" },
    { u"PagerSizeValue", u"9" },
    { u"Top", u"10" },
    { u"Buttom", u"10" },
    { u"Left", u"10" },
    { u"Right", u"10" },
    { u"PagerWidth", u"210" },
    { u"PagerHeight", u"297" },
    { u"HeaderLeft", u"" },
    { u"HeaderCenter", u"" },
    { u"HeaderRight", u"" },
    { u"FooterLeft", u"" },
    { u"FooterCenter", u"[Page # of Pages #]" },
    { u"FooterRight", u"" },
});
static_assert(Defaults.size() == SettingsKeys.size());

constexpr int MostKept = 10000; ///< files beside a settings file

/// Whether a line of the text begins with a key.
bool holdsSettings(TextView text)
{
    while (!text.empty()) {
        const TextView line = text.substr(0, text.find_first_of(u"\r\n"));
        if (std::ranges::any_of(
                SettingsKeys, [line](TextView key) { return trimmed(line).starts_with(key); }))
            return true;
        text.remove_prefix(std::min(text.size(), line.size() + 1));
    }
    return false;
}

/// Copies a file to the first free name beside it; an existing file is never overwritten.
/// @throws RunTimeError WriteFailed: the copy cannot be made
void keepBeside(const std::filesystem::path& path)
{
    std::filesystem::path copy = path;
    copy += ".bak";
    for (int number = 1; number < MostKept; ++number) {
        std::error_code error;
        if (std::filesystem::copy_file(path, copy, error))
            return;
        if (error != std::errc::file_exists)
            break;
        copy = path;
        copy += ".bak" + std::to_string(number);
    }
    throw RunTimeError(ErrorNumber::WriteFailed, pathText(copy));
}

/// The bytes of a file; nothing when it cannot be read.
std::optional<std::string> readableBytes(const std::filesystem::path& path)
{
    try {
        return readFileBytes(path);
    } catch (const RunTimeError&) {
        return std::nullopt;
    }
}

} // namespace

std::span<const DefaultSetting> defaultSettings() { return Defaults; }

Text defaultSettingsText() { return settingsTextWith({}); }

Text settingsTextWith(std::span<const SettingChange> values)
{
    Text text = u"\"\r\n";
    for (const DefaultSetting& setting : Defaults) {
        const auto other = std::ranges::find(values, setting.key, &SettingChange::key);
        const TextView value = other == values.end() ? setting.value : other->value;
        text.append(setting.key).append(u"= ").append(value).append(u"\r\n");
    }
    return text.append(u"\"\r\n");
}

bool deployDefaultSettings(const Platform& platform)
{
    const std::filesystem::path path = settingsPath(platform);
    std::error_code error;
    if (std::filesystem::exists(path, error)) {
        const std::optional<std::string> present = readableBytes(path);
        if (!present || holdsSettings(platform.codec.decode(*present)))
            return false;
    }
    replaceByDefaultSettings(platform, {});
    return true;
}

void replaceByDefaultSettings(const Platform& platform, std::span<const SettingChange> values)
{
    const std::filesystem::path path = settingsPath(platform);
    std::error_code error;
    if (!std::filesystem::exists(path, error))
        std::filesystem::create_directories(path.parent_path(), error);
    const auto lock = lockSettings(platform);
    if (std::filesystem::exists(path, error))
        keepBeside(path);
    replaceSettings(platform, settingsTextWith(values));
}

void resetSettings(const Platform& platform)
{
    const auto lock = lockSettings(platform);
    replaceSettings(platform, defaultSettingsText());
}

} // namespace pelloric
