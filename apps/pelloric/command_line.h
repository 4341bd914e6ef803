// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/phrase.h"

#include <QCommandLineParser>
#include <QString>
#include <QStringList>

#include <span>
#include <stdexcept>
#include <vector>

namespace pelloric {
class RunTimeError;
}

namespace pelloric::app {

/// Exit statuses of the program; a signal that ends it gives 128 and the signal's number.
enum ExitStatus { Done = 0, Failed = 1, WrongUsage = 2, SignalBase = 128 };

/// An error for the person who called the program: one line that says what to do.
class CommandError : public std::runtime_error {
public:
    explicit CommandError(const QString& text, int status = Failed)
        : std::runtime_error(text.toStdString())
        , status_(status)
    {
    }

    /// What the program ends with.
    int status() const { return status_; }

private:
    int status_;
};

/// The arguments do not fit the command; how it is called is told behind the text.
class UsageError : public CommandError {
public:
    explicit UsageError(const QString& text)
        : CommandError(text, WrongUsage)
    {
    }
};

/// An option of a command.
struct Option {
    const char* name; ///< without the dashes; one letter or a word
    const char* value; ///< what stands for its value in the help; null: it takes none
    TextView help; ///< a phrase
    bool mayBeBlank = false; ///< nothing, or blanks alone, are a value like any other
};

using OptionTable = std::span<const Option>;

/// Stands for the number of files of a command that takes one or more.
inline constexpr int OneOrMore = -1;

/// The arguments of a command, taken apart.
class CommandLine {
public:
    /// @param files  how many arguments that are no options are needed; or `OneOrMore`
    /// @throws UsageError unknown options, values that are missing or blank, another number of
    /// files
    CommandLine(const QStringList& arguments, const std::vector<OptionTable>& tables, int files);

    /// Whether an option was given; one that the command does not take never is.
    bool has(const char* option) const;

    /// The value of an option, the last one given; empty when it was not given.
    QString value(const char* option) const;

    /// The arguments that are no options.
    QStringList files() const { return parser_.positionalArguments(); }

    QString file(int number) const { return parser_.positionalArguments().at(number); }

private:
    void refuseBlank(const Option& option) const;

    QCommandLineParser parser_;
    QStringList known_;
};

/// The value of an option as a number.
/// @param isWhole  whether fractions are refused
/// @throws CommandError WrongUsage: it is none, or outside the bounds
double numberOf(const char* option, const QString& text, double least, double most, bool isWhole);

/// What an option does; empty where the line above goes on.
QString helpOf(const Option& option);

/// One line of help for each option, in columns.
QString optionHelp(OptionTable options);

/// What an error says besides its number's text.
QString detailOf(const RunTimeError& error);

/// The one line that tells a person about an error.
QString describe(const RunTimeError& error);

/// Writes "pelloric: " and the text as one line to standard error.
void tell(const QString& text);

/// Writes the text as a further line to standard error, without the program's name.
void tellMore(const QString& text);

/// Writes a text to standard output.
void print(const QString& text);

} // namespace pelloric::app
