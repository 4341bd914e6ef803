// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"
#include "grids/table_grid.h"
#include "platform/qt/file_names.h"

namespace pelloric::app {

class ProgressLine;

/// The options that say what is read of a file, for every command that reads tables.
OptionTable sourceOptions();

/// What FILE is and how its pages look, for the help of commands that make pages of tables and
/// saved documents alike without a window.
QString fileDetails();

using qt::pathOf;

/// Refuses in words what no file is that can be read: a name without one, a folder, a device, a
/// socket, or a file without the rights. A pipe is none of these.
/// @throws CommandError naming it
void checkReadable(const QString& name);

/// Whether a name is the standard input's, or a pipe's, which can be read only once.
bool isPipe(const QString& name);

/// Whether a file is an SQLite database.
bool isDatabase(const QString& name);

/// Whether a name is that of a document file.
bool isDocumentName(const QString& name);

/// Whether a command's file, which may be a database with a table, is another file that exists.
bool isSameFile(const QString& file, const QString& other);

/// What a name says without its folder and extension.
QString plainName(const QString& name);

/// Reads the table that a command's file and options name: a text or office file, or a table
/// ("db.sqlite:table") or query of an SQLite database.
/// @throws CommandError naming the file; RunTimeError Cancelled
TableGrid readTable(const QString& file, const CommandLine& line, ProgressLine& progress);

} // namespace pelloric::app
