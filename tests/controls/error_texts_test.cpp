// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"
#include "document/text_search.h"
#include "document/text_store.h"
#include "fakes/fake_object.h"
#include "fakes/fake_platform.h"
#include "grids/table_grid.h"
#include "platform/automation_object.h"
#include "platform/file_bytes.h"
#include "platform/numbers.h"
#include "platform/run_time_error.h"
#include "platform/safe_file.h"
#include "platform/value.h"
#include "print/page_list.h"
#include "report/chosen_rows.h"
#include "report/late_bound_rows.h"
#include "report/table_row_set.h"
#include "settings/default_settings.h"
#include "settings/settings_file.h"
#include "support/test_paths.h"
#include "view/page_arrangement.h"
#include "view/page_texts.h"
#include "view/view_state.h"

#include <gmock/gmock.h>

#include <functional>
#include <regex>

namespace pelloric {

namespace {

/// What an error is called for, and what its text must name: the object, and the limit or the way
/// out.
struct ErrorRow {
    const char* about;
    std::function<void()> fail;
    ErrorNumber number;
    std::vector<std::string> parts;
};

/// All services, a canvas, and a small table.
struct World {
    World()
        : canvas(platform.services())
    {
        platform.folder.write("OstlConfig.ini", toUtf8(defaultSettingsText()));
        grid.addRow(std::vector<TextView> { u"1", u"2" });
    }

    void set(TextView key, TextView value)
    {
        const SettingChange change { key, value };
        platform.folder.write("OstlConfig.ini", toUtf8(settingsTextWith({ &change, 1 })));
    }

    /// Previews with another value of a setting.
    void previewWith(TextView key, TextView value)
    {
        set(key, value);
        Canvas(platform.services()).doPreview(grid);
    }

    std::string path(const char* name) const { return platform.folder.file(name).string(); }

    void open(const char* name, std::string_view content)
    {
        platform.folder.write(name, content);
        canvas.OpenFile(platform.folder.file(name));
    }

    FakePlatform platform;
    Canvas canvas;
    TableGrid grid { { { u"a", 1000 }, { u"b", 2000 } } };
};

void expectError(const ErrorRow& row)
{
    try {
        row.fail();
        ADD_FAILURE() << row.about << ": no error";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), row.number) << row.about;
        EXPECT_FALSE(error.detail().empty()) << row.about;
        for (const std::string& part : row.parts)
            EXPECT_THAT(toUtf8(error.text()), testing::HasSubstr(part)) << row.about;
    }
}

std::vector<std::filesystem::path> sources()
{
    std::vector<std::filesystem::path> found;
    const auto folder = std::filesystem::path(PELLORIC_TESTS_DIR).parent_path() / "src";
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
        if (entry.path().extension() == ".cpp" || entry.path().extension() == ".h")
            found.push_back(entry.path());
    }
    return found;
}

} // namespace

TEST(ErrorTexts, NameTheObjectTheLimitAndTheWayOut)
{
    World world;
    const Value object = Value::ofObject(world.grid);
    PageDocument document;
    TableRowSet fields(std::make_shared<TextStore>());
    fields.appendField(u"a");
    Value cells[2];
    const ErrorRow rows[] = {
        { "16 bits", [] { roundToInt16(40000); }, ErrorNumber::Overflow,
            { "40000 is not between -32768 and 32767" } },
        { "32 bits", [] { roundToInt32(3e9); }, ErrorNumber::Overflow,
            { "3000000000 is not between -2147483648 and 2147483647" } },
        { "a narrowed number", [] { narrowToInt16(-32769); }, ErrorNumber::Overflow,
            { "-32769 is not between -32768 and 32767" } },
        { "a strict number", [] { strictInt16(u"A4"); }, ErrorNumber::TypeMismatch,
            { "\"A4\" is no whole number between -32768 and 32767" } },
        { "an object as a number", [&] { static_cast<void>(object.toNumber()); },
            ErrorNumber::TypeMismatch, { "an object is no number" } },
        { "a number as an object", [] { static_cast<void>(Value::ofNumber(1).toObject()); },
            ErrorNumber::ObjectMissing, { "an object was expected" } },
        { "a member", [&] { memberOf(world.grid, u"Colour"); }, ErrorNumber::NoSuchMember,
            { "Colour" } },
        { "a column of a table", [&] { static_cast<void>(world.grid.column(2)); },
            ErrorNumber::SubscriptOutOfRange, { "column 3; there are 2" } },
        { "a row of a table", [&] { static_cast<void>(world.grid.cell(1, 0)); },
            ErrorNumber::SubscriptOutOfRange, { "row 2; there is 1" } },
        { "too many cells",
            [&] {
                world.grid.addRow(std::vector<TextView> { u"1", u"2", u"3" });
            },
            ErrorNumber::SubscriptOutOfRange, { "a row of 3 cells; there are 2 columns" } },
        { "too many cells of a table",
            [&] {
                TableGrid tall({ { u"a", 1000 } });
                for (int row = 0; row < 20000; ++row)
                    tall.addRow({});
                tall.widen(32767, {});
            },
            ErrorNumber::Overflow,
            { "row 20000 of a table of 32767 columns makes more than 536870912 cells; take fewer "
              "rows or columns" } },
        { "a page", [&] { static_cast<void>(document.lines(4)); }, ErrorNumber::SubscriptOutOfRange,
            { "page 5; there is 1" } },
        { "a line of a page", [&] { static_cast<void>(document.line(0, 2)); },
            ErrorNumber::SubscriptOutOfRange, { "on page 1 line 3; there are 0" } },
        { "a field of a row set", [&] { static_cast<void>(fields.fieldName(1)); },
            ErrorNumber::SubscriptOutOfRange, { "field 2; there is 1" } },
        { "fields of a row set", [&] { fields.values(0, cells); }, ErrorNumber::SubscriptOutOfRange,
            { "fields 1 to 2; there is 1" } },
        { "fields of no row",
            [&] {
                fields.values(0, { cells, 1 });
            },
            ErrorNumber::SubscriptOutOfRange, { "row 0; there are 0" } },
        { "a text of a page",
            [&] { areaOf(document, 0, TextMatch { .text = 4 }, world.platform.metrics); },
            ErrorNumber::SubscriptOutOfRange, { "on page 1 text 5; there are 0" } },
        { "a page more than there can be",
            [&] {
                document.Totalpages = 32767;
                document.newPage();
            },
            ErrorNumber::Overflow, { "a document holds at most 32767 pages" } },
        { "a file", [&] { readFileBytes(world.platform.folder.file("none.txt")); },
            ErrorNumber::FileNotFound, { world.path("none.txt") } },
        { "a document that is missing",
            [&] { world.canvas.OpenFile(world.platform.folder.file("none.ostl")); },
            ErrorNumber::FileNotFound, { world.path("none.ostl") } },
        { "a document that is damaged",
            [&] {
                world.open("bad.ostl",
                    "##Release2004-10-23\r\n##Release2004-10-23PageWidth=99999999999\r\n"
                    "##Release2004-10-23PageHeight=100\r\n");
            },
            ErrorNumber::Overflow,
            { world.path("bad.ostl"), "is damaged", "99999999999 is not between" } },
        { "a document that is damaged behind its first line",
            [&] {
                world.open("cut.ostl",
                    "##Release2004-10-23\r\n##Release2004-10-23PageWidth=100\r\n"
                    "##Release2004-10-23PageHeight=100\r\n##Release2004-10-23[0]\r\n"
                    "##Release2004-10-23 PLine Begin\r\n1\r\n0\r\n0\r\n1\r\n0\r\n1\r\n1\r\n"
                    "9\r\n9\r\n99999\r\n");
            },
            ErrorNumber::Overflow,
            { world.path("cut.ostl"), "99999 is not between", "what stands before it is shown" } },
        { "a file that cannot be written",
            [&] {
                SafeFile(
                    world.platform.services().files, world.platform.folder.file("none") / "a.ostl");
            },
            ErrorNumber::WriteFailed, { world.path("none") } },
        { "a margin", [&] { world.previewWith(u"Top", u"4000"); }, ErrorNumber::Overflow,
            { "Top= 4000", world.path("OstlConfig.ini"), "at most 361 mm", "Page Setup",
                "restore the defaults" } },
        { "a paper code", [&] { world.previewWith(u"PagerSizeValue", u""); },
            ErrorNumber::TypeMismatch,
            { "PagerSizeValue= ", world.path("OstlConfig.ini"), "a whole number", "Page Setup" } },
        { "a text size", [&] { world.previewWith(u"FontSize", u"200000000"); },
            ErrorNumber::Overflow,
            { "a font of 200000000 points is too large to be measured", "choose a smaller" } },
        { "a text colour", [&] { world.previewWith(u"FontColor", u"1e10"); }, ErrorNumber::Overflow,
            { "the colour 10000000000", "not between 0 and 16777215" } },
        { "a missing settings file",
            [&] {
                std::filesystem::remove(world.platform.folder.file("OstlConfig.ini"));
                world.canvas.doPreview(world.grid);
            },
            ErrorNumber::FileNotFound, { world.path("OstlConfig.ini"), "restore the defaults" } },
        { "another build", [&] { Canvas(world.platform.services()).ReDrawZoom(world.grid); },
            ErrorNumber::ObjectMissing, { "no report was built yet" } },
        { "a scale", [&] { world.canvas.setDispScale(0); }, ErrorNumber::DivisionByZero,
            { "a scale of 0 shows nothing" } },
        { "a scale that is too small", [&] { world.canvas.setDispScale(1e-42F); },
            ErrorNumber::Overflow, { "a scale of 0.", "is too small" } },
        { "a page that is shown",
            [&] {
                world.canvas.setTotalpages(9);
                world.canvas.setCurrentpage(7);
                world.canvas.showPage();
            },
            ErrorNumber::SubscriptOutOfRange, { "page 7" } },
        { "a kind of grid",
            [&] {
                world.set(u"Top", u"10");
                world.canvas.m_PrintObj = static_cast<PrintObjKind>(9);
                world.canvas.doPreview(world.grid);
            },
            ErrorNumber::InvalidCall, { "m_PrintObj names no kind of grid" } },
        { "a missing settings file",
            [&] {
                std::filesystem::remove(world.platform.folder.file("OstlConfig.ini"));
                world.canvas.doPreview(world.grid);
            },
            ErrorNumber::FileNotFound, { world.path("OstlConfig.ini"), "restore the defaults" } },
    };
    for (const ErrorRow& row : rows)
        expectError(row);
}

TEST(ErrorTexts, OfGridsNameWhatIsWrongWithThem)
{
    World world;
    world.grid.addRow(std::vector<TextView> { u"3", u"4" });
    FakeObject wide;
    wide.number(u"Cols", 1e9);
    wide.number(u"Rows", 2);
    wide.number(u"ColWidth", 1000);
    wide.text(u"TextMatrix", u"x");
    FakeRecords lost({ u"A" }, { { u"1" } }, FakeRecords::Cursor::Steps);
    lost.rows.resize(9, { u"1" });
    lost.position = 7;
    TableRowSet oneField(std::make_shared<TextStore>());
    oneField.appendField(u"a");
    FakeDataGrid data(Value::ofRows(oneField), { 1000, 1000 });
    const std::vector<Text> titles { u"a", u"b" };
    const std::vector<Text> wanted { u"Sum" };
    const Value object = Value::ofObject(world.grid);
    const ErrorRow rows[] = {
        { "an object as rows", [&] { static_cast<void>(object.toRows()); },
            ErrorNumber::TypeMismatch, { "a row set was expected" } },
        { "an object as a text",
            [&] {
                Text buffer;
                displayText(object, u'.', buffer);
            },
            ErrorNumber::TypeMismatch, { "an object has no text" } },
        { "an object in a cell",
            [&] {
                TableRowSet cells(std::make_shared<TextStore>());
                cells.appendField(u"a");
                cells.addRecord();
                cells.setLast(0, object);
            },
            ErrorNumber::TypeMismatch, { "a cell holds an object" } },
        { "a column that is not printed", [&] { fieldsNamed(titles, wanted); },
            ErrorNumber::InvalidCall, { "the grid prints no column \"Sum\"" } },
        { "marked rows of a grid without marks",
            [&] { chosenRecords(oneField, { .rows = RowChoice::Marked }, nullptr, 1, u'.'); },
            ErrorNumber::InvalidCall, { "this grid does not tell which of its rows are marked" } },
        { "columns without end", [&] { world.canvas.doPreview(wide); }, ErrorNumber::Overflow,
            { "the grid has 1000000000 columns, at most 1000000 can be read" } },
        { "more columns than a page document has",
            [&] {
                FakeObject broad;
                broad.number(u"Cols", 40000);
                broad.number(u"Rows", 1);
                broad.number(u"ColWidth", 1000);
                broad.text(u"TextMatrix", u"x");
                world.canvas.doPreview(broad);
            },
            ErrorNumber::Overflow, { "more than 32767 columns are printed; leave some out" } },
        { "other columns than were built",
            [&] {
                TableGrid three { { { u"a", 1000 }, { u"b", 1000 }, { u"c", 1000 } } };
                world.canvas.doPreview(world.grid);
                world.canvas.ReDrawZoom(three);
            },
            ErrorNumber::SubscriptOutOfRange,
            { "the grid prints 3 columns now, the report was built with 2; preview it anew" } },
        { "more columns than fields",
            [&] {
                world.canvas.m_PrintObj = PrintObjKind::datagrid;
                world.canvas.doPreview(data);
            },
            ErrorNumber::SubscriptOutOfRange, { "the data grid has more columns than fields" } },
        { "a cursor that is lost", [&] { const LateBoundRows read(lost); },
            ErrorNumber::InvalidCall, { "the data source never comes to its first record" } },
        { "a logo",
            [&] {
                Canvas canvas(world.platform.services());
                canvas.options.logo.imageFile = u"missing";
                canvas.doPreview(world.grid);
            },
            ErrorNumber::FileNotFound, { "missing is no picture" } },
        { "a row without end",
            [&] {
                const Text text(1U << 24U, u'x');
                const std::vector<TextView> cells(256, text);
                TableGrid(std::vector<TableColumn>(256)).addRow(cells);
            },
            ErrorNumber::Overflow, { "row 1 holds more than 4294967295 characters" } },
    };
    for (const ErrorRow& row : rows)
        expectError(row);
}

TEST(ErrorTexts, OfViewsNameWhatHasNoSize)
{
    const ErrorRow rows[] = {
        { "paper without a width", [] { gridOf(OrderStyle::Multiple, 100, {}); },
            ErrorNumber::DivisionByZero, { "the paper has no width" } },
        { "paper without a height",
            [] {
                fittingDivisor(100, 100, { 1, 1 }, { .myWidth = 9 });
            },
            ErrorNumber::DivisionByZero, { "the paper has no width or no height" } },
        { "a window without room",
            [] {
                fittingDivisor(FittingEdge, FittingEdge, { 1, 1 }, { .myWidth = 9, .myHeight = 9 });
            },
            ErrorNumber::DivisionByZero, { "the window has no room for a page" } },
        { "a divisor",
            [] {
                ViewState view;
                view.divisor = 3e38F;
                zoomIn(view, {});
            },
            ErrorNumber::Overflow, { "the pages cannot be shown any smaller" } },
    };
    for (const ErrorRow& row : rows)
        expectError(row);
}

TEST(ErrorTexts, SayHowManyPagesAreNeededAndHowManyRowsFit)
{
    World world;
    TableGrid grid({ { u"a", 1000 } });
    for (int row = 0; row < 33000; ++row)
        grid.addRow(std::vector<TextView> { u"1" });
    expectError({ "a report of too many pages",
        [&] {
            world.set(u"PagerHeight", u"20"); // every row fills a page
            world.canvas.doPreview(grid);
        },
        ErrorNumber::Overflow,
        { "the report needs about 33,000 pages, a document holds 32,767; print rows 1 to 32,767, "
          "or leave out columns" } });
}

/// A grid that promises more rows than any document takes is not walked.
TEST(ErrorTexts, SayHowManyRowsADocumentTakesBeforeAnyIsRead)
{
    World world;
    std::int64_t asked = 0;
    FakeObject tall;
    tall.number(u"Cols", 1);
    tall.number(u"Rows", 2147483647);
    tall.number(u"ColWidth", 1000);
    tall.member(u"TextMatrix", [&asked](FakeObject::Arguments arguments) {
        asked += arguments[0].number() > 0 ? 1 : 0;
        return Value::ofNumber(1);
    });
    expectError({ "a grid of too many rows", [&] { world.canvas.doPreview(tall); },
        ErrorNumber::Overflow,
        { "the grid has 2,147,483,646 rows; the 32,767 pages that a document holds take 3,407,768 "
          "of them at most, so print fewer rows" } });
    world.canvas.options.fit.toSheet = true;
    expectError({ "a grid of too many rows to be fitted", [&] { world.canvas.doPreview(tall); },
        ErrorNumber::Overflow,
        { "the grid has 2,147,483,646 rows; the 32,767 pages that a document holds take "
          "488,654,271 of them at most, so print fewer rows" } });
    EXPECT_EQ(asked, 0);
}

/// An error that is thrown with its number alone tells nobody what it is about.
TEST(ErrorTexts, AreNeverTheTextOfTheNumberAlone)
{
    const std::regex bare(R"(RunTimeError\(ErrorNumber::(?!Cancelled)\w+\))");
    for (const std::filesystem::path& path : sources()) {
        const std::string code = TempFolder::bytesOf(path);
        for (auto at = std::sregex_iterator(code.begin(), code.end(), bare);
             at != std::sregex_iterator(); ++at)
            ADD_FAILURE() << path.string() << ": " << at->str();
    }
}

} // namespace pelloric
