// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/page_document.h"
#include "export/qt/page_export.h"
#include "fakes/temp_folder.h"
#include "platform/member_names.h"
#include "platform/qt/qt_platform.h"
#include "platform/run_time_error.h"
#include "print/qt/qt_printing.h"
#include "tables/qt/csv_table.h"
#include "tables/qt/json_table.h"
#include "tables/qt/office_table.h"
#include "tables/qt/sqlite_table.h"

#include <QSqlDatabase>
#include <QSqlQuery>

#include <gmock/gmock.h>

#include <functional>

namespace pelloric::qt {

namespace {

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
            ErrorNumber::TypeMismatch, { "line 2", "zero byte" } },
        { "too many columns", [&] { csv("wide.csv", std::string(32768, ',')); },
            ErrorNumber::Overflow, { "line 1", "32767" } },
        { "no JSON", [&] { readJson(folder.write("bad.json", "[{]\n"), {}); },
            ErrorNumber::TypeMismatch, { "line 1" } },
        { "JSON that is no table", [&] { readJson(folder.write("no.json", "[1,2]\n"), {}); },
            ErrorNumber::TypeMismatch, { "line 1" } },
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
        { "a folder that is missing", [&] { pdf({}, "none/t.pdf"); }, ErrorNumber::WriteFailed,
            { path("none/t.pdf") } },
        { "an image", [&] { exportPngs(document, {}, { .dpi = 100000 }, folder.file("t.png")); },
            ErrorNumber::Overflow,
            { "an image of 826875 by 1169444 pixels (100000 per inch)", "choose another" } },
    };
    for (const ErrorRow& row : rows)
        expectError(row);
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
