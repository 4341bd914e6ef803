// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/settings_file.h"

#include "platform/file_bytes.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "platform/safe_file.h"
#include "platform/services.h"
#include "platform/text_codec.h"
#include "settings/settings_table.h"

#include <optional>

namespace pelloric {

namespace {

constexpr TextView LineEnd = u"\r\n";
constexpr char16_t Quote = u'"';

/// The lines of a text; one ends at CR LF, at LF alone or at CR alone.
class Lines {
public:
    explicit Lines(TextView text)
        : rest_(text)
    {
    }

    std::optional<TextView> next()
    {
        if (rest_.empty())
            return std::nullopt;
        const TextView line = rest_.substr(0, rest_.find_first_of(LineEnd));
        rest_.remove_prefix(line.size());
        rest_.remove_prefix(rest_.starts_with(LineEnd) ? 2 : rest_.empty() ? 0 : 1);
        return line;
    }

private:
    TextView rest_;
};

Text valueOf(TextView key, TextView text)
{
    Lines lines(text);
    TextView last;
    while (const auto line = lines.next()) {
        last = *line;
        if (contains(last, key)) {
            const std::size_t equals = last.find(u'=');
            return Text(trimmed(equals == TextView::npos ? last : last.substr(equals + 1)));
        }
    }
    return Text(trimmed(last));
}

Text rewritable(TextView content)
{
    Text text(LineEnd);
    Lines lines(content);
    while (const auto line = lines.next()) {
        if (!line->empty() && line->front() != Quote)
            text.append(*line).append(LineEnd);
    }
    return text;
}

/// @throws RunTimeError InvalidCall: the key is not in the text, which stays as it is
void replaceSetting(Text& text, const SettingChange& change)
{
    const TextView oldLine = findSettingLine(change.key, text);
    Text newLine(change.key);
    newLine.append(u"= ").append(change.value);
    text = replaceAll(text, oldLine, newLine);
}

/// The file before a save, as bytes; nothing when there is none.
struct OldFile {
    std::optional<std::string> bytes;
    bool isUnreadable = false;
};

OldFile readOldFile(const std::filesystem::path& path)
{
    try {
        return { readFileBytes(path, MostSettingsBytes), false };
    } catch (const RunTimeError&) {
        std::error_code error;
        const auto type = std::filesystem::status(path, error).type();
        return { std::nullopt, type != std::filesystem::file_type::not_found };
    }
}

SaveOutcome save(const Platform& platform, TextView text)
{
    Text quoted(1, Quote);
    quoted.append(text).append(1, Quote).append(LineEnd);
    try {
        replaceSettings(platform, quoted);
    } catch (const RunTimeError&) {
        return SaveOutcome::WriteFailed;
    }
    return SaveOutcome::Written;
}

} // namespace

std::filesystem::path settingsPath(const Platform& platform)
{
    return platform.folders.systemDirectory() / "OstlConfig.ini";
}

std::unique_ptr<FolderLock> lockSettings(const Platform& platform)
{
    std::error_code error;
    const auto path = std::filesystem::weakly_canonical(settingsPath(platform), error);
    return platform.files.lock(path.parent_path());
}

void replaceSettings(const Platform& platform, TextView content)
{
    std::string bytes;
    platform.codec.encode(content, bytes);
    SafeFile file(platform.files, settingsPath(platform));
    file.write(bytes);
    file.putInPlace();
}

Text readSetting(const Platform& platform, TextView key)
{
    return SettingsSnapshot(platform).value(key);
}

Text readSettingsText(const Platform& platform)
{
    return rewritable(
        platform.codec.decode(readFileBytes(settingsPath(platform), MostSettingsBytes)));
}

TextView findSettingLine(TextView key, TextView text)
{
    const std::size_t start = text.find(key);
    if (start == TextView::npos)
        throw RunTimeError(ErrorNumber::InvalidCall, key);
    const std::size_t end = text.find(u'\r', start + key.size());
    if (end == TextView::npos)
        throw RunTimeError(ErrorNumber::InvalidCall, key);
    return text.substr(start, end - start);
}

SaveOutcome writeSetting(const Platform& platform, TextView key, TextView value)
{
    const SettingChange change { key, value };
    return batchWrite(platform, { &change, 1 }, FailurePolicy::SkipStep);
}

SaveOutcome batchWrite(
    const Platform& platform, std::span<const SettingChange> changes, FailurePolicy policy)
{
    const auto lock = lockSettings(platform);
    const OldFile old = readOldFile(settingsPath(platform));
    const bool stops = policy == FailurePolicy::StopAtFirst;
    if (stops && !old.bytes)
        return SaveOutcome::NothingWritten;
    if (old.isUnreadable)
        return SaveOutcome::WriteFailed;
    Text text = old.bytes ? rewritable(platform.codec.decode(*old.bytes)) : Text();
    for (const SettingChange& change : changes) {
        try {
            replaceSetting(text, change);
        } catch (const RunTimeError&) {
            if (stops)
                return SaveOutcome::NothingWritten;
        }
    }
    return save(platform, text);
}

SettingsSnapshot::SettingsSnapshot(const Platform& platform)
    : text_(platform.codec.decode(readFileBytes(settingsPath(platform), MostSettingsBytes)))
{
}

Text SettingsSnapshot::value(TextView key) const { return valueOf(key, text_); }

ReportSettings readReportSettings(const Platform& platform)
{
    return readReportSettings(SettingsSnapshot(platform));
}

ReportSettings readReportSettings(const SettingsSnapshot& snapshot)
{
    ReportSettings settings;
    for (const Setting& row : settingsTable())
        setSetting(settings, row.key, snapshot.value(row.name));
    return settings;
}

} // namespace pelloric
