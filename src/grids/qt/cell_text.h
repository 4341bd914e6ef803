// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <QString>

class QAbstractItemView;
class QModelIndex;

namespace pelloric::qt {

/// Reads cells as a view shows them.
class CellText {
public:
    /// The text of a cell: the model's own text, or what the view's delegate makes of a number, a
    /// date and the like.
    ///
    /// @return  borrowed until the next call
    TextView of(const QAbstractItemView& view, const QModelIndex& index);

private:
    QString text_;
};

} // namespace pelloric::qt
