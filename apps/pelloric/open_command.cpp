// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "controls/qt/default_platform.h"
#include "platform/qt/qt_phrase.h"
#include "table_source.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_window.h"
#include "windows.h"

namespace pelloric::app {

int runOpen(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, openOptions(), 1);
    const QString file = line.file(0);
    std::error_code ignored;
    if (!std::filesystem::is_regular_file(pathOf(file), ignored))
        throw CommandError(qt::phrased(u"%1: there is no such file").arg(file));
    WindowedApplication application(invocation);
    chooseLanguage(line);
    qt::QtPreviewOpener& opener = qt::installPreviewWindow();
    prepareSettings(qt::defaultPlatform().record());
    opener.showWindow().openDocument(pathOf(file));
    return application.run();
}

QString openDetails()
{
    return qt::phrased(u"FILE is a document file (.ostl) that the preview window or\n"
                       u"\"pelloric export\" has saved.\n");
}

OptionTables openOptions() { return { windowOptions() }; }

} // namespace pelloric::app
