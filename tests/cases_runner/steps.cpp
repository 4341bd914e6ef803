// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "steps.h"

#include "world.h"

#include "platform/numbers.h"
#include "platform/run_time_error.h"
#include "print/page_list.h"
#include "report/page_fields.h"
#include "settings/settings_file.h"
#include "settings/text_helpers.h"
#include "ui/print_options.h"

#include <algorithm>
#include <array>
#include <fstream>
#include <stdexcept>

namespace pelloric::cases {

namespace {

/// The arguments of a step, taken by their place.
class Arguments {
public:
    explicit Arguments(const Json& step)
        : step_(step)
    {
    }

    const Json& json(std::size_t place) const { return step_.at(place + 1); }
    Text text(std::size_t place) const { return textOf(json(place)); }
    double number(std::size_t place) const { return json(place).get<double>(); }
    float single(std::size_t place) const { return static_cast<float>(number(place)); }
    bool truth(std::size_t place) const { return json(place).get<bool>(); }
    std::int32_t whole(std::size_t place) const { return json(place).get<std::int32_t>(); }
    std::int16_t shortWhole(std::size_t place) const { return narrowToInt16(whole(place)); }
    char16_t unit(std::size_t place) const { return text(place).at(0); }

private:
    const Json& step_;
};

using Args = const Arguments&;
using Call = Json (*)(World&, Args);

Json rowTextHeight(World& world, Args args)
{
    const auto rows = makeRecord(args.json(0), args.json(1));
    const auto widths = args.json(2).get<std::vector<double>>();
    return world.canvas.recorder().rowTextHeight(*rows, widths, args.truth(3), u'.');
}

Json batch(World& world, Args args)
{
    std::vector<std::pair<Text, Text>> texts;
    for (const Json& pair : args.json(0))
        texts.emplace_back(textOf(pair.at(0)), textOf(pair.at(1)));
    std::vector<SettingChange> changes;
    for (const auto& [key, value] : texts)
        changes.push_back({ key, value });
    batchWrite(world.platform, changes,
        args.truth(1) ? FailurePolicy::StopAtFirst : FailurePolicy::SkipStep);
    return nullptr;
}

Json settingsBytes(World& world, Args args)
{
    const auto digits = args.json(0).get<std::string>();
    std::ofstream file(world.settingsFile(), std::ios::binary);
    for (std::size_t at = 0; at + 1 < digits.size(); at += 2)
        file.put(static_cast<char>(std::stoi(digits.substr(at, 2), nullptr, 16)));
    return nullptr;
}

Json newPages(World& world, Args args)
{
    for (std::int32_t count = args.whole(0); count > 0; --count)
        world.canvas.newPage();
    return nullptr;
}

Json setLineAttributes(World& world, Args args)
{
    world.canvas.recorder().setLineAttributes({ .LineStyle = args.shortWhole(0),
        .LineColor = args.whole(2),
        .LineWidth = args.shortWhole(1),
        .FillStyle = args.shortWhole(3),
        .FillColor = args.whole(4) });
    return nullptr;
}

Json setTextFont(World& world, Args args)
{
    Font font;
    font.name = args.text(0);
    font.size = args.single(1);
    font.bold = args.truth(2);
    font.italic = args.truth(3);
    world.canvas.recorder().setTextFont(font, args.whole(4));
    return nullptr;
}

Json printCentred(World& world, Args args)
{
    world.canvas.recorder().printCentred(
        args.text(0), args.number(1), args.number(2), args.whole(3));
    return nullptr;
}

Json cellText(World& world, Args args)
{
    world.canvas.recorder().cellText(args.text(0), args.number(1), args.number(2), args.whole(3));
    return nullptr;
}

Json openFile(World& world, Args args)
{
    world.writeLines(world.documentFile(), args.json(0));
    world.canvas.OpenFile(world.documentFile());
    return nullptr;
}

void save(World& world, char16_t separator)
{
    const char16_t before = std::exchange(world.platform.decimalSeparator, separator);
    world.canvas.SaveFile(world.documentFile());
    world.platform.decimalSeparator = before;
}

Json savedLines(World& world, Args args)
{
    save(world, args.unit(0));
    return world.readLines(world.documentFile());
}

Json saveAndOpen(World& world, Args args)
{
    save(world, args.unit(0));
    world.canvas.OpenFile(world.documentFile());
    return nullptr;
}

RowSet& sourceOf(World& world)
{
    RowSet* rows = world.grid ? world.grid->source() : nullptr;
    if (rows == nullptr)
        throw std::invalid_argument("the grid has no DataSource");
    return *rows;
}

AutomationObject& gridOf(World& world)
{
    if (!world.grid)
        throw std::invalid_argument("the case has no grid");
    return *world.grid;
}

/// What a print job called on the printer, each page's own operations folded into its number.
Json jobLog(const Json& operations)
{
    static const std::array<std::string, 3> Kept { "paper size", "orientation", "EndDoc" };
    Json log = Json::array();
    for (const Json& operation : operations) {
        const auto name = operation.at(0).get<std::string>();
        if (name == "page" || std::find(Kept.begin(), Kept.end(), name) != Kept.end())
            log.push_back(operation);
    }
    return log;
}

Json doPrint(World& world, Args args)
{
    world.printer.operations = Json::array();
    world.canvas.doPrint(args.truth(0), args.text(1), args.shortWhole(2));
    return jobLog(world.printer.operations);
}

Json printedPage(World& world, Args args)
{
    world.printer.operations = Json::array();
    world.canvas.printPage(args.shortWhole(0));
    Json log = Json::array();
    for (const Json& operation : world.printer.operations) {
        if (operation.at(0) != "page")
            log.push_back(operation);
    }
    return log;
}

Json pressPrintButton(World& world, Args args)
{
    world.printers.names.clear();
    for (const Json& name : args.json(0))
        world.printers.names.push_back(textOf(name));
    world.printers.opensThem = args.truth(1);
    const auto outcome = pressPrint(world.printers, { args.truth(2), args.text(3), args.text(4) });
    if (const auto* message = std::get_if<Message>(&outcome)) {
        Json result = Json::array({ "message" });
        for (const Json& part : jsonOf(*message))
            result.push_back(part);
        return result;
    }
    const auto& print = std::get<PrintArguments>(outcome);
    return Json::array({ "print", print.allPages, jsonOf(print.pageList), print.copies });
}

struct StepRow {
    const char* name;
    Call call;
};

constexpr StepRow Steps[] = {
    { "val", [](World&, Args args) -> Json { return leadingNumber(args.text(0)); } },
    { "round", [](World&, Args args) -> Json { return roundToInt32(args.number(0)); } },
    { "formatNumber",
        [](World&, Args args) -> Json { return jsonOf(formatNumber(args.number(0))); } },
    { "formatSingle",
        [](World&, Args args) -> Json { return jsonOf(formatSingle(args.single(0))); } },
    { "filterChars",
        [](World&, Args args) -> Json {
            return jsonOf(filterChars(args.text(0), args.text(1), args.truth(2)));
        } },
    { "countChar",
        [](World&, Args args) -> Json { return countChar(args.text(0), args.text(1)); } },
    { "getField",
        [](World&, Args args) -> Json {
            return jsonOf(getField(args.text(0), args.shortWhole(1), args.text(2), args.truth(3)));
        } },
    { "readSetting",
        [](World& world, Args args) -> Json {
            return jsonOf(readSetting(world.platform, args.text(0)));
        } },
    { "readSettingsText",
        [](World& world, Args) -> Json { return jsonOf(readSettingsText(world.platform)); } },
    { "findSettingLine",
        [](World&, Args args) -> Json {
            return jsonOf(Text(findSettingLine(args.text(0), args.text(1))));
        } },
    { "writeSetting",
        [](World& world, Args args) -> Json {
            writeSetting(world.platform, args.text(0), args.text(1));
            return nullptr;
        } },
    { "batchWrite", batch },
    { "settingsFile",
        [](World& world, Args args) -> Json {
            world.writeLines(world.settingsFile(), args.json(0));
            return nullptr;
        } },
    { "settingsBytes", settingsBytes },
    { "AddHeader",
        [](World& world, Args args) -> Json {
            world.facade.AddHeader(args.text(0), args.whole(1));
            return nullptr;
        } },
    { "AddFooter",
        [](World& world, Args args) -> Json {
            world.facade.AddFooter(args.text(0), args.whole(1));
            return nullptr;
        } },
    { "ShowHeader",
        [](World& world, Args args) -> Json {
            world.facade.setShowHeader(args.truth(0));
            return nullptr;
        } },
    { "MergeGrid",
        [](World& world, Args args) -> Json {
            world.facade.setMergeGrid(args.truth(0));
            return nullptr;
        } },
    { "MarvenStartRow",
        [](World& world, Args args) -> Json {
            world.facade.setMarvenStartRow(args.whole(0));
            return nullptr;
        } },
    { "marginCentimetres",
        [](World&, Args args) -> Json { return marginOfCentimetres(args.shortWhole(0)); } },
    { "clear",
        [](World& world, Args) -> Json {
            world.canvas.clear();
            return nullptr;
        } },
    { "newPage", newPages },
    { "Currentpage",
        [](World& world, Args args) -> Json {
            world.canvas.setCurrentpage(args.shortWhole(0));
            return nullptr;
        } },
    { "Totalpages",
        [](World& world, Args args) -> Json {
            world.canvas.setTotalpages(args.shortWhole(0));
            return nullptr;
        } },
    { "CurrentX",
        [](World& world, Args args) -> Json {
            world.canvas.setCurrentX(args.whole(0));
            return nullptr;
        } },
    { "CurrentY",
        [](World& world, Args args) -> Json {
            world.canvas.setCurrentY(args.whole(0));
            return nullptr;
        } },
    { "read Currentpage", [](World& world, Args) -> Json { return world.canvas.Currentpage(); } },
    { "read Totalpages", [](World& world, Args) -> Json { return world.canvas.Totalpages(); } },
    { "read CurrentX", [](World& world, Args) -> Json { return world.canvas.CurrentX(); } },
    { "read CurrentY", [](World& world, Args) -> Json { return world.canvas.CurrentY(); } },
    { "setLineAttributes", setLineAttributes },
    { "setTextFont", setTextFont },
    { "lineTo",
        [](World& world, Args args) -> Json {
            world.canvas.recorder().lineTo({ args.whole(0), args.whole(1) });
            return nullptr;
        } },
    { "printText",
        [](World& world, Args args) -> Json {
            world.canvas.recorder().printText(args.text(0), args.truth(1));
            return nullptr;
        } },
    { "printCentred", printCentred },
    { "cellText", cellText },
    { "wrappingPrint",
        [](World& world, Args args) -> Json {
            world.canvas.recorder().wrappingPrint(args.text(0), args.number(1));
            return nullptr;
        } },
    { "rowTextHeight", rowTextHeight },
    { "OpenFile", openFile },
    { "saved lines", savedLines },
    { "SaveFile and OpenFile", saveAndOpen },
    { "grid",
        [](World& world, Args args) -> Json {
            world.takeGrid(args.json(0));
            return nullptr;
        } },
    { "DataSource cursor",
        [](World& world, Args args) -> Json {
            sourceOf(world).setPosition(args.whole(0));
            return nullptr;
        } },
    { "read DataSource cursor",
        [](World& world, Args) -> Json { return sourceOf(world).position(); } },
    { "loadReportStyle",
        [](World& world, Args) -> Json {
            world.canvas.loadReportStyle();
            return nullptr;
        } },
    { "doPreview",
        [](World& world, Args) -> Json {
            world.canvas.doPreview(gridOf(world));
            return nullptr;
        } },
    { "ReDrawZoom",
        [](World& world, Args) -> Json {
            world.canvas.ReDrawZoom(gridOf(world));
            return nullptr;
        } },
    { "Minimum",
        [](World& world, Args) -> Json {
            world.canvas.Minimum();
            return nullptr;
        } },
    { "Maximum",
        [](World& world, Args) -> Json {
            world.canvas.Maximum();
            return nullptr;
        } },
    { "hasPageField", [](World&, Args args) -> Json { return hasPageField(args.text(0)); } },
    { "expandPageField",
        [](World& world, Args args) -> Json {
            return jsonOf(expandPageField(args.text(0), world.canvas.Currentpage(), world.clock));
        } },
    { "showWholePage",
        [](World& world, Args) -> Json {
            world.canvas.showWholePage();
            return nullptr;
        } },
    { "showPage",
        [](World& world, Args) -> Json {
            world.canvas.showPage();
            return nullptr;
        } },
    { "showAllPage",
        [](World& world, Args) -> Json {
            world.canvas.showAllPage();
            return nullptr;
        } },
    { "showMuliPage",
        [](World& world, Args args) -> Json {
            world.canvas.showMuliPage(args.shortWhole(0));
            return nullptr;
        } },
    { "SetShowStyle",
        [](World& world, Args args) -> Json {
            world.canvas.SetShowStyle(args.shortWhole(0), args.shortWhole(1), args.shortWhole(2));
            return nullptr;
        } },
    { "ReSetLeftTop",
        [](World& world, Args args) -> Json {
            world.canvas.setReSetLeftTop(args.truth(0));
            return nullptr;
        } },
    { "VerticalDir",
        [](World& world, Args args) -> Json {
            world.canvas.setVerticalDir(args.truth(0));
            return nullptr;
        } },
    { "zoomIn",
        [](World& world, Args) -> Json {
            world.canvas.zoomIn();
            return nullptr;
        } },
    { "zoomOut",
        [](World& world, Args) -> Json {
            world.canvas.zoomOut();
            return nullptr;
        } },
    { "OnDraw",
        [](World& world, Args) -> Json {
            world.canvas.OnDraw();
            return nullptr;
        } },
    { "DispScale",
        [](World& world, Args args) -> Json {
            world.canvas.setDispScale(args.single(0));
            return nullptr;
        } },
    { "read DispScale",
        [](World& world, Args) -> Json { return static_cast<double>(world.canvas.DispScale()); } },
    { "viewport",
        [](World& world, Args args) -> Json {
            world.canvas.setViewport(args.whole(0), args.whole(1));
            return nullptr;
        } },
    { "page size",
        [](World& world, Args args) -> Json {
            world.canvas.page.myWidth = args.whole(0);
            world.canvas.page.myHeight = args.whole(1);
            return nullptr;
        } },
    { "Hbar",
        [](World& world, Args args) -> Json {
            world.canvas.setHbar(args.whole(0));
            return nullptr;
        } },
    { "Vbar",
        [](World& world, Args args) -> Json {
            world.canvas.setVbar(args.whole(0));
            return nullptr;
        } },
    { "setMouse",
        [](World& world, Args) -> Json {
            world.canvas.setMouse();
            return nullptr;
        } },
    { "Pan",
        [](World& world, Args) -> Json {
            world.canvas.Pan();
            return nullptr;
        } },
    { "mouseMove",
        [](World& world, Args) -> Json {
            world.canvas.mouseMove();
            return nullptr;
        } },
    { "mouseDown",
        [](World& world, Args args) -> Json {
            world.canvas.mouseDown(args.number(0), args.number(1));
            return nullptr;
        } },
    { "mouseUp",
        [](World& world, Args args) -> Json {
            world.canvas.mouseUp(args.number(0), args.number(1));
            return nullptr;
        } },
    { "paper name",
        [](World& world, Args args) -> Json {
            world.canvas.setPaper(args.text(0));
            return nullptr;
        } },
    { "doPrint", doPrint },
    { "printed page", printedPage },
    { "page list",
        [](World&, Args args) -> Json { return jsonOf(pageListOf(trimmed(args.text(0)))); } },
    { "copies", [](World&, Args args) -> Json { return copiesOf(args.text(0)); } },
    { "press Print", pressPrintButton },
};

struct ErrorRow {
    ErrorNumber number;
    const char* kind;
};

constexpr ErrorRow Errors[] = {
    { ErrorNumber::InvalidCall, "invalid call" },
    { ErrorNumber::Overflow, "overflow" },
    { ErrorNumber::SubscriptOutOfRange, "subscript out of range" },
    { ErrorNumber::DivisionByZero, "division by zero" },
    { ErrorNumber::TypeMismatch, "type mismatch" },
    { ErrorNumber::FileNotFound, "file not found" },
    { ErrorNumber::ObjectMissing, "object missing" },
    { ErrorNumber::NoSuchMember, "no such member" },
};

Json errorOf(const RunTimeError& error)
{
    for (const ErrorRow& row : Errors) {
        if (row.number == error.number())
            return { { "error", row.kind } };
    }
    return { { "error", toUtf8(error.text()) } };
}

} // namespace

Json takeStep(World& world, const Json& step)
{
    const auto name = step.at(0).get<std::string>();
    for (const StepRow& row : Steps) {
        if (name != row.name)
            continue;
        try {
            return row.call(world, Arguments(step));
        } catch (const RunTimeError& error) {
            return errorOf(error);
        }
    }
    throw std::invalid_argument("unknown step \"" + name + "\"");
}

} // namespace pelloric::cases
