// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"
#include "commands.h"
#include "interruption.h"
#include "language.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_phrase.h"
#include "platform/run_time_error.h"
#include "table_source.h"

#include <QCoreApplication>
#include <QFileInfo>

#include <algorithm>
#include <array>
#include <csignal>
#include <new>

#ifdef Q_OS_UNIX
#include <fcntl.h>
#include <sys/resource.h>
#include <unistd.h>
#endif

namespace pelloric::app {

namespace {

constexpr auto Commands = std::to_array<Command>({
    { "demo", "", phraseText(u"Shows all kinds of grids on sample tables"), "pelloric demo",
        runDemo, demoOptions, demoDetails },
    { "preview", "FILE", phraseText(u"Shows a table in the preview window"),
        "pelloric preview stock.csv", runPreview, previewOptions, previewDetails },
    { "open", "FILE.ostl", phraseText(u"Shows a saved document in the preview window"),
        "pelloric open stock.ostl", runOpen, openOptions, openDetails },
    { "export", "FILE... -o OUT", phraseText(u"Writes tables as PDF, PNG, SVG or a document file"),
        "pelloric export stock.csv -o stock.pdf", runExport, exportOptions, exportDetails },
    { "run", "SCRIPT.js [ARGUMENT...]",
        phraseText(u"Runs a script that drives the controls by name"), "pelloric run report.js",
        runScript, nullptr, scriptDetails },
    { "print", "FILE", phraseText(u"Prints a table or a document file"), "pelloric print stock.csv",
        runPrint, printOptions, printDetails },
    { "printers", "", phraseText(u"Lists the printers"), "pelloric printers", runPrinters,
        printersOptions, printersDetails },
    { "settings", "", phraseText(u"Shows or restores the settings file"),
        "pelloric settings --path", runSettings, settingsOptions },
    { "completion", "SHELL", phraseText(u"Writes the completion of a shell: bash, zsh or fish"),
        "pelloric completion bash", runCompletion, nullptr, completionDetails },
    { "help", "[COMMAND]", phraseText(u"Explains the commands"), "pelloric help export", runHelp,
        helpOptions },
});

bool asksForHelp(const QString& argument)
{
    return argument == QLatin1String("--help") || argument == QLatin1String("-h");
}

/// "usage: pelloric open FILE.ostl" and an example.
QString usageOf(const Command& command)
{
    const QString call
        = QStringLiteral("%1 %2").arg(QLatin1String(command.name), QLatin1String(command.synopsis));
    return qt::phrased(u"usage: pelloric %1; for example: %2; \"pelloric help %3\" says more",
        { call.trimmed(), QLatin1String(command.example), QLatin1String(command.name) });
}

int runCommand(const Command& command, Invocation invocation)
{
    for (const QString& argument : invocation.arguments) {
        if (argument == QLatin1String("--"))
            break;
        if (asksForHelp(argument)) {
            invocation.arguments = { QString::fromLatin1(command.name) };
            return runHelp(invocation);
        }
    }
    try {
        return command.run(invocation);
    } catch (const UsageError& error) {
        tell(QString::fromUtf8(error.what()));
        tellMore(usageOf(command));
        return error.status();
    }
}

int run(Invocation invocation)
{
    if (invocation.arguments.isEmpty())
        throw CommandError(
            qt::phrased(u"say what to do, for example \"pelloric export table.csv -o "
                        u"table.pdf\"; see \"pelloric help\""),
            WrongUsage);
    const QString name = invocation.arguments.takeFirst();
    if (name == QLatin1String("--version")) {
        print(QStringLiteral("pelloric " PELLORIC_VERSION "\n"));
        return Done;
    }
    for (const Command& command : Commands) {
        if (name == QLatin1String(command.name))
            return runCommand(command, invocation);
    }
    if (asksForHelp(name))
        return runHelp({ invocation.argc, invocation.argv, {} });
    if (QFileInfo(qt::pathOf(name)).isFile())
        throw CommandError(qt::phrased(u"%1 is a file; say what to do with it: pelloric %2 %1",
                               { name, QLatin1String(isDocumentName(name) ? "open" : "preview") }),
            WrongUsage);
    throw CommandError(qt::phrased(u"no command %1; see \"pelloric help\"").arg(name), WrongUsage);
}

QStringList argumentsOf(int argc, char** argv)
{
    QStringList arguments;
    for (int at = 1; at < argc; ++at)
        arguments.append(qt::fileNameOf(argv[at]));
    return arguments;
}

int statusOf(const RunTimeError& error)
{
    if (error.number() == ErrorNumber::Cancelled && Interruption::signal() != 0)
        return SignalBase + Interruption::signal();
    tell(describe(error));
    return Failed;
}

/// Keeps files that are opened from taking the place of a standard stream that was closed, which
/// would be written into them; reading and writing there fails, as it does without a stream.
void fillStandardStreams()
{
#ifdef Q_OS_UNIX
    for (const int stream : { STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO }) {
        if (fcntl(stream, F_GETFD) >= 0)
            continue;
        const int held = open("/dev/null", stream == STDIN_FILENO ? O_WRONLY : O_RDONLY);
        if (held >= 0 && held != stream)
            close(held);
    }
#endif
}

#ifdef Q_OS_UNIX
/// What the toolkit needs to start at all; with less it ends the program without a word.
struct Need {
    int (*ask)(rlimit& held);
    rlim_t least; ///< units of the limit
    rlim_t unit; ///< of the numbers that are told
    TextView text;
};

constexpr auto Needs = std::to_array<Need>({
    { [](rlimit& held) { return getrlimit(RLIMIT_STACK, &held); }, 256U << 10U, 1024,
        phraseText(u"the stack may hold %1 KB only; allow %2 at least: ulimit -s 8192") },
    { [](rlimit& held) { return getrlimit(RLIMIT_NOFILE, &held); }, 16, 1,
        phraseText(u"only %1 files may be open; allow %2 at least: ulimit -n 1024") },
});
#endif

/// @throws CommandError a limit that somebody has set is too low
void requireResources()
{
#ifdef Q_OS_UNIX
    for (const Need& need : Needs) {
        rlimit held {};
        if (need.ask(held) == 0 && held.rlim_cur < need.least)
            throw CommandError(qt::phrased(need.text,
                { QString::number(held.rlim_cur / need.unit),
                    QString::number(need.least / need.unit) }));
    }
#endif
}

/// Runs the program; every error becomes one line and an exit status.
int guardedRun(int argc, char** argv)
{
#ifdef SIGXFSZ
    // A file past the largest size that is allowed is an error like any other.
    std::signal(SIGXFSZ, SIG_IGN);
#endif
    fillStandardStreams();
    // The toolkit would take options such as "--title" for its own.
    int applicationArgc = std::min(argc, 1);
    speakAs(QLocale::system());
    try {
        requireResources();
        return run({ applicationArgc, argv, argumentsOf(argc, argv) });
    } catch (const CommandError& error) {
        tell(QString::fromUtf8(error.what()));
        return error.status();
    } catch (const RunTimeError& error) {
        return statusOf(error);
    } catch (const std::bad_alloc&) {
        tell(qt::phrased(u"there is not enough memory for this table"));
    } catch (const std::exception& error) {
        tell(QString::fromUtf8(error.what()));
    }
    return Failed;
}

} // namespace

std::span<const Command> commands() { return Commands; }

} // namespace pelloric::app

int main(int argc, char** argv) { return pelloric::app::guardedRun(argc, argv); }
