// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"

#include <QStringList>

#include <span>
#include <vector>

namespace pelloric::app {

/// How the program was called.
struct Invocation {
    int& argc; ///< for the application object, which learns only the program's name
    char** argv = nullptr; ///< for the application object
    QStringList arguments; ///< what stands behind the command's name
};

/// The tables of a command's options, in the order of its help.
using OptionTables = std::vector<OptionTable>;

/// One of the things that the program can do; help, manual page and completions are made of it.
struct Command {
    const char* name = nullptr;
    const char* synopsis = nullptr; ///< what stands behind the name
    TextView summary; ///< one line, a phrase
    const char* example = nullptr; ///< how it is called, whole
    int (*run)(const Invocation& invocation) = nullptr; ///< answers the exit status; may throw
    OptionTables (*options)() = nullptr; ///< may be missing
    QString (*details)() = nullptr; ///< prose of the command's help, ends a line; may be missing
};

/// All commands, in the order in which they are listed.
std::span<const Command> commands();

/// `pelloric demo`: a host with all kinds of grids.
int runDemo(const Invocation& invocation);
OptionTables demoOptions();
QString demoDetails();

/// `pelloric preview`: a table in the preview window.
int runPreview(const Invocation& invocation);
OptionTables previewOptions();
QString previewDetails();

/// `pelloric open`: a saved document in the preview window.
int runOpen(const Invocation& invocation);
OptionTables openOptions();
QString openDetails();

/// `pelloric export`: a table or a document as PDF, images or a document file; needs no display.
int runExport(const Invocation& invocation);
OptionTables exportOptions();
QString exportDetails();

/// `pelloric run`: a script that drives the controls by name; needs no display.
int runScript(const Invocation& invocation);
QString scriptDetails();

/// `pelloric print`: a table or a document on a printer; needs no display.
int runPrint(const Invocation& invocation);
OptionTables printOptions();
QString printDetails();

/// `pelloric printers`: the printers of the system and whether they take jobs; needs no display.
int runPrinters(const Invocation& invocation);
OptionTables printersOptions();
QString printersDetails();

/// `pelloric settings`: shows or restores the settings file; needs no display.
int runSettings(const Invocation& invocation);
OptionTables settingsOptions();

/// `pelloric completion`: what makes a shell complete the program's arguments.
int runCompletion(const Invocation& invocation);
QString completionDetails();

/// `pelloric help`: all commands, or one of them at length, or the manual page.
int runHelp(const Invocation& invocation);
OptionTables helpOptions();

} // namespace pelloric::app
