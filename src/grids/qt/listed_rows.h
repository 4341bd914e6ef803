// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QModelIndex>

#include <functional>
#include <memory>
#include <vector>

class QAbstractItemModel;
class QObject;

namespace pelloric::qt {

/// Tells that the rows of a model are no longer those that were listed.
class ModelWatch {
public:
    ModelWatch();
    ~ModelWatch();

    /// Watches this model and no other, from now on.
    void watch(QAbstractItemModel& model);

    bool isChanged() const { return isChanged_; }

private:
    std::unique_ptr<QObject> context_;
    bool isChanged_ = true;
};

/// Where rows are listed, and which of them; all is asked for row by row.
struct RowListing {
    QAbstractItemModel& model;
    QModelIndex root;
    std::function<bool(int row, const QModelIndex& parent)> isHidden;
    std::function<bool(const QModelIndex& row)> isOpen; ///< whether the branch below it is shown
};

/// The rows of a tree or list from top to bottom, those of open branches among them.
class ListedRows {
public:
    /// Lets the model fetch all rows that are shown, and lists them.
    ///
    /// A branch that is not open is never asked for its rows.
    void take(const RowListing& listing);

    int count() const { return static_cast<int>(rows_.size()); }

    /// Whether the model has changed since its rows were listed, or none were.
    bool isChanged() const { return watch_.isChanged(); }

    /// The first column of a row.
    /// @param place  from 0
    /// @throws RunTimeError SubscriptOutOfRange: there is no such row, or the model has changed
    const QModelIndex& at(int place) const;

private:
    void list(const RowListing& listing, bool fetches);

    std::vector<QModelIndex> rows_;
    ModelWatch watch_;
};

} // namespace pelloric::qt
