// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report_options.h"

#include "lengths.h"
#include "platform/file_bytes.h"
#include "platform/platform.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/text_codec.h"
#include "print/paper_names.h"
#include "report/settings_check.h"
#include "settings/default_settings.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

#include <array>
#include <cmath>
#include <filesystem>
#include <optional>
#include <utility>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "defaults", nullptr, phraseText(u"the default settings, whatever the user's are") },
    { "settings", "FILE",
        phraseText(u"the settings of this file; the default ones for those it lacks") },
    { "title", "TEXT", phraseText(u"title of the file, and centred above every page"), true },
    { "header-left", "TEXT", phraseText(u"above every page, at the left"), true },
    { "header-center", "TEXT", phraseText(u"above every page, in the middle"), true },
    { "header-right", "TEXT", phraseText(u"above every page, at the right"), true },
    { "footer-left", "TEXT", phraseText(u"below every page, at the left"), true },
    { "footer-center", "TEXT", phraseText(u"below every page, in the middle"), true },
    { "footer-right", "TEXT", phraseText(u"below every page, at the right"), true },
    { "paper", "NAME",
        phraseText(u"A2 to A6, B5, Letter, Legal, Tabloid, 8k, 16k, 10x15cm, 4x6in") },
    { "margins", "LENGTHS",
        phraseText(u"top,right,bottom,left, or one for all: 10mm, 1.5cm or 0.5in") },
    { "landscape", nullptr, phraseText(u"the paper's long side lies below") },
    { "portrait", nullptr, phraseText(u"the paper stands upright") },
    { "merge", nullptr, phraseText(u"print equal neighbouring cells once") },
    { "no-headers", nullptr, phraseText(u"leave out the row of column titles") },
    { "font", "NAME", phraseText(u"the face of all texts") },
    { "font-size", "N", phraseText(u"the size of the cells' texts: points") },
    { "widths", "N,N,...",
        phraseText(u"widths of the columns: twips (1440 an inch); 0 leaves one out") },
});

/// An option whose value is a text of the report.
struct TextOption {
    const char* option;
    SettingKey key;
};

constexpr auto TextOptions = std::to_array<TextOption>({
    { "header-left", SettingKey::HeaderLeft },
    { "header-center", SettingKey::HeaderCenter },
    { "header-right", SettingKey::HeaderRight },
    { "footer-left", SettingKey::FooterLeft },
    { "footer-center", SettingKey::FooterCenter },
    { "footer-right", SettingKey::FooterRight },
});

constexpr double LeastPaperMm = 30;
constexpr double MostPaperMm = 2000;

constexpr double LeastFontSize = 1;
constexpr double MostFontSize = 200;

constexpr double TitleFactor = 1.5; ///< of a title's size to that of the cells

QString paperNames()
{
    QStringList names;
    for (const PaperForm& paper : papersToChoose())
        names.append(qt::toQString(paper.name));
    return names.join(QStringLiteral(", "));
}

PaperForm paperOf(const QString& text)
{
    for (const PaperForm& paper : papersToChoose()) {
        if (qt::toQString(paper.name).compare(text, Qt::CaseInsensitive) == 0)
            return paper;
    }
    const std::optional<SizeMm> size = sizeOf(text);
    if (!size)
        throw CommandError(qt::phrased(u"unknown paper \"%1\"; take one of %2, or a size such as "
                                       u"100x150mm or 4x6in")
                               .arg(text, paperNames()),
            WrongUsage);
    const auto held = [&text](double mm) {
        if (mm < LeastPaperMm || mm > MostPaperMm)
            throw CommandError(qt::phrased(u"--paper takes lengths from %1 to %2 mm, not \"%3\"")
                                   .arg(LeastPaperMm)
                                   .arg(MostPaperMm)
                                   .arg(text),
                WrongUsage);
        return mm;
    };
    return { qt::toText(text), held(size->width), held(size->height) };
}

/// The place of a paper in the list of forms, from 1; 0, which is no form, for any other size.
std::int16_t formNumber(const PaperForm& paper)
{
    const auto forms = standardPaperForms();
    const auto isNear = [](double one, double other) { return std::abs(one - other) < 0.5; };
    for (std::size_t at = 0; at < forms.size(); ++at) {
        if (isNear(forms[at].widthMm, paper.widthMm) && isNear(forms[at].heightMm, paper.heightMm))
            return static_cast<std::int16_t>(at + 1);
    }
    return 0;
}

/// An option's value as a text of the report, which stands on one line.
Text textOf(const CommandLine& line, const char* option)
{
    return Text(trimmed(onOneLine(qt::toText(line.value(option)))));
}

void changePaper(const CommandLine& line, ReportSettings& settings)
{
    if (!line.has("paper") && !line.has("landscape") && !line.has("portrait"))
        return;
    if (line.has("landscape") && line.has("portrait"))
        throw CommandError(
            qt::phrased(u"take either --landscape or --portrait, not both"), WrongUsage);
    double& width = settings.paperWidthMm;
    double& height = settings.paperHeightMm;
    bool isLandscape = line.has("landscape");
    if (line.has("paper")) {
        const PaperForm paper = paperOf(line.value("paper"));
        width = paper.widthMm;
        height = paper.heightMm;
        settings.paperName = paper.name;
        settings.paperCode = formNumber(paper);
        isLandscape = isLandscape || (width > height && !line.has("portrait"));
    }
    if (isLandscape == (width < height))
        std::swap(width, height);
    settings.orientation = isLandscape ? 2 : 1;
}

/// In the order of the option.
constexpr double ReportSettings::*Margins[] = { &ReportSettings::topMm, &ReportSettings::rightMm,
    &ReportSettings::bottomMm, &ReportSettings::leftMm };

/// A margin of nothing would be taken for the usual one.
constexpr double LeastMarginMm = 1;

void changeMargins(const CommandLine& line, ReportSettings& settings)
{
    if (!line.has("margins"))
        return;
    const QStringList parts = line.value("margins").split(QLatin1Char(','));
    for (std::size_t margin = 0; margin < std::size(Margins); ++margin) {
        const bool isOne = parts.size() == 1;
        const auto at = isOne ? 0 : static_cast<qsizetype>(margin);
        const std::optional<double> mm = millimetresOf(parts.value(at));
        if ((!isOne && parts.size() != 4) || !mm || *mm < LeastMarginMm || *mm > MostPaperMm)
            throw CommandError(
                qt::phrased(u"--margins takes one length of %1 mm or more and at most %2 mm, or "
                            u"four (top,right,bottom,left), not \"%3\"")
                    .arg(LeastMarginMm)
                    .arg(MostPaperMm)
                    .arg(line.value("margins")),
                WrongUsage);
        settings.*Margins[margin] = *mm;
    }
}

void changeFonts(const CommandLine& line, ReportSettings& settings)
{
    if (line.has("font")) {
        for (FontSettings* const font : { &settings.body, &settings.header, &settings.footer })
            font->name = textOf(line, "font");
    }
    if (line.has("font-size"))
        settings.body.size
            = numberOf("font-size", line.value("font-size"), LeastFontSize, MostFontSize, false);
}

void changeTexts(const CommandLine& line, ReportSettings& settings)
{
    if (line.has("title") && !line.has("header-center")) {
        // A title is larger than the cells, unless the header font is already.
        if (settings.header.size <= settings.body.size) {
            settings.header.size = settings.body.size * TitleFactor;
            settings.header.bold = true;
        }
        setSetting(settings, SettingKey::HeaderCenter, textOf(line, "title"));
    }
    for (const TextOption& row : TextOptions) {
        if (line.has(row.option))
            setSetting(settings, row.key, textOf(line, row.option));
    }
}

/// Tells what is wrong with settings.
/// @throws CommandError no page can be built by them
void check(const ReportSettings& settings, const SettingsSource& source)
{
    for (const SettingProblem& problem : settingProblems(settings, &source)) {
        if (problem.isRefused)
            throw CommandError(qt::phrased(u"%1 Correct it in the file, or do without: --defaults",
                { qt::toQString(problem.text) }));
        if (problem.key)
            tell(qt::toQString(problem.text));
    }
}

/// The settings of a file, with the default ones for those that it lacks.
/// @throws CommandError it is no settings file, or its settings cannot be used
ReportSettings settingsOfFile(const QString& file, const Platform& platform)
{
    Text text;
    try {
        text = platform.codec.decode(readFileBytes(qt::pathOf(file), MostSettingsBytes));
    } catch (const RunTimeError& error) {
        if (error.number() == ErrorNumber::Overflow)
            throw CommandError(qt::phrased(u"%1; settings files are smaller", { detailOf(error) }));
        throw CommandError(describe(error));
    }
    const std::vector<SettingChange> values = settingsIn(text);
    if (values.empty())
        throw CommandError(
            qt::phrased(u"%1 holds no setting; \"pelloric settings --path\" names yours")
                .arg(file));
    const SettingsSnapshot snapshot(settingsTextWith(values));
    ReportSettings settings = readReportSettings(snapshot);
    check(settings, { qt::toText(file), snapshot });
    return settings;
}

/// The user's settings, or the default ones where there are none and none can be made, or those
/// that there are cannot be read, which is told.
ReportSettings settingsOfUser(const Platform& platform)
{
    std::optional<SettingsSnapshot> snapshot;
    try {
        deployDefaultSettings(platform);
        snapshot.emplace(platform);
    } catch (const RunTimeError& error) {
        std::error_code ignored;
        if (std::filesystem::exists(settingsPath(platform), ignored))
            tell(describe(error));
        return {};
    }
    ReportSettings settings = readReportSettings(*snapshot);
    check(settings, { pathText(settingsPath(platform)), *snapshot });
    return settings;
}

ReportSettings presentSettings(const CommandLine& line, const Platform& platform, SettingsBase base)
{
    if (line.has("defaults") && line.has("settings"))
        throw CommandError(
            qt::phrased(u"take either --defaults or --settings, not both"), WrongUsage);
    if (line.has("settings"))
        return settingsOfFile(line.value("settings"), platform);
    if (line.has("defaults") || base == SettingsBase::Defaults)
        return {};
    return settingsOfUser(platform);
}

} // namespace

OptionTable reportOptions() { return Options; }

QString textsDetails()
{
    return qt::phrased(u"The texts above and below every page may hold one of the fields "
                       u"[Date Printed],\n"
                       u"[Time Printed], [Date & Time Printed], [Page # of Pages #], [Total Pages] "
                       u"and [Page #].\n");
}

const char* firstReportOption(const CommandLine& line)
{
    for (const Option& option : Options) {
        if (line.has(option.name))
            return option.name;
    }
    return nullptr;
}

ReportSettings settingsFor(const CommandLine& line, const Platform& platform, SettingsBase base)
{
    ReportSettings settings = presentSettings(line, platform, base);
    if (line.has("no-headers"))
        settings.showHeaders = false;
    if (line.has("merge"))
        settings.mergeCells = true;
    changeFonts(line, settings);
    changePaper(line, settings);
    changeMargins(line, settings);
    changeTexts(line, settings);
    return settings;
}

} // namespace pelloric::app
