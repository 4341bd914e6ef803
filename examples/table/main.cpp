// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/pelloric.h>

#include <QtWidgets>

int main(int count, char** arguments)
{
    QApplication application(count, arguments);
    pelloric::qt::usePreviewWindow();

    QTableWidget table(60, 3);
    table.setHorizontalHeaderLabels({ "Number", "Square", "Cube" });
    for (int row = 0; row < table.rowCount(); ++row) {
        for (int column = 0; column < table.columnCount(); ++column)
            table.setItem(row, column, new QTableWidgetItem(QString::number(pow(row, column + 1))));
    }

    pelloric::qt::Kestrane preview;
    preview.doPreview(&table);
    return QApplication::exec();
}
