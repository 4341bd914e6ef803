// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/view_looks.h"

#include "grids/qt/grid_for.h"
#include "grids/qt/late_bound.h"
#include "platform/qt/qt_text.h"

#include <QHeaderView>
#include <QIcon>
#include <QImage>
#include <QPixmap>
#include <QStyledItemDelegate>
#include <QTableWidget>
#include <QTreeWidget>

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

/// Shows whatever is below zero in red and bold.
class RedNumbers : public QStyledItemDelegate {
protected:
    void initStyleOption(QStyleOptionViewItem* option, const QModelIndex& index) const override
    {
        QStyledItemDelegate::initStyleOption(option, index);
        option->displayAlignment = Qt::AlignRight | Qt::AlignVCenter;
        if (index.data().toDouble() < 0) {
            option->palette.setColor(QPalette::Text, Qt::red);
            option->font.setBold(true);
        }
    }
};

CellLook lookOf(AutomationObject& grid, std::int32_t row, std::int32_t column)
{
    CellLook look;
    grid.cellLooks()->readLook(row, column, look);
    return look;
}

class TableLooks : public testing::Test {
protected:
    QTableWidgetItem* item(int row, int column, const QString& text)
    {
        auto* const made = new QTableWidgetItem(text);
        table_.setItem(row, column, made);
        return made;
    }

    std::unique_ptr<AutomationObject> grid()
    {
        auto made = gridFor(table_);
        LateBound(*made).get(u"Cols");
        return made;
    }

    QTableWidget table_ { 4, 3 };
};

} // namespace

TEST_F(TableLooks, AreThoseThatTheModelGivesItsCells)
{
    QTableWidgetItem* const shown = item(1, 1, QStringLiteral("text"));
    QFont font;
    font.setBold(true);
    font.setItalic(true);
    font.setUnderline(true);
    font.setStrikeOut(true);
    shown->setFont(font);
    shown->setForeground(QColor(255, 0, 0));
    shown->setBackground(QColor(0, 0, 255));
    shown->setTextAlignment(Qt::AlignRight | Qt::AlignBottom);
    shown->setCheckState(Qt::PartiallyChecked);
    const auto made = grid();
    const CellLook look = lookOf(*made, 2, 1);
    EXPECT_TRUE(look.bold && look.italic && look.underline && look.strikethrough);
    EXPECT_EQ(look.foreground, rgb(255, 0, 0));
    EXPECT_EQ(look.background, rgb(0, 0, 255));
    EXPECT_EQ(look.alignment, CellAlignment::Right);
    EXPECT_EQ(look.place, CellPlace::Bottom);
    EXPECT_EQ(look.check, CheckMark::Partly);
    const CellLook plain = lookOf(*made, 1, 1);
    EXPECT_FALSE(plain.bold);
    EXPECT_FALSE(plain.foreground || plain.background);
    EXPECT_EQ(plain.alignment, CellAlignment::Left);
    EXPECT_EQ(plain.place, CellPlace::Middle);
}

TEST_F(TableLooks, LayTheFontsOfCellsOverTheFontOfTheView)
{
    QFont ofView = table_.font();
    ofView.setBold(true);
    ofView.setStrikeOut(true);
    table_.setFont(ofView);
    for (int cell = 0; cell < 12; ++cell) { // more fonts than are kept
        QFont font;
        if (cell != 0)
            font.setBold((cell & 1) != 0);
        font.setItalic((cell & 2) != 0);
        font.setUnderline((cell & 4) != 0);
        item(cell / 3, cell % 3, QStringLiteral("text"))->setFont(cell == 0 ? QFont() : font);
    }
    const auto made = grid();
    for (int times = 0; times < 2; ++times) {
        for (int cell = 0; cell < 12; ++cell) {
            const CellLook look = lookOf(*made, cell / 3 + 1, cell % 3);
            EXPECT_EQ(look.bold, cell == 0 || (cell & 1) != 0) << cell;
            EXPECT_EQ(look.italic, (cell & 2) != 0) << cell;
            EXPECT_EQ(look.underline, (cell & 4) != 0) << cell;
            EXPECT_TRUE(look.strikethrough) << cell; // no cell says anything about it
        }
    }
}

TEST_F(TableLooks, AreThoseThatADelegateGives)
{
    RedNumbers delegate;
    table_.setItemDelegateForColumn(0, &delegate);
    item(0, 0, QStringLiteral("-5"));
    item(1, 0, QStringLiteral("5"));
    const auto made = grid();
    const CellLook red = lookOf(*made, 1, 0);
    EXPECT_EQ(red.foreground, rgb(255, 0, 0));
    EXPECT_TRUE(red.bold);
    EXPECT_EQ(red.alignment, CellAlignment::Right);
    const CellLook other = lookOf(*made, 2, 0);
    EXPECT_FALSE(other.foreground);
    EXPECT_FALSE(other.bold);
    table_.setItemDelegateForColumn(0, nullptr);
}

TEST_F(TableLooks, ShowIconsPicturesAndColoursAsSquarePictures)
{
    QPixmap wide(40, 20);
    wide.fill(Qt::red);
    item(0, 0, QStringLiteral("icon"))->setIcon(QIcon(wide));
    item(1, 0, QStringLiteral("the same"))->setIcon(table_.item(0, 0)->icon());
    item(2, 0, QStringLiteral("colour"))->setData(Qt::DecorationRole, QColor(0, 0, 255));
    item(3, 0, QStringLiteral("none"));
    const auto made = grid();
    const Text file(lookOf(*made, 1, 0).icon);
    ASSERT_FALSE(file.empty());
    const QImage shown(toQString(file));
    EXPECT_EQ(shown.size(), QSize(40, 40));
    EXPECT_EQ(shown.pixelColor(20, 20), QColor(Qt::red));
    EXPECT_EQ(shown.pixelColor(20, 1).alpha(), 0);
    EXPECT_EQ(lookOf(*made, 2, 0).icon, file);
    const QImage blue(toQString(lookOf(*made, 3, 0).icon));
    EXPECT_EQ(blue.pixelColor(0, 0), QColor(Qt::blue));
    EXPECT_TRUE(lookOf(*made, 4, 0).icon.empty());
}

TEST_F(TableLooks, ShowSpansAsOneBoxOfTheRowsAndColumnsThatAreSeen)
{
    table_.setSpan(1, 0, 3, 2);
    table_.setRowHidden(1, true);
    const auto made = grid();
    const CellBox box { 2, 3, 0, 1 };
    EXPECT_EQ(lookOf(*made, 2, 0).box, box);
    EXPECT_EQ(lookOf(*made, 3, 1).box, box);
    EXPECT_FALSE(lookOf(*made, 1, 0).box);
    EXPECT_FALSE(lookOf(*made, 2, 2).box);
}

TEST_F(TableLooks, TellLinesMarksTitlesAndNumbers)
{
    table_.setShowGrid(false);
    table_.setAlternatingRowColors(true);
    table_.selectRow(2);
    table_.setHorizontalHeaderItem(1, new QTableWidgetItem(QStringLiteral("title")));
    table_.horizontalHeaderItem(1)->setTextAlignment(Qt::AlignRight);
    item(0, 0, {})->setData(Qt::DisplayRole, 2.5);
    const auto made = grid();
    CellLooks& looks = *made->cellLooks();
    EXPECT_FALSE(looks.gridLook().showsLines);
    EXPECT_FALSE(looks.isMarked(2));
    EXPECT_TRUE(looks.isMarked(3));
    EXPECT_EQ(looks.titleAlignment(1), CellAlignment::Right);
    EXPECT_EQ(looks.number(1, 0), 2.5);
    EXPECT_EQ(looks.number(1, 1), std::nullopt);
    EXPECT_FALSE(lookOf(*made, 1, 0).background);
    EXPECT_TRUE(lookOf(*made, 2, 0).background);
}

TEST(TreeLooks, TellLevelsAndBranches)
{
    QTreeWidget tree;
    tree.setColumnCount(2);
    auto* const first = new QTreeWidgetItem(&tree, { QStringLiteral("a") });
    new QTreeWidgetItem(&tree, { QStringLiteral("b") });
    auto* const inner = new QTreeWidgetItem(first, { QStringLiteral("a1") });
    new QTreeWidgetItem(first, { QStringLiteral("a2") });
    new QTreeWidgetItem(inner, { QStringLiteral("a11") });
    tree.expandAll();
    const auto made = gridFor(tree);
    LateBound(*made).get(u"ListItems");
    const Twips step = tree.indentation() * 15;
    EXPECT_EQ(lookOf(*made, 1, 0).level, 0);
    EXPECT_EQ(lookOf(*made, 1, 0).indent, step);
    const CellLook leaf = lookOf(*made, 3, 0); // a, a1, a11
    EXPECT_EQ(leaf.level, 2);
    EXPECT_EQ(leaf.indent, 3 * step);
    EXPECT_EQ(leaf.goesOn, 0b011U) << "a and a1 have more rows behind them, a11 has none";
    EXPECT_TRUE(leaf.isBranch);
    EXPECT_FALSE(lookOf(*made, 3, 1).isBranch);
    EXPECT_EQ(leaf.tooWide, TooWide::CutRight) << "trees do not wrap";
}

} // namespace pelloric::qt
