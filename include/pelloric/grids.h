// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// What can be previewed, printed and exported: grids.
///
/// Every member that takes a grid takes a `QObject*`:
/// - a `QTableView` or `QTableWidget`, read as it is shown: columns that were moved or hidden and
///   rows that were hidden are where the user put them;
/// - a `QTreeView`, `QTreeWidget` or `QListView`, read as a list of rows;
/// - a `MemoryGrid`, the table of a host that has no view;
/// - any object with published members (`Q_PROPERTY`, `Q_INVOKABLE`) of one of these families:
///   `Cols`, `Rows`, `ColWidth(column)` (twips), `TextMatrix(row, column)`, row 0 being the
///   titles; or `ColumnHeaders` and `ListItems`; or `DataSource` and `Columns`.
///
/// @code
/// pelloric::qt::MemoryGrid grid({ { "Article", 4000 }, { "Pieces" } });
/// grid.addRow({ "Copper wire", "1200" });
/// preview.doPreview(&grid);
/// @endcode

#include <pelloric/version.h>

#include <QList>
#include <QObject>
#include <QStringList>

#include <memory>

class QTableView;

namespace pelloric {

class AutomationObject;
class TableGrid;

} // namespace pelloric

namespace pelloric::qt {

/// A table of texts in memory that can be previewed like a grid.
///
/// The texts of all cells stand in one store: a table of a million rows costs little more than its
/// texts.
class PELLORIC_EXPORT MemoryGrid : public QObject {
    Q_OBJECT
public:
    /// A column.
    struct Column {
        QString title; ///< printed above the column on every page
        int width = -1; ///< twips (1440 an inch), 0 leaves the column out; -1: the standard width
    };

    /// A table without rows.
    explicit MemoryGrid(const QList<Column>& columns, QObject* parent = nullptr);
    /// Takes a table over.
    explicit MemoryGrid(TableGrid table, QObject* parent = nullptr);
    ~MemoryGrid() override;

    /// Adds a row at the end.
    /// @param cells  left to right; cells that are missing at the end are empty
    /// @throws RunTimeError SubscriptOutOfRange: more cells than columns; the table is as before
    void addRow(const QStringList& cells);

    /// @return  without the row of titles
    qint64 rowCount() const;
    /// The number of columns, those of width 0 among them.
    int columnCount() const;

    /// A cell's text.
    /// @param row     from 0, which is the first that was added
    /// @param column  from 0
    /// @throws RunTimeError SubscriptOutOfRange
    QString cell(qint64 row, int column) const;

    /// A grid on the same rows that may outlive this object.
    std::unique_ptr<AutomationObject> share() const;

private:
    struct Parts;
    std::unique_ptr<Parts> parts_;
};

/// A table view as a data grid, which a view handed over as it is is not: the records of its model
/// are walked in place, in the order and with the filter that the view shows, and hidden columns
/// are printed too.
/// @param view  borrowed; once it is gone, a build is the object-missing error
/// @return  to be handed to `doPreview` or `Report::build`, and need not be kept afterwards
PELLORIC_EXPORT std::unique_ptr<QObject> dataGrid(QTableView& view);

/// Reads a file of values separated by comma, tab or semicolon; its first row holds the titles.
///
/// Of the component `tables`. The encoding is UTF-8 or UTF-16 by a byte order mark, UTF-8 where all
/// of the file is that, else GB18030.
/// @throws RunTimeError FileNotFound, with the path; TypeMismatch, with the line: the bytes are no
///         text, or the file is empty; Overflow: too many columns
PELLORIC_EXPORT std::unique_ptr<MemoryGrid> csvGrid(const QString& path);

/// Reads a table, or the rows of a query, of an SQLite database, which is opened for reading only.
///
/// Of the component `tables`.
/// @param tableOrQuery  the name of a table or view, or a statement that begins with SELECT or
/// WITH;
///                      empty: the only table that there is
/// @throws RunTimeError FileNotFound, with the path; InvalidCall: no such table, or the statement
///         fails
PELLORIC_EXPORT std::unique_ptr<MemoryGrid> sqliteGrid(
    const QString& path, const QString& tableOrQuery = {});

} // namespace pelloric::qt
