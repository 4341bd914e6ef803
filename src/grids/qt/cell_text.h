// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <QString>
#include <QStyleOptionViewItem>
#include <QStyledItemDelegate>
#include <QVariant>

class QAbstractItemView;
class QModelIndex;

namespace pelloric::qt {

/// Reads cells as a view shows them.
///
/// A cell's text is what the view's delegate makes of the model's value in the view's locale: what
/// `displayText` and `initStyleOption` of a styled delegate say. A delegate that only paints shows
/// nothing that could be read; of its cells the model's own text is taken.
class CellText {
public:
    /// Takes how the view shows its cells; before the first cell, and anew whenever that may have
    /// changed.
    void take(const QAbstractItemView& view);

    /// The text of a cell, each line behind a line feed.
    ///
    /// A check box stands before it as a character and a blank: ☑ checked, ☐ not checked, ▣ partly.
    /// @param view  the one that was taken
    /// @return      borrowed until the next call
    TextView of(const QAbstractItemView& view, const QModelIndex& index);

private:
    /// How much of a delegate has to be asked.
    enum class DelegateKind { Plain, Numbers, Styled, Painter };

    DelegateKind kindOf(const QAbstractItemDelegate* delegate);
    TextView readPlain(const QModelIndex& index, DelegateKind kind);
    TextView readStyled(const QStyledItemDelegate& delegate, const QModelIndex& index);
    TextView changed(QString text, const QVariant& checkState);
    QString shown(const QVariant& value, DelegateKind kind) const;

    QStyleOptionViewItem option_; ///< of every cell of the view that was taken
    QStyledItemDelegate plain_; ///< formats what no delegate of the host's formats itself
    const QAbstractItemDelegate* lastDelegate_ = nullptr;
    DelegateKind lastKind_ = DelegateKind::Painter;
    QVariant value_; ///< what a model answered last; its text is lent as it is
    QString text_;
};

} // namespace pelloric::qt
