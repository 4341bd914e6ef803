// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/office_table.h"

#include "fakes/temp_folder.h"
#include "platform/run_time_error.h"
#include "support/test_paths.h"

#include <gtest/gtest.h>
#include <zip.h>

#include <algorithm>

namespace pelloric::qt {

namespace {

std::filesystem::path sample(const char* name)
{
    return std::filesystem::path(PELLORIC_TESTS_DIR) / "data" / "office" / name;
}

/// "title|title|/cell|cell|": what reading gives, or the error's text.
std::string read(const OfficeSource& source)
{
    try {
        const TableGrid grid = readOffice(source);
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

std::string read(const std::filesystem::path& path, const QString& sheet = {})
{
    return read(OfficeSource { .path = path, .sheet = sheet });
}

/// Makes an archive of files, by name and content.
std::filesystem::path zipped(const std::filesystem::path& path,
    const std::vector<std::pair<std::string, std::string>>& files)
{
    zip_t* const archive = zip_open(path.string().c_str(), ZIP_CREATE | ZIP_TRUNCATE, nullptr);
    EXPECT_NE(archive, nullptr);
    for (const auto& [name, content] : files) {
        zip_source_t* const source = zip_source_buffer(archive, content.data(), content.size(), 0);
        EXPECT_GE(zip_file_add(archive, name.c_str(), source, ZIP_FL_OVERWRITE), 0);
    }
    EXPECT_EQ(zip_close(archive), 0);
    return path;
}

/// "g" is green, "b" blue and "-" no background; a row ends with "/ ".
std::string backgroundsOf(TableGrid& grid)
{
    std::string all;
    CellLook look;
    for (std::int32_t row = 1; row <= grid.rowCount(); ++row) {
        all += row > 1 ? "/ " : "";
        for (int column = 0; column < grid.columnCount(); ++column) {
            grid.readLook(row, column, look);
            all += !look.background ? "- " : look.background == rgb(0, 255, 0) ? "g " : "b ";
        }
    }
    return all;
}

/// The boxes as "rows,columns", in the order of their first cells.
std::string boxesOf(TableGrid& grid)
{
    std::string all;
    std::vector<CellBox> seen;
    CellLook look;
    for (std::int32_t row = 1; row <= grid.rowCount(); ++row) {
        for (int column = 0; column < grid.columnCount(); ++column) {
            grid.readLook(row, column, look);
            const CellBox box = look.box.value_or(CellBox());
            if (!look.box)
                continue;
            EXPECT_TRUE(row >= box.firstRow && row <= box.lastRow && column >= box.firstColumn
                && column <= box.lastColumn);
            if (std::find(seen.begin(), seen.end(), box) != seen.end())
                continue;
            all += (seen.empty() ? "" : "/ ") + std::to_string(box.firstRow) + "-"
                + std::to_string(box.lastRow) + "," + std::to_string(box.firstColumn) + "-"
                + std::to_string(box.lastColumn) + " ";
            seen.push_back(box);
        }
    }
    return all;
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

TEST(OfficeTable, TakesColoursOfEmptyCellsMergedCellsAndWidthsOfExcelSheets)
{
    const TempFolder folder;
    const auto file = zipped(folder.file("shown.xlsx"),
        { { "xl/workbook.xml",
              "<workbook xmlns:r='r'><sheets><sheet name='S' r:id='1'/></sheets></workbook>" },
            { "xl/_rels/workbook.xml.rels",
                "<Relationships><Relationship Id='1' Target='s.xml'/></Relationships>" },
            { "xl/styles.xml",
                "<styleSheet><fonts><font/></fonts>"
                "<fills><fill/><fill/><fill><patternFill patternType='solid'>"
                "<fgColor rgb='FF00FF00'/></patternFill></fill>"
                "<fill><patternFill patternType='solid'><fgColor rgb='FF0000FF'/></patternFill>"
                "</fill></fills><cellXfs><xf fontId='0' fillId='0'/><xf fontId='0' fillId='2'/>"
                "<xf fontId='0' fillId='3'/></cellXfs></styleSheet>" },
            { "xl/s.xml",
                "<worksheet><cols><col min='1' max='1' width='10.7109375' customWidth='1'/>"
                "<col min='3' max='3' width='9' hidden='1'/><col min='4' max='4' style='2'/></cols>"
                "<sheetData><row r='2'>"
                "<c r='A2' s='1' t='str'><v>A</v></c><c r='B2' t='str'><v>B</v></c>"
                "<c r='C2' t='str'><v>C</v></c><c r='D2' t='str'><v>D</v></c></row>"
                "<row r='3'><c r='A3' t='str'><v>box</v></c><c r='B3' s='1'/><c r='C3' "
                "s='1'/></row>"
                "<row r='4' s='1' customFormat='1'><c r='C4' t='str'><v>c</v></c>"
                "<c r='D4' s='0'/></row>"
                "<row r='5'><c r='A5' t='str'><v>end</v></c></row>"
                "<row r='1000000'><c r='B1000000' s='1'/></row></sheetData>"
                "<mergeCells><mergeCell ref='A3:A4'/><mergeCell ref='A4:B5'/>"
                "<mergeCell ref='C5:XFD1048576'/></mergeCells></worksheet>" } });
    const OfficeSource whole { .path = file, .takesHidden = true };
    EXPECT_EQ(read(whole), "A|B|C|D|/box||||/||c||/end||||");
    TableGrid grid = readOffice(whole);
    EXPECT_EQ(grid.column(0).shownWidth, std::optional<Twips>(1125)); // 75 pixels
    EXPECT_EQ(grid.column(1).shownWidth, std::nullopt);
    EXPECT_EQ(grid.column(2).shownWidth, std::optional<Twips>(945));
    EXPECT_EQ(backgroundsOf(grid), "- g g b / - g - - / - - - - ");
    EXPECT_EQ(boxesOf(grid), "1-2,0-0 / 3-3,2-3 ");
}

TEST(OfficeTable, TakesColoursOfEmptyCellsMergedCellsAndWidthsOfOpenDocumentSheets)
{
    const TempFolder folder;
    const std::string paragraph = "<text:p>x</text:p>";
    const auto file = zipped(folder.file("shown.ods"),
        { { "mimetype", "application/vnd.oasis.opendocument.spreadsheet" },
            { "content.xml",
                "<o:d xmlns:o='o' xmlns:table='t' xmlns:style='s' xmlns:f='f' xmlns:text='x'>"
                "<style:style style:name='wide' style:family='table-column'>"
                "<style:table-column-properties style:column-width='1in'/></style:style>"
                "<style:style style:name='g' style:family='table-cell'>"
                "<style:table-cell-properties f:background-color='#00ff00'/></style:style>"
                "<style:style style:name='b' style:family='table-cell'>"
                "<style:table-cell-properties f:background-color='#0000ff'/></style:style>"
                "<table:table table:name='S'>"
                "<table:table-column table:style-name='wide'/>"
                "<table:table-column table:visibility='collapse' table:style-name='wide'/>"
                "<table:table-column table:number-columns-repeated='16382' "
                "table:default-cell-style-name='b'/>"
                "<table:table-row><table:table-cell>"
                    + paragraph + "</table:table-cell><table:table-cell>" + paragraph
                    + "</table:table-cell><table:table-cell>" + paragraph
                    + "</table:table-cell></table:table-row>"
                      "<table:table-row><table:table-cell table:number-columns-spanned='2' "
                      "table:number-rows-spanned='2'>"
                    + paragraph
                    + "</table:table-cell><table:covered-table-cell/><table:table-cell/>"
                      "</table:table-row>"
                      "<table:table-row><table:covered-table-cell "
                      "table:number-columns-repeated='2'/>"
                      "<table:table-cell table:style-name='g'/></table:table-row>"
                      "<table:table-row><table:table-cell table:style-name='g' "
                      "table:number-columns-repeated='2'/><table:table-cell>"
                    + paragraph
                    + "</table:table-cell></table:table-row>"
                      "<table:table-row table:number-rows-repeated='1048000'>"
                      "<table:table-cell table:style-name='g' "
                      "table:number-columns-repeated='16384'/></table:table-row>"
                      "</table:table></o:d>" } });
    const OfficeSource whole { .path = file, .takesHidden = true };
    EXPECT_EQ(read(whole), "x|x|x|/x|||/|||/||x|");
    TableGrid grid = readOffice(whole);
    EXPECT_EQ(grid.column(0).shownWidth, std::optional<Twips>(1440));
    EXPECT_EQ(grid.column(1).shownWidth, std::optional<Twips>(1440));
    EXPECT_EQ(grid.column(2).shownWidth, std::nullopt);
    EXPECT_EQ(backgroundsOf(grid), "- - b / - - g / g g b ");
    EXPECT_EQ(boxesOf(grid), "1-2,0-1 ");
}

TEST(OfficeTable, LeavesOutWhatExcelSheetsHideAndCountsIt)
{
    const TempFolder folder;
    const auto cell = [](const std::string& place, const std::string& text) {
        return "<c r='" + place + "' s='1' t='str'><v>" + text + "</v></c>";
    };
    const auto file = zipped(folder.file("hidden.xlsx"),
        { { "xl/workbook.xml",
              "<workbook xmlns:r='r'><sheets><sheet name='S' r:id='1'/><sheet name='N' "
              "r:id='2'/></sheets></workbook>" },
            { "xl/_rels/workbook.xml.rels",
                "<Relationships><Relationship Id='1' Target='s.xml'/><Relationship Id='2' "
                "Target='n.xml'/></Relationships>" },
            { "xl/styles.xml",
                "<styleSheet><fonts><font/></fonts><fills><fill/><fill><patternFill "
                "patternType='solid'><fgColor rgb='FF00FF00'/></patternFill></fill></fills>"
                "<cellXfs><xf fontId='0' fillId='0'/><xf fontId='0' fillId='1'/></cellXfs>"
                "</styleSheet>" },
            { "xl/n.xml",
                "<worksheet><sheetData><row r='1' hidden='1'>" + cell("A1", "x")
                    + "</row></sheetData></worksheet>" },
            { "xl/s.xml",
                "<worksheet><cols><col min='1' max='1' width='10'/>"
                "<col min='2' max='2' width='9' hidden='1'/><col min='3' max='3' width='20'/>"
                "<col min='16384' max='16384' hidden='1'/></cols><sheetData>"
                "<row r='1' hidden='1'>"
                    + cell("A1", "made by us") + "</row><row r='2'>" + cell("A2", "Name")
                    + cell("B2", "Key") + cell("C2", "Price") + cell("D2", "Note")
                    + "</row><row r='3'>" + cell("A3", "bolt") + cell("B3", "1") + cell("C3", "5")
                    + "</row><row r='4' hidden='1'>" + cell("A4", "screw") + cell("C4", "box")
                    + "</row><row r='5'>" + cell("A5", "nut") + "<c r='C5'/>" + cell("D5", "end")
                    + "</row><row r='6'>" + cell("A6", "nail")
                    + "</row><row r='7' hidden='1'/>"
                      "</sheetData><mergeCells><mergeCell ref='C4:C6'/><mergeCell ref='A3:B3'/>"
                      "</mergeCells></worksheet>" } });
    HiddenCount left;
    const OfficeSource source { .path = file, .leftOut = &left };
    EXPECT_EQ(read(source), "Name|Price|Note|/bolt|5||/nut|box|end|/nail|||");
    EXPECT_EQ(left, (HiddenCount { .rows = 2, .columns = 1 }));
    TableGrid grid = readOffice(source);
    EXPECT_EQ(grid.column(0).shownWidth, std::optional<Twips>(1050));
    EXPECT_EQ(grid.column(1).shownWidth, std::optional<Twips>(2100));
    EXPECT_EQ(grid.column(2).shownWidth, std::nullopt);
    EXPECT_EQ(boxesOf(grid), "2-3,1-1 ");
    EXPECT_EQ(backgroundsOf(grid), "g g - / g g g / g g - ");
    EXPECT_EQ(read({ .path = file, .takesHidden = true, .leftOut = &left }),
        "made by us||||/Name|Key|Price|Note|/bolt|1|5||/screw||box||/nut|||end|/nail||||");
    EXPECT_EQ(left, HiddenCount());
    EXPECT_EQ(read(file, QStringLiteral("N")), "Type mismatch: all that the sheet holds is hidden");
}

TEST(OfficeTable, LeavesOutWhatOpenDocumentSheetsHideAndCountsIt)
{
    const TempFolder folder;
    const auto cell = [](const std::string& text) {
        return "<table:table-cell><text:p>" + text + "</text:p></table:table-cell>";
    };
    const auto file = zipped(folder.file("hidden.ods"),
        { { "mimetype", "application/vnd.oasis.opendocument.spreadsheet" },
            { "content.xml",
                "<o:d xmlns:o='o' xmlns:table='t' xmlns:text='x'><table:table table:name='S'>"
                "<table:table-column/><table:table-column table:visibility='collapse'/>"
                "<table:table-column/>"
                "<table:table-row>"
                    + cell("Name") + cell("Key") + cell("Price")
                    + "</table:table-row><table:table-row table:visibility='filter' "
                      "table:number-rows-repeated='3'>"
                    + cell("screw") + "</table:table-row><table:table-row>" + cell("nut")
                    + cell("2") + cell("7")
                    + "</table:table-row><table:table-row table:visibility='collapse' "
                      "table:number-rows-repeated='1048571'><table:table-cell/>"
                      "</table:table-row></table:table></o:d>" } });
    HiddenCount left;
    EXPECT_EQ(read({ .path = file, .leftOut = &left }), "Name|Price|/nut|7|");
    EXPECT_EQ(left, (HiddenCount { .rows = 3, .columns = 1 }));
    EXPECT_EQ(read({ .path = file, .takesHidden = true }),
        "Name|Key|Price|/screw|||/screw|||/screw|||/nut|2|7|");
}

TEST(OfficeTable, RefusesAtOnceMoreThanFitsHoweverFewBytesSayIt)
{
    const auto repeated = sample("repeated_without_end.ods");
    EXPECT_EQ(read(repeated, QStringLiteral("cells")),
        "Overflow: the sheet holds more than 67108864 cells; save the part that is wanted as CSV");
    EXPECT_EQ(read(repeated, QStringLiteral("blanks")),
        "Overflow: the sheet holds more than 1073741824 characters; save the part that is wanted "
        "as CSV");
    const std::string past = "Overflow: a cell past the end of its sheet";
    EXPECT_EQ(read(repeated, QStringLiteral("columns")), past);
    EXPECT_EQ(read(repeated, QStringLiteral("far")), past);
    for (const char* const sheet : { "below", "past", "far" })
        EXPECT_EQ(read(sample("rows_past_the_end.xlsx"), QString::fromLatin1(sheet)), past);
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
    folder.write("soffice", "#!/bin/sh\nexit 1\n");
    const std::string refused = read(old);
    qputenv("PATH", path);
    EXPECT_EQ(converted, "7|");
    EXPECT_EQ(refused,
        "Type mismatch: LibreOffice could not convert this file; save it as .xlsx, .ods or CSV");
}

} // namespace pelloric::qt
