// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report_builder.h"

#include "controls/canvas.h"
#include "document/ostl_reader.h"
#include "font_notes.h"
#include "grids/table_grid.h"
#include "outcome.h"
#include "platform/automation_object.h"
#include "platform/platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/text_metrics.h"
#include "print/page_list.h"
#include "progress_line.h"
#include "report/content_widths.h"
#include "report_options.h"
#include "shape_options.h"
#include "table_source.h"

namespace pelloric::app {

namespace {

constexpr double WidestColumn = 100000; ///< twips

void setWidth(TableGrid& grid, int column, Twips width)
{
    const Value index = Value::ofNumber(column);
    grid.put(memberOf(grid, u"ColWidth"), { &index, 1 }, Value::ofNumber(width));
}

} // namespace

void setColumnWidths(TableGrid& grid, const CommandLine& line, Canvas& canvas)
{
    const Font& font = canvas.style().body.font;
    FaceMetrics& face = canvas.platform().metrics.face(font.name, font.bold, font.italic);
    std::vector<Twips> widths = contentWidths(grid, face, font.size, &canvas.platform().loop);
    // A table exactly as wide as the room is divided.
    fitWidths(widths, canvas.page.myWidth - 2 * canvas.page.intLeft - 1);
    const QStringList given
        = line.has("widths") ? line.value("widths").split(QLatin1Char(',')) : QStringList();
    if (given.size() > grid.columnCount())
        throw CommandError(QStringLiteral("--widths names %1 columns; the table has %2")
                               .arg(given.size())
                               .arg(grid.columnCount()),
            WrongUsage);
    for (int column = 0; column < grid.columnCount(); ++column) {
        Twips width = widths[static_cast<std::size_t>(column)];
        if (column < given.size())
            width = static_cast<Twips>(
                numberOf("widths", given.at(column).trimmed(), 0, WidestColumn, true));
        setWidth(grid, column, width);
    }
}

void buildReport(Canvas& canvas, TableGrid& grid, const CommandLine& line, ProgressLine& progress)
{
    requireFonts();
    canvas.loadReportStyle();
    setColumnWidths(grid, line, canvas);
    const LayoutProgress watched(canvas, progress);
    canvas.options = shapeOf(line);
    if (canvas.options.asShown && !grid.hasLooks())
        note(QStringLiteral("--as-shown does nothing here: only cells of office files have looks"));
    canvas.doPreview(grid);
    if (canvas.table() == nullptr)
        throw CommandError(QStringLiteral("no column is wide enough to be printed; give other "
                                          "--widths"));
}

SavedDocument readDocument(const QString& file, const CommandLine& line, const Platform& platform)
{
    const char* const shape = firstShapeOption(line);
    const char* const option = shape != nullptr ? shape : firstReportOption(line);
    if (option != nullptr && QLatin1String(option) != QLatin1String("title"))
        throw CommandError(
            QStringLiteral("--%1 does not apply to a saved document, whose pages are laid out")
                .arg(QString::fromLatin1(option)),
            WrongUsage);
    requireFonts();
    SavedDocument saved;
    try {
        if (readOstl(platform.codec, pathOf(file), saved.document, saved.setup)
            == OstlResult::BadHeader)
            throw CommandError(QStringLiteral("%1 is no document file").arg(file));
    } catch (const RunTimeError& error) {
        if (error.number() != ErrorNumber::Overflow)
            throw;
        throw CommandError(detailOf(error));
    }
    return saved;
}

std::vector<int> pagesOf(const QString& list, int pageCount)
{
    std::vector<int> pages;
    if (list.isEmpty())
        return pages;
    const Text range = qt::toText(list);
    for (const std::int16_t number : pageNumbersOf(pageListOf(trimmed(range)))) {
        if (number >= 1 && number <= pageCount)
            pages.push_back(number - 1);
    }
    if (pages.empty())
        throw CommandError(
            QStringLiteral("--pages %1 names no page; the document has %2 (write 1,3,5-12)")
                .arg(list)
                .arg(pageCount));
    return pages;
}

} // namespace pelloric::app
