// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "table_source.h"

#include "interruption.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "progress_line.h"
#include "table_selection.h"
#include "tables/qt/csv_table.h"
#include "tables/qt/sqlite_table.h"

#include <QFile>
#include <QFileInfo>

#include <array>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "query", "SQL", "what to take of a database: a SELECT statement" },
    { "encoding", "NAME", "of a CSV or TSV file; else found out (UTF-8, GB18030)" },
});

constexpr char DatabaseMark[] = "SQLite format 3";

/// A database file and one of its tables; no table when the name is all file. Both may hold colons:
/// the longest name of a file that there is counts.
struct DatabaseName {
    QString file;
    QString table;
};

DatabaseName splitName(const QString& name)
{
    if (QFileInfo::exists(name))
        return { name, {} };
    for (auto colon = name.lastIndexOf(QLatin1Char(':')); colon > 0;
         colon = name.lastIndexOf(QLatin1Char(':'), colon - 1)) {
        const QString file = name.left(colon);
        if (QFileInfo(file).isFile())
            return { file, name.mid(colon + 1) };
    }
    return { name, {} };
}

void checkReadable(const QString& name)
{
    const QFileInfo info(name);
    if (!info.exists())
        throw CommandError(QStringLiteral("%1: there is no such file").arg(name));
    if (info.isDir())
        throw CommandError(QStringLiteral("%1 is a folder; name a file in it").arg(name));
    std::error_code ignored;
    const auto type = std::filesystem::status(pathOf(name), ignored).type();
    if (type == std::filesystem::file_type::character || type == std::filesystem::file_type::block)
        throw CommandError(QStringLiteral("%1 is a device; name a file").arg(name));
    if (!info.isReadable())
        throw CommandError(QStringLiteral("%1: you may not read this file").arg(name));
}

TableGrid readDatabase(const DatabaseName& name, const CommandLine& line, ProgressLine& progress)
{
    if (line.has("encoding"))
        throw CommandError(
            QStringLiteral("--encoding is for CSV and TSV files, not databases"), WrongUsage);
    if (line.has("query") && !name.table.isEmpty())
        throw CommandError(QStringLiteral("take either a table or --query, not both"), WrongUsage);
    qt::SqliteSource source;
    source.path = pathOf(name.file);
    source.table = name.table;
    source.query = line.value("query");
    source.progress = [&](std::int64_t) {
        progress.show("Reading", 0);
        return Interruption::mayGoOn();
    };
    return qt::readSqlite(source);
}

TableGrid readValues(const QString& name, const CommandLine& line, ProgressLine& progress)
{
    if (line.has("query"))
        throw CommandError(QStringLiteral("--query is for databases; %1 is none").arg(name));
    const auto step = [&](double part) {
        progress.show("Reading", part);
        return Interruption::mayGoOn();
    };
    return qt::readCsv(pathOf(name), { .encoding = line.value("encoding"), .progress = step });
}

} // namespace

OptionTable sourceOptions() { return Options; }

std::filesystem::path pathOf(const QString& name) { return qt::toText(name); }

bool isDatabase(const QString& name)
{
    QFile file(name);
    return QFileInfo(name).isFile() && file.open(QIODevice::ReadOnly)
        && file.read(sizeof DatabaseMark - 1) == DatabaseMark;
}

bool isDocumentName(const QString& name)
{
    return name.endsWith(QLatin1String(".ostl"), Qt::CaseInsensitive);
}

bool isSameFile(const QString& file, const QString& other)
{
    std::error_code error;
    return std::filesystem::equivalent(pathOf(splitName(file).file), pathOf(other), error);
}

QString plainName(const QString& name)
{
    return QFileInfo(splitName(name).file).completeBaseName();
}

TableGrid readTable(const QString& file, const CommandLine& line, ProgressLine& progress)
{
    const Interruption::AtOnce atOnce;
    const DatabaseName name = splitName(file);
    checkReadable(name.file);
    const bool isFromDatabase = isDatabase(name.file);
    if (!isFromDatabase && !name.table.isEmpty())
        throw CommandError(QStringLiteral("%1 is no SQLite database").arg(name.file));
    try {
        return selected(isFromDatabase ? readDatabase(name, line, progress)
                                       : readValues(name.file, line, progress),
            line);
    } catch (const RunTimeError& error) {
        if (error.number() == ErrorNumber::Cancelled)
            throw;
        throw CommandError(QStringLiteral("%1: %2").arg(name.file, detailOf(error)));
    }
}

} // namespace pelloric::app
