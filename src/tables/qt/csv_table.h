// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/table_grid.h"
#include "tables/qt/text_file.h"

#include <optional>
#include <vector>

namespace pelloric::qt {

/// How a file of separated values is read.
struct CsvOptions {
    QString encoding {}; ///< as `TextFileOptions` has it
    Progress progress {}; ///< told now and then how many thousandths of the work are done
    std::optional<char> delimiter {}; ///< an ASCII character; nothing: found out
    bool hasQuotes = true; ///< false: a quote is a character like any other
    std::size_t mostValueBytes = MostValueBytes; ///< of a value, see there
    /// Gets sentences that the user should read: an encoding that was guessed, rows that look glued
    /// together, rows with another number of values than the titles. May be null; borrowed.
    std::vector<Text>* notes = nullptr;
};

/// Reads a file of separated values into a table: the first row holds the titles.
///
/// Values are separated by tabs in a file named .tsv or .tab that holds any, else by what
/// `findDelimiter` finds out; `SeparatedValues` says when a value is quoted. Empty lines are passed
/// over; a short row is filled up with empty cells, and a row longer than the titles adds columns
/// without a title. Every column has the width -1.
/// @throws RunTimeError as `readTextFile`; TypeMismatch also: an empty file, or a zero byte;
///         Overflow, naming the line: too many columns
TableGrid readCsv(const std::filesystem::path& path, const CsvOptions& options);

} // namespace pelloric::qt
