// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "manual.h"
#include "platform/qt/qt_phrase.h"

#include <algorithm>
#include <array>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "man", nullptr, phraseText(u"write the manual page of the program") },
});

QString heading(const Command& command)
{
    return QStringLiteral("pelloric %1 %2")
        .arg(QString::fromUtf8(command.name), QString::fromUtf8(command.synopsis))
        .trimmed();
}

QString overview()
{
    qsizetype width = 0;
    for (const Command& command : commands())
        width = std::max(width, heading(command).size());
    QString text = qt::phrased(u"Previews, exports and prints tables.\n\n");
    for (const Command& command : commands())
        text += QStringLiteral("  ") + heading(command).leftJustified(width) + QStringLiteral("  ")
            + qt::phrased(command.summary) + QLatin1Char('\n');
    return text
        + qt::phrased(
            u"\n\"pelloric help COMMAND\" says more, \"pelloric --version\" the version.\n");
}

/// What stands behind a command's summary.
QString restOf(const Command& command)
{
    QString text;
    if (command.details)
        text += QLatin1Char('\n') + command.details();
    if (!command.options)
        return text;
    text += QLatin1Char('\n');
    for (const OptionTable table : command.options())
        text += optionHelp(table);
    return text;
}

QString detailsOf(const QString& name)
{
    for (const Command& command : commands()) {
        if (name == QLatin1String(command.name)) {
            const QString text = heading(command) + QLatin1Char('\n') + qt::phrased(command.summary)
                + QStringLiteral(".\n");
            return text + restOf(command);
        }
    }
    throw CommandError(qt::phrased(u"no command %1; see \"pelloric help\"").arg(name), WrongUsage);
}

} // namespace

int runHelp(const Invocation& invocation)
{
    if (invocation.arguments == QStringList(QStringLiteral("--man"))) {
        print(manualPage());
        return Done;
    }
    if (invocation.arguments.isEmpty()) {
        print(overview());
        return Done;
    }
    for (const QString& name : invocation.arguments)
        print(detailsOf(name));
    return Done;
}

OptionTables helpOptions() { return { Options }; }

} // namespace pelloric::app
