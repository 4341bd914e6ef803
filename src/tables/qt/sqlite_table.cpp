// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/sqlite_table.h"

#include "grids/qt/held_value.h"
#include "platform/file_bytes.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QRegularExpression>
#include <QSqlDatabase>
#include <QSqlError>
#include <QSqlQuery>
#include <QSqlRecord>
#include <QStringList>
#include <QTemporaryDir>
#include <QUuid>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <optional>

namespace pelloric::qt {

namespace {

constexpr std::int64_t RowsPerReport = 1024;

/// What a statement that only reads begins with; others may write files beside the database.
constexpr const char* ReadingWords[] = { "SELECT", "WITH", "VALUES", "PRAGMA", "EXPLAIN" };

/// Error numbers of the database as the driver spells them.
constexpr char NoDatabase[] = "26";
constexpr char Misuse[] = "21"; ///< the driver's own: more than one statement

[[noreturn]] void refuse(const Text& what) { throw RunTimeError(ErrorNumber::InvalidCall, what); }

/// Refuses what the database refused, in its words.
[[noreturn]] void refuse(const QSqlError& error)
{
    if (error.nativeErrorCode() == QLatin1String(Misuse))
        refuse(phrase(u"give one statement only"));
    // The database has nothing against open values; the driver has, without a number.
    if (error.databaseText().isEmpty() && error.nativeErrorCode().isEmpty())
        refuse(phrase(u"the statement leaves a value open (?, :name or $name); write the value"));
    refuse(toText(error.databaseText().isEmpty() ? error.driverText() : error.databaseText()));
}

bool isReading(const QString& statement)
{
    static const QRegularExpression firstWord(
        QStringLiteral("\\A(?:\\s+|--[^\\n]*\\n|/\\*.*?\\*/|\\()*+([a-z]+)"),
        QRegularExpression::CaseInsensitiveOption | QRegularExpression::DotMatchesEverythingOption);
    const QString word = firstWord.match(statement).captured(1);
    return std::ranges::any_of(ReadingWords, [&](const char* reading) {
        return word.compare(QLatin1String(reading), Qt::CaseInsensitive) == 0;
    });
}

/// How a database file is read without a trace beside it.
struct Opening {
    std::filesystem::path path;
    const char* parameters = "mode=ro"; ///< of the address of the file
};

std::filesystem::path beside(const std::filesystem::path& path, const char* suffix)
{
    std::filesystem::path other = path;
    other += suffix;
    return other;
}

/// Whether changes of the database go through a log beside it.
bool hasLog(const std::filesystem::path& path)
{
    constexpr std::streamoff ReadVersion = 19; ///< where the file says how it is read
    constexpr int ByLog = 2;
    std::ifstream file(path, std::ios::binary);
    file.seekg(ReadVersion);
    return file.get() == ByLog;
}

/// A database without a log of its own is read as it is, where others would write files to read it.
/// A log that nobody has open can be read only where its index may be written: in a copy.
Opening openingOf(const std::filesystem::path& path, std::optional<QTemporaryDir>& copies)
{
    std::error_code none;
    if (!hasLog(path))
        return { path };
    const std::filesystem::path log = beside(path, "-wal");
    const auto logBytes = std::filesystem::file_size(log, none);
    if (none || logBytes == 0)
        return { path, "mode=ro&immutable=1" };
    if (std::filesystem::exists(beside(path, "-shm"), none))
        return { path, "mode=ro&readonly_shm=1" };
    const std::filesystem::path copy
        = std::filesystem::path(toText(copies.emplace().path())) / "database.sqlite";
    std::filesystem::copy_file(path, copy, none);
    if (!none)
        std::filesystem::copy_file(log, beside(copy, "-wal"), none);
    if (none)
        refuse(phrase(
            u"the database cannot be copied to read its log: %1", { fromUtf8(none.message()) }));
    return { copy };
}

/// The file as an address, in which every byte of its name can be written.
QString addressOf(const Opening& opening)
{
    const auto name = std::filesystem::absolute(opening.path).generic_u8string();
    const QByteArray bytes(reinterpret_cast<const char*>(name.data()), std::ssize(name));
    const QByteArray encoded = bytes.toPercentEncoding("/:");
    return QStringLiteral("file:%1%2?%3")
        .arg(encoded.startsWith('/') ? QString() : QStringLiteral("///"),
            QString::fromLatin1(encoded), QString::fromLatin1(opening.parameters));
}

/// A connection of its own to a database file, for reading only.
class Connection {
public:
    explicit Connection(const std::filesystem::path& path)
        : name_(QUuid::createUuid().toString())
        , database_(QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), name_))
    {
        database_.setConnectOptions(QStringLiteral("QSQLITE_OPEN_READONLY;QSQLITE_OPEN_URI"));
        database_.setDatabaseName(addressOf(openingOf(path, copies_)));
    }

    ~Connection()
    {
        database_.close();
        database_ = QSqlDatabase();
        QSqlDatabase::removeDatabase(name_);
    }

    Connection(const Connection&) = delete;
    Connection& operator=(const Connection&) = delete;

    QSqlDatabase& database() { return database_; }

private:
    std::optional<QTemporaryDir> copies_; ///< gone after the connection
    QString name_;
    QSqlDatabase database_;
};

/// Tables and views in their order.
QStringList tablesOf(const QSqlDatabase& database)
{
    QSqlQuery query(database);
    const QString statement = QStringLiteral("SELECT name FROM sqlite_master WHERE type IN "
                                             "('table', 'view') AND name NOT LIKE 'sqlite\\_%' "
                                             "ESCAPE '\\' ORDER BY name");
    if (!query.exec(statement)) {
        if (query.lastError().nativeErrorCode() == QLatin1String(NoDatabase))
            refuse(phrase(u"this is no SQLite database"));
        refuse(query.lastError());
    }
    QStringList names;
    while (query.next())
        names.append(query.value(0).toString());
    return names;
}

QString chosenTable(const SqliteSource& source, const QStringList& tables)
{
    if (tables.isEmpty())
        refuse(phrase(u"the database has no table"));
    const QString list = tables.join(QStringLiteral(", "));
    if (source.table.isEmpty()) {
        if (tables.size() != 1)
            refuse(phrase(u"name one of the database's tables: %1", { toText(list) }));
        return tables.front();
    }
    if (!tables.contains(source.table, Qt::CaseInsensitive))
        refuse(
            phrase(u"no table %1; the database has: %2", { toText(source.table), toText(list) }));
    return source.table;
}

QString quoted(QString name)
{
    name.replace(QLatin1Char('"'), QLatin1String("\"\""));
    return QLatin1Char('"') + name + QLatin1Char('"');
}

TableGrid gridOf(const QSqlRecord& record)
{
    std::vector<TableColumn> columns;
    columns.reserve(static_cast<std::size_t>(record.count()));
    for (int field = 0; field < record.count(); ++field)
        columns.push_back({ .title = toText(record.fieldName(field)), .width = -1 });
    return TableGrid(std::move(columns));
}

/// The texts of a row, each kept until the next row.
class RowTexts {
public:
    RowTexts(int fields, char16_t separator)
        : held_(static_cast<std::size_t>(fields))
        , buffers_(held_.size())
        , cells_(held_.size())
        , separator_(separator)
    {
    }

    const std::vector<TextView>& read(const QSqlQuery& query)
    {
        for (std::size_t field = 0; field < cells_.size(); ++field) {
            const Value value = held_[field].hold(query.value(static_cast<int>(field)));
            cells_[field] = displayText(value, separator_, buffers_[field]);
        }
        return cells_;
    }

private:
    std::vector<HeldValue> held_;
    std::vector<Text> buffers_;
    std::vector<TextView> cells_;
    char16_t separator_;
};

TableGrid readRows(const SqliteSource& source, QSqlQuery& query)
{
    TableGrid grid = gridOf(query.record());
    RowTexts texts(grid.columnCount(), source.decimalSeparator);
    while (query.next()) {
        grid.addRow(texts.read(query));
        const std::int64_t rows = grid.rowCount();
        if (rows % RowsPerReport == 0)
            tell(source.progress, rows, 0);
    }
    if (query.lastError().isValid())
        refuse(query.lastError());
    return grid;
}

} // namespace

TableGrid readSqlite(const SqliteSource& source)
{
    std::error_code ignored;
    if (!std::filesystem::is_regular_file(source.path, ignored))
        throw RunTimeError(ErrorNumber::FileNotFound, pathText(source.path));
    Connection connection(source.path);
    if (!connection.database().open())
        throw RunTimeError(ErrorNumber::FileNotFound, pathText(source.path));
    const QStringList tables = tablesOf(connection.database());
    if (!source.query.isEmpty() && !isReading(source.query))
        refuse(phrase(u"the statement is no query; give a SELECT"));
    const QString statement = source.query.isEmpty()
        ? QStringLiteral("SELECT * FROM ") + quoted(chosenTable(source, tables))
        : source.query;
    QSqlQuery query(connection.database());
    query.setForwardOnly(true);
    if (!query.exec(statement))
        refuse(query.lastError());
    if (!query.isSelect() || query.record().isEmpty())
        refuse(phrase(u"the statement answers no rows; give a SELECT"));
    return readRows(source, query);
}

} // namespace pelloric::qt
