// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any texts as fonts, colours, margins and papers: of the settings, and typed into the dialogs.

#include "fuzz_bytes.h"
#include "fuzz_platform.h"

#include "platform/run_time_error.h"
#include "report/report_style.h"
#include "settings/default_settings.h"
#include "settings/settings_table.h"
#include "ui/font_description.h"
#include "ui/grid_style.h"
#include "ui/numeric_text.h"
#include "ui/page_setup.h"

using namespace pelloric;

namespace {

/// A text that is a number, nearly one, or none.
Text valueOf(fuzz::Bytes& bytes)
{
    static constexpr TextView Odd[]
        = { u"", u"-", u".", u"1e9", u"-0", u"1e400", u"0x10", u"10,5", u"1e-400", u"99999999999",
              u"10.5.5", u"  7", u"297.00 mm", u"NaN", u"inf", u"361", u"362" };
    const unsigned kind = bytes.byte();
    if (kind < 4 * std::size(Odd))
        return Text(Odd[kind % std::size(Odd)]);
    return kind < 160 ? decimal(bytes.atMost(9999)) : bytes.text(12);
}

/// The default settings with some values replaced.
void writeSettings(fuzz::Bytes& bytes, fuzz::FuzzPlatform& platform)
{
    platform.folders.write("OstlConfig.ini", toUtf8(defaultSettingsText()));
    for (unsigned left = bytes.atMost(6); left > 0; --left) {
        const TextView key = settingsTable()[bytes.byte() % settingsTable().size()].name;
        const Text value = replaceAll(replaceAll(valueOf(bytes), u"\r", u""), u"\n", u"");
        writeSetting(platform.services, key, value);
    }
}

void load(const Platform& platform)
{
    ReportStyle style;
    PageSetup setup;
    try {
        loadReportStyle(style, setup, platform);
        fuzz::require(setup.intTop != 0 && setup.intLeft != 0);
    } catch (const RunTimeError& error) {
        fuzz::require(
            error.number() == ErrorNumber::Overflow || error.number() == ErrorNumber::TypeMismatch);
        fuzz::require(!error.detail().empty());
    }
}

void typeMargin(fuzz::Bytes& bytes, PageSetupState& state)
{
    const Margin margin = AllMargins[bytes.byte() % AllMargins.size()];
    switch (bytes.atMost(3)) {
    case 0:
        state.typeMargin(margin, valueOf(bytes));
        break;
    case 1:
        state.stepMargin(margin, bytes.chance());
        break;
    case 2:
        state.sketch().mouseDown(margin, bytes.number(), bytes.number());
        state.sketch().mouseMove(margin, bytes.number(), bytes.number());
        state.releaseLine();
        break;
    default:
        state.chooseOrientation(bytes.chance());
    }
    const Text& box = state.marginBox(margin);
    fuzz::require(box.empty() || box.ends_with(u"mm") || !contains(box, u"\n"));
    state.sketch().ruledLines();
}

void pageSetup(fuzz::Bytes& bytes, const Platform& platform)
{
    try {
        PageSetupState state(platform);
        for (unsigned left = bytes.atMost(12); left > 0; --left)
            typeMargin(bytes, state);
        state.paper.widthBox = valueOf(bytes);
        state.formatTexts[bytes.atMost(5)] = bytes.text(12);
        state.headerFont.font.name = bytes.text(8);
        fontDescription(state.headerFont.font);
        state.save();
    } catch (const RunTimeError& error) {
        fuzz::require(error.number() == ErrorNumber::Overflow);
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static fuzz::FuzzPlatform platform;
    if (size > 1U << 12U)
        return 0;
    fuzz::Bytes bytes(data, size);
    writeSettings(bytes, platform);
    load(platform.services);
    pageSetup(bytes, platform.services);
    GridStyleState grid(platform.services);
    grid.selectRow(FontRows[bytes.atMost(2)]);
    grid.pressChangeFont();
    grid.description(static_cast<GridFont>(bytes.atMost(2)));
    grid.headerColor = bytes.number();
    grid.save();
    load(platform.services);
    const Text typed = bytes.text(20);
    fuzz::require(numericCharacters(typed).size() <= typed.size());
    twoDecimals(bytes.number());
    return 0;
}
