// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/office_table.h"

#include "fakes/temp_folder.h"
#include "platform/run_time_error.h"
#include "support/test_paths.h"

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

std::filesystem::path sample(const char* name)
{
    return std::filesystem::path(PELLORIC_TESTS_DIR) / "data" / "office" / name;
}

/// "title|title|/cell|cell|": what reading gives, or the error's text.
std::string read(const std::filesystem::path& path, const QString& sheet = {})
{
    try {
        const TableGrid grid = readOffice({ .path = path, .sheet = sheet });
        Text text;
        for (int column = 0; column < grid.columnCount(); ++column)
            text.append(grid.column(column).title).append(u"|");
        for (std::int64_t row = 0; row < grid.rowCount(); ++row) {
            text.append(u"/");
            for (int column = 0; column < grid.columnCount(); ++column)
                text.append(grid.cell(row, column)).append(u"|");
        }
        return toUtf8(text);
    } catch (const RunTimeError& error) {
        return toUtf8(error.text());
    }
}

} // namespace

TEST(OfficeTable, ReadsTheFirstSheetAsItsCellsLook)
{
    EXPECT_EQ(read(sample("sales.xlsx")),
        "Item|Price|Part|Day|Paid|"
        "/北京 & co|1234.50|15%|2024-01-01|True|"
        "/inline|2469.00||2024-01-01 18:00:00|False|");
    EXPECT_EQ(read(sample("sales.ods")), "Item|Price|Part|Day|/北京 & co|1234.5|15%|2024-01-01|");
}

TEST(OfficeTable, ReadsASheetByItsName)
{
    EXPECT_EQ(read(sample("sales.xlsx"), QStringLiteral("城市")), "7|");
    EXPECT_EQ(read(sample("sales.xlsx"), QStringLiteral("Other")),
        "Invalid procedure call or argument: no sheet Other; the file has: Sales, 城市");
}

TEST(OfficeTable, SaysWhatIsWrongWithOtherFiles)
{
    const TempFolder folder;
    const auto broken = folder.write("b.xlsx", "PK\x03\x04 and then nothing");
    EXPECT_TRUE(isOfficeFile(broken));
    EXPECT_EQ(read(broken).substr(0, 43), "Type mismatch: the office file is damaged; ");
    EXPECT_FALSE(isOfficeFile(folder.write("t.xlsx", "a,b\n")));
    const auto old = folder.write("old.xls", "\xD0\xCF\x11\xE0 more");
    EXPECT_TRUE(isOfficeFile(old));
    const QByteArray path = qgetenv("PATH");
    qputenv("PATH", QByteArray::fromStdString(folder.path().string()));
    const std::string without = read(old);
    qputenv("PATH", path);
    EXPECT_EQ(without,
        "Type mismatch: this office file has to be converted by LibreOffice, which is not "
        "installed; install libreoffice-calc, or save the file as .xlsx, .ods or CSV");
}

TEST(OfficeTable, TellsFontsColoursAndAlignmentOfExcelCells)
{
    TableGrid grid = readOffice({ .path = sample("looks.xlsx"), .sheet = {} });
    ASSERT_TRUE(grid.hasLooks());
    EXPECT_EQ(grid.titleAlignment(0), CellAlignment::Left);
    EXPECT_EQ(grid.titleAlignment(1), CellAlignment::Centre);
    CellLook look;
    grid.readLook(1, 0, look);
    EXPECT_EQ(look,
        (CellLook { .alignment = CellAlignment::Centre,
            .place = CellPlace::Top,
            .bold = true,
            .italic = true,
            .underline = true,
            .foreground = rgb(0xC0, 0, 0),
            .background = rgb(0xFF, 0xE6, 0x99) }));
    grid.readLook(1, 1, look); // a number stands right; half as light as the theme's white
    EXPECT_EQ(look,
        (CellLook { .alignment = CellAlignment::Right,
            .place = CellPlace::Bottom,
            .strikethrough = true,
            .foreground = rgb(0x44, 0x72, 0xC4),
            .background = rgb(128, 128, 128) }));
    grid.readLook(2, 0, look);
    EXPECT_EQ(look, (CellLook { .alignment = CellAlignment::Left, .place = CellPlace::Bottom }));
    grid.readLook(2, 1, look);
    EXPECT_EQ(look, (CellLook { .alignment = CellAlignment::Left, .place = CellPlace::Middle }));
    grid.readLook(3, 0, look);
    EXPECT_EQ(look.alignment, CellAlignment::Centre);
}

TEST(OfficeTable, TellsFontsColoursAndAlignmentOfOpenDocumentCells)
{
    TableGrid grid = readOffice({ .path = sample("looks.ods"), .sheet = {} });
    EXPECT_EQ(grid.titleAlignment(1), CellAlignment::Centre);
    CellLook look;
    grid.readLook(1, 0, look);
    EXPECT_EQ(look,
        (CellLook { .alignment = CellAlignment::Centre,
            .place = CellPlace::Top,
            .bold = true,
            .italic = true,
            .underline = true,
            .foreground = rgb(0xC0, 0, 0),
            .background = rgb(0xFF, 0xE6, 0x99) }));
    grid.readLook(1, 1, look); // the column's style, which derives from itself
    EXPECT_EQ(look,
        (CellLook { .alignment = CellAlignment::Right,
            .place = CellPlace::Bottom,
            .strikethrough = true }));
}

TEST(OfficeTable, IsKnownByItsContentWhereTheNameDoesNotTell)
{
    const TempFolder folder;
    for (const char* const name : { "sales.xlsx", "sales.ods" }) {
        const auto piped = folder.write("piped", TempFolder::bytesOf(sample(name)));
        EXPECT_TRUE(isOfficeFile(piped)) << name;
    }
    EXPECT_FALSE(isOfficeFile(folder.write("packed", "PK\x03\x04 and then nothing")));
}

TEST(OfficeTable, LetsLibreOfficeConvertOlderFiles)
{
    const TempFolder folder;
    const auto old = folder.write("-old.\xFF.xls", "\xD0\xCF\x11\xE0 more");
    const auto program = folder.write("soffice",
        "#!/bin/sh\n[ \"$1 $2 $3 $4\" = \"--headless --convert-to xlsx --outdir\" ] || exit 1\n"
        "cp '"
            + sample("sales.xlsx").string() + "' \"$(echo \"$6\" | sed s/xls$/xlsx/)\"\n");
    std::filesystem::permissions(program, std::filesystem::perms::owner_all);
    const QByteArray path = qgetenv("PATH");
    qputenv("PATH", QByteArray::fromStdString(folder.path().string()) + ':' + path);
    const std::string converted = read(old, QStringLiteral("城市"));
    qputenv("PATH", path);
    EXPECT_EQ(converted, "7|");
}

} // namespace pelloric::qt
