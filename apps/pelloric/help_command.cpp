// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"

namespace pelloric::app {

namespace {

constexpr int SynopsisWidth = 24;

QString heading(const Command& command)
{
    return QStringLiteral("pelloric %1 %2")
        .arg(QString::fromUtf8(command.name), QString::fromUtf8(command.synopsis))
        .trimmed();
}

QString overview()
{
    QString text = QStringLiteral("Previews, exports and prints tables.\n\n");
    for (const Command& command : commands()) {
        const QString synopsis = QStringLiteral("%1 %2").arg(
            QString::fromUtf8(command.name), QString::fromUtf8(command.synopsis));
        text += QStringLiteral("  pelloric ") + synopsis.leftJustified(SynopsisWidth)
            + QStringLiteral("  ") + QString::fromUtf8(command.summary) + QLatin1Char('\n');
    }
    return text
        + QStringLiteral(
            "\n\"pelloric help COMMAND\" says more, \"pelloric --version\" the version.\n");
}

QString detailsOf(const QString& name)
{
    for (const Command& command : commands()) {
        if (name == QLatin1String(command.name)) {
            const QString text = heading(command) + QLatin1Char('\n')
                + QString::fromUtf8(command.summary) + QStringLiteral(".\n");
            return command.details ? text + QLatin1Char('\n') + command.details() : text;
        }
    }
    throw CommandError(
        QStringLiteral("no command %1; see \"pelloric help\"").arg(name), WrongUsage);
}

} // namespace

int runHelp(const Invocation& invocation)
{
    if (invocation.arguments.isEmpty()) {
        print(overview());
        return Done;
    }
    for (const QString& name : invocation.arguments)
        print(detailsOf(name));
    return Done;
}

} // namespace pelloric::app
