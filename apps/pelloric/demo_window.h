// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QMainWindow>
#include <QSqlDatabase>

#include <functional>

class QAbstractItemView;
class QCheckBox;
class QLineEdit;
class QSpinBox;
class QTabWidget;
class QTableView;
class QTableWidget;
class QTreeWidget;

namespace pelloric {
class TableGrid;
}

namespace pelloric::qt {
class Kestrane;
class QtPlatform;
}

namespace pelloric::app {

/// The demonstration: one form with a flex grid, a list view, a data grid, spans and a tree on
/// real tables, the host code of each beside it, and one `Kestrane` that previews them.
class DemoWindow final : public QMainWindow {
    Q_OBJECT

public:
    /// @param platform  outlives the window
    /// @param samples   the folder of the sample tables
    /// @throws CommandError a sample cannot be read
    DemoWindow(qt::QtPlatform& platform, const QString& samples);
    ~DemoWindow() override;

    /// The pages of the form: "Flex Grid", "List View", "Data Grid", "Spans", "Tree", then the
    /// person's own tables.
    QTabWidget& pages() { return *pages_; }

private:
    /// A page of the form.
    struct Page {
        QString name; ///< of its view; its button is "preview" and this
        QString title; ///< of its tab
        QString about; ///< what its table is
        const char* code; ///< the file of its host code
        std::function<void()> preview; ///< runs that code
    };

    QWidget* makeHeading();
    QWidget* makeReportBox();
    void addPage(const Page& page, QAbstractItemView* view);
    QWidget* makeCode(const Page& page);
    void addShownPages(const TableGrid& wines, const QString& samples);
    static void arrange(QTableWidget& view);
    QTreeWidget* makeListView(const QString& file);
    QTableView* makeDataGrid(const QString& file);
    void addOwnTable();

    QSqlDatabase database_;
    qt::Kestrane* facade_;
    QTabWidget* pages_;
    QCheckBox* showHeader_ = nullptr;
    QCheckBox* mergeGrid_ = nullptr;
    QCheckBox* asShown_ = nullptr;
    QSpinBox* startRow_ = nullptr;
    QLineEdit* footer_ = nullptr;
    int ownTables_ = 0;
};

} // namespace pelloric::app
