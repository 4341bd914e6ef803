// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "command_line.h"

#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QCommandLineOption>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cmath>
#include <cstdio>
#include <cstring>

namespace pelloric::app {

namespace {

constexpr int HelpColumn = 26;

QString dashed(const char* name)
{
    const QString text = QString::fromLatin1(name);
    return (text.size() == 1 ? QStringLiteral("-") : QStringLiteral("--")) + text;
}

/// What the parser says of an option, in the language in force.
QString wrongOption(const QCommandLineParser& parser)
{
    constexpr auto Sentences = std::to_array<TextView>({
        phraseText(u"Unknown option '%1'."),
        phraseText(u"Missing value after '%1'."),
        phraseText(u"Unexpected value after '%1'."),
    });
    QString text = parser.errorText();
    const auto quote = text.indexOf(QLatin1Char('\''));
    const auto last = text.lastIndexOf(QLatin1Char('\''));
    const QString option = last > quote ? text.mid(quote + 1, last - quote - 1) : QString();
    for (const TextView sentence : Sentences) {
        if (text == qt::toQString(sentence).arg(option))
            return qt::phrased(sentence, { option });
    }
    return text;
}

/// What can be done about an error, a phrase around its text.
struct Advice {
    ErrorNumber number;
    TextView text;
};

constexpr auto Advices = std::to_array<Advice>({
    { ErrorNumber::WriteFailed, phraseText(u"%1; check that the folder exists and takes files") },
    { ErrorNumber::DiskFull, phraseText(u"%1; make room on the disk, or choose another one") },
    { ErrorNumber::PermissionDenied,
        phraseText(u"%1; check your rights to the file and its folder") },
    { ErrorNumber::FileNotFound, phraseText(u"%1; check the name and that you may read it") },
});

} // namespace

CommandLine::CommandLine(
    const QStringList& arguments, const std::vector<OptionTable>& tables, int files)
{
    for (const OptionTable table : tables) {
        for (const Option& option : table) {
            known_.append(QString::fromLatin1(option.name));
            parser_.addOption(QCommandLineOption(QString::fromLatin1(option.name), {},
                option.value ? QString::fromLatin1(option.value) : QString()));
        }
    }
    // The parser takes the first argument for the program's name.
    if (!parser_.parse(QStringList(QString()) + arguments))
        throw UsageError(wrongOption(parser_));
    for (const OptionTable table : tables)
        std::ranges::for_each(table, [this](const Option& option) { refuseBlank(option); });
    const auto given = parser_.positionalArguments().size();
    if (files != OneOrMore && given > files)
        throw UsageError(qt::phrased(u"one argument too many: %1; quote names with blanks",
            { parser_.positionalArguments().at(files) }));
    if (given < std::max(files, files == OneOrMore ? 1 : 0))
        throw UsageError(qt::phrased(u"an argument is missing"));
}

/// @throws UsageError the option's value says nothing, which nobody writes on purpose
void CommandLine::refuseBlank(const Option& option) const
{
    if (option.value == nullptr || option.mayBeBlank || !has(option.name))
        return;
    const QString text = value(option.name);
    if (text.trimmed().isEmpty())
        throw UsageError(qt::phrased(u"%1 takes %2, not \"%3\": %4",
            { dashed(option.name), QString::fromLatin1(option.value), text, helpOf(option) }));
}

bool CommandLine::has(const char* option) const
{
    const QString name = QString::fromLatin1(option);
    return known_.contains(name) && parser_.isSet(name);
}

QString CommandLine::value(const char* option) const
{
    return has(option) ? parser_.value(QString::fromLatin1(option)) : QString();
}

double numberOf(const char* option, const QString& text, double least, double most, bool isWhole)
{
    bool isNumber = false;
    const double number = text.toDouble(&isNumber);
    const bool isInside = isNumber && number >= least && number <= most;
    if (!isInside || (isWhole && number != std::floor(number)))
        throw CommandError(
            qt::phrased(isWhole ? phraseText(u"%1 takes a whole number from %2 to %3, not \"%4\"")
                                : phraseText(u"%1 takes a number from %2 to %3, not \"%4\""),
                { dashed(option), QString::number(least), QString::number(most), text }),
            WrongUsage);
    return number;
}

QString helpOf(const Option& option)
{
    return option.help.empty() ? QString() : qt::phrased(option.help);
}

QString optionHelp(OptionTable options)
{
    QString help;
    for (const Option& option : options) {
        QString left = QStringLiteral("  ") + dashed(option.name);
        if (option.value)
            left += QLatin1Char(' ') + QString::fromLatin1(option.value);
        help += left.leftJustified(HelpColumn - 1) + QLatin1Char(' ') + helpOf(option)
            + QLatin1Char('\n');
    }
    return help;
}

QString detailOf(const RunTimeError& error)
{
    const TextView detail = error.detail();
    return qt::toQString(detail.empty() ? TextView(error.text()) : detail);
}

QString describe(const RunTimeError& error)
{
    QString text = qt::toQString(error.text());
    for (const Advice& advice : Advices) {
        if (advice.number == error.number())
            text = qt::phrased(advice.text, { text });
    }
    return text;
}

void tell(const QString& text) { tellMore(QStringLiteral("pelloric: ") + text); }

void tellMore(const QString& text)
{
    QString line = text;
    for (QChar& character : line) {
        if (character.category() == QChar::Other_Control)
            character = QLatin1Char(' ');
    }
    std::fputs((line.toUtf8() + '\n').constData(), stderr);
}

void print(const QString& text)
{
    std::fputs(text.toUtf8().constData(), stdout);
    if (std::fflush(stdout) != 0)
        throw CommandError(qt::phrased(u"standard output cannot be written: %1",
            { QString::fromLocal8Bit(std::strerror(errno)) }));
}

} // namespace pelloric::app
