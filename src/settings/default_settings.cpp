// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/default_settings.h"

#include "platform/file_bytes.h"
#include "platform/files.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "platform/text_codec.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

#include <algorithm>
#include <string>

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

/// @return  None: the copy is whole; else there is none, and what was begun of it is gone
FileFault copyTo(FileSystem& files, const std::filesystem::path& path, std::string_view bytes,
    const std::filesystem::path& like)
{
    OpenedFile copy = files.create(path, like);
    if (!copy.file)
        return copy.fault;
    if (copy.file->write(bytes) && copy.file->sync())
        return FileFault::None;
    const FileFault fault = copy.file->fault();
    copy.file.reset(); // some systems remove no file that is open
    std::error_code ignored;
    std::filesystem::remove(path, ignored);
    return fault == FileFault::None ? FileFault::Other : fault;
}

/// Copies a file to the first free name beside it; an existing file is never overwritten.
/// @throws RunTimeError WriteFailed, PermissionDenied, DiskFull, with the path: the copy cannot be
///         made
void keepBeside(FileSystem& files, const std::filesystem::path& path)
{
    const std::string bytes = readFileBytes(path);
    std::filesystem::path copy = path;
    copy += ".bak";
    FileFault fault = copyTo(files, copy, bytes, path);
    for (int number = 1; number < MostKept && fault == FileFault::Exists; ++number) {
        copy = path;
        copy += ".bak" + std::to_string(number);
        fault = copyTo(files, copy, bytes, path);
    }
    if (fault != FileFault::None)
        throw RunTimeError(errorNumberOf(fault), pathText(copy));
}

/// Whether there is a file that must be left alone: one that holds settings or cannot be read.
bool isTaken(const Platform& platform)
{
    const std::filesystem::path path = settingsPath(platform);
    std::error_code error;
    if (!std::filesystem::exists(path, error))
        return false;
    try {
        return holdsSettings(platform.codec.decode(readFileBytes(path, MostSettingsBytes)));
    } catch (const RunTimeError&) {
        return true;
    }
}

/// Under the lock.
void replace(const Platform& platform, std::span<const SettingChange> values)
{
    const std::filesystem::path path = settingsPath(platform);
    std::error_code error;
    if (std::filesystem::exists(path, error))
        keepBeside(platform.files, path);
    replaceSettings(platform, settingsTextWith(values));
}

void createFolder(const Platform& platform)
{
    std::error_code error;
    std::filesystem::create_directories(settingsPath(platform).parent_path(), error);
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
    if (isTaken(platform))
        return false;
    createFolder(platform);
    const auto lock = lockSettings(platform);
    if (isTaken(platform))
        return false;
    replace(platform, {});
    return true;
}

void replaceByDefaultSettings(const Platform& platform, std::span<const SettingChange> values)
{
    createFolder(platform);
    const auto lock = lockSettings(platform);
    replace(platform, values);
}

void resetSettings(const Platform& platform)
{
    const auto lock = lockSettings(platform);
    replaceSettings(platform, defaultSettingsText());
}

} // namespace pelloric
