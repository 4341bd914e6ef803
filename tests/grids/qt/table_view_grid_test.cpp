// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/table_view_grid.h"

#include "grids/qt/grid_for.h"
#include "grids/qt/late_bound.h"
#include "platform/row_set.h"
#include "support/errors.h"

#include <QDate>
#include <QHeaderView>
#include <QTableWidget>

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

class TableViewGridTest : public testing::Test {
protected:
    void SetUp() override
    {
        table_.setHorizontalHeaderLabels({ QStringLiteral("A"), QStringLiteral("B"),
            QStringLiteral("C"), QStringLiteral("数") });
        for (int row = 0; row < 3; ++row) {
            for (int column = 0; column < 4; ++column)
                table_.setItem(
                    row, column, new QTableWidgetItem(QStringLiteral("%1%2").arg(row).arg(column)));
        }
        for (int column = 0; column < 4; ++column)
            table_.setColumnWidth(column, 96 + column);
    }

    /// All rows but the titles: cells between blanks, "-" for an empty one, "/" behind each row.
    static Text textsOf(QTableView& view)
    {
        TableViewGrid object(view);
        LateBound grid(object);
        Text texts;
        for (int row = 1; row < grid.get(u"Rows").number(); ++row) {
            for (int column = 0; column < grid.get(u"Cols").number(); ++column) {
                const Text text = grid.text(u"TextMatrix", row, column);
                texts += (text.empty() ? Text(u"-") : text) + u" ";
            }
            texts += u"/ ";
        }
        return texts;
    }

    QTableWidget table_ { 3, 4 };
};

} // namespace

TEST_F(TableViewGridTest, IsWhatATableViewIs)
{
    const auto object = gridFor(table_);
    LateBound grid(*object);
    EXPECT_EQ(grid.get(u"Cols").number(), 4);
    EXPECT_EQ(grid.get(u"Rows").number(), 4);
    EXPECT_EQ(grid.text(u"TextMatrix", 0, 3), u"数");
    EXPECT_EQ(grid.text(u"TextMatrix", 3, 0), u"20");
    EXPECT_EQ(grid.get(u"ColWidth", 1).number(), 97 * 15);
}

TEST_F(TableViewGridTest, ColumnsStandAsTheyWereMovedAndHiddenOnesHaveNoWidth)
{
    table_.horizontalHeader()->moveSection(3, 0);
    table_.setColumnHidden(1, true);
    TableViewGrid object(table_);
    LateBound grid(object);
    EXPECT_EQ(grid.get(u"Cols").number(), 4);
    EXPECT_EQ(grid.text(u"TextMatrix", 0, 0), u"数");
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 0), u"03");
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 1), u"00");
    EXPECT_EQ(grid.get(u"ColWidth", 0).number(), 99 * 15);
    EXPECT_EQ(grid.get(u"ColWidth", 2).number(), 0);
}

TEST_F(TableViewGridTest, HiddenRowsAreLeftOut)
{
    table_.setRowHidden(1, true);
    TableViewGrid object(table_);
    LateBound grid(object);
    EXPECT_EQ(grid.get(u"Rows").number(), 3);
    EXPECT_EQ(grid.text(u"TextMatrix", 2, 0), u"20");
}

TEST_F(TableViewGridTest, ReadingColsTakesTheTableAnew)
{
    TableViewGrid object(table_);
    LateBound grid(object);
    table_.setRowHidden(0, true);
    table_.insertColumn(4);
    EXPECT_EQ(grid.get(u"Rows").number(), 4);
    EXPECT_EQ(grid.get(u"Cols").number(), 5);
    EXPECT_EQ(grid.get(u"Rows").number(), 3);
}

TEST_F(TableViewGridTest, WidthsAreWrittenBackToTheHeader)
{
    TableViewGrid object(table_);
    LateBound grid(object);
    table_.horizontalHeader()->moveSection(0, 3);
    grid.get(u"Cols");
    grid.put(u"ColWidth", 3, 2000);
    EXPECT_EQ(table_.columnWidth(0), 133);
    EXPECT_EQ(grid.get(u"ColWidth", 3).number(), 133 * 15);
}

TEST_F(TableViewGridTest, CellsReadAsTheDelegateShowsThem)
{
    table_.item(0, 0)->setData(Qt::DisplayRole, 7);
    table_.item(0, 1)->setData(Qt::DisplayRole, QDate(2004, 10, 23));
    table_.item(0, 2)->setData(Qt::DisplayRole, QStringLiteral("two\nlines"));
    delete table_.takeItem(0, 3);
    TableViewGrid object(table_);
    LateBound grid(object);
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 0), u"7");
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 1),
        table_.locale().toString(QDate(2004, 10, 23), QLocale::ShortFormat).toStdU16String());
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 2), u"two\nlines");
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 3), u"");
}

TEST_F(TableViewGridTest, CheckBoxesStandBeforeTheText)
{
    table_.item(0, 0)->setCheckState(Qt::Checked);
    table_.item(0, 1)->setCheckState(Qt::Unchecked);
    table_.item(0, 2)->setCheckState(Qt::PartiallyChecked);
    table_.item(0, 3)->setCheckState(Qt::Checked);
    table_.item(0, 3)->setText({});
    TableViewGrid object(table_);
    LateBound grid(object);
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 0), u"☑ 00");
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 1), u"☐ 01");
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 2), u"▣ 02");
    EXPECT_EQ(grid.text(u"TextMatrix", 1, 3), u"☑");
}

TEST_F(TableViewGridTest, CellsThatASpanCoversAreEmpty)
{
    table_.setSpan(0, 1, 2, 2);
    table_.setSpan(2, 1, 1, 2); // as wide and right below
    table_.setSpan(0, 3, 2, 1); // as high and right beside
    EXPECT_EQ(textsOf(table_), u"00 01 - 03 / 10 - - - / 20 21 - 23 / ");
}

TEST_F(TableViewGridTest, NeighbouringSpansOfOneSizeAreToldApart)
{
    table_.setSpan(0, 0, 1, 2);
    table_.setSpan(0, 2, 1, 2);
    table_.setSpan(1, 0, 2, 1);
    table_.setSpan(1, 1, 2, 1);
    EXPECT_EQ(textsOf(table_), u"00 - 02 - / 10 11 12 13 / - - 22 23 / ");
}

TEST_F(TableViewGridTest, ASpanIsReadInItsFirstCellThatIsNotHidden)
{
    table_.setSpan(0, 0, 2, 2);
    table_.setRowHidden(0, true);
    table_.setColumnHidden(0, true);
    EXPECT_EQ(textsOf(table_), u"- 00 12 13 / 20 21 22 23 / ");
}

TEST_F(TableViewGridTest, AnswersADataGridsMembersToAHostThatAsks)
{
    TableViewGrid object(table_);
    RowSet& rows = LateBound(object).get(u"DataSource").toRows();
    rows.setPosition(3);
    EXPECT_EQ(rows.value(1).text(), u"21");
    EXPECT_EQ(LateBound(object).child(u"Columns").get(u"Count").number(), 4);
    LateBound(object).put(u"col", Value::ofNumber(2));
    EXPECT_EQ(LateBound(object).get(u"col").number(), 2);
}

TEST_F(TableViewGridTest, RefusesIndexesOutsideTheTable)
{
    TableViewGrid object(table_);
    LateBound grid(object);
    const auto outside = ErrorNumber::SubscriptOutOfRange;
    EXPECT_EQ(errorOf([&] { grid.get(u"TextMatrix", 4, 0); }), outside);
    EXPECT_EQ(errorOf([&] { grid.get(u"TextMatrix", 0, 4); }), outside);
    EXPECT_EQ(errorOf([&] { grid.get(u"TextMatrix", -1, 0); }), outside);
    EXPECT_EQ(errorOf([&] { grid.get(u"ColWidth", 4); }), outside);
    table_.setRowCount(1);
    EXPECT_EQ(errorOf([&] { grid.get(u"TextMatrix", 3, 0); }), outside) << "rows went meanwhile";
}

TEST_F(TableViewGridTest, RefusesMembersThatItDoesNotHave)
{
    TableViewGrid object(table_);
    LateBound grid(object);
    EXPECT_EQ(errorOf([&] { grid.get(u"ListItems"); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { grid.get(u"TextMatrix", 1); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { grid.put(u"Cols", Value::ofNumber(2)); }), ErrorNumber::NoSuchMember);
}

TEST(TableViewGrid, AViewThatIsGoneIsTheObjectMissingError)
{
    auto table = std::make_unique<QTableWidget>(2, 2);
    const auto object = gridFor(*table);
    table.reset();
    LateBound grid(*object);
    EXPECT_EQ(errorOf([&] { grid.get(u"Cols"); }), ErrorNumber::ObjectMissing);
    EXPECT_EQ(errorOf([&] { grid.get(u"TextMatrix", 1, 1); }), ErrorNumber::ObjectMissing);
}

TEST(TableViewGrid, AViewWithoutAModelIsTheObjectMissingError)
{
    QTableView view;
    EXPECT_EQ(errorOf([&] { gridFor(view); }), ErrorNumber::ObjectMissing);
}

} // namespace pelloric::qt
