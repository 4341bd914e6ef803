// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/settings_table.h"

#include "platform/numbers.h"
#include "platform/run_time_error.h"

#include <cmath>
#include <cstddef>
#include <limits>

namespace pelloric {

namespace {

constexpr SettingRange Colors { .least = 0, .most = 0xFFFFFF };

/// No text is higher than the highest sheet.
constexpr SettingRange Points { .least = 0, .most = 16000, .isAbove = true };

/// A tenth of the longest sheet's twips fits 16 bits.
constexpr SettingRange SheetMm { .least = 0, .most = 5779, .isAbove = true };

/// The twips of a margin fit 16 bits when it is as much larger as it is printed.
constexpr SettingRange atMost(double mm) { return { .least = 0, .most = mm }; }

constexpr auto Settings = std::to_array<Setting>({
    { SettingKey::ShowHeaders, u"ShowHeaders", u"1", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.showHeaders; } },
    { SettingKey::GridHor, u"GridHor", u"1", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.horizontalLines; } },
    { SettingKey::GridVer, u"GridVer", u"1", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.verticalLines; } },
    { SettingKey::GridMerge, u"GridMerge", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.mergeCells; } },
    { SettingKey::HeaderColor, u"HeaderColor", u"14737632", SettingUnit::Color,
        [](ReportSettings& s) -> SettingField { return &s.headerColor; }, Colors },
    { SettingKey::GridLineColor, u"GridLineColor", u"0", SettingUnit::Color,
        [](ReportSettings& s) -> SettingField { return &s.gridLineColor; }, Colors },
    { SettingKey::FontName, u"FontName", u"宋体", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.body.name; } },
    { SettingKey::FontSize, u"FontSize", u"9", SettingUnit::Points,
        [](ReportSettings& s) -> SettingField { return &s.body.size; }, Points },
    { SettingKey::FontBold, u"FontBold", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.body.bold; } },
    { SettingKey::FontItalic, u"FontItalic", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.body.italic; } },
    { SettingKey::FontStrikethru, u"FontStrikethru", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.body.strikethrough; } },
    { SettingKey::FontUnderline, u"FontUnderline", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.body.underline; } },
    { SettingKey::FontColor, u"FontColor", u"0", SettingUnit::Color,
        [](ReportSettings& s) -> SettingField { return &s.body.color; }, Colors },
    { SettingKey::HeaderFontName, u"HeaderFontName", u"宋体", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.header.name; } },
    { SettingKey::HeaderFontSize, u"HeaderFontSize", u"9", SettingUnit::Points,
        [](ReportSettings& s) -> SettingField { return &s.header.size; }, Points },
    { SettingKey::HeaderFontBold, u"HeaderFontBold", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.header.bold; } },
    { SettingKey::HeaderFontItalic, u"HeaderFontItalic", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.header.italic; } },
    { SettingKey::HeaderFontStrikethru, u"HeaderFontStrikethru", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.header.strikethrough; } },
    { SettingKey::HeaderFontUnderline, u"HeaderFontUnderline", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.header.underline; } },
    { SettingKey::HeaderFontColor, u"HeaderFontColor", u"0", SettingUnit::Color,
        [](ReportSettings& s) -> SettingField { return &s.header.color; }, Colors },
    { SettingKey::FooterFontName, u"FooterFontName", u"宋体", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.footer.name; } },
    { SettingKey::FooterFontSize, u"FooterFontSize", u"9", SettingUnit::Points,
        [](ReportSettings& s) -> SettingField { return &s.footer.size; }, Points },
    { SettingKey::FooterFontBold, u"FooterFontBold", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.footer.bold; } },
    { SettingKey::FooterFontItalic, u"FooterFontItalic", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.footer.italic; } },
    { SettingKey::FooterFontStrikethru, u"FooterFontStrikethru", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.footer.strikethrough; } },
    { SettingKey::FooterFontUnderline, u"FooterFontUnderline", u"0", SettingUnit::Switch,
        [](ReportSettings& s) -> SettingField { return &s.footer.underline; } },
    { SettingKey::FooterFontColor, u"FooterFontColor", u"0", SettingUnit::Color,
        [](ReportSettings& s) -> SettingField { return &s.footer.color; }, Colors },
    { SettingKey::PagerSize, u"PagerSize", u"A4", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.paperName; } },
    { SettingKey::PagerOrientation, u"PagerOrientation", u"1", SettingUnit::Code,
        [](ReportSettings& s) -> SettingField { return &s.orientation; },
        { .least = 1, .most = 2 } },
    { SettingKey::PagerSizeValue, u"PagerSizeValue", u"9", SettingUnit::Code,
        [](ReportSettings& s) -> SettingField { return &s.paperCode; } },
    { SettingKey::Top, u"Top", u"10", SettingUnit::Millimetres,
        [](ReportSettings& s) -> SettingField { return &s.topMm; }, atMost(361) },
    { SettingKey::Buttom, u"Buttom", u"10", SettingUnit::Millimetres,
        [](ReportSettings& s) -> SettingField { return &s.bottomMm; }, atMost(321) },
    { SettingKey::Left, u"Left", u"10", SettingUnit::Millimetres,
        [](ReportSettings& s) -> SettingField { return &s.leftMm; }, atMost(481) },
    { SettingKey::Right, u"Right", u"10", SettingUnit::Millimetres,
        [](ReportSettings& s) -> SettingField { return &s.rightMm; }, atMost(481) },
    { SettingKey::PagerWidth, u"PagerWidth", u"210", SettingUnit::Millimetres,
        [](ReportSettings& s) -> SettingField { return &s.paperWidthMm; }, SheetMm },
    { SettingKey::PagerHeight, u"PagerHeight", u"297", SettingUnit::Millimetres,
        [](ReportSettings& s) -> SettingField { return &s.paperHeightMm; }, SheetMm },
    { SettingKey::HeaderLeft, u"HeaderLeft", u"", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.headerTexts[0]; } },
    { SettingKey::HeaderCenter, u"HeaderCenter", u"", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.headerTexts[1]; } },
    { SettingKey::HeaderRight, u"HeaderRight", u"", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.headerTexts[2]; } },
    { SettingKey::FooterLeft, u"FooterLeft", u"", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.footerTexts[0]; } },
    { SettingKey::FooterCenter, u"FooterCenter", u"[Page # of Pages #]", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.footerTexts[1]; } },
    { SettingKey::FooterRight, u"FooterRight", u"", SettingUnit::Text,
        [](ReportSettings& s) -> SettingField { return &s.footerTexts[2]; } },
});
static_assert(Settings.size() == static_cast<std::size_t>(SettingKey::FooterRight) + 1);
static_assert([] {
    for (std::size_t row = 0; row < Settings.size(); ++row) {
        if (Settings[row].key != static_cast<SettingKey>(row))
            return false;
    }
    return true;
}());

constexpr int FontSettingCount
    = static_cast<int>(SettingKey::FontColor) - static_cast<int>(SettingKey::FontName) + 1;
static_assert(static_cast<int>(SettingKey::HeaderFontName)
    == static_cast<int>(SettingKey::FontName) + FontSettingCount);
static_assert(static_cast<int>(SettingKey::FooterFontName)
    == static_cast<int>(SettingKey::HeaderFontName) + FontSettingCount);

std::optional<std::int16_t> wholeCode(TextView text)
{
    try {
        return strictInt16(text);
    } catch (const RunTimeError&) {
        return std::nullopt;
    }
}

struct FillField {
    TextView text;

    void operator()(bool* field) const { *field = leadingNumber(text) != 0; }
    void operator()(double* field) const { *field = leadingNumber(text); }
    void operator()(std::optional<std::int16_t>* field) const { *field = wholeCode(text); }
    void operator()(Text* field) const { *field = Text(text); }
};

struct DescribeField {
    SettingUnit unit;
    char16_t decimalSeparator;

    Text operator()(const bool* field) const { return *field ? u"1" : u"0"; }
    Text operator()(const double* field) const
    {
        return unit == SettingUnit::Points && isHeld(unit, *field)
            ? formatSingle(static_cast<float>(*field), decimalSeparator)
            : formatNumber(*field, decimalSeparator);
    }
    Text operator()(const std::optional<std::int16_t>* field) const
    {
        return *field ? decimal(**field) : Text();
    }
    Text operator()(const Text* field) const { return *field; }
};

} // namespace

std::span<const Setting> settingsTable() { return Settings; }

const Setting& settingOf(SettingKey key) { return Settings[static_cast<std::size_t>(key)]; }

TextView settingName(SettingKey key) { return settingOf(key).name; }

bool isHeld(SettingUnit unit, double value)
{
    return unit == SettingUnit::Points ? std::abs(value) <= std::numeric_limits<float>::max()
                                       : std::isfinite(value);
}

void setSetting(ReportSettings& settings, SettingKey key, TextView text)
{
    std::visit(FillField { text }, settingOf(key).field(settings));
}

Text settingText(const ReportSettings& settings, SettingKey key, char16_t decimalSeparator)
{
    const Setting& row = settingOf(key);
    // The table hands out fields that can be written; this one is only read.
    return std::visit(DescribeField { row.unit, decimalSeparator },
        row.field(const_cast<ReportSettings&>(settings)));
}

SettingKey fontKey(ReportFont font, SettingKey ofBody)
{
    return static_cast<SettingKey>(
        static_cast<int>(ofBody) + static_cast<int>(font) * FontSettingCount);
}

} // namespace pelloric
