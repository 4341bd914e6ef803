// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/default_settings.h"

#include "platform/file_bytes.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "platform/text_codec.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

#include <algorithm>
#include <optional>

namespace pelloric {

namespace {

constexpr int MostKept = 10000; ///< files beside a settings file

/// Whether a line of the text begins with a key.
bool holdsSettings(TextView text)
{
    while (!text.empty()) {
        const TextView line = text.substr(0, text.find_first_of(u"\r\n"));
        if (std::ranges::any_of(settingsTable(),
                [line](const Setting& row) { return trimmed(line).starts_with(row.name); }))
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
        return readFileBytes(path, MostSettingsBytes);
    } catch (const RunTimeError&) {
        return std::nullopt;
    }
}

} // namespace

Text defaultSettingsText() { return settingsTextWith({}); }

Text settingsTextWith(std::span<const SettingChange> values)
{
    Text text = u"\"\r\n";
    for (const Setting& setting : settingsTable()) {
        const auto other = std::ranges::find(values, setting.name, &SettingChange::key);
        const TextView value = other == values.end() ? setting.start : other->value;
        text.append(setting.name).append(u"= ").append(value).append(u"\r\n");
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
