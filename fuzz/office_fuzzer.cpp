// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any texts as the parts of an office file whose archive is whole; a byte 30 ends a part.

#include "fuzz_platform.h"

#include "platform/run_time_error.h"
#include "tables/qt/office_table.h"

#include <array>
#include <span>
#include <vector>

using namespace pelloric;

namespace {

constexpr auto XlsxParts = std::to_array<std::string_view>(
    { "xl/worksheets/sheet1.xml", "xl/styles.xml", "xl/sharedStrings.xml", "xl/workbook.xml",
        "xl/_rels/workbook.xml.rels", "xl/theme/theme1.xml" });
constexpr auto OdsParts
    = std::to_array<std::string_view>({ "content.xml", "styles.xml", "mimetype" });

/// Parts that stand in for those that the input does not have.
constexpr std::string_view Workbook
    = "<workbook xmlns:r=\"http://schemas.openxmlformats.org/officeDocument/2006/relationships\">"
      "<sheets><sheet name=\"S\" sheetId=\"1\" r:id=\"rId1\"/></sheets></workbook>";
constexpr std::string_view Relations = "<Relationships><Relationship Id=\"rId1\" "
                                       "Target=\"worksheets/sheet1.xml\"/></Relationships>";

constexpr char PartEnd = 30;

std::uint32_t checksum(std::string_view bytes)
{
    std::uint32_t sum = ~0U;
    for (const char byte : bytes) {
        sum ^= static_cast<unsigned char>(byte);
        for (int bit = 0; bit < 8; ++bit)
            sum = sum >> 1U ^ (0xEDB88320U & (0U - (sum & 1U)));
    }
    return ~sum;
}

/// An archive whose parts are stored as they are.
class Archive {
public:
    void add(std::string_view name, std::string_view part)
    {
        const std::string facts = factsOf(name, part);
        index_ += "PK\x01\x02" + number(20, 2) + facts + number(0, 10) + number(bytes_.size(), 4);
        index_ += name;
        bytes_ += "PK\x03\x04" + facts;
        bytes_.append(name).append(part);
        ++count_;
    }

    std::string bytes() const
    {
        return bytes_ + index_ + "PK\x05\x06" + number(0, 4) + number(count_, 2) + number(count_, 2)
            + number(index_.size(), 4) + number(bytes_.size(), 4) + number(0, 2);
    }

private:
    static std::string number(std::size_t value, int size)
    {
        std::string bytes;
        for (int at = 0; at < size; ++at)
            bytes += at < 8 ? static_cast<char>(value >> (8U * static_cast<unsigned>(at))) : '\0';
        return bytes;
    }

    static std::string factsOf(std::string_view name, std::string_view part)
    {
        return number(20, 2) + number(0, 8) + number(checksum(part), 4) + number(part.size(), 4)
            + number(part.size(), 4) + number(name.size(), 2) + number(0, 2);
    }

    std::string bytes_;
    std::string index_;
    std::size_t count_ = 0;
};

std::string archiveOf(std::string_view input, bool isXlsx)
{
    const std::span<const std::string_view> names = isXlsx
        ? std::span<const std::string_view>(XlsxParts)
        : std::span<const std::string_view>(OdsParts);
    Archive archive;
    for (const std::string_view name : names) {
        std::string_view part = input.substr(0, input.find(PartEnd));
        input.remove_prefix(std::min(input.size(), part.size() + 1));
        if (part.empty() && name == "xl/workbook.xml")
            part = Workbook;
        if (part.empty() && name == "xl/_rels/workbook.xml.rels")
            part = Relations;
        if (!part.empty())
            archive.add(name, part);
    }
    return archive.bytes();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static const fuzz::ProcessFolder folder;
    if (size == 0 || size > 1U << 14U)
        return 0;
    const bool isXlsx = data[0] % 2 == 0;
    const std::string_view input(reinterpret_cast<const char*>(data) + 1, size - 1);
    const auto path = folder.write(isXlsx ? "t.xlsx" : "t.ods", archiveOf(input, isXlsx));
    try {
        const TableGrid table = qt::readOffice({ path });
        fuzz::require(table.columnCount() > 0);
        for (std::int64_t row = 0; row < std::min<std::int64_t>(table.rowCount(), 1000); ++row) {
            for (int column = 0; column < table.columnCount(); ++column)
                static_cast<void>(table.cell(row, column));
        }
    } catch (const RunTimeError& error) {
        fuzz::require(!error.detail().empty());
    }
    return 0;
}
