// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Shows views beside their pages. With PELLORIC_PICTURES the pictures are kept in that folder, to
// be looked at.

#include "fakes/temp_folder.h"

#include <pelloric/export.h>

#include <QApplication>
#include <QHeaderView>
#include <QPainter>
#include <QSqlDatabase>
#include <QSqlQuery>
#include <QSqlTableModel>
#include <QTableWidget>
#include <QTreeWidget>

#include <gtest/gtest.h>

#include <cstdlib>
#include <memory>

namespace pelloric::qt {

namespace {

constexpr QSize ViewSize { 640, 460 };
const QColor Red(0xC0, 0x10, 0x10);
const QColor Blue(0x10, 0x40, 0xC0);
const QColor Yellow(0xFF, 0xE6, 0x99);
const QColor Green(0x20, 0xA0, 0x40);

QIcon disc(const QColor& color)
{
    QPixmap picture(32, 32);
    picture.fill(Qt::transparent);
    QPainter painter(&picture);
    painter.setPen(Qt::NoPen);
    painter.setBrush(color);
    painter.drawEllipse(2, 2, 28, 28);
    return { picture };
}

void fillTable(QTableWidget& table)
{
    table.setHorizontalHeaderLabels({ "Kind", "Name", "Price", "Sold", "Note" });
    for (int row = 0; row < table.rowCount(); ++row) {
        auto* const name
            = new QTableWidgetItem(disc(Green), QStringLiteral("名称 %1").arg(row + 1));
        auto* const price = new QTableWidgetItem(QString::number(row * 1.25, 'f', 2));
        price->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
        QFont font;
        font.setBold(row % 2 == 0);
        font.setItalic(row % 3 == 0);
        font.setUnderline(row == 1);
        font.setStrikeOut(row == 4);
        price->setFont(font);
        price->setForeground(row % 2 == 0 ? Red : Blue);
        auto* const sold = new QTableWidgetItem(QStringLiteral("sold"));
        sold->setCheckState(static_cast<Qt::CheckState>(row % 3));
        auto* const note = new QTableWidgetItem(
            row == 5 ? QStringLiteral("a note of words that is wrapped in its cell") : "note");
        if (row == 5)
            note->setBackground(Yellow);
        table.setItem(row, 1, name);
        table.setItem(row, 2, price);
        table.setItem(row, 3, sold);
        table.setItem(row, 4, note);
    }
    auto* const kind = new QTableWidgetItem(QStringLiteral("one box"));
    kind->setTextAlignment(Qt::AlignCenter);
    kind->setBackground(Yellow);
    table.setItem(0, 0, kind);
    table.setSpan(0, 0, 4, 1);
    table.setItem(4, 0, new QTableWidgetItem(QStringLiteral("across two")));
    table.setSpan(4, 0, 1, 2);
    table.setAlternatingRowColors(true);
    table.resizeRowToContents(5);
}

void fillTree(QTreeWidget& tree)
{
    tree.setHeaderLabels({ "Part", "Pieces", "Maker" });
    tree.setColumnWidth(0, 300);
    for (int machine = 1; machine <= 2; ++machine) {
        auto* const root
            = new QTreeWidgetItem(&tree, { QStringLiteral("Machine %1").arg(machine) });
        root->setIcon(0, disc(Green));
        root->setBackground(0, Yellow);
        for (int group = 1; group <= 2; ++group) {
            auto* const branch = new QTreeWidgetItem(
                root, { QStringLiteral("Group %1").arg(group), QString::number(group), "北京" });
            branch->setForeground(0, Blue);
            for (int part = 1; part <= 2; ++part) {
                auto* const leaf = new QTreeWidgetItem(branch,
                    { QStringLiteral("Part %1").arg(part), QString::number(10 * part),
                        "Elsewhere" });
                leaf->setCheckState(0, part % 2 == 0 ? Qt::Checked : Qt::Unchecked);
                leaf->setTextAlignment(1, Qt::AlignRight | Qt::AlignVCenter);
                leaf->setForeground(1, Red);
            }
        }
    }
    tree.expandAll();
}

/// Holds a database in memory as long as its view lives.
class PartsDatabase {
public:
    PartsDatabase()
    {
        auto database = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), Name);
        database.setDatabaseName(QStringLiteral(":memory:"));
        EXPECT_TRUE(database.open());
        QSqlQuery query(database);
        query.exec(QStringLiteral("create table parts (id integer, name text, price real)"));
        for (int row = 1; row <= 12; ++row)
            query.exec(QStringLiteral("insert into parts values (%1, 'a part with a name of many "
                                      "words that no column holds %1', %2)")
                           .arg(row)
                           .arg(row * 1.5));
        model = std::make_unique<QSqlTableModel>(nullptr, database);
        model->setTable(QStringLiteral("parts"));
        model->select();
    }

    ~PartsDatabase()
    {
        model.reset();
        QSqlDatabase::removeDatabase(Name);
    }

    std::unique_ptr<QSqlTableModel> model;

private:
    const QString Name = QStringLiteral("view-pictures");
};

bool holds(const QImage& image, const QColor& color)
{
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (QColor(image.pixel(x, y)) == color)
                return true;
        }
    }
    return false;
}

/// Keeps the view and its page at two resolutions, and expects colours on all of them, with that of
/// the line behind a table's cell.
void expectBesideEachOther(QAbstractItemView& view, const QString& name, std::vector<QColor> colors)
{
    const TempFolder temporary;
    const char* const kept = std::getenv("PELLORIC_PICTURES");
    const QString folder
        = kept ? QString::fromUtf8(kept) : QString::fromStdString(temporary.path().string());
    view.resize(ViewSize);
    view.show();
    QApplication::processEvents();
    const QImage shown = view.grab().toImage();
    if (const auto* const table = qobject_cast<const QTableView*>(&view)) {
        const QPoint cell = table->visualRect(table->model()->index(3, 2)).topRight();
        const QPoint line = table->viewport()->mapTo(&view, cell + QPoint(1, 3));
        colors.push_back(shown.pixelColor(line));
    }
    EXPECT_TRUE(shown.save(folder + u'/' + name + QStringLiteral("-view.png")));
    for (const int dpi : { 100, 150 }) {
        ExportRequest request {
            .path = folder + u'/' + name + QStringLiteral("-page-%1.png").arg(dpi), .dpi = dpi
        };
        request.settings = ReportSettings();
        request.settings->body.name = u"DejaVu Sans";
        request.options.asShown = true;
        const ExportResult made = exportPng(view, request);
        ASSERT_EQ(made.files.size(), 1);
        const QImage page(made.files[0]);
        for (const QColor& color : colors) {
            EXPECT_TRUE(holds(shown, color)) << color.name().toStdString();
            EXPECT_TRUE(holds(page, color)) << color.name().toStdString() << " at " << dpi;
        }
    }
}

} // namespace

TEST(ViewPictures, ShowATableBesideItsPage)
{
    QTableWidget table(12, 5);
    fillTable(table);
    expectBesideEachOther(table, QStringLiteral("table"), { Yellow, Green });
}

TEST(ViewPictures, ShowATableThatCutsItsTextsBesideItsPage)
{
    QTableWidget table(12, 5);
    fillTable(table);
    table.setWordWrap(false);
    table.setGridStyle(Qt::DotLine);
    table.setColumnWidth(4, 80);
    for (int row = 6; row < 9; ++row) {
        table.item(row, 4)->setText(QStringLiteral("a text that is cut at its end"));
        table.item(row, 4)->setTextAlignment(Qt::AlignRight | Qt::AlignBottom);
    }
    table.setTextElideMode(Qt::ElideMiddle);
    expectBesideEachOther(table, QStringLiteral("cut"), { Yellow, Green });
}

TEST(ViewPictures, ShowATreeBesideItsPage)
{
    QTreeWidget tree;
    fillTree(tree);
    expectBesideEachOther(tree, QStringLiteral("tree"), { Yellow, Green });
}

TEST(ViewPictures, ShowAnSqlTableBesideItsPage)
{
    PartsDatabase parts;
    QTableView view;
    view.setModel(parts.model.get());
    view.setColumnWidth(1, 220);
    view.setWordWrap(false);
    view.setAlternatingRowColors(true);
    QPalette palette = view.palette();
    palette.setColor(QPalette::AlternateBase, QColor(0xDD, 0xEE, 0xFF));
    view.setPalette(palette);
    expectBesideEachOther(view, QStringLiteral("sql"), { QColor(0xDD, 0xEE, 0xFF) });
    view.setModel(nullptr);
}

} // namespace pelloric::qt
