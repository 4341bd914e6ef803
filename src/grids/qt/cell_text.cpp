// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/cell_text.h"

#include "platform/qt/qt_text.h"

#include <QAbstractItemView>
#include <QStyledItemDelegate>

#include <typeinfo>

namespace pelloric::qt {

TextView CellText::of(const QAbstractItemView& view, const QModelIndex& index)
{
    const QVariant shown = index.data(Qt::DisplayRole);
    const auto* delegate
        = qobject_cast<const QStyledItemDelegate*>(view.itemDelegateForIndex(index));
    const bool isPlain = !delegate || typeid(*delegate) == typeid(QStyledItemDelegate);
    const bool isText = shown.typeId() == QMetaType::QString;
    if (!delegate || (isPlain && isText)) {
        text_ = shown.toString();
    } else if (shown.isNull() && isPlain) {
        text_.clear();
    } else {
        text_ = delegate->displayText(shown, view.locale());
        text_.replace(QChar(QChar::LineSeparator), QLatin1Char('\n')); // as delegates write it
    }
    return viewOf(text_);
}

} // namespace pelloric::qt
