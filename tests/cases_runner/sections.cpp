// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "steps.h"
#include "world.h"

#include "settings/settings_file.h"

#include <fstream>
#include <iterator>
#include <stdexcept>

namespace pelloric::cases {

namespace {

Json lineOf(const Lineobj& line)
{
    return Json::array({ line.LineWidth, line.LineStyle, line.LineColor, line.FillStyle,
        line.FillColor, line.pt1.x, line.pt1.y, line.pt2.x, line.pt2.y });
}

Json textRecordOf(const Textobj& text)
{
    return Json::array({ text.prnFont.bold ? 1 : 0, text.prnFont.italic ? 1 : 0,
        jsonOf(text.prnFont.name), static_cast<double>(text.prnFont.size), text.ForeColor,
        text.pt.x, text.pt.y, jsonOf(text.Str) });
}

Json pageOf(const PageDocument& document, int page)
{
    Json lines = Json::array();
    for (std::size_t index = 0; index < document.lines(page).size(); ++index)
        lines.push_back(lineOf(document.line(page, index)));
    Json texts = Json::array();
    for (std::size_t index = 0; index < document.texts(page).size(); ++index)
        texts.push_back(textRecordOf(document.text(page, index)));
    return { { "lines", std::move(lines) }, { "texts", std::move(texts) } };
}

Json documentSection(World& world)
{
    const Canvas& canvas = world.canvas;
    const PageSetup& page = canvas.page;
    Json pages = Json::array();
    for (int index = 0; index < canvas.document().pageCount(); ++index)
        pages.push_back(pageOf(canvas.document(), index));
    return { { "Totalpages", canvas.Totalpages() }, { "Currentpage", canvas.Currentpage() },
        { "myWidth", page.myWidth }, { "myHeight", page.myHeight },
        { "margins",
            { { "intTop", page.intTop }, { "intButtom", page.intButtom },
                { "intLeft", page.intLeft }, { "intRight", page.intRight } } },
        { "pages", std::move(pages) } };
}

Json builtOf(const GridTable& table)
{
    Json fields = Json::array();
    for (const Text& name : table.fieldNames)
        fields.push_back(jsonOf(name));
    Json bands = Json::array();
    for (const ColPos& band : table.ColumnBands)
        bands.push_back(Json::array({ band.StartCol, band.EndCol }));
    return { { "fields", std::move(fields) }, { "ColumnWidths", table.ColumnWidths },
        { "tableWidth", table.tableWidth }, { "ColumnBands", std::move(bands) } };
}

Json tableSection(World& world)
{
    const GridTable* table = world.canvas.table();
    return { { "built", table != nullptr ? builtOf(*table) : Json() },
        { "host widths", world.grid ? world.grid->widths() : std::vector<double>() } };
}

Json progressSection(World& world)
{
    const ProgressBar& progress = world.buildBar.bar();
    return { { "maximum", progress.maximum }, { "value", progress.value } };
}

Json fontOf(const ColoredFont& font)
{
    return Json::array(
        { jsonOf(font.font.name), static_cast<double>(font.font.size), font.font.bold,
            font.font.italic, font.font.strikethrough, font.font.underline, font.color });
}

Json slotsOf(const SlotTexts& slots)
{
    return Json::array({ jsonOf(slots[0]), jsonOf(slots[1]), jsonOf(slots[2]) });
}

Json styleSection(World& world)
{
    const ReportStyle& style = world.canvas.style();
    return { { "ShowHeaders", style.ShowHeaders }, { "GridHor", style.GridHor },
        { "GridVer", style.GridVer }, { "GridMerge", style.GridMerge },
        { "HeaderColor", style.HeaderColor }, { "GridLineColor", style.GridLineColor },
        { "bodyFont", fontOf(style.body) }, { "headerFont", fontOf(style.header) },
        { "footerFont", fontOf(style.footer) }, { "PagerSize", jsonOf(style.PagerSize) },
        { "PagerOrientation", style.PagerOrientation }, { "PagerSizeValue", style.PagerSizeValue },
        { "printableWidthTenth", style.printableWidthTenth },
        { "printableHeightTenth", style.printableHeightTenth },
        { "header", slotsOf(style.headerTexts) }, { "footer", slotsOf(style.footerTexts) } };
}

Json barOf(const ScrollBar& bar)
{
    if (!bar.enabled)
        return { { "enabled", false }, { "value", bar.value } };
    return { { "enabled", true }, { "maximum", bar.maximum }, { "value", bar.value },
        { "large change", bar.largeChange }, { "small change", bar.smallChange } };
}

Json viewSection(World& world)
{
    const ViewState& view = world.canvas.view();
    const PageFacts facts = world.canvas.facts();
    Json surfaces = Json::array();
    Json pages = Json::array();
    for (std::size_t surface = 0; surface < view.surfaces.size(); ++surface) {
        surfaces.push_back(Json::array({ view.surfaces[surface].x, view.surfaces[surface].y }));
        const auto page = pageOnSurface(view, facts, static_cast<int>(surface));
        pages.push_back(page ? Json(*page) : Json());
    }
    return { { "divisor", static_cast<double>(view.divisor) }, { "inner width", view.innerWidth },
        { "inner height", view.innerHeight },
        { "OrderStyle", static_cast<std::int32_t>(view.style) }, { "columns", view.grid.columns },
        { "rows", view.grid.rows },
        { "window", Json::array({ view.window.nPages, view.window.MinPage, view.window.MaxPage }) },
        { "multi-page", view.multiPage }, { "ReSetLeftTop", view.ReSetLeftTop },
        { "pan", view.pan }, { "Hbar", barOf(view.Hbar) }, { "Vbar", barOf(view.Vbar) },
        { "surfaces", std::move(surfaces) }, { "pages", std::move(pages) } };
}

Json settingsSection(World& world)
{
    std::ifstream file(world.settingsFile(), std::ios::binary);
    if (!file)
        return nullptr;
    const std::string bytes { std::istreambuf_iterator<char>(file), {} };
    return jsonOf(world.codec.decode(bytes));
}

Json messagesSection(World& world) { return world.messages.shown; }

struct SectionRow {
    const char* name;
    Json (*dump)(World&);
};

constexpr SectionRow Sections[] = {
    { "document", documentSection },
    { "table", tableSection },
    { "progress", progressSection },
    { "style", styleSection },
    { "view", viewSection },
    { "settings", settingsSection },
    { "messages", messagesSection },
};

} // namespace

Json dumpSection(World& world, const std::string& name)
{
    for (const SectionRow& row : Sections) {
        if (name == row.name)
            return row.dump(world);
    }
    throw std::invalid_argument("unknown section \"" + name + "\"");
}

} // namespace pelloric::cases
