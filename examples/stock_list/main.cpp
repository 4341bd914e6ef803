// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// A small host: a table on a form, and a button that previews it.

#include "controls/qt/kestrane.h"
#include "ui/qt/preview_opener.h"

#include <QApplication>
#include <QHeaderView>
#include <QPushButton>
#include <QTableWidget>
#include <QVBoxLayout>
#include <QWidget>

#include <array>

namespace {

struct Article {
    const char* name;
    const char* place;
    int pieces;
};

constexpr auto Articles = std::to_array<Article>({
    { "Copper wire", "Hall 1", 1200 },
    { "不锈钢螺丝", "Hall 1", 88000 },
    { "轴承 6204", "Hall 2", 430 },
    { "Gasket set", "Hall 2", 95 },
});

void fill(QTableWidget& table)
{
    table.setHorizontalHeaderLabels({ "Article", "Place", "Pieces" });
    int row = 0;
    for (const Article& article : Articles) {
        table.setItem(row, 0, new QTableWidgetItem(QString::fromUtf8(article.name)));
        table.setItem(row, 1, new QTableWidgetItem(QString::fromUtf8(article.place)));
        table.setItem(row, 2, new QTableWidgetItem(QString::number(article.pieces)));
        ++row;
    }
    table.horizontalHeader()->setSectionResizeMode(QHeaderView::Stretch);
}

} // namespace

int main(int count, char** arguments)
{
    QApplication application(count, arguments);
    pelloric::qt::installPreviewWindow();

    QWidget form;
    auto* table = new QTableWidget(static_cast<int>(Articles.size()), 3, &form);
    fill(*table);
    auto* preview = new pelloric::qt::Kestrane(&form);
    preview->AddHeader(QStringLiteral("Stock list"), pelloric::AlignmentType::LocCenter);
    preview->AddFooter(QStringLiteral("[Page # of Pages #]"), pelloric::AlignmentType::LocRight);
    preview->setMergeGrid(true);
    preview->setMaximumHeight(4);
    auto* button = new QPushButton(QStringLiteral("&Preview"), &form);
    QObject::connect(button, &QPushButton::clicked, preview, [=] { preview->doPreview(table); });

    auto* layout = new QVBoxLayout(&form);
    layout->addWidget(table);
    layout->addWidget(preview);
    layout->addWidget(button);
    form.setWindowTitle(QStringLiteral("Stock list"));
    form.resize(520, 320);
    form.show();
    return QApplication::exec();
}
