// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/page_setup_hints.h"

#include "platform/numbers.h"
#include "platform/units.h"
#include "report/report_style.h"
#include "settings/settings_table.h"
#include "ui/page_setup.h"

#include <cmath>
#include <limits>

namespace pelloric {

namespace {

constexpr double LongestSheetMm = 5779; ///< whose tenth of twips still fits 16 bits

/// A margin and what stands for it in texts.
struct MarginName {
    Margin margin;
    SettingKey key;
    bool isHorizontal; ///< it takes room from the sheet's height
};

constexpr auto Names = std::to_array<MarginName>({
    { Margin::Top, SettingKey::Top, true },
    { Margin::Right, SettingKey::Right, false },
    { Margin::Bottom, SettingKey::Buttom, true },
    { Margin::Left, SettingKey::Left, false },
});

constexpr bool isInOrderOfMargins()
{
    for (std::size_t at = 0; at < Names.size(); ++at) {
        if (static_cast<std::size_t>(Names[at].margin) != at)
            return false;
    }
    return Names.size() == AllMargins.size();
}
static_assert(isInOrderOfMargins());

const MarginName& nameOf(Margin margin) { return Names[static_cast<std::size_t>(margin)]; }

/// "12.5 mm": at most one decimal.
Text millimetres(double length)
{
    return formatNumber(std::round(length * 10) / 10).append(u" mm");
}

/// The millimetres before the unit of a size box; nothing when there is no such number.
std::optional<double> lengthOf(TextView box)
{
    const double length = leadingNumber(box);
    if (box.find(u"mm") == TextView::npos || !(length > 0) || length > LongestSheetMm)
        return std::nullopt;
    return length;
}

Text sizeHint(TextView name, TextView box)
{
    Text text(name);
    if (box.empty())
        return text.append(u" is empty: OK keeps the stored one.");
    if (box.find(u"mm") == TextView::npos)
        return text.append(u" \"").append(box).append(
            u"\" lacks its unit, as in \"210mm\": OK will save nothing of all three tabs.");
    const double length = leadingNumber(box);
    if (!(length > 0))
        return text.append(u" must be above 0: OK will store it, and no page can be laid out.");
    if (length > LongestSheetMm)
        return text.append(u" is at most ")
            .append(millimetres(LongestSheetMm))
            .append(u": OK will store it, and no page can be built until it is smaller.");
    return {};
}

/// What the margins are judged by.
struct Sheet {
    std::optional<double> width; ///< mm
    std::optional<double> height; ///< mm

    std::optional<double> along(const MarginName& name) const
    {
        return name.isHorizontal ? height : width;
    }
};

double storedMargin(const PageSetupState& state, Margin margin)
{
    return toMillimetres(state.sketch().margin(margin));
}

double printedMargin(const PageSetupState& state, Margin margin)
{
    return storedMargin(state, margin) * marginFactor(nameOf(margin).key);
}

/// "Top 120 mm is printed as 192 mm".
Text printedAs(const PageSetupState& state, const MarginName& name)
{
    return Text(settingName(name.key))
        .append(u" ")
        .append(millimetres(storedMargin(state, name.margin)))
        .append(u" is printed as ")
        .append(millimetres(printedMargin(state, name.margin)));
}

/// The margin across from one; to the room of the columns the left one counts twice.
Margin oppositeOf(const MarginName& name)
{
    if (!name.isHorizontal)
        return Margin::Left;
    return name.margin == Margin::Top ? Margin::Bottom : Margin::Top;
}

Text marginHint(const PageSetupState& state, const Sheet& sheet, const MarginName& name)
{
    const double stored = storedMargin(state, name.margin);
    const double printed = printedMargin(state, name.margin);
    Text text = printedAs(state, name);
    if (twipsOfMm(printed) > std::numeric_limits<std::int16_t>::max())
        return text.append(u"; a margin is at most ")
            .append(millimetres(std::floor(
                std::numeric_limits<std::int16_t>::max() / twipsOfMm(1) / marginFactor(name.key))))
            .append(u" here. OK will store it, and no page can be built until it is smaller.");
    if (std::abs(twipsOfMm(printed)) < 0.5)
        return Text(settingName(name.key)).append(u" 0 mm is printed as 20 mm.");
    if (stored < 0)
        return Text(settingName(name.key))
            .append(u" lies outside the sheet. OK will store it all the same.");
    const std::optional<double> room = sheet.along(name);
    if (!room)
        return {};
    text.append(u", and the sheet is ").append(millimetres(*room));
    text.append(name.isHorizontal ? TextView(u" high") : TextView(u" wide"));
    if (printed >= *room)
        return text.append(u": it lies outside. OK will store it all the same.");
    if (name.margin == Margin::Right)
        return {}; // takes no room from the columns
    const double opposite = printedMargin(state, oppositeOf(name));
    if (printed + opposite >= *room && printed >= opposite) // said once, of the larger one
        return text
            .append(name.isHorizontal ? TextView(u": there is no room left for a row.")
                                      : TextView(u": there is no room left for a column."))
            .append(u" OK will store it all the same.");
    return {};
}

} // namespace

PageSetupHints hintsOf(const PageSetupState& state)
{
    PageSetupHints hints;
    const PaperChoice& paper = state.paper;
    hints.sizes = sizeHint(u"Width", paper.widthBox);
    const Text height = sizeHint(u"Height", paper.heightBox);
    if (!hints.sizes.empty() && !height.empty())
        hints.sizes.append(u" ");
    hints.sizes.append(height);
    const Sheet sheet { lengthOf(paper.widthBox), lengthOf(paper.heightBox) };
    for (const MarginName& name : Names)
        hints.margins[static_cast<std::size_t>(name.margin)] = marginHint(state, sheet, name);
    hints.file = state.fileHint();
    return hints;
}

} // namespace pelloric
