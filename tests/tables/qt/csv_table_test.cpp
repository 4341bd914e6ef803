// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/csv_table.h"

#include "fakes/temp_folder.h"
#include "platform/run_time_error.h"
#include "tables/qt/sqlite_table.h"

#include <QSqlDatabase>
#include <QSqlQuery>

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

/// Titles and cells in one text: cells end in "|", rows in "/".
Text dump(const TableGrid& grid)
{
    Text text;
    for (int column = 0; column < grid.columnCount(); ++column)
        text.append(grid.column(column).title).append(u"|");
    for (std::int64_t row = 0; row < grid.rowCount(); ++row) {
        text.append(u"/");
        for (int column = 0; column < grid.columnCount(); ++column)
            text.append(grid.cell(row, column)).append(u"|");
    }
    return text;
}

/// What reading the bytes as a file of that name gives: the dump, or the error's text.
std::string read(std::string_view name, std::string_view bytes, const QString& encoding = {})
{
    const TempFolder folder;
    try {
        return toUtf8(dump(readCsv(folder.write(name, bytes), { .encoding = encoding })));
    } catch (const RunTimeError& error) {
        return toUtf8(error.text());
    }
}

struct ReadCase {
    std::string_view name;
    std::string_view bytes;
    std::string_view result;
};

} // namespace

TEST(CsvTable, KeepsCharactersThatLieAcrossTwoPiecesOfAFile)
{
    constexpr std::size_t Piece = 1U << 20U; // that is read at once
    const Text face = u"\U0001F600";
    for (std::size_t before = Piece - 12; before <= Piece; before += 2) {
        Text text = u"\uFEFFa\n";
        text.resize(before / 2, u'x');
        const Text whole = text + face + u"\n";
        const std::string bytes(
            reinterpret_cast<const char*>(whole.data()), whole.size() * sizeof(char16_t));
        const std::string result = read("pieces.csv", bytes);
        EXPECT_TRUE(result.ends_with("x\xF0\x9F\x98\x80|")) << before;
    }
}

TEST(CsvTable, RefusesHalvesOfCharactersThatAMarkSaysAreText)
{
    const Text half = u"\uFEFFa\n\xD83Dx\n";
    const std::string bytes(
        reinterpret_cast<const char*>(half.data()), half.size() * sizeof(char16_t));
    EXPECT_EQ(read("half.csv", bytes),
        "Type mismatch: bytes that are no UTF-16LE, which the file's mark says it is");
}

#if defined(__unix__)
TEST(CsvTable, ReadsAFileWhoseNameIsNoText) { EXPECT_EQ(read("n\xFF.csv", "a\n1\n"), "a|/1|"); }
#endif

TEST(CsvTable, ReadsTitlesAndCells)
{
    const ReadCase cases[] = {
        { "a.csv", "a,b\n1,2\n", "a|b|/1|2|" },
        { "no_line_end.csv", "a,b\n1,2", "a|b|/1|2|" },
        { "crlf.csv", "a,b\r\n1,2\r\n", "a|b|/1|2|" },
        { "cr.csv", "a,b\r1,2\r", "a|b|/1|2|" },
        { "quotes.csv", "a,b\n\"x,y\",\"say \"\"hi\"\"\"\n", "a|b|/x,y|say \"hi\"|" },
        { "line_break.csv", "a,b\n\"x\ny\",2\n", "a|b|/x\ny|2|" },
        { "empty_lines.csv", "a,b\n\n1,2\n\n\n3,4\n", "a|b|/1|2|/3|4|" },
        { "short_row.csv", "a,b,c\n1\n", "a|b|c|/1|||" },
        { "long_row.csv", "a\n1,2,3\n4\n", "a|||/1|2|3|/4|||" },
        { "ever_longer_rows.csv", "a,b\n1\n2,3,4\n5\n6,7,8,9\n",
            "a|b|||/1||||/2|3|4||/5||||/6|7|8|9|" },
        { "titles.csv", "a,b\n", "a|b|" },
        { "mark.csv",
            "\xEF\xBB\xBF"
            "a,b\n1,2\n",
            "a|b|/1|2|" },
        { "gb.csv", "\xB3\xC7\xCA\xD0\n\xB1\xB1\xBE\xA9\n", "城市|/北京|" },
        { "utf8.csv", "城市\n北京\n", "城市|/北京|" },
        { "tabs.tsv", "a\tb,c\n1\t2\n", "a|b,c|/1|2|" },
        { "sniffed_tabs.csv", "a\tb\n1\t2\n", "a|b|/1|2|" },
        { "sniffed_semicolons.csv", "a;b;\"c,d,e,f\"\n1;2,5;3\n", "a|b|c,d,e,f|/1|2,5|3|" },
        { "open_quote.csv", "a,b\n1,2\n3,\"x\ny,4\n", "a|b|/1|2|/3|\"x|/y|4|" },
        { "text_behind_quote.csv", "a,b\n\"abc\" def,2\n3,4\n", "a|b|/\"abc\" def|2|/3|4|" },
        { "bars.txt", "a|b\n1|2,5\n", "a|b|/1|2,5|" },
        { "commas.tsv", "a,b\n1,2\n", "a|b|/1|2|" },
        { "western.csv", "Name,Ort\nM\xFCller,K\xF6ln\nJos\xE9,Caf\xE9\n",
            "Name|Ort|/Müller|Köln|/José|Café|" },
        { "empty_cells.tsv", "a\tb\tc\n\t\t3\n", "a|b|c|/||3|" },
    };
    for (const ReadCase& row : cases)
        EXPECT_EQ(read(row.name, row.bytes), row.result) << row.name;
}

TEST(CsvTable, ReadsUtf16ByItsByteOrderMark)
{
    const std::string_view bytes("\xFF\xFE"
                                 "a\0,\0b\0\n\0\x17\x53\x2C\0"
                                 "2\0",
        16);
    EXPECT_EQ(read("utf16.csv", bytes), "a|b|/北|2|");
}

TEST(CsvTable, ReadsAnEncodingThatIsAskedFor)
{
    EXPECT_EQ(read("latin.csv", "a\n\xE9\n", QStringLiteral("ISO-8859-1")), "a|/é|");
}

TEST(CsvTable, NamesTheLineOfWhatItCannotRead)
{
    const ReadCase cases[] = {
        { "cut_gb.csv", "\xB3\xC7\n\xB1\xB1\n\xBE",
            "Type mismatch: line 3: bytes that are neither UTF-8 nor GB18030 text; name the "
            "encoding" },
        { "marked_as_utf8.csv",
            "\xEF\xBB\xBF"
            "a\n\xB3\xC7\n",
            "Type mismatch: line 2: bytes that are no UTF-8, which the file's mark says it is" },
        { "half_utf16.csv",
            std::string_view("\xFF\xFE"
                             "a\0\n\0b",
                7),
            "Type mismatch: bytes that are no UTF-16LE, which the file's mark says it is" },
        { "zero.csv", std::string_view("a\n\"x\ny\"\n\0\n", 10),
            "Type mismatch: line 4: a zero byte; this is no text file, unless in UTF-16: then name "
            "UTF-16LE or UTF-16BE as its encoding" },
        { "empty.csv", "", "Type mismatch: the file is empty" },
        { "blank.csv", "\n\n", "Type mismatch: the file is empty" },
    };
    for (const ReadCase& row : cases)
        EXPECT_EQ(read(row.name, row.bytes), row.result) << row.name;
    EXPECT_EQ(read("a.csv", "a\n\xE9\n", QStringLiteral("UTF-8")),
        "Type mismatch: line 2: bytes that are no UTF-8");
}

TEST(CsvTable, ReadsAsItIsToldToRead)
{
    const TempFolder folder;
    const auto path = folder.write("a.csv", "a;b,\"c\n1;2,\"3\n");
    EXPECT_EQ(dump(readCsv(path, { .delimiter = ';' })), u"a|b,\"c|/1|2,\"3|");
    EXPECT_EQ(dump(readCsv(folder.write("b.csv", "\"a,b\"\n\"1,2\"\n"), { .hasQuotes = false })),
        u"\"a|b\"|/\"1|2\"|");
}

TEST(CsvTable, ReadsByTheDelimiterThatTheFirstLineNames)
{
    const TempFolder folder;
    std::vector<Text> notes;
    const auto path = folder.write("a.csv", "\xEF\xBB\xBFsep=;\r\nName;a,b\r\nx;1,5\r\ny\r\n");
    EXPECT_EQ(dump(readCsv(path, { .notes = &notes })), u"Name|a,b|/x|1,5|/y||");
    ASSERT_EQ(notes.size(), 1U);
    EXPECT_NE(notes[0].find(u"the first at line 4;"), Text::npos);
    EXPECT_EQ(dump(readCsv(path, { .delimiter = ',' })), u"Name;a|b|/x;1|5|/y||");
    EXPECT_EQ(read("b.tsv", "sep=,\na,b\n1,2\n"), "a|b|/1|2|");
    EXPECT_EQ(read("c.csv", "sep=;\n"), "Type mismatch: the file is empty");
}

TEST(CsvTable, SaysWhichEncodingWasGuessedAndWhichRowsLookGlued)
{
    const TempFolder folder;
    std::vector<Text> notes;
    readCsv(folder.write("utf8.csv", "Ä,b\n\"x\ny\",2\n"), { .notes = &notes });
    EXPECT_EQ(notes, std::vector<Text>());
    readCsv(folder.write("w.csv", "Name,Ort\nM\xFCller,K\xF6ln\nJos\xE9,Caf\xE9\n"),
        { .notes = &notes });
    readCsv(folder.write("g.csv", "a,b,c\n1,2,3\n\"x,2,3\ny\",4\n5,6,7\n"), { .notes = &notes });
    EXPECT_EQ(notes,
        (std::vector<Text> {
            u"the encoding was guessed to be windows-1252; name another one if letters look wrong",
            u"the row at line 3 may be several rows glued together: a quoted value goes on over a "
            u"line break, and the row has not as many values as the titles" }));
}

TEST(CsvTable, SaysHowManyRowsHaveNotAsManyValuesAsTheTitles)
{
    const TempFolder folder;
    std::vector<Text> notes;
    const auto ragged = folder.write("a.csv", "a;b\n1;2\n3\n4;5;6\n7;8\n");
    EXPECT_EQ(dump(readCsv(ragged, { .notes = &notes })), u"a|b||/1|2||/3|||/4|5|6|/7|8||");
    ASSERT_EQ(notes.size(), 1U);
    EXPECT_EQ(toUtf8(notes[0]),
        "2 of 4 rows have not as many values as the titles, the first at line 3; is this a table "
        "with \";\" between its values?");
    notes.clear();
    readCsv(folder.write("b.csv", "a,b\n1,2\n\n3,4\n"), { .notes = &notes });
    EXPECT_TRUE(notes.empty());
}

TEST(CsvTable, RefusesAValueWithoutEndAsSoonAsItIsSeen)
{
    constexpr std::size_t Most = 1U << 20U;
    const TempFolder folder;
    std::int64_t seen = 0;
    const auto read = [&](const std::string& bytes, CsvOptions options) {
        options.mostValueBytes = Most;
        options.progress = [&seen](std::int64_t done, std::int64_t) {
            seen = done;
            return true;
        };
        try {
            return std::to_string(readCsv(folder.write("t.csv", bytes), options).rowCount());
        } catch (const RunTimeError& error) {
            return toUtf8(error.text());
        }
    };
    EXPECT_EQ(read("a,b\n1," + std::string(9 * Most, 'x'), {}),
        "Overflow: the value behind byte 6 holds more than 1048576 bytes; leave it out, or shorten "
        "it");
    EXPECT_LT(seen, 100) << "of the 300 parts that reading takes";
    EXPECT_EQ(read("a,b\n1," + std::string(Most, 'x'), {}), "1");
    const std::string half(Most / 2 + 1, 'x');
    EXPECT_EQ(read("a#b\n" + half + '#' + half, { .delimiter = '#' }), "1");
    EXPECT_EQ(read("a,b\n1,\"" + half + '\n' + half + "\"\n", {}),
        "Overflow: line 2: value 2 of the row holds more than 1048576 bytes; leave it out, or "
        "shorten it");
}

TEST(CsvTable, RefusesAnUnknownEncodingAndAMissingFile)
{
    EXPECT_EQ(read("a.csv", "a\n", QStringLiteral("no-such")).substr(0, 40),
        "Type mismatch: unknown encoding no-such;");
    EXPECT_THROW(readCsv("no_such_file.csv", {}), RunTimeError);
}

TEST(CsvTable, EndsWhenTheProgressSaysSo)
{
    const TempFolder folder;
    const CsvOptions options { .encoding = {},
        .progress = [](std::int64_t, std::int64_t) { return false; } };
    try {
        readCsv(folder.write("a.csv", "a\n1\n"), options);
        FAIL() << "it was read all the same";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::Cancelled);
    }
}

TEST(CsvTable, ReadsEveryRowOfALargeFile)
{
    std::string bytes = "n,城市\n";
    for (int row = 0; row < 50000; ++row)
        bytes += std::to_string(row) + ",\"北京\"\r\n";
    const TempFolder folder;
    const TableGrid grid = readCsv(folder.write("large.csv", bytes), {});
    ASSERT_EQ(grid.rowCount(), 50000);
    for (int row = 0; row < 50000; ++row) {
        ASSERT_EQ(grid.cell(row, 0), TextView(decimal(row)));
        ASSERT_EQ(grid.cell(row, 1), u"北京");
    }
}

namespace {

/// A database with the tables "two words" and "t".
class SqliteTable : public testing::Test {
protected:
    void SetUp() override
    {
        {
            QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), Name);
            database.setDatabaseName(QString::fromStdString(path().string()));
            ASSERT_TRUE(database.open());
            QSqlQuery query(database);
            for (const char* statement : { "CREATE TABLE t (n INTEGER, x REAL, s TEXT)",
                     "INSERT INTO t VALUES (9007199254740993, 0.5, '007')",
                     "INSERT INTO t VALUES (-1, 1e20, NULL)", "CREATE TABLE \"two words\" (a)" })
                ASSERT_TRUE(query.exec(QString::fromLatin1(statement)));
        }
        QSqlDatabase::removeDatabase(Name);
    }

    std::filesystem::path path() const { return folder_.file("a.db"); }

    std::string read(const QString& table, const QString& query = {}) const
    {
        SqliteSource source;
        source.path = path();
        source.table = table;
        source.query = query;
        try {
            return toUtf8(dump(readSqlite(source)));
        } catch (const RunTimeError& error) {
            return toUtf8(error.text());
        }
    }

private:
    inline static const QString Name = QStringLiteral("making");
    TempFolder folder_;
};

} // namespace

TEST_F(SqliteTable, KeepsNumbersAsTheDatabaseGivesThem)
{
    EXPECT_EQ(read(QStringLiteral("t")), "n|x|s|/9007199254740993|0.5|007|/-1|1E+20||");
}

TEST_F(SqliteTable, ReadsTablesWithAnyNameAndQueries)
{
    EXPECT_EQ(read(QStringLiteral("two words")), "a|");
    EXPECT_EQ(read({}, QStringLiteral("SELECT s AS 名称, n + 1 FROM t WHERE n > 0")),
        "名称|n + 1|/007|9007199254740994|");
}

TEST_F(SqliteTable, SaysWhichTablesThereAre)
{
    EXPECT_EQ(read(QStringLiteral("u")),
        "Invalid procedure call or argument: no table u; the database has: t, two words");
    EXPECT_EQ(read({}),
        "Invalid procedure call or argument: name one of the database's tables: t, two words");
}

TEST_F(SqliteTable, NeverChangesTheDatabase)
{
    const std::string before = TempFolder::bytesOf(path());
    EXPECT_NE(read({}, QStringLiteral("WITH x AS (SELECT 1) DELETE FROM t")).find("readonly"),
        std::string::npos);
    EXPECT_EQ(TempFolder::bytesOf(path()), before);
}

TEST_F(SqliteTable, RefusesEveryStatementThatIsNoQuery)
{
    const std::filesystem::path copy = path().parent_path() / "copy.db";
    const QString target = QString::fromStdString(copy.string());
    for (const char* statement : { "VACUUM INTO '%1'", " /* SELECT */ vacuum into '%1'",
             "-- SELECT\nVACUUM INTO '%1'", "ATTACH DATABASE '%1' AS other" })
        read({}, QString::fromLatin1(statement).arg(target));
    EXPECT_FALSE(std::filesystem::exists(copy));
    EXPECT_EQ(read({}, QStringLiteral("BEGIN")),
        "Invalid procedure call or argument: the statement is no query; give a SELECT");
    EXPECT_EQ(read({}, QStringLiteral("PRAGMA foreign_keys = 1")),
        "Invalid procedure call or argument: the statement answers no rows; give a SELECT");
    EXPECT_EQ(read({}, QStringLiteral("SELECT 1; SELECT 2")),
        "Invalid procedure call or argument: give one statement only");
    for (const char* const open : { "SELECT $5", "SELECT ?", "SELECT:x FROM (VALUES (1))" })
        EXPECT_EQ(read({}, QString::fromLatin1(open)),
            "Invalid procedure call or argument: the statement leaves a value open (?, :name or "
            "$name); write the value");
    EXPECT_EQ(read({}, QStringLiteral("-- one\n/* two */ values (1)")), "column1|/1|");
}

TEST_F(SqliteTable, TellsALockedDatabaseFromNone)
{
    const QString other = QStringLiteral("other");
    {
        QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), other);
        database.setDatabaseName(QString::fromStdString(path().string()));
        ASSERT_TRUE(database.open());
        QSqlQuery query(database);
        ASSERT_TRUE(query.exec(QStringLiteral("BEGIN EXCLUSIVE")));
        EXPECT_EQ(
            read(QStringLiteral("t")), "Invalid procedure call or argument: database is locked");
    }
    QSqlDatabase::removeDatabase(other);
    TempFolder folder;
    const auto broken = folder.write("b.db", "SQLite format 3" + std::string(2000, 'x'));
    try {
        readSqlite({ .path = broken, .table = {}, .query = {} });
        FAIL() << "it was read all the same";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(
            toUtf8(error.text()), "Invalid procedure call or argument: this is no SQLite database");
    }
}

} // namespace pelloric::qt
