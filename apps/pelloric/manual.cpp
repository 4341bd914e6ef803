// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "manual.h"

#include "command_line.h"
#include "commands.h"
#include "platform/qt/qt_phrase.h"

#include <QStringList>

#include <algorithm>
#include <array>
#include <functional>

namespace pelloric::app {

namespace {

QString dashed(const Option& option)
{
    const QString name = QString::fromLatin1(option.name);
    return (name.size() == 1 ? QStringLiteral("-") : QStringLiteral("--")) + name;
}

void withOptions(const Command& command, const std::function<void(const Option&)>& take)
{
    if (!command.options)
        return;
    for (const OptionTable table : command.options()) {
        for (const Option& option : table)
            take(option);
    }
}

/// What stands in the help for a value that is a file's or folder's name.
bool isFile(const char* value)
{
    constexpr const char* Files[] = { "FILE", "OUT", "FOLDER" };
    return std::ranges::any_of(
        Files, [value](const char* file) { return qstrcmp(file, value) == 0; });
}

/// Whether a command takes a file besides its options.
bool takesFile(const Command& command)
{
    const QString synopsis = QString::fromLatin1(command.synopsis);
    return synopsis.startsWith(QStringLiteral("FILE"))
        || synopsis.startsWith(QStringLiteral("SCRIPT"));
}

/// A text as man shows it: hyphens stay hyphens, and no line is taken for a request.
QString manText(QString text)
{
    text.replace(QLatin1Char('\\'), QStringLiteral("\\e"));
    text.replace(QLatin1Char('-'), QStringLiteral("\\-"));
    if (text.startsWith(QLatin1Char('.')) || text.startsWith(QLatin1Char('\'')))
        text.prepend(QStringLiteral("\\&"));
    return text;
}

QString manParagraph(const QString& prose)
{
    QString text;
    for (const QString& line : prose.trimmed().split(QLatin1Char('\n')))
        text += manText(line) + QLatin1Char('\n');
    return text;
}

QString manHeading(const QString& heading)
{
    const bool hasBlank = heading.contains(QLatin1Char(' '));
    return QLatin1String(".SH ") + (hasBlank ? u'"' + heading + u'"' : heading) + QLatin1Char('\n');
}

QString manEntry(const QString& term, const QString& meaning)
{
    return QStringLiteral(".TP\n") + manText(term) + QLatin1Char('\n') + manText(meaning)
        + QLatin1Char('\n');
}

/// What the program ends with.
struct Status {
    const char* numbers;
    TextView meaning;
};

constexpr auto Statuses = std::to_array<Status>({
    { "0", phraseText(u"Everything was done.") },
    { "1", phraseText(u"It failed; standard error says why in one line.") },
    { "2", phraseText(u"The program was called in a wrong way.") },
    { "130, 143", phraseText(u"It was ended by Ctrl+C or a signal.") },
});

QString manCommand(const Command& command)
{
    QString text = QStringLiteral(".SS \"pelloric %1\"\n")
                       .arg(manText((QString::fromLatin1(command.name) + QLatin1Char(' ')
                           + QString::fromLatin1(command.synopsis))
                                        .trimmed()));
    text += manText(qt::phrased(command.summary)) + QStringLiteral(".\n");
    if (command.details)
        text += QStringLiteral(".PP\n") + manParagraph(command.details());
    withOptions(command, [&text](const Option& option) {
        text += QStringLiteral(".TP\n\\fB%1\\fR").arg(manText(dashed(option)));
        if (option.value)
            text += QStringLiteral(" \\fI%1\\fR").arg(manText(QString::fromUtf8(option.value)));
        text += QLatin1Char('\n') + manText(helpOf(option)) + QLatin1Char('\n');
    });
    return text;
}

/// A text between single quotes of a shell.
QString quoted(QString text)
{
    return QLatin1Char('\'') + text.replace(QLatin1Char('\''), QStringLiteral("'\\''"))
        + QLatin1Char('\'');
}

QStringList optionNames(const Command& command, bool withFilesOnly = false)
{
    QStringList names;
    withOptions(command, [&](const Option& option) {
        if (!withFilesOnly || (option.value && isFile(option.value)))
            names.append(dashed(option));
    });
    return names;
}

QStringList commandNames()
{
    QStringList names;
    for (const Command& command : commands())
        names.append(QString::fromLatin1(command.name));
    return names;
}

/// Names end at blanks there, so that files with blanks are completed by the shell itself.
QString bashCompletion()
{
    QString cases;
    for (const Command& command : commands()) {
        cases += QStringLiteral("        %1) options=%2 files=%3 ;;\n")
                     .arg(QString::fromLatin1(command.name),
                         quoted(optionNames(command).join(QLatin1Char(' '))),
                         QLatin1String(takesFile(command) ? "yes" : "no"));
    }
    return QStringLiteral(
        "# bash completion of pelloric\n"
        "_pelloric() {\n"
        "    local word=${COMP_WORDS[COMP_CWORD]} options= files=no\n"
        "    COMPREPLY=()\n"
        "    if [ \"$COMP_CWORD\" -eq 1 ]; then\n"
        "        COMPREPLY=($(compgen -W %1 -- \"$word\"))\n"
        "        return\n"
        "    fi\n"
        "    case ${COMP_WORDS[1]} in\n"
        "        help) COMPREPLY=($(compgen -W %1 -- \"$word\")); return ;;\n"
        "        completion) COMPREPLY=($(compgen -W 'bash zsh fish' -- \"$word\")); return ;;\n"
        "%2"
        "    esac\n"
        "    if [[ $word == -* ]]; then\n"
        "        COMPREPLY=($(compgen -W \"$options --help\" -- \"$word\"))\n"
        "    elif [ \"$files\" = yes ] || [[ ${COMP_WORDS[COMP_CWORD-1]} == -* ]]; then\n"
        "        compopt -o filenames 2> /dev/null\n"
        "        mapfile -t COMPREPLY < <(compgen -f -- \"$word\")\n"
        "    fi\n"
        "}\n"
        "complete -F _pelloric pelloric\n")
        .arg(quoted(commandNames().join(QLatin1Char(' '))), cases);
}

QString zshText(QString text)
{
    text.replace(QLatin1Char('\\'), QStringLiteral("\\\\"));
    for (const char special : { '[', ']', ':' })
        text.replace(QLatin1Char(special), QStringLiteral("\\") + QLatin1Char(special));
    return text;
}

QString zshCompletion()
{
    QString names;
    QString cases;
    for (const Command& command : commands()) {
        const QString name = QString::fromLatin1(command.name);
        names += QStringLiteral("        %1\n")
                     .arg(quoted(name + QLatin1Char(':') + qt::phrased(command.summary)));
        cases += QStringLiteral("        %1)\n            _arguments \\\n").arg(name);
        withOptions(command, [&cases](const Option& option) {
            QString spec
                = dashed(option) + QLatin1Char('[') + zshText(helpOf(option)) + QLatin1Char(']');
            if (option.value)
                spec += QLatin1Char(':') + zshText(QString::fromUtf8(option.value))
                    + QLatin1Char(':') + QLatin1String(isFile(option.value) ? "_files" : " ");
            cases += QStringLiteral("                %1 \\\n").arg(quoted(spec));
        });
        cases += QStringLiteral("                '*:file:%1'\n            ;;\n")
                     .arg(QLatin1String(takesFile(command)         ? "_files"
                             : name == QLatin1String("completion") ? "(bash zsh fish)"
                             : name == QLatin1String("help")       ? "($names)"
                                                                   : " "));
    }
    return QStringLiteral("#compdef pelloric\n"
                          "_pelloric() {\n"
                          "    local -a commands names\n"
                          "    commands=(\n%1    )\n"
                          "    names=(${commands%%:*})\n"
                          "    if (( CURRENT == 2 )); then\n"
                          "        _describe command commands\n"
                          "        return\n"
                          "    fi\n"
                          "    local command=$words[2]\n"
                          "    shift words\n"
                          "    (( CURRENT-- ))\n"
                          "    case $command in\n%2    esac\n"
                          "}\n"
                          "_pelloric \"$@\"\n")
        .arg(names, cases);
}

QString fishCompletion()
{
    QString text = QStringLiteral("# fish completion of pelloric\ncomplete -c pelloric -f\n");
    const QString all = commandNames().join(QLatin1Char(' '));
    for (const Command& command : commands()) {
        const QString name = QString::fromLatin1(command.name);
        text += QStringLiteral(
            "complete -c pelloric -n 'not __fish_seen_subcommand_from %1' -a %2 -d %3\n")
                    .arg(all, name, quoted(qt::phrased(command.summary)));
        const QString here
            = QStringLiteral("complete -c pelloric -n '__fish_seen_subcommand_from %1'").arg(name);
        if (takesFile(command))
            text += here + QStringLiteral(" -F\n");
        withOptions(command, [&](const Option& option) {
            const QString dashes = dashed(option).startsWith(QStringLiteral("--"))
                ? QStringLiteral("-l")
                : QStringLiteral("-s");
            text += QStringLiteral("%1 %2 %3 -d %4%5\n")
                        .arg(here, dashes, QString::fromLatin1(option.name), quoted(helpOf(option)),
                            QLatin1String(!option.value    ? ""
                                    : isFile(option.value) ? " -r -F"
                                                           : " -x"));
        });
    }
    return text
        + QStringLiteral(
            "complete -c pelloric -n '__fish_seen_subcommand_from completion' -a 'bash zsh fish'\n")
        + QStringLiteral("complete -c pelloric -n '__fish_seen_subcommand_from help' -a '%1'\n")
              .arg(all);
}

struct Shell {
    const char* name;
    QString (*completion)();
};

constexpr auto Shells = std::to_array<Shell>({
    { "bash", bashCompletion },
    { "zsh", zshCompletion },
    { "fish", fishCompletion },
});

} // namespace

QString manualPage()
{
    QString text = QStringLiteral(".TH PELLORIC 1 \"\" \"Pelloric %1\" \"%2\"\n")
                       .arg(QStringLiteral(PELLORIC_VERSION), qt::phrased(u"User Commands"));
    text += manHeading(qt::phrased(u"NAME")) + QStringLiteral("pelloric \\- ")
        + manText(qt::phrased(u"previews, exports and prints tables")) + QLatin1Char('\n');
    text += manHeading(qt::phrased(u"SYNOPSIS"));
    for (const Command& command : commands()) {
        text += QStringLiteral(".B pelloric %1\n").arg(manText(QString::fromLatin1(command.name)));
        if (const QString synopsis = QString::fromLatin1(command.synopsis); !synopsis.isEmpty())
            text += manText(synopsis) + QLatin1Char('\n');
        text += QStringLiteral(".br\n");
    }
    text += manHeading(qt::phrased(u"DESCRIPTION"))
        + manParagraph(qt::phrased(
            u"Lays tables out into pages with header, titles, grid lines and footer, and shows, "
            u"prints or saves them."));
    text += manHeading(qt::phrased(u"COMMANDS"));
    for (const Command& command : commands())
        text += manCommand(command);
    text += manHeading(qt::phrased(u"EXIT STATUS"));
    for (const Status& status : Statuses)
        text += manEntry(QLatin1String(status.numbers), qt::phrased(status.meaning));
    return text + manHeading(qt::phrased(u"FILES"))
        + manEntry(QStringLiteral("$XDG_CONFIG_HOME/pelloric/OstlConfig.ini"),
            qt::phrased(u"Paper, margins, texts and styles; see \"pelloric settings\"."));
}

QString completionOf(const QString& shell)
{
    for (const Shell& known : Shells) {
        if (shell == QLatin1String(known.name))
            return known.completion();
    }
    return {};
}

int runCompletion(const Invocation& invocation)
{
    const CommandLine line(invocation.arguments, {}, 1);
    const QString completion = completionOf(line.file(0));
    if (completion.isEmpty())
        throw CommandError(qt::phrased(u"no completion for the shell %1; take bash, zsh or fish",
                               { line.file(0) }),
            WrongUsage);
    print(completion);
    return Done;
}

QString completionDetails()
{
    return qt::phrased(u"For bash: source <(pelloric completion bash)\n"
                       u"For zsh: pelloric completion zsh > a folder of $fpath, as _pelloric\n"
                       u"For fish: pelloric completion fish | source\n");
}

} // namespace pelloric::app
