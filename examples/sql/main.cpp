// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/pelloric.h>

#include <QtSql>
#include <QtWidgets>

int main(int count, char** arguments)
{
    QApplication application(count, arguments);
    pelloric::qt::usePreviewWindow();

    QSqlDatabase database = QSqlDatabase::addDatabase("QSQLITE");
    database.setDatabaseName(QApplication::arguments().value(1, "samples/samples.sqlite"));
    database.open();
    QSqlTableModel model;
    model.setTable(database.tables().value(0));
    model.select();
    QTableView view;
    view.setModel(&model);

    pelloric::qt::Kestrane preview;
    preview.doPreview(&view); // all rows, however many the view has fetched
    return QApplication::exec();
}
