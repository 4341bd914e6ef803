// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/csv_table.h"

#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "tables/separated_values.h"

#include <algorithm>
#include <limits>

namespace pelloric::qt {

namespace {

constexpr std::size_t SniffedBytes = 1U << 16U;
constexpr std::size_t MostColumns = std::numeric_limits<std::int16_t>::max();
constexpr std::size_t RowsOfAStep = 4096; ///< between two reports of the progress
constexpr std::size_t MostNamedRows = 5; ///< of those that look glued

/// Parts of the whole work after which the bytes are read, and the rows counted.
constexpr double PartRead = 0.3;
constexpr double PartCounted = 0.6;

[[noreturn]] void refuse(const Text& what) { throw RunTimeError(ErrorNumber::TypeMismatch, what); }

char delimiterOf(const std::filesystem::path& path, std::string_view text)
{
    const std::string_view start = text.substr(0, SniffedBytes);
    const QString extension = QString::fromStdU16String(path.extension().u16string()).toLower();
    const bool isTabbed = extension == QLatin1String(".tsv") || extension == QLatin1String(".tab");
    return isTabbed && start.find('\t') != std::string_view::npos ? '\t' : findDelimiter(start);
}

/// Tells how far a walk over the rows has come.
void tell(const CsvOptions& options, double part)
{
    if (options.progress && !options.progress(part))
        throw RunTimeError(ErrorNumber::Cancelled);
}

/// What a table has to hold.
struct Sizes {
    std::size_t columns = 0;
    std::size_t rows = 0; ///< the titles' among them
    std::vector<std::int64_t> gluedLines {}; ///< where rows begin that look glued
    std::size_t glued = 0;
    std::size_t ragged = 0; ///< rows with another number of values than the titles, not glued
    std::int64_t raggedLine = 0; ///< where the first of them begins
};

/// A line break in a value whose row does not have as many values as the titles is most likely a
/// quote that somebody forgot to close.
void noteOddRow(const SeparatedValues& row, std::size_t titles, Sizes& sizes)
{
    if (row.valueCount() == titles)
        return;
    if (!row.hasLineBreak()) {
        if (sizes.ragged++ == 0)
            sizes.raggedLine = row.line();
        return;
    }
    ++sizes.glued;
    if (sizes.gluedLines.size() < MostNamedRows)
        sizes.gluedLines.push_back(row.line());
}

Sizes countSizes(std::string_view text, ValuesDialect dialect, const CsvOptions& options)
{
    SeparatedValues values(text, dialect);
    Sizes sizes;
    std::size_t titles = 0;
    while (values.nextRow()) {
        const std::size_t count = values.valueCount();
        if (count > MostColumns)
            throw RunTimeError(
                ErrorNumber::Overflow, atLine(values.line(), u"more than 32767 values in a row"));
        if (sizes.rows++ == 0)
            titles = count;
        else
            noteOddRow(values, titles, sizes);
        sizes.columns = std::max(sizes.columns, count);
        if (sizes.rows % RowsOfAStep == 0)
            tell(options,
                PartRead
                    + (PartCounted - PartRead) * static_cast<double>(values.position())
                        / static_cast<double>(text.size()));
    }
    return sizes;
}

/// The values of a row as texts, the buffers kept from row to row.
class RowTexts {
public:
    std::span<const TextView> of(const SeparatedValues& values)
    {
        units_.clear();
        ends_.clear();
        for (std::size_t at = 0; at < values.valueCount(); ++at) {
            appendUtf8(units_, values.value(at));
            ends_.push_back(units_.size());
        }
        cells_.clear();
        std::size_t begin = 0;
        for (const std::size_t end : ends_) {
            cells_.push_back(TextView(units_).substr(begin, end - begin));
            begin = end;
        }
        return cells_;
    }

private:
    Text units_; ///< the cells of the row, one behind the other
    std::vector<std::size_t> ends_;
    std::vector<TextView> cells_;
};

TableGrid makeGrid(
    std::string_view text, ValuesDialect dialect, const Sizes& sizes, const CsvOptions& options)
{
    SeparatedValues values(text, dialect);
    RowTexts row;
    values.nextRow();
    std::vector<TableColumn> columns(sizes.columns, TableColumn { .title = {}, .width = -1 });
    std::size_t column = 0;
    for (const TextView title : row.of(values))
        columns[column++].title = title;
    TableGrid grid(std::move(columns));
    grid.reserve(sizes.rows - 1);
    for (std::size_t rows = 1; values.nextRow(); ++rows) {
        grid.addRow(row.of(values));
        if (rows % RowsOfAStep == 0)
            tell(options,
                PartCounted
                    + (1 - PartCounted) * static_cast<double>(values.position())
                        / static_cast<double>(text.size()));
    }
    return grid;
}

void refuseZeroBytes(std::string_view text)
{
    const std::size_t zero = text.find('\0');
    if (zero == std::string_view::npos)
        return;
    const auto line = std::ranges::count(text.substr(0, zero), '\n') + 1;
    refuse(atLine(line, u"a zero byte; this is no text file"));
}

Text gluedNote(const Sizes& sizes)
{
    Text lines;
    for (const std::int64_t line : sizes.gluedLines)
        lines.append(lines.empty() ? u"" : u", ").append(decimal(line));
    if (sizes.glued > sizes.gluedLines.size())
        lines.append(u" and others");
    return (sizes.glued == 1 ? u"the row at line " : u"the rows at lines ") + lines
        + u" may be several rows glued together: a quoted value goes on over a line break, and the "
          u"row has not as many values as the titles";
}

Text raggedNote(const Sizes& sizes, char delimiter)
{
    const Text between = delimiter == '\t'
        ? Text(u"a tab")
        : Text(u"\"") + Text(1, static_cast<char16_t>(delimiter)) + u"\"";
    return decimal(static_cast<std::int64_t>(sizes.ragged)) + u" of "
        + decimal(static_cast<std::int64_t>(sizes.rows - 1))
        + u" rows have not as many values as the titles, the first at line "
        + decimal(sizes.raggedLine) + u"; is this a table with " + between
        + u" between its values?";
}

} // namespace

TableGrid readCsv(const std::filesystem::path& path, const CsvOptions& options)
{
    TextFileOptions reading { options.encoding, {} };
    if (options.progress)
        reading.progress = [&](double part) { return options.progress(part * PartRead); };
    const TextFile file = readTextFile(path, reading);
    refuseZeroBytes(file.text);
    const ValuesDialect dialect {
        options.delimiter ? *options.delimiter : delimiterOf(path, file.text), options.hasQuotes
    };
    const Sizes sizes = countSizes(file.text, dialect, options);
    if (sizes.rows == 0)
        refuse(u"the file is empty");
    TableGrid grid = makeGrid(file.text, dialect, sizes, options);
    if (options.notes != nullptr && file.isGuessed)
        options.notes->push_back(u"the encoding was guessed to be " + toText(file.encoding)
            + u"; name another one if letters look wrong");
    if (options.notes != nullptr && sizes.glued > 0)
        options.notes->push_back(gluedNote(sizes));
    if (options.notes != nullptr && sizes.ragged > 0)
        options.notes->push_back(raggedNote(sizes, dialect.delimiter));
    return grid;
}

} // namespace pelloric::qt
