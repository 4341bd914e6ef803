// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/grids.h>

#include "platform/qt/qt_text.h"
#include "tables/qt/csv_table.h"
#include "tables/qt/sqlite_table.h"

#include <QLocale>

namespace pelloric::qt {

namespace {

bool isQuery(const QString& text)
{
    const QString word = text.trimmed().section(QLatin1Char(' '), 0, 0);
    return word.compare(QLatin1String("select"), Qt::CaseInsensitive) == 0
        || word.compare(QLatin1String("with"), Qt::CaseInsensitive) == 0;
}

} // namespace

std::unique_ptr<MemoryGrid> csvGrid(const QString& path)
{
    return std::make_unique<MemoryGrid>(readCsv(toText(path), {}));
}

std::unique_ptr<MemoryGrid> sqliteGrid(const QString& path, const QString& tableOrQuery)
{
    SqliteSource source { .path = toText(path) };
    (isQuery(tableOrQuery) ? source.query : source.table) = tableOrQuery;
    const QString point = QLocale().decimalPoint();
    source.decimalSeparator = point.isEmpty() ? u'.' : point.front().unicode();
    return std::make_unique<MemoryGrid>(readSqlite(source));
}

} // namespace pelloric::qt
