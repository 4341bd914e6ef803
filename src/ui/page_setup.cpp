// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/page_setup.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/platform.h"
#include "platform/run_time_error.h"
#include "report/settings_check.h"
#include "ui/font_description.h"
#include "ui/numeric_text.h"

#include <cmath>
#include <utility>

namespace pelloric {

namespace {

constexpr TextView SizeUnit = u"mm";
constexpr TextView MarginUnit = u" mm";

/// The keys of the six boxes, in the order of the boxes.
constexpr auto FormatKeys = std::to_array<SettingKey>({
    SettingKey::HeaderLeft,
    SettingKey::HeaderCenter,
    SettingKey::HeaderRight,
    SettingKey::FooterLeft,
    SettingKey::FooterCenter,
    SettingKey::FooterRight,
});
static_assert(FormatKeys.size() == PageSetupState::FormatBoxes);
constexpr std::size_t FooterBox = 3; ///< index of the first footer box

struct MarginKey {
    SettingKey key;
    Margin margin;
};

/// In the order in which the margins are loaded and saved.
constexpr auto MarginKeys = std::to_array<MarginKey>({
    { SettingKey::Top, Margin::Top },
    { SettingKey::Buttom, Margin::Bottom },
    { SettingKey::Left, Margin::Left },
    { SettingKey::Right, Margin::Right },
});

/// Problems that are about no key's value are about the file.
Text fileHintOf(const Platform& platform)
{
    for (const SettingProblem& problem : settingProblems(platform)) {
        if (!problem.key)
            return phrase(u"%1 OK will save nothing.", { problem.text });
    }
    return {};
}

Text marginText(double millimetres) { return formatNumber(millimetres).append(MarginUnit); }

/// Adds what stands before "mm" in a size box; an empty box leaves its key alone.
/// @throws RunTimeError InvalidCall: the box holds something, but no "mm"
void addSize(SettingChanges& changes, SettingKey key, TextView box)
{
    if (box.empty())
        return;
    const std::size_t unit = box.find(SizeUnit);
    if (unit == TextView::npos)
        throw RunTimeError(ErrorNumber::InvalidCall, settingName(key));
    changes.addText(key, box.substr(0, unit));
}

} // namespace

PageSetupState::PageSetupState(const Platform& platform, ReportSettings* own)
    : PageSetupState(platform, platform.printers.forms(), own)
{
}

PageSetupState::PageSetupState(
    const Platform& platform, const std::vector<PaperForm>& forms, ReportSettings* own)
    : platform_(platform)
    , own_(own)
    , fileHint_(own != nullptr ? Text() : fileHintOf(platform))
    , rows_(pelloric::paperRows(forms))
{
    restoreMargins();
    const LenientSettings settings(platform, own);
    headerFont = settings.font(ReportFont::Header);
    footerFont = settings.font(ReportFont::Footer);
    loadTexts(settings);
    loadPaper(settings);
    loadMargins(settings);
}

void PageSetupState::setForms(const std::vector<PaperForm>& forms)
{
    rows_ = pelloric::paperRows(forms);
}

void PageSetupState::loadTexts(const LenientSettings& settings)
{
    for (std::size_t box = 0; box < formatTexts.size(); ++box)
        formatTexts[box] = settings.text(FormatKeys[box]).value_or(Text());
}

void PageSetupState::loadPaper(const LenientSettings& settings)
{
    paper.paperName = settings.text(SettingKey::PagerSize).value_or(Text());
    try {
        paper.paperCode = strictInt16(settings.text(SettingKey::PagerSizeValue).value_or(u"0"));
    } catch (const RunTimeError&) {
        paper.paperCode = 0; // no form has this code
    }
    if (const auto width = settings.text(SettingKey::PagerWidth))
        paper.widthBox = *width + Text(SizeUnit);
    if (const auto height = settings.text(SettingKey::PagerHeight))
        paper.heightBox = *height + Text(SizeUnit);
    chooseOrientation(
        roundHalfEven(settings.number(SettingKey::PagerOrientation).value_or(1)) == 1);
}

void PageSetupState::loadMargins(const LenientSettings& settings)
{
    for (const MarginKey& row : MarginKeys) {
        const double stored = settings.number(row.key).value_or(0);
        if (stored != 0)
            writeBox(row.margin, marginText(stored));
    }
}

void PageSetupState::writeBox(Margin margin, Text text)
{
    const double units = toSketchUnits(leadingNumber(text));
    boxes_[static_cast<std::size_t>(margin)] = std::move(text);
    if (std::isfinite(units))
        sketch_.setMargin(margin, units);
}

void PageSetupState::typeMargin(Margin margin, TextView text)
{
    writeBox(margin, numericCharacters(text).append(MarginUnit));
}

void PageSetupState::stepMargin(Margin margin, bool up)
{
    const double value = leadingNumber(marginBox(margin));
    if (up || value > 0)
        writeBox(margin, marginText(up ? value + 1 : value - 1));
}

void PageSetupState::restoreMargins()
{
    for (const Margin margin : AllMargins)
        writeBox(margin, marginText(toMillimetres(SketchScale)));
}

void PageSetupState::releaseLine()
{
    if (const auto margin = sketch_.mouseUp())
        writeBox(*margin, twoDecimals(toMillimetres(sketch_.margin(*margin))).append(MarginUnit));
}

void PageSetupState::chooseOrientation(bool portrait)
{
    paper.chooseOrientation(portrait);
    sizeSketch();
}

void PageSetupState::sizeSketch()
{
    picture_ = sketchRect(SketchFrameWidth, SketchFrameHeight, paper.isPortrait());
    sketch_.setSize(picture_.width, picture_.height);
}

void PageSetupState::focusFormatBox(int box)
{
    if (box >= 1 && box <= FormatBoxes)
        lastFormatBox_ = box;
}

void PageSetupState::chooseField(int entry)
{
    if (lastFormatBox_ == 0 || entry < 0 || entry >= static_cast<int>(FieldEntries.size()))
        return;
    formatTexts[static_cast<std::size_t>(lastFormatBox_ - 1)]
        = FieldEntries[static_cast<std::size_t>(entry)].field;
}

Text PageSetupState::headerFontText() const { return fontDescription(headerFont.font); }

Text PageSetupState::footerFontText() const { return fontDescription(footerFont.font); }

SaveOutcome PageSetupState::save() const
{
    SettingChanges changes(platform_, own_);
    changes.addText(SettingKey::PagerSize, paper.paperName);
    try {
        addSize(changes, SettingKey::PagerWidth, paper.widthBox);
        addSize(changes, SettingKey::PagerHeight, paper.heightBox);
    } catch (const RunTimeError&) {
        return SaveOutcome::NothingWritten;
    }
    changes.addNumber(SettingKey::PagerOrientation, paper.orientation);
    changes.addNumber(SettingKey::PagerSizeValue, paper.paperCode);
    for (const MarginKey& row : MarginKeys)
        changes.addNumber(row.key, toMillimetres(sketch_.margin(row.margin)));
    changes.addFont(ReportFont::Header, headerFont);
    for (std::size_t box = 0; box < FooterBox; ++box)
        changes.addText(FormatKeys[box], trimmed(formatTexts[box]));
    changes.addFont(ReportFont::Footer, footerFont);
    for (std::size_t box = FooterBox; box < formatTexts.size(); ++box)
        changes.addText(FormatKeys[box], trimmed(formatTexts[box]));
    return changes.save(FailurePolicy::StopAtFirst);
}

} // namespace pelloric
