// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QMainWindow>
#include <QSqlDatabase>

class QAbstractItemView;
class QCheckBox;
class QLineEdit;
class QSpinBox;
class QTabWidget;

namespace pelloric::qt {
class Kestrane;
class QtPlatform;
}

namespace pelloric::app {

/// The demonstration: one form with a flex grid, a list view and a data grid on real tables, and
/// one `Kestrane` that previews them.
class DemoWindow final : public QMainWindow {
    Q_OBJECT

public:
    /// @param platform  outlives the window
    /// @param samples   the folder of the sample tables
    /// @throws CommandError a sample cannot be read
    DemoWindow(qt::QtPlatform& platform, const QString& samples);
    ~DemoWindow() override;

    /// The pages of the form: "Flex Grid", "List View", "Data Grid".
    QTabWidget& pages() { return *pages_; }

private:
    QWidget* makeHeading();
    QWidget* makeReportBox();
    void addPage(
        const QString& name, const QString& title, const QString& about, QAbstractItemView* view);
    QAbstractItemView* makeFlexGrid(const QString& file);
    QAbstractItemView* makeListView(const QString& file);
    QAbstractItemView* makeDataGrid(const QString& file);
    void preview(QAbstractItemView* view, const QString& title);

    QSqlDatabase database_;
    qt::Kestrane* facade_;
    QTabWidget* pages_;
    QCheckBox* showHeader_ = nullptr;
    QCheckBox* mergeGrid_ = nullptr;
    QSpinBox* startRow_ = nullptr;
    QLineEdit* footer_ = nullptr;
};

} // namespace pelloric::app
