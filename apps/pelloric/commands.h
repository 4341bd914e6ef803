// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QStringList>

#include <span>

namespace pelloric::app {

/// How the program was called.
struct Invocation {
    int& argc; ///< for the application object, which learns only the program's name
    char** argv = nullptr; ///< for the application object
    QStringList arguments; ///< what stands behind the command's name
};

/// One of the things that the program can do.
struct Command {
    const char* name = nullptr;
    const char* synopsis = nullptr; ///< what stands behind the name
    const char* summary = nullptr; ///< one line
    int (*run)(const Invocation& invocation) = nullptr; ///< answers the exit status; may throw
    QString (*details)() = nullptr; ///< the rest of the command's help; may be missing
};

/// All commands, in the order in which they are listed.
std::span<const Command> commands();

/// `pelloric demo`: a host with all kinds of grids.
int runDemo(const Invocation& invocation);
QString demoDetails();

/// `pelloric preview`: a table in the preview window.
int runPreview(const Invocation& invocation);
QString previewDetails();

/// `pelloric open`: a saved document in the preview window.
int runOpen(const Invocation& invocation);
QString openDetails();

/// `pelloric export`: a table or a document as PDF, images or a document file; needs no display.
int runExport(const Invocation& invocation);
QString exportDetails();

/// `pelloric run`: a script that drives the controls by name; needs no display.
int runScript(const Invocation& invocation);
QString scriptDetails();

/// `pelloric print`: a table or a document on a printer; needs no display.
int runPrint(const Invocation& invocation);
QString printDetails();

/// `pelloric printers`: the printers of the system and whether they take jobs; needs no display.
int runPrinters(const Invocation& invocation);
QString printersDetails();

/// `pelloric settings`: shows or restores the settings file; needs no display.
int runSettings(const Invocation& invocation);
QString settingsDetails();

/// `pelloric help`: all commands, or one of them at length.
int runHelp(const Invocation& invocation);

} // namespace pelloric::app
