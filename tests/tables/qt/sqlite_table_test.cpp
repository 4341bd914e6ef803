// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/sqlite_table.h"

#include "fakes/temp_folder.h"
#include "grids/table_grid.h"

#include <QSqlDatabase>
#include <QSqlQuery>

#include <gtest/gtest.h>

#include <set>

namespace pelloric::qt {

namespace {

namespace fs = std::filesystem;

/// A database whose changes go through a log, as one program leaves it open.
class LoggedDatabase : public testing::Test {
protected:
    void SetUp() override
    {
        database_ = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), Name);
        database_.setDatabaseName(QString::fromStdString(file("live.sqlite").string()));
        ASSERT_TRUE(database_.open());
        QSqlQuery query(database_);
        ASSERT_TRUE(query.exec(QStringLiteral("PRAGMA journal_mode=WAL")));
        query.exec(QStringLiteral("PRAGMA wal_autocheckpoint=0"));
        query.exec(QStringLiteral("create table \"x:y\" (a)"));
        query.exec(QStringLiteral("insert into \"x:y\" values (1), (2)"));
    }

    void TearDown() override { close(); }

    void close()
    {
        if (!database_.isValid())
            return;
        database_.close();
        database_ = QSqlDatabase();
        QSqlDatabase::removeDatabase(Name);
    }

    fs::path file(const char* name) const { return folder_.path() / name; }

    std::set<std::string> names(const fs::path& folder) const
    {
        std::set<std::string> found;
        for (const auto& entry : fs::directory_iterator(folder))
            found.insert(entry.path().filename().string());
        return found;
    }

    /// A copy of the database in a folder of its own, with the files that the suffixes name.
    fs::path copied(std::initializer_list<const char*> suffixes) const
    {
        const fs::path folder = file("copy");
        fs::create_directory(folder);
        for (const char* const suffix : suffixes)
            fs::copy_file(file((std::string("live.sqlite") + suffix).c_str()),
                folder / (std::string("a b%.sqlite") + suffix));
        return folder / "a b%.sqlite";
    }

    static std::int64_t rowsOf(const fs::path& path)
    {
        return readSqlite({ .path = path, .table = QStringLiteral("x:y"), .query = {} }).rowCount();
    }

    const QString Name = QStringLiteral("logged");
    QSqlDatabase database_;
    TempFolder folder_;
};

} // namespace

TEST_F(LoggedDatabase, IsReadWithoutALogAndLeavesNothingBeside)
{
    close();
    const fs::path path = copied({ "" });
    EXPECT_EQ(rowsOf(path), 2);
    EXPECT_EQ(names(path.parent_path()), (std::set<std::string> { "a b%.sqlite" }));
}

TEST_F(LoggedDatabase, IsReadWithALogThatIsLeftOver)
{
    const fs::path path = copied({ "", "-wal" });
    EXPECT_EQ(rowsOf(path), 2) << "what stands only in the log is read, too";
    EXPECT_EQ(
        names(path.parent_path()), (std::set<std::string> { "a b%.sqlite", "a b%.sqlite-wal" }));
}

TEST_F(LoggedDatabase, IsReadWhileAnotherProgramHasItOpen)
{
    const auto before = names(folder_.path());
    EXPECT_EQ(rowsOf(file("live.sqlite")), 2);
    EXPECT_EQ(names(folder_.path()), before);
    QSqlQuery query(database_);
    EXPECT_TRUE(query.exec(QStringLiteral("insert into \"x:y\" values (3)")));
    EXPECT_EQ(rowsOf(file("live.sqlite")), 3);
}

TEST_F(LoggedDatabase, MayHaveAnyBytesInItsName)
{
    close();
    const fs::path path = file("not \xff utf-8.sqlite");
    fs::rename(file("live.sqlite"), path);
    EXPECT_EQ(rowsOf(path), 2);
}

} // namespace pelloric::qt
