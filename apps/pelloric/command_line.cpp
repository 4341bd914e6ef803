// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"

#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QCommandLineOption>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>

namespace pelloric::app {

namespace {

constexpr int HelpColumn = 26;

QString dashed(const char* name)
{
    const QString text = QString::fromLatin1(name);
    return (text.size() == 1 ? QStringLiteral("-") : QStringLiteral("--")) + text;
}

/// What can be done about an error; stands behind its text.
struct Advice {
    ErrorNumber number;
    const char* text;
};

constexpr auto Advices = std::to_array<Advice>({
    { ErrorNumber::WriteFailed, "; check that the folder exists and takes files" },
    { ErrorNumber::DiskFull, "; make room on the disk, or choose another one" },
    { ErrorNumber::PermissionDenied, "; check your rights to the file and its folder" },
    { ErrorNumber::FileNotFound, "; check the name and that you may read it" },
});

} // namespace

CommandLine::CommandLine(
    const QStringList& arguments, const std::vector<OptionTable>& tables, int files)
{
    for (const OptionTable table : tables) {
        for (const Option& option : table) {
            parser_.addOption(QCommandLineOption(QString::fromLatin1(option.name), {},
                option.value ? QString::fromLatin1(option.value) : QString()));
        }
    }
    // The parser takes the first argument for the program's name.
    if (!parser_.parse(QStringList(QString()) + arguments))
        throw CommandError(parser_.errorText(), WrongUsage);
    const auto given = parser_.positionalArguments().size();
    if (files != OneOrMore && given > files)
        throw CommandError(QStringLiteral("one argument too many: %1; quote names with blanks")
                               .arg(parser_.positionalArguments().at(files)),
            WrongUsage);
    if (given < std::max(files, files == OneOrMore ? 1 : 0))
        throw CommandError(QStringLiteral("the file is missing"), WrongUsage);
}

bool CommandLine::has(const char* option) const
{
    return parser_.isSet(QString::fromLatin1(option));
}

QString CommandLine::value(const char* option) const
{
    return parser_.value(QString::fromLatin1(option));
}

double numberOf(const char* option, const QString& text, double least, double most, bool isWhole)
{
    bool isNumber = false;
    const double number = text.toDouble(&isNumber);
    const bool isInside = isNumber && number >= least && number <= most;
    if (!isInside || (isWhole && number != std::floor(number)))
        throw CommandError(
            QStringLiteral("%1 takes a %2 from %3 to %4, not \"%5\"")
                .arg(dashed(option),
                    isWhole ? QStringLiteral("whole number") : QStringLiteral("number"),
                    QString::number(least), QString::number(most), text),
            WrongUsage);
    return number;
}

QString optionHelp(OptionTable options)
{
    QString help;
    for (const Option& option : options) {
        QString left = QStringLiteral("  ") + dashed(option.name);
        if (option.value)
            left += QLatin1Char(' ') + QString::fromLatin1(option.value);
        help += left.leftJustified(HelpColumn - 1) + QLatin1Char(' ')
            + QString::fromUtf8(option.help) + QLatin1Char('\n');
    }
    return help;
}

QString detailOf(const RunTimeError& error)
{
    const QString text = qt::toQString(error.text());
    const QString plain = qt::toQString(errorText(error.number())) + QStringLiteral(": ");
    return text.startsWith(plain) ? text.mid(plain.size()) : text;
}

QString describe(const RunTimeError& error)
{
    QString text = qt::toQString(error.text());
    for (const Advice& advice : Advices) {
        if (advice.number == error.number())
            text += QString::fromLatin1(advice.text);
    }
    return text;
}

void tell(const QString& text)
{
    QString line = text;
    for (QChar& character : line) {
        if (character.category() == QChar::Other_Control)
            character = QLatin1Char(' ');
    }
    std::fputs(("pelloric: " + line.toUtf8() + '\n').constData(), stderr);
}

void print(const QString& text)
{
    std::fputs(text.toUtf8().constData(), stdout);
    if (std::fflush(stdout) != 0)
        throw CommandError(QStringLiteral("standard output cannot be written"));
}

} // namespace pelloric::app
