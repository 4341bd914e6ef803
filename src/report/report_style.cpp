// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/report_style.h"

#include "platform/file_bytes.h"
#include "platform/numbers.h"
#include "platform/run_time_error.h"
#include "platform/units.h"
#include "report/settings_check.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

#include <optional>

namespace pelloric {

namespace {

/// Settings whose numbers become those of a style; an error names key and value.
class StyleNumbers {
public:
    StyleNumbers(const ReportSettings& settings, const SettingsSource* source)
        : settings_(settings)
        , source_(source)
    {
    }

    std::int32_t whole(SettingKey key, double value) const
    {
        try {
            return roundToInt32(value);
        } catch (const RunTimeError& error) {
            refuse(error.number(), key);
        }
    }

    std::int16_t shortWhole(SettingKey key, double value) const
    {
        try {
            return roundToInt16(value);
        } catch (const RunTimeError& error) {
            refuse(error.number(), key);
        }
    }

    float single(SettingKey key, double value) const
    {
        try {
            return toSingle(value);
        } catch (const RunTimeError& error) {
            refuse(error.number(), key);
        }
    }

    [[noreturn]] void refuse(ErrorNumber number, SettingKey key) const
    {
        throw settingError(number, key, settings_, source_);
    }

private:
    const ReportSettings& settings_;
    const SettingsSource* source_;
};

void applyFont(const StyleNumbers& numbers, const FontSettings& settings, ReportFont which,
    ColoredFont& target)
{
    target.font = {};
    target.font.name = settings.name;
    target.font.size = numbers.single(fontKey(which, SettingKey::FontSize), settings.size);
    target.font.bold = settings.bold;
    target.font.italic = settings.italic;
    target.font.strikethrough = settings.strikethrough;
    target.font.underline = settings.underline;
    target.color = settings.color;
}

struct MarginRow {
    SettingKey key;
    double ReportSettings::*millimetres;
    double factor; ///< how much larger than stored the margin is printed
    std::int16_t PageSetup::*field;
};

constexpr MarginRow Margins[] = {
    { SettingKey::Top, &ReportSettings::topMm, 1.6, &PageSetup::intTop },
    { SettingKey::Buttom, &ReportSettings::bottomMm, 1.8, &PageSetup::intButtom },
    { SettingKey::Left, &ReportSettings::leftMm, 1.2, &PageSetup::intLeft },
    { SettingKey::Right, &ReportSettings::rightMm, 1.2, &PageSetup::intRight },
};

constexpr std::int16_t DefaultMargin = 2 * TwipsPerCm;

void applyPaper(const StyleNumbers& numbers, const ReportSettings& settings, PageSetup& setup)
{
    for (const MarginRow& row : Margins) {
        const double twips = twipsOfMm(settings.*row.millimetres * row.factor);
        const std::int16_t margin = numbers.shortWhole(row.key, twips);
        setup.*row.field = margin == 0 ? DefaultMargin : margin;
    }
    setup.myWidth = numbers.whole(SettingKey::PagerWidth, twipsOfMm(settings.paperWidthMm));
    setup.myHeight = numbers.whole(SettingKey::PagerHeight, twipsOfMm(settings.paperHeightMm));
}

} // namespace

double marginFactor(SettingKey margin)
{
    for (const MarginRow& row : Margins) {
        if (row.key == margin)
            return row.factor;
    }
    return 1;
}

void setPrintableTenths(ReportStyle& style, const PageSetup& setup)
{
    const double width = static_cast<double>(setup.myWidth) - setup.intRight - setup.intLeft;
    const double height = static_cast<double>(setup.myHeight) - setup.intButtom - setup.intTop;
    const std::int16_t widthTenth = roundToInt16(width / 10);
    const std::int16_t heightTenth = roundToInt16(height / 10);
    style.printableWidthTenth = widthTenth;
    style.printableHeightTenth = heightTenth;
}

void applySettings(const ReportSettings& settings, ReportStyle& style, PageSetup& setup,
    const SettingsSource* source)
{
    const StyleNumbers numbers(settings, source);
    style.ShowHeaders = settings.showHeaders;
    style.GridHor = settings.horizontalLines;
    style.GridVer = settings.verticalLines;
    style.GridMerge = settings.mergeCells;
    style.HeaderColor = numbers.whole(SettingKey::HeaderColor, settings.headerColor);
    style.GridLineColor = numbers.whole(SettingKey::GridLineColor, settings.gridLineColor);
    applyFont(numbers, settings.body, ReportFont::Body, style.body);
    applyFont(numbers, settings.header, ReportFont::Header, style.header);
    applyFont(numbers, settings.footer, ReportFont::Footer, style.footer);
    style.PagerSize = settings.paperName;
    style.PagerOrientation = numbers.shortWhole(SettingKey::PagerOrientation, settings.orientation);
    if (!settings.paperCode)
        numbers.refuse(ErrorNumber::TypeMismatch, SettingKey::PagerSizeValue);
    style.PagerSizeValue = *settings.paperCode;
    applyPaper(numbers, settings, setup);
    try {
        setPrintableTenths(style, setup);
    } catch (const RunTimeError& error) {
        numbers.refuse(error.number(),
            setup.myWidth > setup.myHeight ? SettingKey::PagerWidth : SettingKey::PagerHeight);
    }
    style.headerTexts = settings.headerTexts;
    style.footerTexts = settings.footerTexts;
}

void loadReportStyle(ReportStyle& style, PageSetup& setup, const Platform& platform)
{
    std::optional<SettingsSnapshot> snapshot;
    try {
        snapshot.emplace(platform);
    } catch (const RunTimeError& error) {
        throw missingSettings(error, platform);
    }
    const SettingsSource source { pathText(settingsPath(platform)), *snapshot };
    applySettings(readReportSettings(*snapshot), style, setup, &source);
}

} // namespace pelloric
