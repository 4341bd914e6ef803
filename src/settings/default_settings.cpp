// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/default_settings.h"

#include "platform/file_bytes.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "platform/text_codec.h"
#include "settings/settings_file.h"
#include "settings/settings_keys.h"

#include <array>

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

} // namespace

std::span<const DefaultSetting> defaultSettings() { return Defaults; }

Text defaultSettingsText()
{
    Text text = u"\"\r\n";
    for (const DefaultSetting& setting : Defaults)
        text.append(setting.key).append(u"= ").append(setting.value).append(u"\r\n");
    return text.append(u"\"\r\n");
}

bool deployDefaultSettings(const Platform& platform)
{
    const std::filesystem::path path = settingsPath(platform);
    std::error_code error;
    if (std::filesystem::exists(path, error))
        return false;
    std::filesystem::create_directories(path.parent_path(), error);
    std::string bytes;
    platform.codec.encode(defaultSettingsText(), bytes);
    if (!createFile(path, bytes))
        throw RunTimeError(ErrorNumber::WriteFailed, pathText(path));
    return true;
}

} // namespace pelloric
