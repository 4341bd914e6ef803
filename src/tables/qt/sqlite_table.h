// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"
#include "platform/progress.h"

#include <QString>

#include <filesystem>

namespace pelloric::qt {

/// What is read of an SQLite database.
struct SqliteSource {
    std::filesystem::path path;
    QString table {}; ///< a table or view; empty: the only one that there is
    QString query {}; ///< a SELECT statement, taken instead of the table when it is not empty
    char16_t decimalSeparator = u'.';
    Progress
        progress {}; ///< told now and then how many rows have been read; nobody knows of how many
};

/// Reads a table or the answer of a query into a table, the names of the columns as titles.
///
/// The database is opened for reading only. Numbers are written as the database gives them, a null
/// is an empty cell, and every column has the width -1.
/// @throws RunTimeError FileNotFound: it is missing or no database, with the path; InvalidCall: no
///         such table (the message lists those there are), or the statement fails or answers no
///         rows; Cancelled: the progress said so
TableGrid readSqlite(const SqliteSource& source);

} // namespace pelloric::qt
