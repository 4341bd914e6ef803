// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/model_row_set.h"

#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QAbstractItemModel>

#include <algorithm>

namespace pelloric::qt {

void ModelRowSet::take(QAbstractItemModel& model)
{
    fetchAll(model, {});
    take(model, {}, SectionMap(model.rowCount()), SectionMap(model.columnCount()));
}

void ModelRowSet::take(
    QAbstractItemModel& model, const QModelIndex& root, SectionMap rows, SectionMap columns)
{
    model_ = &model;
    root_ = root;
    rows_ = std::move(rows);
    columns_ = std::move(columns);
    names_.clear();
    for (int field = 0; field < columns_.count(); ++field)
        names_.append(columnTitle(model, columns_.logical(field)));
    setPosition(position_);
}

TextView ModelRowSet::fieldName(int field) const
{
    if (field < 0 || field >= columns_.count())
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"column"), std::int64_t { field } + 1, columns_.count()));
    return viewOf(names_[field]);
}

void ModelRowSet::setPosition(std::int64_t position)
{
    position_ = std::clamp<std::int64_t>(position, 0, recordCount() + 1);
}

Value ModelRowSet::value(int field)
{
    if (!model_)
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"the grid's model is gone"));
    const bool isField = field >= 0 && field < columns_.count();
    if (!isField)
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange,
            noSuchItem(phrase(u"column"), std::int64_t { field } + 1, columns_.count()));
    if (isBeforeFirst() || isAfterLast())
        throw RunTimeError(
            ErrorNumber::SubscriptOutOfRange, noSuchItem(phrase(u"row"), position_, recordCount()));
    const int row = rows_.logical(static_cast<int>(position_ - 1));
    if (row >= model_->rowCount(root_))
        throw RunTimeError(ErrorNumber::SubscriptOutOfRange, phrase(u"the grid has lost rows"));
    return held_.hold(model_->index(row, columns_.logical(field), root_).data(Qt::DisplayRole));
}

} // namespace pelloric::qt
