// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "headless.h"
#include "platform/file_bytes.h"
#include "platform/platform.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "settings/default_settings.h"
#include "settings/settings_file.h"

#include <array>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "path", nullptr, phraseText(u"only say where the file is") },
    { "reset", nullptr, phraseText(u"put the default settings back") },
});

QString settingsText(const Platform& platform)
{
    QString text = qt::toQString(readSettingsText(platform));
    text.remove(QLatin1Char('\r'));
    return text.mid(1); // the line end that the text begins with
}

} // namespace

int runSettings(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, settingsOptions(), 0);
    const HeadlessApplication application(invocation);
    qt::QtPlatform platform;
    const Platform record = platform.record();
    const QString path = qt::toQString(pathText(settingsPath(record)));
    if (line.has("path")) {
        print(path + QLatin1Char('\n'));
        return Done;
    }
    deployDefaultSettings(record);
    if (line.has("reset"))
        resetSettings(record);
    else
        print(settingsText(record));
    return Done;
}

OptionTables settingsOptions() { return { Options }; }

} // namespace pelloric::app
