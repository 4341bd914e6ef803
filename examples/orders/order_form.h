// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QMainWindow>
#include <QSortFilterProxyModel>
#include <QSqlTableModel>
#include <QTimer>

class QLineEdit;
class QTableView;

namespace pelloric::qt {
class Kestrane;
class Sorvane;
}

/// A table of orders with a filter, and the pages that it makes.
class OrderForm final : public QMainWindow {
    Q_OBJECT

public:
    OrderForm();

    /// Writes the orders that the filter leaves as a PDF file. @return  whether that went well
    bool savePdf(const QString& path);

private:
    void addTools();
    void buildPages();
    void askForPdf();

    QSqlTableModel orders_;
    QSortFilterProxyModel left_; ///< what the filter leaves of them
    QLineEdit* filter_;
    QTableView* view_;
    pelloric::qt::Sorvane* pages_; ///< the canvas on this form, without the preview window
    pelloric::qt::Kestrane* preview_; ///< opens the preview window
    QTimer pause_; ///< after the last key in the filter
};
