// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Measures how tables of all sources become row sets, each beside the walk over the bare source:
//   pelloric_bench_reading [ROWS]    300,000 rows unless given
// Times are processor seconds, the least of several.

#include "sample_table.h"

#include "grids/qt/table_view_grid.h"
#include "grids/qt/tree_view_grid.h"
#include "report/grid_reader.h"
#include "tables/qt/csv_table.h"
#include "tables/qt/sqlite_table.h"

#include <QApplication>
#include <QSqlDatabase>
#include <QSqlQuery>
#include <QStandardItemModel>
#include <QTableView>
#include <QTemporaryDir>
#include <QTreeView>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <filesystem>
#include <functional>
#include <vector>

namespace {

using namespace pelloric;
namespace fs = std::filesystem;

constexpr int Repeats = 5;
constexpr std::int64_t UsualRows = 300'000;
constexpr double LeastMegabytes = 150;
constexpr double MostWalks = 2.0;

double secondsOf(const std::function<void()>& run)
{
    double least = 1e9;
    for (int repeat = 0; repeat < Repeats; ++repeat) {
        const std::clock_t begin = std::clock();
        run();
        least = std::min(least, static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC);
    }
    return least;
}

QString stringOf(TextView text)
{
    return QString::fromUtf16(text.data(), static_cast<qsizetype>(text.size()));
}

GridTable read(AutomationObject& grid, PrintObjKind kind = PrintObjKind::MSFlexGrid)
{
    return readGrid(grid,
        { .kind = kind,
            .paperWidth = 11500,
            .keptWidths = {},
            .store = std::make_shared<TextStore>() });
}

void print(const char* what, double seconds, double figure, const char* unit, bool isMet)
{
    std::printf(
        "%-44s %8.3f s %8.2f %s: %s\n", what, seconds, figure, unit, isMet ? "met" : "MISSED");
    std::fflush(stdout);
}

void readCsvFile(const TableGrid& table, const fs::path& folder)
{
    const fs::path path = folder / "table.csv";
    bench::writeCsv(table, path);
    const double seconds = secondsOf([&] {
        TableGrid grid = qt::readCsv(path, {});
        for (int column = 0; column < grid.columnCount(); ++column) {
            const Value index = Value::ofNumber(column);
            grid.put(memberOf(grid, u"ColWidth"), { &index, 1 }, Value::ofNumber(1200));
        }
        read(grid);
    });
    const double megabytes = static_cast<double>(fs::file_size(path)) / 1e6 / seconds;
    print("CSV file to row set", seconds, megabytes, "MB/s, at least 150",
        megabytes >= LeastMegabytes);
}

void makeDatabase(const TableGrid& table, QSqlDatabase database)
{
    QSqlQuery query(database);
    query.exec(QStringLiteral("CREATE TABLE t (a INTEGER, b, c, d, e, f, g INTEGER, h REAL)"));
    database.transaction();
    query.prepare(QStringLiteral("INSERT INTO t VALUES (?, ?, ?, ?, ?, ?, ?, ?)"));
    for (std::int64_t row = 0; row < table.rowCount(); ++row) {
        for (int column = 0; column < table.columnCount(); ++column)
            query.bindValue(column, stringOf(table.cell(row, column)));
        query.exec();
    }
    database.commit();
}

/// The least that a program does with a query: every value as a text.
std::size_t walk(QSqlDatabase database)
{
    std::size_t units = 0;
    QSqlQuery query(database);
    query.setForwardOnly(true);
    query.exec(QStringLiteral("SELECT * FROM t"));
    const int columns = 8;
    while (query.next()) {
        for (int column = 0; column < columns; ++column)
            units += static_cast<std::size_t>(query.value(column).toString().size());
    }
    return units;
}

void readDatabase(const TableGrid& table, const fs::path& folder)
{
    const fs::path path = folder / "table.sqlite";
    const QString connection = QStringLiteral("bench");
    double bare = 0;
    {
        QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), connection);
        database.setDatabaseName(QString::fromStdString(path.string()));
        database.open();
        makeDatabase(table, database);
        bare = secondsOf([&] { walk(database); });
    }
    QSqlDatabase::removeDatabase(connection);
    const double seconds = secondsOf([&] {
        TableGrid grid = qt::readSqlite({ .path = path });
        read(grid);
    });
    print("SQLite table to row set", seconds, seconds / bare, "bare walks, at most 2",
        seconds <= MostWalks * bare);
}

std::size_t walk(const QAbstractItemModel& model)
{
    std::size_t units = 0;
    for (int row = 0; row < model.rowCount(); ++row) {
        for (int column = 0; column < model.columnCount(); ++column)
            units += static_cast<std::size_t>(
                model.index(row, column).data(Qt::DisplayRole).toString().size());
    }
    return units;
}

/// The least that shows what a view shows: texts and check boxes of all cells, the texts copied.
std::size_t walkShown(const QAbstractItemModel& model, std::vector<char16_t>& texts)
{
    texts.clear();
    std::size_t boxes = 0;
    for (int row = 0; row < model.rowCount(); ++row) {
        for (int column = 0; column < model.columnCount(); ++column) {
            const QModelIndex index = model.index(row, column);
            const QString text = index.data(Qt::DisplayRole).toString();
            boxes += index.data(Qt::CheckStateRole).isNull() ? 0 : 1;
            texts.insert(texts.end(), text.utf16(), text.utf16() + text.size());
        }
    }
    return boxes;
}

QStandardItemModel* modelOf(const TableGrid& table, QObject& owner)
{
    auto* const model
        = new QStandardItemModel(static_cast<int>(table.rowCount()), table.columnCount(), &owner);
    for (int row = 0; row < model->rowCount(); ++row) {
        for (int column = 0; column < model->columnCount(); ++column)
            model->setItem(row, column, new QStandardItem(stringOf(table.cell(row, column))));
    }
    return model;
}

/// @param bare   seconds of a walk that asks for one role of every cell
/// @param shown  seconds of a walk that asks for all that is shown and copies it
void judgeView(const char* what, double bare, double shown, const std::function<void()>& run)
{
    const double seconds = secondsOf(run);
    std::printf(
        "%-44s %10s %8.2f walks that copy texts and check boxes\n", what, "", seconds / shown);
    print(what, seconds, seconds / bare, "bare walks, at most 2", seconds <= MostWalks * bare);
}

/// The fields of a row set in place, as its document is laid out.
std::size_t walk(RowSet& rows)
{
    std::size_t units = 0;
    for (rows.moveFirst(); !rows.isAfterLast(); rows.moveNext()) {
        for (int field = 0; field < rows.fieldCount(); ++field)
            units += rows.value(field).text().size();
    }
    return units;
}

void readViews(const TableGrid& texts)
{
    QObject owner;
    QStandardItemModel& model = *modelOf(texts, owner);
    const double bare = secondsOf([&] { walk(model); });
    std::vector<char16_t> copied;
    const double shown = secondsOf([&] { walkShown(model, copied); });
    QTableView table;
    table.setModel(&model);
    judgeView("table view to row set", bare, shown, [&] {
        qt::TableViewGrid grid(table);
        read(grid);
    });
    judgeView("data grid of a table view, walked in place", bare, shown, [&] {
        qt::TableViewGrid grid(table);
        walk(*read(grid, PrintObjKind::datagrid).rows);
    });
    QTreeView tree;
    tree.setModel(&model);
    judgeView("tree view to row set", bare, shown, [&] {
        qt::TreeViewGrid grid(tree);
        read(grid, PrintObjKind::ListView);
    });
}

} // namespace

int main(int count, char** arguments)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(count, arguments);
    const std::int64_t rows = count > 1 ? std::atoll(arguments[1]) : UsualRows;
    std::printf("\nReading %lld rows of 8 columns\n", static_cast<long long>(rows));
    const QTemporaryDir folder;
    const fs::path path(folder.path().toStdString());
    const TableGrid table = bench::sampleTable(rows);
    readCsvFile(table, path);
    readDatabase(table, path);
    readViews(table);
    return 0;
}
