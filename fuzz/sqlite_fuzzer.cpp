// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any bytes as a database, and any text as a statement for a good one.

#include "fuzz_application.h"
#include "fuzz_platform.h"

#include "platform/run_time_error.h"
#include "tables/qt/sqlite_table.h"

#include <QSqlDatabase>
#include <QSqlQuery>

using namespace pelloric;

namespace {

constexpr const char* GoodTable[] = {
    "CREATE TABLE t(a, b INTEGER, \"c:d\" TEXT)",
    "CREATE VIEW v AS SELECT b, a FROM t",
    "INSERT INTO t VALUES (1, 2.5, 'x'), (NULL, 9223372036854775807, x'00FF')",
};

std::string goodDatabase(const fuzz::ProcessFolder& folder)
{
    const auto path = folder.systemDirectory() / "good.sqlite";
    QSqlDatabase database = QSqlDatabase::addDatabase("QSQLITE", "good");
    database.setDatabaseName(QString::fromStdString(path.string()));
    fuzz::require(database.open());
    for (const char* statement : GoodTable)
        fuzz::require(QSqlQuery(database).exec(QString::fromLatin1(statement)));
    database.close();
    return folder.read("good.sqlite");
}

void read(const qt::SqliteSource& source)
{
    try {
        const TableGrid table = qt::readSqlite(source);
        fuzz::require(table.columnCount() > 0);
    } catch (const RunTimeError& error) {
        fuzz::require(!error.detail().empty() || error.number() == ErrorNumber::Cancelled);
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    fuzz::application();
    static const fuzz::ProcessFolder folder;
    static const std::string good = goodDatabase(folder);
    if (size == 0 || size > 1U << 14U)
        return 0;
    const std::string_view bytes(reinterpret_cast<const char*>(data) + 1, size - 1);
    qt::SqliteSource source;
    int rounds = 0;
    source.progress = [&rounds](std::int64_t, std::int64_t) { return ++rounds < 100; };
    if (data[0] % 2 == 0) {
        source.path = folder.write("any.sqlite", bytes);
        read(source);
        return 0;
    }
    source.path = folder.systemDirectory() / "good.sqlite";
    const QString text = QString::fromUtf8(bytes.data(), static_cast<qsizetype>(bytes.size()));
    (data[0] % 4 == 1 ? source.query : source.table) = text;
    read(source);
    fuzz::require(folder.read("good.sqlite") == good); // nothing writes
    return 0;
}
