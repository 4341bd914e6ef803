// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/pelloric.h>

#include <QtWidgets>

int main(int count, char** arguments)
{
    QApplication application(count, arguments);
    pelloric::qt::usePreviewWindow();

    QTreeWidget files;
    files.setHeaderLabels({ "Name", "Bytes", "Changed" });
    for (const QFileInfo& file : QDir::current().entryInfoList(QDir::Files))
        new QTreeWidgetItem(&files,
            { file.fileName(), QString::number(file.size()),
                file.lastModified().toString("yyyy-MM-dd") });

    pelloric::qt::Kestrane preview;
    preview.doPreview(&files);
    return QApplication::exec();
}
