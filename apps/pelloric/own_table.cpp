// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "own_table.h"

#include "command_line.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "table_source.h"
#include "tables/qt/csv_table.h"
#include "tables/qt/sqlite_table.h"
#include "ui/qt/named_boxes.h"

#include <QComboBox>
#include <QCoreApplication>
#include <QFileDialog>
#include <QFileInfo>
#include <QInputDialog>
#include <QMessageBox>
#include <QSqlDatabase>
#include <QStandardPaths>

namespace pelloric::app {

namespace {

constexpr char Context[] = "pelloric::app::OwnTable";

constexpr const char* Title = QT_TRANSLATE_NOOP("pelloric::app::OwnTable", "Open Your Own Table");

QString words(const char* text) { return QCoreApplication::translate(Context, text); }

/// The tables and views of a database.
QStringList tablesOf(const QString& file)
{
    const QString connection = QStringLiteral("tables");
    QStringList tables;
    {
        QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), connection);
        database.setConnectOptions(QStringLiteral("QSQLITE_OPEN_READONLY"));
        database.setDatabaseName(file);
        if (database.open())
            tables = database.tables(QSql::Tables) + database.tables(QSql::Views);
    }
    QSqlDatabase::removeDatabase(connection);
    return tables;
}

/// @return  nothing: the person has chosen none
std::optional<QString> chooseTable(QWidget& window, const QStringList& tables)
{
    QInputDialog dialog(&window);
    dialog.setWindowTitle(words(Title));
    dialog.setLabelText(
        words(QT_TRANSLATE_NOOP("pelloric::app::OwnTable", "Table of the database:")));
    dialog.setComboBoxItems(tables);
    qt::nameBox(*dialog.findChild<QComboBox*>(),
        words(QT_TRANSLATE_NOOP("pelloric::app::OwnTable", "Table of the database")));
    if (dialog.exec() != QDialog::Accepted)
        return std::nullopt;
    return dialog.textValue();
}

/// @return  nothing: the person has chosen none
std::optional<OwnTable> readDatabase(QWidget& window, const QString& file)
{
    const QStringList tables = tablesOf(file);
    QString table = tables.value(0);
    if (tables.size() > 1) {
        const std::optional<QString> chosen = chooseTable(window, tables);
        if (!chosen)
            return std::nullopt;
        table = *chosen;
    }
    qt::SqliteSource source;
    source.path = pathOf(file);
    source.table = table;
    return OwnTable { table.isEmpty() ? plainName(file) : table, qt::readSqlite(source) };
}

} // namespace

std::optional<OwnTable> openOwnTable(QWidget& window, const QString& file)
{
    try {
        if (isDatabase(file))
            return readDatabase(window, file);
        return OwnTable { plainName(file), qt::readCsv(pathOf(file), {}) };
    } catch (const RunTimeError& error) {
        QMessageBox::warning(&window, words(Title),
            QFileInfo(file).fileName() + QStringLiteral(": ") + detailOf(error));
    }
    return std::nullopt;
}

std::optional<OwnTable> askOwnTable(QWidget& window)
{
    const QString file = QFileDialog::getOpenFileName(&window, words(Title),
        QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation),
        words(QT_TRANSLATE_NOOP("pelloric::app::OwnTable",
            "Tables (*.csv *.tsv *.txt *.sqlite *.db *.sqlite3);;All files (*)")));
    if (file.isEmpty())
        return std::nullopt;
    return openOwnTable(window, file);
}

} // namespace pelloric::app
