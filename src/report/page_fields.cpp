// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/page_fields.h"

#include "document/recorder.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "platform/services.h"
#include "report/report_style.h"
#include "settings/settings_table.h"

#include <array>

namespace pelloric {

namespace {

Text dateField(std::int64_t, const Clock& clock) { return clock.date(); }

Text timeField(std::int64_t, const Clock& clock) { return clock.time(); }

Text dateAndTimeField(std::int64_t, const Clock& clock)
{
    return clock.date() + u" " + clock.time();
}

Text pageOfPagesField(std::int64_t page, const Clock&)
{
    return decimal(page) + u" of " + Text(PageCountToken);
}

Text totalPagesField(std::int64_t, const Clock&) { return Text(PageCountToken); }

Text pageField(std::int64_t page, const Clock&) { return decimal(page); }

struct FieldToken {
    TextView token;
    Text (*expand)(std::int64_t page, const Clock& clock);
};

/// In the order in which a text is searched; the first token found is the one expanded.
constexpr auto FieldTokens = std::to_array<FieldToken>({
    { u"[Date Printed]", dateField },
    { u"[Time Printed]", timeField },
    { u"[Date & Time Printed]", dateAndTimeField },
    { u"[Page # of Pages #]", pageOfPagesField },
    { u"[Total Pages]", totalPagesField },
    { u"[Page #]", pageField },
});

/// One line of three texts.
struct SlotLine {
    const SlotTexts& texts;
    const ColoredFont& font;
    std::int64_t page; ///< from 1
    Twips y; ///< twips
};

/// @throws RunTimeError Overflow: the settings hold no colour
Color inkOf(const ColoredFont& font)
{
    try {
        return roundToInt32(font.color);
    } catch (const RunTimeError& error) {
        throw RunTimeError(error.number(),
            phrase(u"the colour %1 of the font %2 is not between 0 and %3",
                { formatNumber(font.color), font.font.name,
                    formatNumber(settingOf(SettingKey::FontColor).range.most) }));
    }
}

/// Draws the slots that are not empty.
/// @return whether there was one
bool drawSlots(const SlotLine& line, const ReportStyle& style, const PageSetup& setup,
    const Clock& clock, Recorder& recorder)
{
    const auto output = [&](const Text& text) {
        return hasPageField(text) ? expandPageField(text, line.page, clock) : text;
    };
    const auto& [left, centre, right] = line.texts;
    recorder.setTextFont(line.font.font, inkOf(line.font));
    if (!left.empty()) {
        recorder.moveTo({ setup.intLeft, line.y });
        recorder.printText(output(left), true);
    }
    if (!centre.empty()) {
        const Twips width = recorder.textWidth(centre);
        const double room = static_cast<double>(setup.myWidth) - width;
        recorder.printCentred(output(centre), roundHalfEven(room / 2), width, line.y);
    }
    if (!right.empty()) {
        recorder.moveTo({ setup.intLeft + 9 * style.printableWidthTenth, line.y });
        recorder.printText(output(right), true);
    }
    recorder.setTextFont(style.body.font, inkOf(style.body));
    return !left.empty() || !centre.empty() || !right.empty();
}

} // namespace

bool hasPageField(TextView text)
{
    const TextView searched = trimmed(text);
    for (const FieldToken& field : FieldTokens) {
        if (contains(searched, field.token))
            return true;
    }
    return false;
}

Text expandPageField(TextView text, std::int64_t page, const Clock& clock)
{
    for (const FieldToken& field : FieldTokens) {
        const std::size_t found = text.find(field.token);
        if (found == TextView::npos)
            continue;
        Text expanded(text.substr(0, found));
        expanded.append(field.expand(page, clock));
        return expanded.append(text.substr(found + field.token.size()));
    }
    return u"No." + decimal(page);
}

PageLines::PageLines(
    const ReportStyle& style, const PageSetup& setup, const Clock& clock, Recorder& recorder)
    : style_(style)
    , setup_(setup)
    , clock_(clock)
    , recorder_(recorder)
{
}

void PageLines::drawPageHeader(std::int64_t page)
{
    const SlotLine line { style_.headerTexts, style_.header, page, setup_.intTop };
    if (!drawSlots(line, style_, setup_, clock_, recorder_))
        recorder_.setCurrentY(setup_.intTop);
}

void PageLines::drawPageFooter(std::int64_t page, double y)
{
    const SlotLine line { style_.footerTexts, style_.footer, page, roundToInt32(y) };
    drawSlots(line, style_, setup_, clock_, recorder_);
}

} // namespace pelloric
