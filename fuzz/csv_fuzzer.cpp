// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any bytes as a file of separated values; the first byte chooses how it is named and encoded, and
// whether the bytes lie across the end of what is read at once.

#include "fuzz_platform.h"

#include "platform/run_time_error.h"
#include "tables/qt/csv_table.h"

using namespace pelloric;

namespace {

struct Form {
    const char* name;
    const char* encoding;
};

constexpr Form Forms[] = {
    { "table.csv", "" },
    { "table.tsv", "" },
    { "table.csv", "GB18030" },
    { "table.csv", "UTF-8" },
    { "table.csv", "UTF-16LE" },
    { "table.csv", "windows-1252" },
};

constexpr std::size_t PieceBytes = 1U << 20U; ///< that the reader takes at once

/// Rows that end so far in front of the end of the first piece.
std::string rowsBefore(std::size_t left)
{
    std::string rows = "a,b\n";
    const std::string row = std::string(1021, 'x') + ",y\n";
    while (rows.size() + row.size() <= PieceBytes - left)
        rows += row;
    return rows.append(PieceBytes - left - rows.size(), 'z');
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static const fuzz::ProcessFolder folder;
    if (size == 0 || size > 1U << 14U)
        return 0;
    const Form& form = Forms[data[0] % std::size(Forms)];
    const bool isLarge = data[0] >= 250 && size > 1;
    std::string bytes = isLarge ? rowsBefore(data[1] % 16) : std::string();
    bytes.append(reinterpret_cast<const char*>(data) + 1, size - 1);
    const auto path = folder.write(form.name, bytes);
    qt::CsvOptions options;
    options.encoding = QString::fromLatin1(form.encoding);
    try {
        const TableGrid table = qt::readCsv(path, options);
        fuzz::require(table.columnCount() > 0);
        for (std::int64_t row = 0; row < table.rowCount(); ++row) {
            for (int column = 0; column < table.columnCount(); ++column)
                fuzz::require(table.cell(row, column).size() <= bytes.size());
        }
    } catch (const RunTimeError& error) {
        fuzz::require(
            error.number() == ErrorNumber::TypeMismatch || error.number() == ErrorNumber::Overflow);
    }
    return 0;
}
