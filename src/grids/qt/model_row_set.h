// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "grids/qt/held_value.h"
#include "grids/qt/view_sections.h"
#include "platform/row_set.h"

#include <QPersistentModelIndex>
#include <QPointer>
#include <QStringList>

class QAbstractItemModel;

namespace pelloric::qt {

/// The rows of a model, walked in place; no fields and no records until a model is taken.
class ModelRowSet final : public RowSet {
public:
    /// Takes all rows and columns of a model in its own order, once all are fetched.
    void take(QAbstractItemModel& model);

    /// Takes some; the cursor stays where it is, as far as there are records.
    ///
    /// @param rows     of the model below the root: the records, in order
    /// @param columns  of the model below the root: the fields, in order
    void take(
        QAbstractItemModel& model, const QModelIndex& root, SectionMap rows, SectionMap columns);

    int fieldCount() const override { return columns_.count(); }
    TextView fieldName(int field) const override;
    std::int64_t recordCount() const override { return rows_.count(); }
    std::int64_t position() const override { return position_; }
    void setPosition(std::int64_t position) override;

    /// @throws RunTimeError SubscriptOutOfRange: also when the model has lost the row meanwhile;
    ///         ObjectMissing: the model is gone
    Value value(int field) override;

private:
    QPointer<QAbstractItemModel> model_;
    QPersistentModelIndex root_;
    SectionMap rows_;
    SectionMap columns_;
    QStringList names_;
    std::int64_t position_ = 0;
    HeldValue held_;
};

} // namespace pelloric::qt
