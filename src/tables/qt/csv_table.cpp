// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/csv_table.h"

#include "document/limits.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/utf8.h"
#include "tables/separated_values.h"

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr std::size_t SniffedBytes = 1U << 16U;
constexpr std::size_t RowsOfAStep = 4096; ///< between two reports of the progress
constexpr std::size_t MostNamedRows = 5; ///< of those that look glued

constexpr std::int64_t Steps = 1000; ///< of the whole work

/// Part of the whole work after which the bytes are read.
constexpr double PartRead = 0.3;

/// Room for more rows than the first rows let expect.
constexpr double Spare = 1.05;

[[noreturn]] void refuse(const Text& what) { throw RunTimeError(ErrorNumber::TypeMismatch, what); }

char delimiterOf(const std::filesystem::path& path, std::string_view text)
{
    const std::string_view start = text.substr(0, SniffedBytes);
    const QString extension = QString::fromStdU16String(path.extension().u16string()).toLower();
    const bool isTabbed = extension == QLatin1String(".tsv") || extension == QLatin1String(".tab");
    return isTabbed && start.find('\t') != std::string_view::npos ? '\t' : findDelimiter(start);
}

/// Tells how far a walk over the rows has come.
void tellPart(const CsvOptions& options, double part)
{
    tell(options.progress, static_cast<std::int64_t>(part * Steps), Steps);
}

/// Rows with another number of values than the titles.
struct OddRows {
    std::vector<std::int64_t> gluedLines {}; ///< where the first of those begin that look glued
    std::size_t glued = 0;
    std::size_t ragged = 0; ///< of the others
    std::int64_t raggedLine = 0; ///< where the first of them begins
};

/// A line break in a value whose row does not have as many values as the titles is most likely a
/// quote that somebody forgot to close.
void noteOddRow(const SeparatedValues& row, std::size_t titles, OddRows& odd)
{
    if (row.valueCount() == titles)
        return;
    if (!row.hasLineBreak()) {
        if (odd.ragged++ == 0)
            odd.raggedLine = row.line();
        return;
    }
    ++odd.glued;
    if (odd.gluedLines.size() < MostNamedRows)
        odd.gluedLines.push_back(row.line());
}

/// @throws RunTimeError Overflow: a value of the row is too long
void refuseLongValues(const SeparatedValues& values, std::size_t most)
{
    for (std::size_t at = 0; at < values.valueCount(); ++at) {
        if (values.value(at).size() > most)
            throw RunTimeError(ErrorNumber::Overflow,
                atLine(values.line(),
                    phrase(u"value %1 of the row holds more than %2 bytes; leave it out, or "
                           u"shorten it",
                        { decimal(static_cast<std::int64_t>(at) + 1),
                            decimal(static_cast<std::int64_t>(most)) })));
    }
}

/// Goes to the next row.
/// @param most  bytes of a value
/// @throws RunTimeError Overflow: too many columns, or a value is too long
bool nextRow(SeparatedValues& values, std::size_t most)
{
    const std::size_t before = values.position();
    if (!values.nextRow())
        return false;
    if (values.position() - before > most)
        refuseLongValues(values, most);
    if (values.valueCount() > MostColumns)
        throw RunTimeError(ErrorNumber::Overflow,
            atLine(
                values.line(), phrase(u"more than %1 values in a row", { decimal(MostColumns) })));
    return true;
}

/// The most values of a row, from a row on.
/// @param most  bytes of a value
std::size_t widestFrom(SeparatedValues values, std::size_t most)
{
    std::size_t widest = values.valueCount();
    while (nextRow(values, most))
        widest = std::max(widest, values.valueCount());
    return widest;
}

/// The values of a row as texts, the buffers kept from row to row.
class RowTexts {
public:
    /// @return  valid until the next row
    std::span<const TextView> of(const SeparatedValues& values)
    {
        std::size_t most = 0;
        for (std::size_t at = 0; at < values.valueCount(); ++at)
            most += values.value(at).size();
        if (units_.size() < most)
            units_.resize(most);
        cells_.clear();
        char16_t* begin = units_.data();
        for (std::size_t at = 0; at < values.valueCount(); ++at) {
            char16_t* const end = putUtf8(begin, values.value(at));
            cells_.emplace_back(begin, static_cast<std::size_t>(end - begin));
            begin = end;
        }
        return cells_;
    }

private:
    Text units_; ///< the cells of the row, one behind the other, and room
    std::vector<TextView> cells_;
};

TableGrid gridOf(std::span<const TextView> titles)
{
    std::vector<TableColumn> columns;
    for (const TextView title : titles)
        columns.push_back({ .title = Text(title), .width = -1 });
    return TableGrid(std::move(columns));
}

TableGrid makeGrid(
    std::string_view text, ValuesDialect dialect, const CsvOptions& options, OddRows& odd)
{
    SeparatedValues values(text, dialect);
    if (!nextRow(values, options.mostValueBytes))
        refuse(phrase(u"the file is empty"));
    RowTexts row;
    TableGrid grid = gridOf(row.of(values));
    const std::size_t titles = values.valueCount();
    for (std::size_t rows = 1; nextRow(values, options.mostValueBytes); ++rows) {
        noteOddRow(values, titles, odd);
        if (values.valueCount() > static_cast<std::size_t>(grid.columnCount()))
            grid.widen(widestFrom(values, options.mostValueBytes), { .title = {}, .width = -1 });
        grid.addRow(row.of(values));
        if (rows % RowsOfAStep != 0)
            continue;
        const double part
            = static_cast<double>(values.position()) / static_cast<double>(text.size());
        tellPart(options, PartRead + (1 - PartRead) * part);
        if (rows == RowsOfAStep)
            grid.reserve(static_cast<std::size_t>(static_cast<double>(rows) / part * Spare));
    }
    return grid;
}

void refuseZeroBytes(std::string_view text)
{
    const std::size_t zero = text.find('\0');
    if (zero == std::string_view::npos)
        return;
    const auto line = std::ranges::count(text.substr(0, zero), '\n') + 1;
    refuse(atLine(line,
        phrase(u"a zero byte; this is no text file, unless in UTF-16: then name UTF-16LE or "
               u"UTF-16BE as its encoding")));
}

Text gluedNote(const OddRows& odd)
{
    Text lines;
    for (const std::int64_t line : odd.gluedLines)
        lines.append(lines.empty() ? u"" : u", ").append(decimal(line));
    if (odd.glued > odd.gluedLines.size())
        lines = phrase(u"%1 and others", { lines });
    return phrase(odd.glued == 1
            ? phraseText(
                u"the row at line %1 may be several rows glued together: a quoted value goes "
                u"on over a line break, and the row has not as many values as the titles")
            : phraseText(
                u"the rows at lines %1 may be several rows glued together: a quoted value goes "
                u"on over a line break, and the row has not as many values as the titles"),
        { lines });
}

Text raggedNote(const OddRows& odd, std::int64_t rows, char delimiter)
{
    const Text between = delimiter == '\t'
        ? phrase(u"a tab")
        : Text(u"\"") + Text(1, static_cast<char16_t>(delimiter)) + u"\"";
    return phrase(
        u"%1 of %2 rows have not as many values as the titles, the first at line %3; is this a "
        u"table with %4 between its values?",
        { decimal(static_cast<std::int64_t>(odd.ragged)), decimal(rows), decimal(odd.raggedLine),
            between });
}

} // namespace

TableGrid readCsv(const std::filesystem::path& path, const CsvOptions& options)
{
    TextFileOptions reading { .encoding = options.encoding,
        .mostValueBytes = options.mostValueBytes,
        .delimiter = options.delimiter.value_or(',') };
    if (options.progress)
        reading.progress = [&](std::int64_t done, std::int64_t total) {
            const double part
                = static_cast<double>(done) / static_cast<double>(std::max<std::int64_t>(1, total));
            return options.progress(static_cast<std::int64_t>(part * PartRead * Steps), Steps);
        };
    const TextFile file = readTextFile(path, reading);
    refuseZeroBytes(file.text);
    const DelimiterLine named = delimiterLineOf(file.text);
    // Its line end stays, so that lines are counted as the file has them.
    const std::string_view rows = std::string_view(file.text).substr(named.length);
    const ValuesDialect dialect { options.delimiter ? *options.delimiter
            : named.length > 0                      ? named.delimiter
                                                    : delimiterOf(path, rows),
        options.hasQuotes };
    OddRows odd;
    TableGrid grid = makeGrid(rows, dialect, options, odd);
    if (options.notes != nullptr && file.isGuessed)
        options.notes->push_back(
            phrase(u"the encoding was guessed to be %1; name another one if letters look wrong",
                { toText(file.encoding) }));
    if (options.notes != nullptr && odd.glued > 0)
        options.notes->push_back(gluedNote(odd));
    if (options.notes != nullptr && odd.ragged > 0)
        options.notes->push_back(raggedNote(odd, grid.rowCount(), dialect.delimiter));
    return grid;
}

} // namespace pelloric::qt
