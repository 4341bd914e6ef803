// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/cell_text.h"

#include "platform/qt/qt_text.h"

#include <QAbstractItemView>
#include <QItemDelegate>

#include <limits>
#include <typeinfo>

namespace pelloric::qt {

namespace {

constexpr int EndlessRoom = 32767; ///< pixels; no delegate has to elide in a cell of that size

/// The members through which a view asks its delegate are protected; a derived type may name them.
struct OptionOfView : QAbstractItemView {
    static constexpr auto init = &OptionOfView::initViewItemOption;
};

struct OptionOfDelegate : QStyledItemDelegate {
    static constexpr auto init = &OptionOfDelegate::initStyleOption;
};

QChar boxOf(Qt::CheckState state)
{
    switch (state) {
    case Qt::Unchecked:
        return QChar(u'☐');
    case Qt::PartiallyChecked:
        return QChar(u'▣');
    case Qt::Checked:
        break;
    }
    return QChar(u'☑');
}

} // namespace

void CellText::take(const QAbstractItemView& view)
{
    option_ = QStyleOptionViewItem();
    (view.*OptionOfView::init)(&option_);
    option_.rect = QRect(0, 0, EndlessRoom, EndlessRoom);
    lastDelegate_ = nullptr;
    lastKind_ = DelegateKind::Painter;
}

TextView CellText::of(const QAbstractItemView& view, const QModelIndex& index)
{
    const QAbstractItemDelegate* const delegate = view.itemDelegateForIndex(index);
    const DelegateKind kind = kindOf(delegate);
    return kind == DelegateKind::Styled
        ? readStyled(static_cast<const QStyledItemDelegate&>(*delegate), index)
        : readPlain(index, kind);
}

CellText::DelegateKind CellText::kindOf(const QAbstractItemDelegate* delegate)
{
    if (delegate == lastDelegate_)
        return lastKind_;
    lastDelegate_ = delegate;
    if (qobject_cast<const QStyledItemDelegate*>(delegate))
        lastKind_ = typeid(*delegate) == typeid(QStyledItemDelegate) ? DelegateKind::Plain
                                                                     : DelegateKind::Styled;
    else if (qobject_cast<const QItemDelegate*>(delegate))
        lastKind_ = DelegateKind::Numbers;
    else
        lastKind_ = DelegateKind::Painter;
    return lastKind_;
}

/// What a delegate does that changes nothing, without its fonts, colours and icons. Most models
/// answer several roles one after the other, too, and then copy every answer. A text that is shown
/// as it is stays where the model's answer has it.
TextView CellText::readPlain(const QModelIndex& index, DelegateKind kind)
{
    value_ = index.data(Qt::DisplayRole);
    const QVariant checkState = index.data(Qt::CheckStateRole);
    if (value_.typeId() != QMetaType::QString)
        return changed(shown(value_, kind), checkState);
    const auto& text = *static_cast<const QString*>(value_.constData());
    const bool isAsItIs = checkState.isNull() && !text.contains(QChar(QChar::LineSeparator));
    return isAsItIs ? viewOf(text) : changed(text, checkState);
}

TextView CellText::readStyled(const QStyledItemDelegate& delegate, const QModelIndex& index)
{
    QStyleOptionViewItem option = option_;
    option.index = index;
    (delegate.*OptionOfDelegate::init)(&option, index);
    const bool hasBox = option.features.testFlag(QStyleOptionViewItem::HasCheckIndicator);
    return changed(
        option.features.testFlag(QStyleOptionViewItem::HasDisplay) ? option.text : QString(),
        hasBox ? QVariant(static_cast<int>(option.checkState)) : QVariant());
}

QString CellText::shown(const QVariant& value, DelegateKind kind) const
{
    if (value.isNull())
        return {};
    if (kind == DelegateKind::Numbers && value.typeId() == QMetaType::Double)
        return option_.locale.toString(
            value.toDouble(), 'g', std::numeric_limits<double>::digits10);
    return plain_.displayText(value, option_.locale);
}

/// Line separators as line feeds, as delegates write them, and the check box before the text.
TextView CellText::changed(QString text, const QVariant& checkState)
{
    text_ = std::move(text);
    text_.replace(QChar(QChar::LineSeparator), QLatin1Char('\n'));
    if (!checkState.isNull()) {
        if (!text_.isEmpty())
            text_.prepend(QLatin1Char(' '));
        text_.prepend(boxOf(static_cast<Qt::CheckState>(checkState.toInt())));
    }
    return viewOf(text_);
}

} // namespace pelloric::qt
