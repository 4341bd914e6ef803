// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "controls/qt/default_platform.h"
#include "demo_walk.h"
#include "demo_window.h"
#include "headless.h"
#include "platform/platform.h"
#include "platform/qt/qt_text.h"
#include "settings/default_settings.h"
#include "state_log.h"
#include "ui/qt/preview_opener.h"
#include "windows.h"

#include <QFileInfo>
#include <QSettings>
#include <QTemporaryDir>

#include <array>
#include <optional>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "samples", "FOLDER", "where the sample tables are" },
    { "walk", "OUT", "walk through by itself, without a display, and leave what it shows in OUT" },
    { "log", "FILE", "write what the preview window shows to a file, a line for each change" },
});

/// The samples that were installed, those of the sources, or those of the present folder.
QString samplesFolder(const CommandLine& line)
{
    if (line.has("samples"))
        return line.value("samples");
    const QStringList folders { QCoreApplication::applicationDirPath()
            + QStringLiteral("/../share/pelloric/samples"),
        QStringLiteral(PELLORIC_SAMPLES), QStringLiteral("samples") };
    for (const QString& folder : folders) {
        if (QFileInfo(folder + QStringLiteral("/samples.sqlite")).isFile())
            return folder;
    }
    throw CommandError(QStringLiteral("the sample tables are not found; name their folder with "
                                      "--samples"));
}

/// The walk changes neither the person's settings nor where their windows stand.
int walk(const Invocation& invocation, const CommandLine& line)
{
    const HeadlessWidgets application(invocation);
    const QTemporaryDir folder;
    QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, folder.path());
    qt::QtPreviewOpener& opener = qt::installPreviewWindow();
    qt::QtPlatform& platform = qt::defaultPlatform();
    platform.folders().setSystemDirectory(qt::toText(folder.path()));
    deployDefaultSettings(platform.record());
    DemoWindow demo(platform, samplesFolder(line));
    walkDemo(demo, opener, platform, line.value("walk"));
    return Done;
}

} // namespace

int runDemo(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, { Options }, 0);
    if (line.has("walk"))
        return walk(invocation, line);
    WindowedApplication application(invocation);
    qt::QtPreviewOpener& opener = qt::installPreviewWindow();
    qt::QtPlatform& platform = qt::defaultPlatform();
    prepareSettings(platform.record());
    std::optional<StateLog> log;
    if (line.has("log"))
        log.emplace(line.value("log"), opener);
    DemoWindow demo(platform, samplesFolder(line));
    demo.show();
    return application.run();
}

QString demoDetails()
{
    return QStringLiteral("Shows one form with a flex grid, a list view and a data grid on sample\n"
                          "tables, each with a button that previews it.\n\n")
        + optionHelp(Options);
}

} // namespace pelloric::app
