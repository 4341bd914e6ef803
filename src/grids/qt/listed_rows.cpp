// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/listed_rows.h"

#include "grids/qt/view_sections.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <QAbstractItemModel>
#include <QPersistentModelIndex>

#include <algorithm>

namespace pelloric::qt {

ModelWatch::ModelWatch() = default;
ModelWatch::~ModelWatch() = default;

void ModelWatch::watch(QAbstractItemModel& model)
{
    context_ = std::make_unique<QObject>();
    isChanged_ = false;
    const auto change = [this] { isChanged_ = true; };
    QObject* const context = context_.get();
    QObject::connect(&model, &QAbstractItemModel::rowsInserted, context, change);
    QObject::connect(&model, &QAbstractItemModel::rowsRemoved, context, change);
    QObject::connect(&model, &QAbstractItemModel::rowsMoved, context, change);
    QObject::connect(&model, &QAbstractItemModel::columnsInserted, context, change);
    QObject::connect(&model, &QAbstractItemModel::columnsRemoved, context, change);
    QObject::connect(&model, &QAbstractItemModel::columnsMoved, context, change);
    QObject::connect(&model, &QAbstractItemModel::layoutChanged, context, change);
    QObject::connect(&model, &QAbstractItemModel::modelReset, context, change);
    QObject::connect(&model, &QObject::destroyed, context, change);
}

/// Fetching may move rows that are listed already; then all are listed anew.
void ListedRows::take(const RowListing& listing)
{
    watch_.watch(listing.model);
    list(listing, true);
    if (!watch_.isChanged())
        return;
    list(listing, false);
    watch_.watch(listing.model);
}

const QModelIndex& ListedRows::at(int place) const
{
    const auto row = static_cast<std::size_t>(place);
    if (isChanged() || row >= rows_.size())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange, phrase(u"the list has changed"));
    return rows_[row];
}

void ListedRows::list(const RowListing& listing, bool fetches)
{
    struct Branch {
        QPersistentModelIndex parent;
        int next;
        int count;
    };
    QAbstractItemModel& model = listing.model;
    std::vector<Branch> open;
    const auto enter = [&](const QModelIndex& parent) {
        if (fetches)
            fetchAll(model, parent);
        open.push_back({ parent, 0, model.rowCount(parent) });
    };
    rows_.clear();
    enter(listing.root);
    rows_.reserve(static_cast<std::size_t>(std::max(0, open.front().count)));
    while (!open.empty()) {
        Branch& branch = open.back();
        if (branch.next >= branch.count) {
            open.pop_back();
            continue;
        }
        const int row = branch.next++;
        const QModelIndex parent = branch.parent;
        const QModelIndex index = model.index(row, 0, parent);
        if (!index.isValid() || listing.isHidden(row, parent))
            continue;
        rows_.push_back(index);
        if (listing.isOpen(index) && model.hasChildren(index))
            enter(index);
    }
}

} // namespace pelloric::qt
