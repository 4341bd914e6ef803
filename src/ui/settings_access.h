// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "report/report_style.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

#include <optional>
#include <vector>

namespace pelloric {

/// Reads settings for a dialog, which opens all the same when some of them cannot be read.
class LenientSettings {
public:
    /// @param own  read instead of the file; null: the file is read
    explicit LenientSettings(const Platform& platform, const ReportSettings* own = nullptr);

    /// The value of a key; nothing when there is no file to read.
    std::optional<Text> text(SettingKey key) const;

    /// The leading number of a key's value; nothing when there is no file to read.
    std::optional<double> number(SettingKey key) const;

    /// The seven settings of a font; each that cannot be read stays at its initial value.
    ColoredFont font(ReportFont which) const;

private:
    const ReportSettings* own_;
    std::optional<SettingsSnapshot> settings_;
};

/// The keys that a dialog rewrites in one save, in the order in which they are added.
class SettingChanges {
public:
    /// @param platform  outlives the changes
    /// @param own       changed instead of the file; null: the file is written
    explicit SettingChanges(const Platform& platform, ReportSettings* own = nullptr);

    /// Line breaks become blanks, for a setting is one line.
    void addText(SettingKey key, TextView value);
    /// In general form, with the locale's separator.
    void addNumber(SettingKey key, double value);
    /// The seven settings of a font.
    void addFont(ReportFont which, const ColoredFont& font);

    SaveOutcome save(FailurePolicy policy) const;

private:
    struct Entry {
        SettingKey key;
        Text value;
    };

    const Platform& platform_;
    ReportSettings* own_;
    char16_t decimalSeparator_;
    std::vector<Entry> entries_;
};

/// The font as a font dialog answered it; an empty face becomes `FallbackFace`.
ColoredFont chosenFont(ColoredFont answer);

} // namespace pelloric
