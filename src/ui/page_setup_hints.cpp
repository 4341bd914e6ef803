// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/page_setup_hints.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/units.h"
#include "report/report_style.h"
#include "settings/settings_table.h"
#include "ui/page_setup.h"

#include <cmath>
#include <limits>

namespace pelloric {

namespace {

double longestSheetMm() { return settingOf(SettingKey::PagerWidth).range.most; }

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
    if (box.find(u"mm") == TextView::npos || !(length > 0) || length > longestSheetMm())
        return std::nullopt;
    return length;
}

Text sizeHint(TextView name, TextView box)
{
    if (box.empty())
        return phrase(u"%1 is empty: OK keeps the stored one.", { name });
    if (box.find(u"mm") == TextView::npos)
        return phrase(
            u"%1 \"%2\" lacks its unit, as in \"210mm\": OK will save nothing of all three "
            u"tabs.",
            { name, box });
    const double length = leadingNumber(box);
    if (!(length > 0))
        return phrase(
            u"%1 must be above 0: OK will store it, and no page can be laid out.", { name });
    if (length > longestSheetMm())
        return phrase(u"%1 is at most %2: OK will store it, and no page can be built until it is "
                      u"smaller.",
            { name, millimetres(longestSheetMm()) });
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
    return phrase(u"%1 %2 is printed as %3",
        { settingName(name.key), millimetres(storedMargin(state, name.margin)),
            millimetres(printedMargin(state, name.margin)) });
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
    const Text margin = printedAs(state, name);
    if (twipsOfMm(printed) > std::numeric_limits<std::int16_t>::max())
        return phrase(
            u"%1; a margin is at most %2 here. OK will store it, and no page can be built until "
            u"it is smaller.",
            { margin,
                millimetres(std::floor(std::numeric_limits<std::int16_t>::max() / twipsOfMm(1)
                    / marginFactor(name.key))) });
    if (std::abs(twipsOfMm(printed)) < 0.5)
        return phrase(u"%1 0 mm is printed as 20 mm.", { settingName(name.key) });
    if (stored < 0)
        return phrase(u"%1 lies outside the sheet. OK will store it all the same.",
            { settingName(name.key) });
    const std::optional<double> room = sheet.along(name);
    if (!room)
        return {};
    const Text facts = phrase(name.isHorizontal ? phraseText(u"%1, and the sheet is %2 high")
                                                : phraseText(u"%1, and the sheet is %2 wide"),
        { margin, millimetres(*room) });
    if (printed >= *room)
        return phrase(u"%1: it lies outside. OK will store it all the same.", { facts });
    if (name.margin == Margin::Right)
        return {}; // takes no room from the columns
    const double opposite = printedMargin(state, oppositeOf(name));
    if (printed + opposite >= *room && printed >= opposite) // said once, of the larger one
        return phrase(name.isHorizontal
                ? phraseText(u"%1: there is no room left for a row. OK will store it all the same.")
                : phraseText(u"%1: there is no room left for a column. OK will store it all the "
                             u"same."),
            { facts });
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
