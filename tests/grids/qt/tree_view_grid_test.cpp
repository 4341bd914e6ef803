// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/tree_view_grid.h"

#include "grids/qt/grid_for.h"
#include "grids/qt/late_bound.h"
#include "support/errors.h"

#include <QHeaderView>
#include <QListWidget>
#include <QTreeWidget>

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

QTreeWidgetItem* branch(const QString& name, const QStringList& leaves)
{
    auto* item
        = new QTreeWidgetItem({ name, name + QStringLiteral("1"), name + QStringLiteral("2") });
    for (const QString& leaf : leaves)
        item->addChild(new QTreeWidgetItem({ leaf }));
    return item;
}

class TreeViewGridTest : public testing::Test {
protected:
    void SetUp() override
    {
        tree_.setHeaderLabels(
            { QStringLiteral("Name"), QStringLiteral("One"), QStringLiteral("Two") });
        tree_.addTopLevelItem(branch(QStringLiteral("a"), { QStringLiteral("a-x") }));
        tree_.addTopLevelItem(
            branch(QStringLiteral("b"), { QStringLiteral("b-x"), QStringLiteral("b-y") }));
        tree_.addTopLevelItem(branch(QStringLiteral("c"), {}));
        tree_.topLevelItem(1)->setExpanded(true);
        for (int column = 0; column < 3; ++column)
            tree_.header()->resizeSection(column, 100 + column);
    }

    /// The first column of all rows.
    static Text rowsOf(AutomationObject& object)
    {
        LateBound items = LateBound(object).child(u"ListItems");
        const auto count = static_cast<int>(items.get(u"Count").number());
        Text rows;
        for (int row = 1; row <= count; ++row)
            rows.append(items.item(row).get(u"Text").text()).append(u" ");
        return rows;
    }

    QTreeWidget tree_;
};

} // namespace

TEST_F(TreeViewGridTest, ListsOpenBranchesFromTopToBottom)
{
    const auto object = gridFor(tree_);
    EXPECT_EQ(rowsOf(*object), u"a b b-x b-y c ");
    tree_.expandAll();
    EXPECT_EQ(rowsOf(*object), u"a a-x b b-x b-y c ");
}

TEST_F(TreeViewGridTest, LeavesHiddenRowsAndWhatIsBelowThemOut)
{
    tree_.topLevelItem(1)->setHidden(true);
    TreeViewGrid object(tree_);
    EXPECT_EQ(rowsOf(object), u"a c ");
}

TEST_F(TreeViewGridTest, HeadersAndSubItemsStandInTheOrderSeen)
{
    tree_.header()->setFirstSectionMovable(true);
    tree_.header()->moveSection(2, 0);
    tree_.setColumnHidden(1, true);
    TreeViewGrid object(tree_);
    LateBound headers = LateBound(object).child(u"ColumnHeaders");
    EXPECT_EQ(headers.get(u"Count").number(), 3);
    EXPECT_EQ(headers.item(1).get(u"Text").text(), u"Two");
    EXPECT_EQ(headers.item(1).get(u"Width").number(), 102 * 15);
    EXPECT_EQ(headers.item(3).get(u"Width").number(), 0);
    LateBound item = LateBound(object).child(u"ListItems").item(1);
    EXPECT_EQ(item.get(u"Text").text(), u"a2");
    EXPECT_EQ(item.get(u"SubItems", 1).text(), u"a");
    EXPECT_EQ(item.get(u"SubItems", 2).text(), u"a1");
}

TEST_F(TreeViewGridTest, CollectionsCanBeIndexedThemselves)
{
    TreeViewGrid object(tree_);
    LateBound grid(object);
    EXPECT_EQ(LateBound(grid.get(u"ColumnHeaders", 2).toObject()).get(u"Text").text(), u"One");
    EXPECT_EQ(LateBound(grid.get(u"ListItems", 3).toObject()).get(u"Text").text(), u"b-x");
}

TEST_F(TreeViewGridTest, WidthsAreWrittenBackToTheHeader)
{
    TreeViewGrid object(tree_);
    LateBound(object).child(u"ColumnHeaders").item(2).put(u"Width", Value::ofNumber(3000));
    EXPECT_EQ(tree_.header()->sectionSize(1), 200);
}

TEST_F(TreeViewGridTest, RefusesIndexesOutsideTheList)
{
    TreeViewGrid object(tree_);
    LateBound items = LateBound(object).child(u"ListItems");
    LateBound headers = LateBound(object).child(u"ColumnHeaders");
    const auto outside = ErrorNumber::SubscriptOutOfRange;
    EXPECT_EQ(errorOf([&] { items.item(0); }), outside);
    EXPECT_EQ(errorOf([&] { items.item(6); }), outside);
    EXPECT_EQ(errorOf([&] { headers.item(4); }), outside);
    EXPECT_EQ(errorOf([&] { items.item(1).get(u"SubItems", 0); }), outside);
    EXPECT_EQ(errorOf([&] { items.item(1).get(u"SubItems", 3); }), outside);
    EXPECT_EQ(errorOf([&] { LateBound(object).get(u"Cols"); }), ErrorNumber::NoSuchMember);
}

TEST_F(TreeViewGridTest, ARowThatWentMeanwhileIsRefused)
{
    TreeViewGrid object(tree_);
    LateBound item = LateBound(object).child(u"ListItems").item(3);
    tree_.clear();
    EXPECT_EQ(errorOf([&] { item.get(u"Text"); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(rowsOf(object), u"");
}

TEST(TreeViewGrid, AListIsOneColumnAsWideAsTheView)
{
    QListWidget list;
    list.addItems({ QStringLiteral("一"), QStringLiteral("二"), QStringLiteral("三") });
    list.setRowHidden(1, true);
    const auto object = gridFor(list);
    LateBound headers = LateBound(*object).child(u"ColumnHeaders");
    EXPECT_EQ(headers.get(u"Count").number(), 1);
    EXPECT_EQ(headers.item(1).get(u"Width").number(), list.viewport()->width() * 15);
    LateBound items = LateBound(*object).child(u"ListItems");
    EXPECT_EQ(items.get(u"Count").number(), 2);
    EXPECT_EQ(items.item(2).get(u"Text").text(), u"三");
}

TEST(TreeViewGrid, AListHasABlankAsItsTitle)
{
    QListWidget list;
    const auto object = gridFor(list);
    EXPECT_EQ(LateBound(*object).child(u"ColumnHeaders").item(1).get(u"Text").text(), u" ");
}

TEST(TreeViewGrid, ASingleColumnWhoseHeaderIsHiddenHasABlankAsItsTitle)
{
    QTreeWidget tree;
    tree.setHeaderLabel(QStringLiteral("Name"));
    const auto object = gridFor(tree);
    LateBound header = LateBound(*object).child(u"ColumnHeaders").item(1);
    EXPECT_EQ(header.get(u"Text").text(), u"Name");
    tree.setHeaderHidden(true);
    EXPECT_EQ(header.get(u"Text").text(), u" ");
}

TEST_F(TreeViewGridTest, WhatTheFirstColumnSpansIsEmpty)
{
    tree_.topLevelItem(1)->setFirstColumnSpanned(true);
    TreeViewGrid object(tree_);
    LateBound items = LateBound(object).child(u"ListItems");
    LateBound spanned = items.item(2);
    EXPECT_EQ(spanned.get(u"Text").text(), u"b");
    EXPECT_EQ(spanned.get(u"SubItems", 1).text(), u"");
    EXPECT_EQ(items.item(1).get(u"SubItems", 1).text(), u"a1");
}

TEST_F(TreeViewGridTest, CheckBoxesStandBeforeTheText)
{
    tree_.topLevelItem(0)->setCheckState(1, Qt::Checked);
    tree_.topLevelItem(2)->setCheckState(0, Qt::Unchecked);
    TreeViewGrid object(tree_);
    EXPECT_EQ(rowsOf(object), u"a b b-x b-y ☐ c ");
    LateBound items = LateBound(object).child(u"ListItems");
    EXPECT_EQ(items.item(1).get(u"SubItems", 1).text(), u"☑ a1");
}

} // namespace pelloric::qt
