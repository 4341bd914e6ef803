// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/shaped_report.h"

#include "platform/cell_look.h"
#include "platform/numbers.h"
#include "platform/platform.h"
#include "report/chosen_rows.h"
#include "report/grid_reader.h"
#include "report/report_pictures.h"
#include "report/report_style.h"
#include "report/shaped_layout.h"

#include <algorithm>
#include <limits>
#include <numeric>
#include <optional>
#include <utility>

namespace pelloric {

namespace {

template <typename Number> std::vector<Number> numbersFrom(Number first, std::size_t count)
{
    std::vector<Number> numbers(count);
    std::iota(numbers.begin(), numbers.end(), first);
    return numbers;
}

/// The rows and columns that are printed, and where they come from.
struct Choice {
    std::vector<int> fields; ///< of the table, from 0
    std::optional<ChosenRows> rows; ///< nothing: all of them as they stand
    std::vector<double> widths; ///< twips
    std::vector<int> gridColumns;
    std::vector<std::int64_t> lookRows; ///< empty: all in order
};

/// The options with their condition as a filter.
ReportOptions filtering(const ReportOptions& options, std::span<const Text> titles)
{
    if (options.whereColumn.empty())
        return options;
    const auto field
        = static_cast<std::size_t>(fieldsNamed(titles, { &options.whereColumn, 1 }).front());
    ReportOptions result = options;
    result.filter = [field, wanted = Text(trimmed(options.whereText)), other = options.filter](
                        std::int64_t row, std::span<const TextView> texts) {
        return trimmed(texts[field]) == wanted && (!other || other(row, texts));
    };
    return result;
}

Choice choose(GridTable& table, const ReportOptions& options, char16_t decimalSeparator)
{
    Choice choice;
    choice.fields = options.columns.empty()
        ? numbersFrom(0, table.ColumnWidths.size())
        : fieldsNamed(
            std::span(table.fieldNames).first(table.ColumnWidths.size()), options.columns);
    for (const int field : choice.fields) {
        choice.widths.push_back(table.ColumnWidths[static_cast<std::size_t>(field)]);
        choice.gridColumns.push_back(table.gridColumns[static_cast<std::size_t>(field)]);
    }
    if (!options.choosesCells())
        return choice;
    const bool choosesRows
        = options.rows != RowChoice::All || options.filter || !options.whereColumn.empty();
    std::vector<std::int64_t> records = choosesRows
        ? chosenRecords(*table.rows, filtering(options, table.fieldNames), table.looks,
            table.firstLookRow, decimalSeparator)
        : numbersFrom<std::int64_t>(1, static_cast<std::size_t>(table.rows->recordCount()));
    for (const std::int64_t record : records)
        choice.lookRows.push_back(table.firstLookRow + record - 1);
    choice.rows.emplace(*table.rows, choice.fields, std::move(records));
    return choice;
}

void turnSheet(ReportStyle& style, PageSetup& setup)
{
    constexpr std::int16_t Landscape = 2;
    std::swap(setup.myWidth, setup.myHeight);
    style.PagerOrientation = Landscape;
    setPrintableTenths(style, setup);
}

/// The setup of the text below what the pictures take of a page's top.
PageSetup belowPictures(const PageSetup& setup, const ReportPictures& placed)
{
    PageSetup rest = setup;
    const std::int64_t top = std::int64_t { setup.intTop } + placed.headRoom;
    rest.intTop
        = narrowToInt16(std::min<std::int64_t>(top, std::numeric_limits<std::int16_t>::max()));
    return rest;
}

/// Every page of a report has the same ones.
void addToPages(const ReportPictures& placed, PageDocument& document)
{
    for (int page = 0; page < document.pageCount(); ++page) {
        for (const PictureRecord& picture : placed.pictures)
            document.addPicture(page, picture);
    }
}

} // namespace

ReportOutcome layOutReport(GridTable& table, const ReportOptions& options,
    const ReportTarget& target, const Progress& progress)
{
    const Platform& platform = target.platform;
    Choice choice = choose(table, options, platform.decimalSeparator);
    RowSet& rows = choice.rows ? static_cast<RowSet&>(*choice.rows) : *table.rows;
    ReportOutcome outcome;
    outcome.records = rows.recordCount();
    if (!options.shapesPages(table.looks != nullptr)) {
        const ReportPictures placed = placeReportPictures(
            options, target.setup, platform.pictures, target.document.store());
        const PageSetup setup = belowPictures(target.setup, placed);
        const auto bands = cutColumnBands(choice.widths, setup.myWidth, setup.intLeft);
        LayoutEngine engine({ target.style, setup, rows, choice.widths, bands }, platform,
            target.document, target.recorder);
        engine.build(progress);
        addToPages(placed, target.document);
        outcome.titleTop = engine.titleTop();
        outcome.fit.pagesAcross = static_cast<int>(bands.size());
        return outcome;
    }
    std::vector<Text> titles;
    for (const int field : choice.fields)
        titles.push_back(table.fieldNames[static_cast<std::size_t>(field)]);
    const std::vector<int> keys = keyFieldsOf(options, titles);
    outcome.fit
        = fitReport(choice.widths, keys, target.setup, target.style.body.font.size, options.fit);
    if (outcome.fit.isTurned)
        turnSheet(target.style, target.setup);
    const ReportPictures placed
        = placeReportPictures(options, target.setup, platform.pictures, target.document.store());
    const PageSetup setup = belowPictures(target.setup, placed);
    ReportStyle style = target.style;
    style.body.font.size = static_cast<float>(style.body.font.size * outcome.fit.scale);
    for (double& width : choice.widths)
        width *= outcome.fit.scale;
    if (options.fit.isAsked() || !keys.empty())
        narrowToSheet(choice.widths, keys, setup);
    ShapedSource source { .style = style,
        .setup = setup,
        .rows = rows,
        .widths = choice.widths,
        .options = options,
        .scale = outcome.fit.scale,
        .looks = options.asShown ? table.looks : nullptr,
        .lookColumns = choice.gridColumns,
        .lookRows = choice.lookRows,
        .firstLookRow = table.firstLookRow,
        .number = {} };
    if (table.looks != nullptr) {
        source.number = [&](std::int64_t record, int field) {
            const std::int64_t row = choice.lookRows.empty()
                ? table.firstLookRow + record - 1
                : choice.lookRows[static_cast<std::size_t>(record - 1)];
            return table.looks->number(static_cast<std::int32_t>(row),
                choice.gridColumns[static_cast<std::size_t>(field)]);
        };
    }
    ShapedLayout layout(source, platform, target.document, target.recorder);
    layout.build(progress);
    addToPages(placed, target.document);
    outcome.titleTop = layout.titleTop();
    outcome.fit.pagesAcross = static_cast<int>(layout.bandCount());
    outcome.leftOut = layout.leftOut();
    return outcome;
}

} // namespace pelloric
