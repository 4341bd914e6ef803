// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any bytes as a JSON file, and as an office file.

#include "fuzz_platform.h"

#include "platform/run_time_error.h"
#include "tables/qt/json_table.h"
#include "tables/qt/office_table.h"

using namespace pelloric;

namespace {

void check(const TableGrid& table)
{
    fuzz::require(table.columnCount() > 0);
    for (std::int64_t row = 0; row < table.rowCount(); ++row) {
        for (int column = 0; column < table.columnCount(); ++column)
            static_cast<void>(table.cell(row, column));
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static const fuzz::ProcessFolder folder;
    static const int hasNoPrograms = setenv("PATH", "", 1); // that could convert a file
    fuzz::require(hasNoPrograms == 0);
    if (size == 0 || size > 1U << 14U)
        return 0;
    const std::string_view bytes(reinterpret_cast<const char*>(data) + 1, size - 1);
    qt::looksLikeJson(bytes);
    try {
        if (data[0] % 4 == 0)
            check(qt::readOffice({ folder.write("t.xlsx", bytes) }));
        else if (data[0] % 4 == 1)
            check(qt::readOffice({ folder.write("t.ods", bytes) }));
        else
            check(qt::readJson(folder.write("t.json", bytes), {}));
    } catch (const RunTimeError& error) {
        fuzz::require(!error.detail().empty());
    }
    return 0;
}
