// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report_builder.h"

#include "controls/canvas.h"
#include "document/ostl_reader.h"
#include "font_notes.h"
#include "grids/table_grid.h"
#include "interruption.h"
#include "language.h"
#include "outcome.h"
#include "platform/automation_object.h"
#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/text_metrics.h"
#include "print/page_list.h"
#include "progress_line.h"
#include "report/content_widths.h"
#include "report/report_totals.h"
#include "report_options.h"
#include "shape_options.h"
#include "table_source.h"

#include <array>

namespace pelloric::app {

namespace {

/// A rule of `FitRule` as it is told in JSON, in their order.
constexpr auto RuleNames
    = std::to_array<const char*>({ nullptr, "as is", "landscape", "shrunk", "bands" });
static_assert(RuleNames.size() == static_cast<std::size_t>(FitRule::Bands) + 1);

constexpr double WidestColumn = 100000; ///< twips

QString cellsOf(std::int64_t count)
{
    return count == 1 ? qt::phrased(u"1 cell") : qt::phrased(u"%1 cells").arg(count);
}

int columnOf(const TableGrid& grid, TextView title)
{
    int column = 0;
    while (column < grid.columnCount() && grid.column(column).title != title)
        ++column;
    return column;
}

/// Makes room for the names of totals, which stand in the first column in bold.
void widenForTotals(
    const TableGrid& grid, const ReportOptions& options, Canvas& canvas, std::vector<Twips>& widths)
{
    const int first
        = options.keyColumnNames.empty() ? 0 : columnOf(grid, options.keyColumnNames.front());
    if (options.totals.empty() || first >= grid.columnCount())
        return;
    const Font& font = canvas.style().body.font;
    FaceMetrics& face = canvas.platform().metrics.face(font.name, true, font.italic);
    const auto widthOf = [&](TextView text) { return textWidth(face.advanceOf(text), font.size); };
    const TotalWords words = completed(options.totalWords);
    double names = widthOf(words.total);
    double group = 0;
    for (const Text& title : options.groupColumns) {
        if (const int column = columnOf(grid, title); column < grid.columnCount())
            group += widths[static_cast<std::size_t>(column)];
    }
    names = std::max(names, group);
    Twips& width = widths[static_cast<std::size_t>(first)];
    for (const Aggregation& total : options.totals) {
        const Text name = Text(u": ").append(wordOf(words, total.function));
        const double needed = names + widthOf(name) + CellPadding + 1;
        width = std::max(width, roundToInt32(std::min<double>(needed, WidestContent)));
    }
}

/// The options of the command line; on paper the words are those of its language.
ReportOptions optionsOf(const CommandLine& line)
{
    ReportOptions options = shapeOf(line);
    const QString name = line.value("language");
    const bool isNamed = !name.isEmpty() && name != QLatin1String("system");
    options.totalWords = totalWordsIn(isNamed ? QLocale(name) : QLocale::system());
    return options;
}

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
    widenForTotals(grid, optionsOf(line), canvas, widths);
    // A table exactly as wide as the room is divided.
    fitWidths(widths, canvas.page.myWidth - 2 * canvas.page.intLeft - 1);
    const QStringList given
        = line.has("widths") ? line.value("widths").split(QLatin1Char(',')) : QStringList();
    if (given.size() > grid.columnCount())
        throw CommandError(qt::phrased(u"--widths names %1 columns; the table has %2")
                               .arg(given.size())
                               .arg(grid.columnCount()),
            WrongUsage);
    for (int column = 0; column < grid.columnCount(); ++column) {
        Twips width = widths[static_cast<std::size_t>(column)];
        if (line.has("as-shown"))
            width = grid.column(column).shownWidth.value_or(width);
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
    canvas.options = optionsOf(line);
    if (canvas.options.asShown && !grid.hasLooks())
        note(qt::phrased(u"--as-shown does nothing here: only cells of office files have looks"));
    canvas.doPreview(grid);
    if (canvas.table() == nullptr)
        throw CommandError(qt::phrased(u"no column is wide enough to be printed; give other "
                                       u"--widths"));
    if (canvas.printedRows() == 0 && grid.rowCount() > 0)
        note(qt::phrased(u"no row is printed: --where %1 holds for none").arg(line.value("where")));
    for (const LeftOut& column : canvas.leftOut())
        note(qt::phrased(u"the total of %1 leaves out %2, being no numbers")
                 .arg(qt::toQString(column.column), cellsOf(column.cells)));
}

QJsonObject shapeFacts(const Canvas& canvas)
{
    const FitResult& fit = canvas.fit();
    QJsonObject facts { { QStringLiteral("bands"), fit.pagesAcross },
        { QStringLiteral("printedRows"), static_cast<qint64>(canvas.printedRows()) } };
    const char* const rule = RuleNames[static_cast<std::size_t>(fit.rule)];
    if (rule == nullptr)
        return facts;
    facts.insert(QStringLiteral("fit"), QLatin1String(rule));
    facts.insert(QStringLiteral("scale"), fit.scale);
    facts.insert(QStringLiteral("turned"), fit.isTurned);
    return facts;
}

SavedDocument readDocument(const QString& file, const CommandLine& line, const Platform& platform)
{
    const char* const shape = firstShapeOption(line);
    const char* const option = shape != nullptr ? shape : firstReportOption(line);
    if (option != nullptr && QLatin1String(option) != QLatin1String("title"))
        throw CommandError(
            qt::phrased(u"--%1 does not apply to a saved document, whose pages are laid out")
                .arg(QString::fromLatin1(option)),
            WrongUsage);
    checkReadable(file);
    if (isPipe(file))
        throw CommandError(
            qt::phrased(u"%1 is a pipe; a saved document is read from a file, so save it "
                        u"to one and name that")
                .arg(file));
    requireFonts();
    const Interruption::AtOnce atOnce;
    SavedDocument saved;
    try {
        if (readOstl(platform.codec, pathOf(file), saved.document, saved.setup)
            == OstlResult::BadHeader)
            throw CommandError(qt::phrased(u"%1 is no document file").arg(file));
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
            qt::phrased(u"--pages %1 names no page; the document has %2 (write 1,3,5-12)")
                .arg(list)
                .arg(pageCount));
    return pages;
}

} // namespace pelloric::app
