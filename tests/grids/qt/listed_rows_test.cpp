// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/listed_rows.h"

#include "support/errors.h"

#include <QAbstractListModel>
#include <QSortFilterProxyModel>

#include <gtest/gtest.h>

#include <algorithm>

namespace pelloric::qt {

namespace {

/// Numbers from the largest down, four of which come at a time.
class LazyNumbers : public QAbstractListModel {
public:
    LazyNumbers(int count, int fetched)
        : count_(count)
        , fetched_(fetched)
    {
    }

    int rowCount(const QModelIndex& parent) const override
    {
        return parent.isValid() ? 0 : fetched_;
    }

    QVariant data(const QModelIndex& index, int role) const override
    {
        return role == Qt::DisplayRole ? QVariant(count_ - index.row()) : QVariant();
    }

    bool canFetchMore(const QModelIndex& parent) const override
    {
        return !parent.isValid() && fetched_ < count_;
    }

    void fetchMore(const QModelIndex&) override
    {
        const int next = std::min(count_, fetched_ + 4);
        beginInsertRows({}, fetched_, next - 1);
        fetched_ = next;
        endInsertRows();
    }

private:
    int count_;
    int fetched_;
};

class ListedRowsTest : public testing::Test {
protected:
    void take(QAbstractItemModel& model)
    {
        rows_.take({ .model = model,
            .root = {},
            .isHidden = [this](int row, const QModelIndex&) { return ++asked_, row == hiddenRow_; },
            .isOpen = [](const QModelIndex&) { return true; } });
    }

    /// What the rows hold, from top to bottom.
    std::vector<int> numbers() const
    {
        std::vector<int> all;
        for (int row = 0; row < rows_.count(); ++row)
            all.push_back(rows_.at(row).data().toInt());
        return all;
    }

    ListedRows rows_;
    int asked_ = 0; ///< how often it was asked whether a row is hidden
    int hiddenRow_ = -1;
};

} // namespace

TEST_F(ListedRowsTest, ListsAModelThatHasAllItsRowsOnce)
{
    LazyNumbers model(3, 3);
    take(model);
    EXPECT_EQ(numbers(), (std::vector { 3, 2, 1 }));
    EXPECT_EQ(asked_, 3);
}

TEST_F(ListedRowsTest, ListsAnewWhatFetchingHasMoved)
{
    LazyNumbers model(10, 2);
    QSortFilterProxyModel sorted; // every row that is fetched comes before those that are there
    sorted.setSourceModel(&model);
    sorted.sort(0);
    take(sorted);
    EXPECT_EQ(numbers(), (std::vector { 1, 2, 3, 4, 5, 6, 7, 8, 9, 10 }));
    EXPECT_FALSE(rows_.isChanged());
}

TEST_F(ListedRowsTest, LeavesHiddenRowsOut)
{
    LazyNumbers model(3, 3);
    hiddenRow_ = 1;
    take(model);
    EXPECT_EQ(numbers(), (std::vector { 3, 1 }));
}

TEST_F(ListedRowsTest, RefusesRowsOfAModelThatHasChangedSince)
{
    LazyNumbers model(6, 6);
    EXPECT_TRUE(rows_.isChanged());
    take(model);
    EXPECT_EQ(errorOf([&] { rows_.at(6); }), ErrorNumber::SubscriptOutOfRange);
    emit model.layoutChanged();
    EXPECT_TRUE(rows_.isChanged());
    EXPECT_EQ(errorOf([&] { rows_.at(0); }), ErrorNumber::SubscriptOutOfRange);
}

} // namespace pelloric::qt
