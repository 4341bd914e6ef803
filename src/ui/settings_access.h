// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "report/report_style.h"
#include "settings/settings_file.h"

#include <optional>
#include <vector>

namespace pelloric {

/// Reads settings for a dialog, which opens all the same when some of them cannot be read.
class LenientSettings {
public:
    explicit LenientSettings(const Platform& platform);

    /// The value of a key; nothing when there is no file to read.
    std::optional<Text> text(TextView key) const;

    /// The leading number of a key's value; nothing when there is no file to read.
    std::optional<double> number(TextView key) const;

    /// The seven settings of a font; each that cannot be read stays at its initial value.
    /// @param prefix  what the keys begin with: "", "Header" or "Footer"
    ColoredFont font(TextView prefix) const;

private:
    std::optional<SettingsSnapshot> settings_;
};

/// The keys that a dialog rewrites in one save, in the order in which they are added.
class SettingChanges {
public:
    /// @param platform  outlives the changes
    explicit SettingChanges(const Platform& platform);

    /// Line breaks become blanks, for a setting is one line.
    void addText(TextView key, TextView value);
    /// In general form, with the locale's separator.
    void addNumber(TextView key, double value);
    /// The seven settings of a font.
    void addFont(TextView prefix, const ColoredFont& font);

    SaveOutcome save(FailurePolicy policy) const;

private:
    struct Entry {
        Text key;
        Text value;
    };

    const Platform& platform_;
    std::vector<Entry> entries_;
};

/// The font as a font dialog answered it; an empty face becomes `FallbackFace`.
ColoredFont chosenFont(ColoredFont answer);

} // namespace pelloric
