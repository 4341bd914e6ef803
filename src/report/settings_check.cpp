// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/settings_check.h"

#include "document/page_document.h"
#include "platform/file_bytes.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/platform.h"
#include "report/report_style.h"
#include "settings/default_settings.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <span>
#include <utility>

namespace pelloric {

namespace {

/// Settings with the place where they came from.
struct Judged {
    const ReportSettings& settings;
    const SettingsSource* source;
};

/// What the value of one key must be, for a person; other keys go by their unit. "%1" stands for
/// the most that its row of the settings allows.
struct LimitRow {
    SettingKey key;
    TextView limit;
};

constexpr auto Limits = std::to_array<LimitRow>({
    { SettingKey::PagerOrientation, phraseText(u"1 is portrait and 2 is landscape") },
    { SettingKey::PagerSizeValue,
        phraseText(u"the number of a paper is a whole number, such as 9") },
    { SettingKey::Top, phraseText(u"this margin is at most %1 mm") },
    { SettingKey::Buttom, phraseText(u"this margin is at most %1 mm") },
    { SettingKey::Left, phraseText(u"this margin is at most %1 mm") },
    { SettingKey::Right, phraseText(u"this margin is at most %1 mm") },
    { SettingKey::PagerWidth, phraseText(u"a sheet is wider than 0 and no wider than %1 mm") },
    { SettingKey::PagerHeight, phraseText(u"a sheet is higher than 0 and no higher than %1 mm") },
});

TextView limitOf(SettingKey key)
{
    const auto row = std::ranges::find(Limits, key, &LimitRow::key);
    if (row != Limits.end())
        return row->limit;
    switch (settingOf(key).unit) {
    case SettingUnit::Color:
        return phraseText(u"a colour is a number from 0 to %1");
    case SettingUnit::Points:
        return phraseText(u"a font size is a number of points above 0, at most %1");
    case SettingUnit::Switch:
    case SettingUnit::Millimetres:
    case SettingUnit::Code:
    case SettingUnit::Text:
        break;
    }
    return {};
}

/// The fonts of header and footer are in both dialogs.
bool isInPageSetup(SettingKey key) { return key >= SettingKey::HeaderFontName; }

bool isInGridStyle(SettingKey key) { return key < SettingKey::PagerSize; }

/// "Top= 4000".
Text assignment(const Judged& judged, SettingKey key)
{
    const TextView name = settingName(key);
    const Text value = judged.source != nullptr ? judged.source->snapshot.value(name)
                                                : settingText(judged.settings, key, u'.');
    return Text(name).append(u"= ").append(value);
}

/// "Top= 4000 in /…/OstlConfig.ini".
Text inFile(const Text& what, const SettingsSource* source)
{
    return source != nullptr ? phrase(u"%1 in %2", { what, source->file }) : what;
}

/// "Top= 4000 in /…/OstlConfig.ini: this margin is at most 361 mm".
Text describeValue(const Judged& judged, SettingKey key)
{
    Text text = inFile(assignment(judged, key), judged.source);
    const TextView limit = limitOf(key);
    if (limit.empty())
        return text;
    return text.append(u": ").append(phrase(limit, { formatNumber(settingOf(key).range.most) }));
}

/// The line that begins with a key, without the key and what stands up to its "=".
std::optional<TextView> ownValue(TextView text, TextView key)
{
    while (!text.empty()) {
        const TextView line = text.substr(0, text.find_first_of(u"\r\n"));
        text.remove_prefix(std::min(text.size(), line.size() + 1));
        if (!trimmed(line).starts_with(key))
            continue;
        const TextView rest = trimmed(trimmed(line).substr(key.size()));
        if (rest.starts_with(u'='))
            return trimmed(rest.substr(1));
    }
    return std::nullopt;
}

std::vector<SettingKey> missingKeys(const SettingsSource* source)
{
    std::vector<SettingKey> missing;
    for (const Setting& row : settingsTable()) {
        if (source != nullptr && !ownValue(source->snapshot.text(), row.name))
            missing.push_back(row.key);
    }
    return missing;
}

/// "GridHor, GridVer and 3 more settings are missing in /…/OstlConfig.ini."
SettingProblem problemOfMissing(std::span<const SettingKey> keys, const SettingsSource* source)
{
    constexpr std::size_t MostNamed = 3;
    const bool isCut = keys.size() > MostNamed;
    const std::size_t listed = isCut ? MostNamed : keys.size() - 1;
    Text names;
    for (const SettingKey key : keys.first(listed))
        names.append(names.empty() ? u"" : u", ").append(settingName(key));
    if (isCut)
        names = phrase(u"%1 and %2 more settings",
            { names, decimal(static_cast<std::int64_t>(keys.size() - listed)) });
    else if (listed > 0)
        names = phrase(u"%1 and %2", { names, settingName(keys.back()) });
    else
        names = settingName(keys.back());
    const TextView missing
        = keys.size() == 1 ? phraseText(u"%1 is missing") : phraseText(u"%1 are missing");
    return { .text = inFile(phrase(missing, { names }), source).append(u"."), .key = {} };
}

/// Whether a style takes settings.
bool isTaken(const ReportSettings& settings)
{
    ReportStyle style;
    PageSetup setup;
    try {
        applySettings(settings, style, setup);
        return true;
    } catch (const RunTimeError&) {
        return false;
    }
}

/// The default settings with one that is judged.
ReportSettings alone(const Judged& judged, SettingKey key)
{
    ReportSettings one;
    ReportSettings present = judged.settings;
    const SettingField from = settingOf(key).field(present);
    const SettingField to = settingOf(key).field(one);
    std::visit([&to](auto* value) { *std::get<decltype(value)>(to) = *value; }, from);
    return one;
}

/// Whether a value that a style takes can be seen on a page.
bool isUsable(const Judged& judged, SettingKey key)
{
    ReportSettings present = judged.settings;
    const SettingField field = settingOf(key).field(present);
    const double* const number
        = std::holds_alternative<double*>(field) ? std::get<double*>(field) : nullptr;
    if (number == nullptr)
        return true;
    const Setting& row = settingOf(key);
    switch (row.unit) {
    case SettingUnit::Points:
        return row.range.holds(*number);
    case SettingUnit::Color:
        return std::abs(*number) <= std::numeric_limits<Color>::max();
    default:
        return !row.range.isAbove || *number > row.range.least;
    }
}

/// Margins that leave nothing of the paper between them.
std::optional<SettingProblem> marginProblem(const Judged& judged)
{
    ReportStyle style;
    PageSetup setup;
    applySettings(judged.settings, style, setup);
    const bool isHigh = setup.intTop + setup.intButtom >= setup.myHeight;
    const bool isWide = 2 * setup.intLeft >= setup.myWidth;
    if (!isHigh && !isWide)
        return std::nullopt;
    const SettingKey first = isHigh ? SettingKey::Top : SettingKey::Left;
    Text text = assignment(judged, first);
    for (const SettingKey key : { isHigh ? SettingKey::Buttom : SettingKey::Right,
             isHigh ? SettingKey::PagerHeight : SettingKey::PagerWidth })
        text.append(u", ").append(assignment(judged, key));
    text = inFile(text, judged.source).append(u": ");
    text.append(
        phrase(u"the margins leave no room on the sheet; they are printed larger than stored, "
               u"1.6 times at the top, 1.8 times at the bottom and 1.2 times at the sides."));
    return SettingProblem { .text = text, .key = first, .isInPageSetup = true };
}

SettingsSource sourceOf(const Platform& platform, const SettingsSnapshot& snapshot)
{
    return { pathText(settingsPath(platform)), snapshot };
}

/// Whether the file says of itself that it is written in an encoding of Unicode's own.
bool hasByteOrderMark(const Platform& platform)
{
    try {
        const std::string bytes = readFileBytes(settingsPath(platform), MostSettingsBytes);
        return bytes.starts_with("\xEF\xBB\xBF") || bytes.starts_with("\xFF\xFE")
            || bytes.starts_with("\xFE\xFF");
    } catch (const RunTimeError&) {
        return false; // a file that has gone meanwhile is told by the next load
    }
}

} // namespace

std::vector<SettingProblem> settingProblems(const Platform& platform)
{
    std::optional<SettingsSnapshot> snapshot;
    try {
        snapshot.emplace(platform);
    } catch (const RunTimeError& error) {
        return { { .text = error.text() + u".", .key = {}, .isRefused = true } };
    }
    const SettingsSource source = sourceOf(platform, *snapshot);
    std::vector<SettingProblem> problems = settingProblems(readReportSettings(*snapshot), &source);
    if (hasByteOrderMark(platform))
        problems.push_back(
            { .text = phrase(u"%1 begins with a byte-order mark, which belongs to another "
                             u"encoding; settings are written in GB18030.",
                  { source.file }),
                .key = {} });
    return problems;
}

std::vector<SettingProblem> settingProblems(
    const ReportSettings& settings, const SettingsSource* source)
{
    const Judged judged { settings, source };
    const std::vector<SettingKey> missing = missingKeys(source);
    const bool isWhole = isTaken(settings);
    std::vector<SettingProblem> problems;
    for (const Setting& row : settingsTable()) {
        const bool isRefused = !isWhole && !isTaken(alone(judged, row.key));
        const bool isThere = std::ranges::find(missing, row.key) == missing.end();
        if (isThere && (isRefused || !isUsable(judged, row.key)))
            problems.push_back({ describeValue(judged, row.key).append(u"."), row.key,
                isInPageSetup(row.key), isInGridStyle(row.key), isRefused });
    }
    if (isWhole && problems.empty() && missing.empty()) {
        if (auto margins = marginProblem(judged))
            problems.push_back(std::move(*margins));
    }
    if (!missing.empty())
        problems.push_back(problemOfMissing(missing, source));
    return problems;
}

RunTimeError settingError(ErrorNumber number, SettingKey key, const ReportSettings& settings,
    const SettingsSource* source)
{
    if (source != nullptr && !ownValue(source->snapshot.text(), settingName(key))) {
        const Text missing = phrase(u"%1 is missing", { settingName(key) });
        return RunTimeError(
            number, phrase(u"%1; restore the defaults", { inFile(missing, source) }));
    }
    return RunTimeError(number,
        phrase(u"%1; correct it in %2 or restore the defaults",
            { describeValue({ settings, source }, key),
                isInGridStyle(key) ? TextView(u"Design Report") : TextView(u"Page Setup") }));
}

RunTimeError missingSettings(const RunTimeError& cause, const Platform& platform)
{
    return RunTimeError(cause.number(),
        phrase(u"%1, which holds paper, margins and style; restore the defaults",
            { pathText(settingsPath(platform)) }));
}

std::vector<SettingChange> settingsIn(TextView text)
{
    std::vector<SettingChange> settings;
    for (const Setting& row : settingsTable()) {
        if (const auto value = ownValue(text, row.name))
            settings.push_back({ row.name, *value });
    }
    return settings;
}

void restoreDefaultSettings(const Platform& platform)
{
    std::optional<SettingsSnapshot> present;
    try {
        present.emplace(platform);
    } catch (const RunTimeError&) {
        return replaceByDefaultSettings(platform, {});
    }
    std::vector<SettingChange> kept = settingsIn(present->text());
    for (const SettingProblem& problem : settingProblems(platform)) {
        if (problem.key)
            std::erase_if(kept, [&problem](const SettingChange& setting) {
                return setting.key == settingName(*problem.key);
            });
    }
    replaceByDefaultSettings(platform, kept);
}

void restoreDefaultSettings(ReportSettings& settings)
{
    for (const SettingProblem& problem : settingProblems(settings)) {
        if (problem.key)
            setSetting(settings, *problem.key, settingOf(*problem.key).start);
    }
}

} // namespace pelloric
