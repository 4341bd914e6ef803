// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "controls/qt/default_platform.h"
#include "demo_walk.h"
#include "demo_window.h"
#include "headless.h"
#include "platform/platform.h"
#include "platform/qt/qt_phrase.h"
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
    { "samples", "FOLDER", phraseText(u"where the sample tables are") },
    { "walk", "OUT",
        phraseText(u"walk through by itself, without a display, and leave what it shows in OUT") },
    { "log", "FILE",
        phraseText(u"write what the preview window shows to a file, a line for each change") },
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
    throw CommandError(qt::phrased(u"the sample tables are not found; name their folder with "
                                   u"--samples"));
}

/// Settings that go with the demonstration: it changes neither the person's own nor where their
/// windows stand.
class DemoSettings {
public:
    /// @throws CommandError there is no room for them
    explicit DemoSettings(qt::QtPlatform& platform)
    {
        if (!folder_.isValid())
            throw CommandError(
                qt::phrased(u"%1; check the folder of temporary files").arg(folder_.errorString()));
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, folder_.path());
        platform.folders().setSystemDirectory(qt::toText(folder_.path()));
        deployDefaultSettings(platform.record());
    }

private:
    QTemporaryDir folder_;
};

int walk(const Invocation& invocation, const CommandLine& line)
{
    const HeadlessWidgets application(invocation);
    chooseLanguage(line);
    qt::QtPlatform& platform = qt::defaultPlatform();
    const DemoSettings settings(platform);
    qt::QtPreviewOpener& opener = qt::installPreviewWindow();
    DemoWindow demo(platform, samplesFolder(line));
    walkDemo(demo, opener, platform, line.value("walk"));
    return Done;
}

} // namespace

int runDemo(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, demoOptions(), 0);
    if (line.has("walk"))
        return walk(invocation, line);
    WindowedApplication application(invocation);
    chooseLanguage(line);
    qt::QtPlatform& platform = qt::defaultPlatform();
    const DemoSettings settings(platform);
    qt::QtPreviewOpener& opener = qt::installPreviewWindow();
    std::optional<StateLog> log;
    if (line.has("log"))
        log.emplace(line.value("log"), opener);
    DemoWindow demo(platform, samplesFolder(line));
    demo.show();
    return application.run();
}

QString demoDetails()
{
    return qt::phrased(
        u"Shows one form with a flex grid, a list view and a data grid on sample\n"
        u"tables, each with its host code and a button that previews it; tables of\n"
        u"your own can be opened beside them. What its dialogs change is forgotten.\n");
}

OptionTables demoOptions() { return { Options, windowOptions() }; }

} // namespace pelloric::app
