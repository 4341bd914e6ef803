// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/report_style.h"

#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "settings/settings_file.h"

#include <limits>

namespace pelloric {

namespace {

/// Reads one key after the other as the type that its value has.
class StyleReader {
public:
    explicit StyleReader(const Platform& platform)
        : settings_(platform)
    {
    }

    Text text(TextView key) const { return settings_.value(key); }
    double number(TextView key) const { return leadingNumber(text(key)); }
    bool truth(TextView key) const { return number(key) != 0; }
    Color color(TextView key) const { return roundToInt32(number(key)); }

    float single(TextView key) const
    {
        const double value = number(key);
        if (!(value <= std::numeric_limits<float>::max()
                && value >= std::numeric_limits<float>::lowest()))
            throw RunTimeError(ErrorNumber::Overflow, key);
        return static_cast<float>(value);
    }

private:
    SettingsSnapshot settings_;
};

/// The keys of a font all begin with the same word.
void loadFont(const StyleReader& read, const Text& prefix, ColoredFont& target)
{
    target.font = {};
    target.font.name = read.text(prefix + u"FontName");
    target.font.size = read.single(prefix + u"FontSize");
    target.font.bold = read.truth(prefix + u"FontBold");
    target.font.italic = read.truth(prefix + u"FontItalic");
    target.font.strikethrough = read.truth(prefix + u"FontStrikethru");
    target.font.underline = read.truth(prefix + u"FontUnderline");
    target.color = read.number(prefix + u"FontColor");
}

struct MarginRow {
    TextView key;
    double factor; ///< how much larger than stored the margin is printed
    std::int16_t PageSetup::*field;
};

constexpr MarginRow Margins[] = {
    { u"Top", 1.6, &PageSetup::intTop },
    { u"Buttom", 1.8, &PageSetup::intButtom },
    { u"Left", 1.2, &PageSetup::intLeft },
    { u"Right", 1.2, &PageSetup::intRight },
};

constexpr std::int16_t DefaultMargin = 2 * TwipsPerCm;

void loadPaper(const StyleReader& read, PageSetup& setup)
{
    for (const MarginRow& row : Margins) {
        const double twips = read.number(row.key) * row.factor * TwipsPerCm / 10;
        const std::int16_t margin = roundToInt16(twips);
        setup.*row.field = margin == 0 ? DefaultMargin : margin;
    }
    setup.myWidth = roundToInt32(TwipsPerCm * read.number(u"PagerWidth") / 10);
    setup.myHeight = roundToInt32(TwipsPerCm * read.number(u"PagerHeight") / 10);
}

constexpr TextView SlotNames[] = { u"Left", u"Center", u"Right" };

void loadSlots(const StyleReader& read, const Text& prefix, SlotTexts& slots)
{
    for (std::size_t slot = 0; slot < slots.size(); ++slot)
        slots[slot] = read.text(prefix + Text(SlotNames[slot]));
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

void loadReportStyle(ReportStyle& style, PageSetup& setup, const Platform& platform)
{
    const StyleReader read(platform);
    style.ShowHeaders = read.truth(u"ShowHeaders");
    style.GridHor = read.truth(u"GridHor");
    style.GridVer = read.truth(u"GridVer");
    style.GridMerge = read.truth(u"GridMerge");
    style.HeaderColor = read.color(u"HeaderColor");
    style.GridLineColor = read.color(u"GridLineColor");
    loadFont(read, u"", style.body);
    loadFont(read, u"Header", style.header);
    loadFont(read, u"Footer", style.footer);
    style.PagerSize = read.text(u"PagerSize");
    style.PagerOrientation = roundToInt16(read.number(u"PagerOrientation"));
    style.PagerSizeValue = strictInt16(read.text(u"PagerSizeValue"));
    loadPaper(read, setup);
    setPrintableTenths(style, setup);
    loadSlots(read, u"Header", style.headerTexts);
    loadSlots(read, u"Footer", style.footerTexts);
}

} // namespace pelloric
