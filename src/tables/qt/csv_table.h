// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"

#include <QString>

#include <filesystem>
#include <functional>

namespace pelloric::qt {

/// How a file of separated values is read.
struct CsvOptions {
    /// Name of the encoding; empty: UTF-8 or UTF-16 by a byte order mark, else UTF-8 when all of
    /// the file is that, else GB18030.
    QString encoding {};
    char delimiter = 0; ///< between values; 0: found out
    bool isQuoted = true; ///< false: a quotation mark is a character like any other
    /// Told now and then how much has been read; answers whether to go on. May be empty.
    std::function<bool(double part)> progress {};
};

/// Reads a file of separated values into a table: the first row holds the titles.
///
/// Values are separated by tabs in a file named .tsv or .tab, else by the one of comma, tab and
/// semicolon that the first line holds most of. Quoted values may hold separators, line breaks and
/// doubled quotes. Empty lines are passed over; a short row is filled up with empty cells, and a
/// row longer than the titles adds columns without a title. Every column has the width -1.
/// @throws RunTimeError FileNotFound: it is missing or cannot be read, with the path; TypeMismatch,
///         naming the line where there is one: an unknown encoding, bytes that are no text, an
///         empty file, a quoted value without an end; Overflow: too many columns; Cancelled: the
///         progress said so
TableGrid readCsv(const std::filesystem::path& path, const CsvOptions& options);

} // namespace pelloric::qt
