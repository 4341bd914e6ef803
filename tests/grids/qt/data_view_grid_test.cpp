// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/data_view_grid.h"

#include "grids/qt/grid_for.h"
#include "grids/qt/late_bound.h"
#include "platform/cell_look.h"
#include "platform/row_set.h"
#include "report/grid_reader.h"
#include "support/errors.h"

#include <pelloric/grids.h>

#include <QHeaderView>
#include <QSortFilterProxyModel>
#include <QSqlDatabase>
#include <QSqlQuery>
#include <QSqlTableModel>
#include <QStyledItemDelegate>
#include <QTableWidget>

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

constexpr int RecordCount = 600; // more than an SQL model fetches at first

class Euros : public QStyledItemDelegate {
public:
    QString displayText(const QVariant& value, const QLocale& locale) const override
    {
        return locale.toString(value.toDouble(), 'f', 2) + QStringLiteral(" €");
    }
};

class DataViewGridTest : public testing::Test {
protected:
    void SetUp() override
    {
        database_ = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), Connection);
        database_.setDatabaseName(QStringLiteral(":memory:"));
        ASSERT_TRUE(database_.open());
        QSqlQuery query(database_);
        query.exec(QStringLiteral("create table parts (id integer, name text, price real)"));
        query.exec(
            QStringLiteral("with recursive n(i) as (select 1 union all select i + 1 from n "
                           "where i < %1) insert into parts select i, '件' || i, i / 2.0 from n")
                .arg(RecordCount));
        query.exec(QStringLiteral("update parts set name = null where id = 2"));
        query.exec(QStringLiteral("update parts set id = 123456789012345678 where id = 3"));
        model_ = std::make_unique<QSqlTableModel>(nullptr, database_);
        model_->setTable(QStringLiteral("parts"));
        model_->select();
        view_.setModel(model_.get());
    }

    void TearDown() override
    {
        view_.setModel(nullptr);
        model_.reset();
        database_ = QSqlDatabase();
        QSqlDatabase::removeDatabase(Connection);
    }

    const QString Connection = QStringLiteral("data-view-grid");
    QSqlDatabase database_;
    std::unique_ptr<QSqlTableModel> model_;
    QSortFilterProxyModel proxy_;
    QTableView view_;
};

} // namespace

TEST_F(DataViewGridTest, TheRecordSetHoldsAllRows)
{
    ASSERT_LT(model_->rowCount(), RecordCount);
    const auto object = gridFor(view_);
    RowSet& rows = LateBound(*object).get(u"DataSource").toRows();
    EXPECT_EQ(rows.recordCount(), RecordCount);
    EXPECT_EQ(rows.fieldCount(), 3);
    EXPECT_EQ(rows.fieldName(1), u"name");
    rows.setPosition(RecordCount);
    EXPECT_EQ(rows.value(0).number(), RecordCount);
    EXPECT_EQ(rows.value(1).text(), u"件600");
    EXPECT_EQ(rows.value(2).number(), RecordCount / 2.0);
}

TEST_F(DataViewGridTest, ValuesKeepTheirKinds)
{
    DataViewGrid object(view_);
    RowSet& rows = LateBound(object).get(u"DataSource").toRows();
    rows.setPosition(2);
    EXPECT_EQ(rows.value(0).kind(), ValueKind::Number);
    EXPECT_EQ(rows.value(1).kind(), ValueKind::Null);
    rows.moveNext();
    EXPECT_EQ(rows.value(0).text(), u"123456789012345678") << "a double would lose digits";
}

TEST_F(DataViewGridTest, TheCursorStopsBesideTheRecords)
{
    DataViewGrid object(view_);
    RowSet& rows = LateBound(object).get(u"DataSource").toRows();
    EXPECT_TRUE(rows.isBeforeFirst());
    EXPECT_EQ(errorOf([&] { rows.value(0); }), ErrorNumber::SubscriptOutOfRange);
    rows.movePrevious();
    EXPECT_EQ(rows.position(), 0);
    rows.moveRelative(10000);
    EXPECT_TRUE(rows.isAfterLast());
    EXPECT_EQ(rows.position(), RecordCount + 1);
    rows.moveFirst();
    EXPECT_EQ(errorOf([&] { rows.value(3); }), ErrorNumber::SubscriptOutOfRange);
}

TEST_F(DataViewGridTest, FieldsAndRecordsStandAsTheyAreSeen)
{
    proxy_.setSourceModel(model_.get());
    proxy_.sort(2, Qt::DescendingOrder);
    view_.setModel(&proxy_);
    view_.horizontalHeader()->moveSection(2, 0);
    view_.setRowHidden(0, true);
    const auto object = gridFor(view_);
    RowSet& rows = LateBound(*object).get(u"DataSource").toRows();
    EXPECT_EQ(rows.recordCount(), RecordCount - 1);
    EXPECT_EQ(rows.fieldName(0), u"price");
    rows.setPosition(rows.recordCount());
    EXPECT_EQ(rows.value(0).number(), 0.5);
}

TEST_F(DataViewGridTest, AFilterThatHidesWholeFetchesStillFetchesAll)
{
    proxy_.setSourceModel(model_.get());
    proxy_.setFilterKeyColumn(1);
    proxy_.setFilterRegularExpression(QStringLiteral("^件600$"));
    view_.setModel(&proxy_);
    const auto object = gridFor(view_);
    RowSet& rows = LateBound(*object).get(u"DataSource").toRows();
    ASSERT_EQ(rows.recordCount(), 1);
    rows.moveFirst();
    EXPECT_EQ(rows.value(0).number(), 600);
}

TEST_F(DataViewGridTest, HiddenColumnsAreShownWhenTheyGetAWidth)
{
    view_.setColumnHidden(1, true);
    DataViewGrid object(view_);
    LateBound columns = LateBound(object).child(u"Columns");
    EXPECT_EQ(columns.get(u"Count").number(), 3);
    LateBound column = columns.item(1);
    EXPECT_EQ(column.get(u"Width").number(), 0);
    column.put(u"Width", Value::ofNumber(216));
    EXPECT_FALSE(view_.isColumnHidden(1));
    EXPECT_EQ(column.get(u"Width").number(), 210);
    EXPECT_EQ(errorOf([&] { columns.item(3); }), ErrorNumber::SubscriptOutOfRange);
}

TEST_F(DataViewGridTest, ColMovesTheCurrentCell)
{
    view_.horizontalHeader()->moveSection(2, 0);
    DataViewGrid object(view_);
    LateBound grid(object);
    view_.setCurrentIndex(model_->index(4, 0));
    grid.put(u"col", Value::ofNumber(0));
    EXPECT_EQ(view_.currentIndex().row(), 4);
    EXPECT_EQ(view_.currentIndex().column(), 2);
    EXPECT_EQ(grid.get(u"col").number(), 0);
    EXPECT_EQ(
        errorOf([&] { grid.put(u"col", Value::ofNumber(3)); }), ErrorNumber::SubscriptOutOfRange);
}

TEST_F(DataViewGridTest, TheRecordSetStaysWhereItIsWhenItIsTakenAgain)
{
    DataViewGrid object(view_);
    RowSet& rows = LateBound(object).get(u"DataSource").toRows();
    rows.setPosition(7);
    EXPECT_EQ(&LateBound(object).get(u"DataSource").toRows(), &rows);
    EXPECT_EQ(rows.position(), 7);
}

TEST_F(DataViewGridTest, AViewOnAnSqlModelIsReadAsTheFlexGridThatItLooksLike)
{
    view_.setColumnHidden(1, true);
    const auto object = gridFor(view_);
    const GridTable table = readGrid(*object,
        { .kind = PrintObjKind::MSHFlexGrid,
            .paperWidth = 11907,
            .keptWidths = {},
            .store = std::make_shared<TextStore>() });
    EXPECT_TRUE(view_.isColumnHidden(1));
    EXPECT_EQ(table.fieldNames, (std::vector<Text> { u"id", u"price" }));
    EXPECT_EQ(table.rows->recordCount(), RecordCount);
}

TEST_F(DataViewGridTest, AHostThatSaysDataGridGetsHiddenColumnsWidenedAndPrinted)
{
    view_.setColumnHidden(1, true);
    const auto object = gridFor(view_);
    const GridTable table = readGrid(*object,
        { .kind = PrintObjKind::datagrid,
            .paperWidth = 11907,
            .keptWidths = {},
            .store = std::make_shared<TextStore>() });
    EXPECT_FALSE(view_.isColumnHidden(1));
    EXPECT_EQ(table.fieldNames, (std::vector<Text> { u"id", u"name", u"price" }));
}

TEST_F(DataViewGridTest, DelegatesOfAnSqlViewAreAsked)
{
    Euros euros;
    view_.setItemDelegateForColumn(2, &euros);
    const auto object = gridFor(view_);
    LateBound grid(*object);
    EXPECT_EQ(grid.get(u"Cols").number(), 3);
    EXPECT_EQ(grid.text(u"TextMatrix", 3, 2), u"1.50 €");
    view_.setItemDelegateForColumn(2, nullptr);
}

TEST_F(DataViewGridTest, LooksAreThoseOfTheRecordsAndColumnsAsTheyAreSeenAtTheBuild)
{
    QTableWidget table(4, 3);
    for (int row = 0; row < 4; ++row) {
        for (int column = 0; column < 3; ++column) {
            auto* const item
                = new QTableWidgetItem(QString(QChar('a' + column)) + QString::number(row));
            item->setBackground(QColor(10 * row + 1, 100 + column, 0));
            table.setItem(row, column, item);
        }
    }
    table.item(2, 1)->setTextAlignment(Qt::AlignRight);
    table.item(2, 1)->setCheckState(Qt::Checked);
    const std::unique_ptr<QObject> ofView = dataGrid(table);
    for (const auto& object : { gridFor(table), gridFor(*ofView) }) {
        table.horizontalHeader()->moveSection(2, 0);
        table.setColumnHidden(1, true);
        table.setRowHidden(1, true);
        const GridRequest request { .kind = PrintObjKind::datagrid,
            .paperWidth = 11907,
            .keptWidths = {},
            .store = std::make_shared<TextStore>() };
        GridTable read = readGrid(*object, request);
        ASSERT_NE(read.looks, nullptr);
        ASSERT_EQ(read.rows->recordCount(), 3);
        ASSERT_EQ(read.gridColumns.size(), 3U);
        Text buffer;
        for (std::int32_t record = 1; record <= 3; ++record) {
            read.rows->setPosition(record);
            for (std::size_t field = 0; field < 3; ++field) {
                const Text text(
                    displayText(read.rows->value(static_cast<int>(field)), u'.', buffer));
                CellLook look;
                read.looks->readLook(read.firstLookRow + record - 1, read.gridColumns[field], look);
                const int column = text[0] - u'a';
                const int row = text[1] - u'0';
                EXPECT_EQ(look.background, rgb(10 * row + 1, 100 + column, 0)) << toUtf8(text);
                const bool isSpecial = text == u"b2";
                EXPECT_EQ(look.alignment == CellAlignment::Right, isSpecial) << toUtf8(text);
                EXPECT_EQ(look.check == CheckMark::On, isSpecial) << toUtf8(text);
            }
        }
        table.selectRow(2);
        EXPECT_TRUE(read.looks->isMarked(2));
        EXPECT_FALSE(read.looks->isMarked(1));
        table.setRowHidden(1, false);
        table.horizontalHeader()->moveSection(0, 2);
        table.clearSelection();
    }
}

TEST_F(DataViewGridTest, RefusesMembersThatItDoesNotHave)
{
    DataViewGrid object(view_);
    EXPECT_EQ(errorOf([&] { LateBound(object).get(u"TextMatrix"); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(
        errorOf([&] { LateBound(object).put(u"DataSource", {}); }), ErrorNumber::NoSuchMember);
}

} // namespace pelloric::qt
