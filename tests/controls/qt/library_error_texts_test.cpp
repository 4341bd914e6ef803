// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/kestrane.h>
#include <pelloric/sorvane.h>

#include "controls/canvas.h"
#include "controls/qt/published_values.h"
#include "document/page_document.h"
#include "export/qt/page_export.h"
#include "fakes/fake_services.h"
#include "fakes/temp_folder.h"
#include "grids/qt/grid_for.h"
#include "grids/qt/held_value.h"
#include "grids/qt/late_bound.h"
#include "grids/qt/model_row_set.h"
#include "grids/qt/table_view_grid.h"
#include "grids/qt/tree_view_grid.h"
#include "grids/table_grid.h"
#include "platform/member_names.h"
#include "platform/platform.h"
#include "platform/qt/qt_platform.h"
#include "platform/run_time_error.h"
#include "print/qt/qt_printing.h"
#include "support/test_paths.h"
#include "tables/qt/csv_table.h"
#include "tables/qt/json_table.h"
#include "tables/qt/office_table.h"
#include "tables/qt/sqlite_table.h"
#include "ui/qt/page_files.h"

#include <QSqlDatabase>
#include <QSqlQuery>
#include <QStandardItemModel>
#include <QTableWidget>
#include <QTreeWidget>

#include <gmock/gmock.h>

#include <functional>

namespace pelloric::qt {

namespace {

namespace fs = std::filesystem;

/// What an error is called for, and what its text must name: the object, and the limit or the way
/// out.
struct ErrorRow {
    const char* about;
    std::function<void()> fail;
    ErrorNumber number;
    std::vector<std::string> parts;
};

void expectError(const ErrorRow& row)
{
    try {
        row.fail();
        ADD_FAILURE() << row.about << ": no error";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), row.number) << row.about;
        for (const std::string& part : row.parts)
            EXPECT_THAT(toUtf8(error.text()), testing::HasSubstr(part)) << row.about;
    }
}

/// A folder with files that cannot be read for one reason each.
class LibraryErrorTexts : public testing::Test {
protected:
    LibraryErrorTexts()
    {
        {
            QSqlDatabase database = QSqlDatabase::addDatabase("QSQLITE", "errors");
            database.setDatabaseName(QString::fromStdString(path("good.sqlite")));
            EXPECT_TRUE(database.open());
            for (const char* statement : { "CREATE TABLE one(a)", "CREATE TABLE two(a)" })
                EXPECT_TRUE(QSqlQuery(database).exec(QString::fromLatin1(statement)));
        }
        QSqlDatabase::removeDatabase("errors");
    }

    static std::filesystem::path office(const char* name)
    {
        return fs::path(PELLORIC_TESTS_DIR) / "data" / "office" / name;
    }

    static std::string wideJson()
    {
        std::string json = "[{";
        for (int name = 0; name < 32768; ++name)
            json += (name > 0 ? ",\"" : "\"") + std::to_string(name) + "\":0";
        return json + "}]";
    }

    std::string path(const char* name) const { return folder.file(name).string(); }

    void csv(const char* name, std::string_view bytes, const QString& encoding = {})
    {
        readCsv(folder.write(name, bytes), { .encoding = encoding });
    }

    void sqlite(const char* name, const QString& table, const QString& query = {})
    {
        readSqlite({ .path = folder.file(name), .table = table, .query = query });
    }

    void pdf(const ExportOptions& options, const char* name, const PageSetup& setup = {})
    {
        exportPdf(document, setup, platform.fonts(), options, folder.file(name));
    }

    TempFolder folder;
    QtPlatform platform;
    PageDocument document;
};

} // namespace

TEST_F(LibraryErrorTexts, OfTablesNameFileLineAndWayOut)
{
    const ErrorRow rows[] = {
        { "a missing table", [&] { readCsv(folder.file("none.csv"), {}); },
            ErrorNumber::FileNotFound, { path("none.csv") } },
        { "a folder as a table", [&] { readCsv(folder.path(), {}); }, ErrorNumber::FileNotFound,
            { folder.path().string() } },
        { "bytes that are no text",
            [&] {
                csv("bad.csv",
                    "\xEF\xBB\xBF"
                    "a\n\xFF\n");
            },
            ErrorNumber::TypeMismatch, { "line 2", "no UTF-8" } },
        { "an encoding", [&] { csv("t.csv", "a\n", "klingon"); }, ErrorNumber::TypeMismatch,
            { "klingon", "known are UTF-8" } },
        { "an empty table", [&] { csv("empty.csv", ""); }, ErrorNumber::TypeMismatch,
            { "the file is empty" } },
        { "a zero byte", [&] { csv("zero.csv", std::string_view("a\nb\0c\n", 6)); },
            ErrorNumber::TypeMismatch, { "line 2: a zero byte; ", "unless in UTF-16" } },
        { "too many columns", [&] { csv("wide.csv", std::string(32768, ',')); },
            ErrorNumber::Overflow, { "line 1: more than 32767 values in a row" } },
        { "no JSON", [&] { readJson(folder.write("bad.json", "[{]\n"), {}); },
            ErrorNumber::TypeMismatch, { "line 1" } },
        { "a number of JSON that is too large",
            [&] { readJson(folder.write("n.json", "[{\"a\": 1},\n{\"a\": 1e99999}]"), {}); },
            ErrorNumber::TypeMismatch,
            { "line 2: the number '1e99999' is too large; write it in quotation marks" } },
        { "JSON that is no table", [&] { readJson(folder.write("no.json", "[1,2]\n"), {}); },
            ErrorNumber::TypeMismatch, { "line 1" } },
        { "JSON of too many columns", [&] { readJson(folder.write("w.json", wideJson()), {}); },
            ErrorNumber::TypeMismatch, { "line 1: more than 32767 different names" } },
        { "an empty sheet", [&] { readOffice({ office("empty_sheet.xlsx") }); },
            ErrorNumber::TypeMismatch, { "the sheet is empty" } },
        { "an office file that unpacks without end",
            [&] { readOffice({ office("part_of_3_gb.xlsx") }); }, ErrorNumber::Overflow,
            { "the office file holds more than 2 GB" } },
        { "a damaged office file", [&] { readOffice({ folder.write("b.xlsx", "PK\x03\x04") }); },
            ErrorNumber::TypeMismatch, { "the office file is damaged", "save it" } },
        { "a missing database", [&] { sqlite("none.sqlite", {}); }, ErrorNumber::FileNotFound,
            { path("none.sqlite") } },
        { "a file that is no database",
            [&] {
                folder.write("text.sqlite", "a,b\n");
                sqlite("text.sqlite", {});
            },
            ErrorNumber::InvalidCall, { "this is no SQLite database" } },
        { "a database without tables",
            [&] {
                folder.write("empty.sqlite", "");
                sqlite("empty.sqlite", {});
            },
            ErrorNumber::InvalidCall, { "the database has no table" } },
        { "a table that is not there", [&] { sqlite("good.sqlite", "three"); },
            ErrorNumber::InvalidCall, { "three", "one", "two" } },
        { "a statement that writes", [&] { sqlite("good.sqlite", {}, "DROP TABLE one"); },
            ErrorNumber::InvalidCall, { "SELECT" } },
        { "a statement with a mistake", [&] { sqlite("good.sqlite", {}, "SELECT b FROM one"); },
            ErrorNumber::InvalidCall, { "no such column: b" } },
        { "two statements", [&] { sqlite("good.sqlite", {}, "SELECT 1; SELECT 2"); },
            ErrorNumber::InvalidCall, { "one statement only" } },
    };
    for (const ErrorRow& row : rows)
        expectError(row);
}

TEST_F(LibraryErrorTexts, OfExportsNamePagePaperAndFile)
{
    const ErrorRow rows[] = {
        { "a page", [&] { pdf({ .pages = { 4 } }, "t.pdf"); }, ErrorNumber::SubscriptOutOfRange,
            { "page 5; there is 1" } },
        { "paper", [&] { pdf({}, "t.pdf", { .myHeight = 300000, .myWidth = 0 }); },
            ErrorNumber::Overflow,
            { "paper of 0 by 300000 twips", "1 to 288000 twips (200 inches)" } },
        { "no page",
            [&] {
                PageDocument none;
                none.Totalpages = 0;
                exportPdf(none, {}, platform.fonts(), {}, folder.file("t.pdf"));
            },
            ErrorNumber::SubscriptOutOfRange, { "the document has no page to write" } },
        { "a kind of file that pages cannot be saved as",
            [&] {
                Platform services = platform.record();
                Canvas canvas(services);
                savePages(canvas, platform.fonts(), folder.file("t.doc"), {});
            },
            ErrorNumber::InvalidCall,
            { path("t.doc") + ": the name must end in .pdf, .png or .svg" } },
        { "a folder that is missing", [&] { pdf({}, "none/t.pdf"); }, ErrorNumber::WriteFailed,
            { path("none/t.pdf") } },
        { "an image", [&] { exportPngs(document, {}, { .dpi = 100000 }, folder.file("t.png")); },
            ErrorNumber::Overflow,
            { "an image of 826875 by 1169444 pixels (100000 per inch)", "choose another" } },
    };
    for (const ErrorRow& row : rows)
        expectError(row);
}

TEST_F(LibraryErrorTexts, OfArgumentsSayWhatWasGivenAndWhatIsWanted)
{
    QObject control;
    const QVariant list = QStringList { "a", "b" };
    Value number = Value::ofNumber(70000);
    TableGrid grid({ { u"a", 1000 } });
    const ErrorRow rows[] = {
        { "a word as a number", [] { toInt16(QStringLiteral("wide")); }, ErrorNumber::TypeMismatch,
            { "\"wide\" was given where a number is wanted" } },
        { "a list as a text", [&] { toPlainText(list); }, ErrorNumber::TypeMismatch,
            { "QStringList was given where a plain value is wanted" } },
        { "a number as a grid", [&] { toGrid(7, control); }, ErrorNumber::TypeMismatch,
            { "int was given where a grid is wanted" } },
        { "no grid", [&] { toGrid(QVariant::fromValue<QObject*>(nullptr), control); },
            ErrorNumber::ObjectMissing, { "no grid was given" } },
        { "null as a grid", [&] { toGrid(QVariant::fromValue(nullptr), control); },
            ErrorNumber::ObjectMissing, { "no grid was given" } },
        { "a number past its member's type",
            [&] { toVariant(number, QMetaType::fromType<short>()); }, ErrorNumber::Overflow,
            { "70000 is past what the member holds" } },
        { "an object as a plain value",
            [&] { toVariant(Value::ofObject(grid), QMetaType::fromType<QVariant>()); },
            ErrorNumber::TypeMismatch, { "an object is no plain value" } },
    };
    for (const ErrorRow& row : rows)
        expectError(row);
}

TEST_F(LibraryErrorTexts, OfGridsThatChangeOrGoSayWhatToDo)
{
    auto model = std::make_unique<QStandardItemModel>(3, 1);
    ModelRowSet shrunk;
    shrunk.take(*model);
    shrunk.setPosition(3);
    model->removeRow(0);
    auto table = std::make_unique<QTableWidget>(3, 1);
    TableViewGrid shorter(*table);
    LateBound(shorter).get(u"Rows");
    table->setRowCount(1);
    QTreeWidget tree;
    tree.addTopLevelItem(new QTreeWidgetItem(QStringList("a")));
    TreeViewGrid list(tree);
    LateBound item = LateBound(list).child(u"ListItems").item(1);
    tree.clear();
    auto object = std::make_unique<QObject>();
    const auto gone = gridFor(*object);
    object.reset();
    auto goneTable = std::make_unique<QTableWidget>(1, 1);
    const auto goneView = gridFor(*goneTable);
    goneTable.reset();
    const ErrorRow rows[] = {
        { "a model that shrank", [&] { shrunk.value(0); }, ErrorNumber::SubscriptOutOfRange,
            { "the grid has lost rows" } },
        { "a model that is gone",
            [&] {
                model.reset();
                shrunk.value(0);
            },
            ErrorNumber::ObjectMissing, { "the grid's model is gone" } },
        { "a view that shrank", [&] { LateBound(shorter).get(u"TextMatrix", 3, 0); },
            ErrorNumber::SubscriptOutOfRange, { "the grid has lost rows" } },
        { "a list that changed", [&] { item.get(u"Text"); }, ErrorNumber::SubscriptOutOfRange,
            { "the list has changed" } },
        { "an object that is gone", [&] { LateBound(*gone).get(u"objectName"); },
            ErrorNumber::ObjectMissing, { "the object is gone" } },
        { "a view that is gone", [&] { LateBound(*goneView).get(u"Cols"); },
            ErrorNumber::ObjectMissing, { "the grid is gone" } },
    };
    for (const ErrorRow& row : rows)
        expectError(row);
}

TEST_F(LibraryErrorTexts, OfControlsAreToldInAMessageBox)
{
    FakeMessages messages;
    platform.useMessages(messages);
    Kestrane facade(platform);
    facade.doPreview(std::unique_ptr<AutomationObject>());
    facade.doPreview(static_cast<QObject*>(nullptr));
    Sorvane canvas(platform);
    canvas.doPreview(nullptr);
    const std::vector<Message> shown = messages.take();
    ASSERT_EQ(shown.size(), 3U);
    EXPECT_THAT(toUtf8(shown[0].text), testing::HasSubstr("doPreview was given no grid"));
    EXPECT_THAT(toUtf8(shown[1].text), testing::HasSubstr("doPreview was given no grid"));
    EXPECT_THAT(toUtf8(shown[2].text), testing::HasSubstr("no grid was given"));
    Kestrane::setDefaultPreviewOpener(nullptr);
    QTableWidget table(1, 1);
    facade.doPreview(&table);
    EXPECT_THAT(
        toUtf8(messages.take().at(0).text), testing::HasSubstr("nobody opens the preview window"));
}

TEST_F(LibraryErrorTexts, OfIndexesNameTheLimits)
{
    const Value index = Value::ofNumber(7);
    expectError({ "an index",
        [&] {
            indexArgument({ &index, 1 }, 0, 0, 2);
        },
        ErrorNumber::SubscriptOutOfRange, { "index 7 is not between 0 and 2" } });
    expectError({ "no index", [&] { indexArgument({}, 0, 0, 2); }, ErrorNumber::NoSuchMember,
        { "an index is missing" } });
}

} // namespace pelloric::qt
