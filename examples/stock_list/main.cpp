// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/pelloric.h>

#include <QtWidgets>

int main(int count, char** arguments)
{
    QApplication application(count, arguments);
    pelloric::qt::usePreviewWindow(); // once, after the QApplication

    QWidget form;
    auto* table = new QTableWidget(40, 3); // or any other view or grid
    table->setHorizontalHeaderLabels({ "Article", "Place", "Pieces" });
    const QStringList articles { "Copper wire", "不锈钢螺丝", "轴承 6204", "Gasket set" };
    for (int row = 0; row < table->rowCount(); ++row) {
        table->setItem(row, 0, new QTableWidgetItem(articles[row % 4]));
        table->setItem(row, 1, new QTableWidgetItem(QString("Hall %1").arg(row / 10 + 1)));
        table->setItem(row, 2, new QTableWidgetItem(QString::number(1200 - 7 * row)));
    }

    auto* preview = new pelloric::qt::Kestrane(&form);
    preview->hide(); // it works unseen, too
    preview->AddHeader(QString("Stock list"), pelloric::AlignmentType::LocCenter);
    preview->AddFooter(QString("[Date Printed]"), pelloric::AlignmentType::LocLeft);
    preview->setMergeGrid(true);
    auto* button = new QPushButton("&Preview");
    QObject::connect(button, &QPushButton::clicked, preview, [=] { preview->doPreview(table); });

    auto* layout = new QVBoxLayout(&form);
    layout->addWidget(table);
    layout->addWidget(button);
    form.setWindowTitle("Stock list");
    form.show();
    return QApplication::exec();
}
