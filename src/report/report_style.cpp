// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/report_style.h"

#include "platform/numbers.h"
#include "platform/run_time_error.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

namespace pelloric {

namespace {

void applyFont(const FontSettings& settings, ReportFont which, ColoredFont& target)
{
    target.font = {};
    target.font.name = settings.name;
    target.font.size = toSingle(settings.size, settingName(fontKey(which, SettingKey::FontSize)));
    target.font.bold = settings.bold;
    target.font.italic = settings.italic;
    target.font.strikethrough = settings.strikethrough;
    target.font.underline = settings.underline;
    target.color = settings.color;
}

struct MarginRow {
    double ReportSettings::*millimetres;
    double factor; ///< how much larger than stored the margin is printed
    std::int16_t PageSetup::*field;
};

constexpr MarginRow Margins[] = {
    { &ReportSettings::topMm, 1.6, &PageSetup::intTop },
    { &ReportSettings::bottomMm, 1.8, &PageSetup::intButtom },
    { &ReportSettings::leftMm, 1.2, &PageSetup::intLeft },
    { &ReportSettings::rightMm, 1.2, &PageSetup::intRight },
};

constexpr std::int16_t DefaultMargin = 2 * TwipsPerCm;

void applyPaper(const ReportSettings& settings, PageSetup& setup)
{
    for (const MarginRow& row : Margins) {
        const double twips = settings.*row.millimetres * row.factor * TwipsPerCm / 10;
        const std::int16_t margin = roundToInt16(twips);
        setup.*row.field = margin == 0 ? DefaultMargin : margin;
    }
    setup.myWidth = roundToInt32(TwipsPerCm * settings.paperWidthMm / 10);
    setup.myHeight = roundToInt32(TwipsPerCm * settings.paperHeightMm / 10);
}

} // namespace

void setPrintableTenths(ReportStyle& style, const PageSetup& setup)
{
    const double width = static_cast<double>(setup.myWidth) - setup.intRight - setup.intLeft;
    const double height = static_cast<double>(setup.myHeight) - setup.intButtom - setup.intTop;
    const std::int16_t widthTenth = roundToInt16(width / 10);
    const std::int16_t heightTenth = roundToInt16(height / 10);
    style.printableWidthTenth = widthTenth;
    style.printableHeightTenth = heightTenth;
}

void applySettings(const ReportSettings& settings, ReportStyle& style, PageSetup& setup)
{
    style.ShowHeaders = settings.showHeaders;
    style.GridHor = settings.horizontalLines;
    style.GridVer = settings.verticalLines;
    style.GridMerge = settings.mergeCells;
    style.HeaderColor = roundToInt32(settings.headerColor);
    style.GridLineColor = roundToInt32(settings.gridLineColor);
    applyFont(settings.body, ReportFont::Body, style.body);
    applyFont(settings.header, ReportFont::Header, style.header);
    applyFont(settings.footer, ReportFont::Footer, style.footer);
    style.PagerSize = settings.paperName;
    style.PagerOrientation = roundToInt16(settings.orientation);
    if (!settings.paperCode)
        throw RunTimeError(ErrorNumber::TypeMismatch, settingName(SettingKey::PagerSizeValue));
    style.PagerSizeValue = *settings.paperCode;
    applyPaper(settings, setup);
    setPrintableTenths(style, setup);
    style.headerTexts = settings.headerTexts;
    style.footerTexts = settings.footerTexts;
}

void loadReportStyle(ReportStyle& style, PageSetup& setup, const Platform& platform)
{
    applySettings(readReportSettings(platform), style, setup);
}

} // namespace pelloric
