// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "controls/canvas.h"
#include "controls/qt/default_platform.h"
#include "interruption.h"
#include "platform/qt/qt_phrase.h"
#include "platform/run_time_error.h"
#include "progress_line.h"
#include "report_builder.h"
#include "report_options.h"
#include "shape_options.h"
#include "table_selection.h"
#include "table_source.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_prompts.h"
#include "ui/qt/preview_window.h"
#include "windows.h"

#include <pelloric/sorvane.h>

#include <optional>

namespace pelloric::app {

namespace {

/// The widths are those of the settings in force.
/// @param own  of the window; null: those of the settings file
void prepareWidths(
    TableGrid& grid, const CommandLine& line, Platform platform, const ReportSettings* own)
{
    Canvas canvas(platform);
    if (own != nullptr)
        canvas.useSettings(*own);
    canvas.loadReportStyle();
    setColumnWidths(grid, line, canvas);
}

} // namespace

int runPreview(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, previewOptions(), 1);
    if (isDocumentName(line.file(0)))
        throw CommandError(qt::phrased(u"%1 is a saved document; show it with \"pelloric open\"")
                               .arg(line.file(0)),
            WrongUsage);
    WindowedApplication application(invocation);
    chooseLanguage(line);
    qt::QtPreviewOpener& opener = qt::installPreviewWindow();
    qt::QtPlatform& platform = qt::defaultPlatform();
    // What the dialogs change is kept, unless options say how this one report looks.
    std::optional<ReportSettings> settings;
    if (firstReportOption(line) != nullptr)
        settings = settingsFor(line, platform.record(), SettingsBase::Users);
    else
        prepareSettings(platform.record());
    const ReportOptions shape = shapeOf(line);
    std::unique_ptr<TableGrid> grid;
    {
        const Interruption interruption(platform.loop());
        ProgressLine progress;
        grid = std::make_unique<TableGrid>(readTable(line.file(0), line, progress));
    }
    opener.setSettings(settings);
    // Before every build: a dialog may have chosen another font or paper.
    TableGrid& table = *grid;
    Canvas* shown = nullptr;
    qt::PreviewPrompts prompts;
    prompts.beforeBuild = [&](AutomationObject&) {
        prepareWidths(table, line, platform.record(), shown->ownSettings());
    };
    opener.setPrompts(prompts);
    opener.setReportOptions(shape);
    shown = &opener.showWindow().canvas().canvas();
    try {
        opener.openPreview(std::move(grid));
    } catch (const RunTimeError& error) {
        tell(describe(error)); // the window says it, too, and can mend it
    }
    return application.run();
}

QString previewDetails()
{
    return qt::phrased(u"FILE is a CSV or TSV file, whose first row holds the titles, a JSON "
                       u"file, an .xlsx or\n"
                       u".ods file (file.xlsx:Sheet), or an SQLite database (db.sqlite:table, or "
                       u"db.sqlite with\n"
                       u"--query). Pages look as your settings say, which the window's dialogs\n"
                       u"change; --defaults does without them. With one of the options for\n"
                       u"headers, paper and so on, what the dialogs change is not kept.\n")
        + textsDetails() + namesDetails();
}

OptionTables previewOptions()
{
    return { sourceOptions(), selectionOptions(), reportOptions(), shapeOptions(),
        windowOptions() };
}

} // namespace pelloric::app
