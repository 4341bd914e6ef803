// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "grids/qt/held_grid.h"
#include "headless.h"
#include "platform/platform.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_platform.h"
#include "platform/text_metrics.h"
#include "print/qt/qt_printing.h"
#include "report/content_widths.h"
#include "script/qt/script_host.h"
#include "stack_guard.h"
#include "table_source.h"
#include "tables/qt/csv_table.h"
#include "tables/qt/sqlite_table.h"
#include "windows.h"

#include "language.h"
#include <algorithm>
#include <memory>
#include <optional>

namespace pelloric::app {

namespace {

constexpr float MeasuredSize = 9; ///< points; columns suit texts of this size
constexpr auto MeasuredFace = u"宋体";

/// Reads tables whose columns are as wide as what they hold.
class Tables final : public qt::ScriptTables {
public:
    explicit Tables(TextMetrics& metrics)
        : metrics_(metrics)
    {
    }

    QObject* csv(const QString& path) override { return held(qt::readCsv(pathOf(path), {})); }

    QObject* sqlite(const QString& path, const QString& tableOrQuery) override
    {
        const bool isQuery = tableOrQuery.trimmed().contains(QLatin1Char(' '));
        return held(qt::readSqlite({ .path = pathOf(path),
            .table = isQuery ? QString() : tableOrQuery,
            .query = isQuery ? tableOrQuery : QString() }));
    }

private:
    QObject* held(TableGrid table) const
    {
        auto grid = std::make_shared<TableGrid>(std::move(table));
        FaceMetrics& face = metrics_.face(MeasuredFace, false, false);
        const std::vector<Twips> widths = contentWidths(*grid, face, MeasuredSize);
        const MemberId colWidth = memberOf(*grid, u"ColWidth");
        for (std::size_t column = 0; column < widths.size(); ++column) {
            const Value index = Value::ofNumber(static_cast<double>(column));
            grid->put(colWidth, { &index, 1 }, Value::ofNumber(widths[column]));
        }
        return new qt::HeldGrid(std::move(grid));
    }

    TextMetrics& metrics_;
};

} // namespace

int runScript(const Invocation& invocation)
{
    if (invocation.arguments.isEmpty())
        throw UsageError(qt::phrased(u"say which script to run"));
    speakEnglish(); // a script may read what errors say
    guardStack();
    QStringList arguments = invocation.arguments;
    const bool isWindowed = arguments.front() == QLatin1String("--window");
    if (isWindowed)
        arguments.removeFirst();
    if (arguments.isEmpty())
        throw UsageError(qt::phrased(u"say which script to run"));
    std::optional<WindowedApplication> windowed;
    std::optional<HeadlessWidgets> headless;
    if (isWindowed)
        windowed.emplace(invocation);
    else
        headless.emplace(invocation);
    qt::QtPlatform platform;
    const qt::QtPrinting printing(platform);
    const Platform record = platform.record();
    prepareSettings(record);
    Tables tables(record.metrics);
    qt::ScriptHost host(
        platform, tables, isWindowed ? qt::ScriptWindows::Shown : qt::ScriptWindows::Hidden);
    const QString script = arguments.takeFirst();
    return host.run(script, arguments);
}

QString scriptDetails()
{
    return qt::phrased(
        u"The script finds Sorvane and Kestrane, the records and enumerations of their interface,\n"
        u"args, messages, print(...), exit(status), csv(path), sqlite(path, tableOrQuery),\n"
        u"lines(canvas, page), texts(canvas, page), placePicture(canvas, page, picture) and\n"
        u"wait(milliseconds). A control also has grab(path) and resize(width, height).\n"
        u"Kestrane.doPreview builds in the preview window, whose canvas previewCanvas() is. "
        u"Nothing\n"
        u"is shown, unless --window stands before SCRIPT: then the program goes on until the "
        u"window\n"
        u"is closed.\n"
        u"An exception that it does not catch ends the program with status 1.\n");
}

} // namespace pelloric::app
