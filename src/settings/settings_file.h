// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/files.h"
#include "platform/text.h"

#include <filesystem>
#include <span>
#include <utility>

namespace pelloric {

struct Platform;
struct ReportSettings;

/// A settings file of more bytes is refused before it is read to its end.
inline constexpr std::size_t MostSettingsBytes = 1U << 24U;

/// The settings file "OstlConfig.ini" in the system directory, asked for afresh at every call.
///
/// It is a list of lines of the form key, "= ", value. What the program saves is one quoted text:
/// the first and the last line are a lone double quote each. There is no cache of it, and the
/// system never adds a key.
std::filesystem::path settingsPath(const Platform& platform);

/// Keeps other programs from changing the settings until it is given back.
/// @return  null where there is no folder or no lock in reasonable time; the settings are changed
///          without it then
std::unique_ptr<FolderLock> lockSettings(const Platform& platform);

/// Replaces the file's whole content; a link is followed.
///
/// At every moment the file holds the old content or the new one.
/// @param content  as it is to stand in the file
/// @throws RunTimeError WriteFailed, DiskFull or PermissionDenied, with the path
void replaceSettings(const Platform& platform, TextView content);

/// The trimmed value of a key: what follows the first "=" of the first line that holds the key
/// anywhere, letter case told apart.
///
/// Which line a key finds is decided by the order of the lines, so "Left" finds a "HeaderLeft"
/// that stands above it; that is kept. A line without "=" is the value as a whole. When no line
/// holds the key, the last line of the file is the result, and of an empty file the empty text.
///
/// For hosts that ask for one key; a report and the dialogs ask a `SettingsSnapshot` for all.
/// @throws RunTimeError FileNotFound: the file is missing or cannot be read
Text readSetting(const Platform& platform, TextView key);

/// The whole settings text, ready to be rewritten: CR LF, then every line with a CR LF behind it,
/// without the empty lines and those that begin with a double quote.
/// @throws RunTimeError FileNotFound: the file is missing or cannot be read
Text readSettingsText(const Platform& platform);

/// The line of a key inside a settings text, from the key's first occurrence to the CR.
///
/// @return  borrowed from `text`
/// @throws RunTimeError InvalidCall: the key does not occur, or no CR stands behind it
TextView findSettingLine(TextView key, TextView text);

/// A key and its new value, which holds neither CR nor LF.
struct SettingChange {
    TextView key;
    TextView value;
};

/// What a batch does with a step that fails.
enum class FailurePolicy {
    StopAtFirst, ///< nothing is written
    SkipStep, ///< the next step runs
};

/// How a save ended.
enum class SaveOutcome {
    Written,
    NothingWritten, ///< a step failed before the file was touched; it is as it was
    WriteFailed, ///< not written; the file holds what it held as far as the disk allows
};

/// Rewrites one key; a key that is not in the file is never added.
///
/// The key's line is replaced everywhere it occurs, inside other lines too. A step that fails is
/// skipped: a missing file becomes one that holds two double quotes and CR LF. Only a file that
/// exists and cannot be read is left alone, for its settings would be lost.
SaveOutcome writeSetting(const Platform& platform, TextView key, TextView value);

/// Rewrites several keys, one after the other, in one save.
SaveOutcome batchWrite(
    const Platform& platform, std::span<const SettingChange> changes, FailurePolicy policy);

/// The settings file as it was at one moment, for a loader that asks for many keys.
class SettingsSnapshot {
public:
    /// Reads the file once.
    /// @throws RunTimeError FileNotFound: the file is missing or cannot be read
    explicit SettingsSnapshot(const Platform& platform);
    /// A settings text that is held already.
    explicit SettingsSnapshot(Text text)
        : text_(std::move(text))
    {
    }

    /// What `readSetting` answers for the key.
    Text value(TextView key) const;

    const Text& text() const { return text_; }

private:
    Text text_;
};

/// All settings as a file held them.
ReportSettings readReportSettings(const SettingsSnapshot& snapshot);

/// All settings as the file holds them.
/// @throws RunTimeError FileNotFound: the file is missing or cannot be read
ReportSettings readReportSettings(const Platform& platform);

} // namespace pelloric
