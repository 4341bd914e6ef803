// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/cell_look.h"

#include <QFont>
#include <QStyleOptionViewItem>

#include <array>
#include <map>
#include <utility>

class QAbstractItemDelegate;
class QAbstractItemView;
class QHeaderView;
class QModelIndex;
class QStyledItemDelegate;
class QTreeView;

namespace pelloric::qt {

/// Reads how a view shows its cells, as its delegates say it.
class ViewLooks {
public:
    /// Takes how the view shows its cells; before the first cell, and anew whenever that may have
    /// changed.
    void take(const QAbstractItemView& view);

    /// Overwrites all of `look` but what belongs to rows, trees and boxes.
    /// @param view  the one that was taken
    void read(const QAbstractItemView& view, const QModelIndex& index, CellLook& look);

    /// Gives rows a colour in turn, where the view does.
    /// @param row  from 1, as it is printed
    void alternate(std::int32_t row, CellLook& look) const;

    /// Lines between cells, for views that draw none.
    static GridLook withoutLines();

    static CellAlignment titleAlignment(const QHeaderView& header, int section);

    /// The number of a cell, as its model has it.
    static std::optional<double> number(const QModelIndex& index);

    /// How a row of a tree hangs below those above it.
    /// @param index  in the column of the branches
    static void readBranch(const QTreeView& tree, const QModelIndex& index, CellLook& look);

private:
    /// What of a font is shown.
    struct FontLook {
        QFont font; ///< as a cell has it
        bool bold = false;
        bool italic = false;
        bool underline = false;
        bool strikethrough = false;
    };

    const QStyledItemDelegate* styledDelegate(const QAbstractItemDelegate* delegate);
    void readPlain(const QModelIndex& index, CellLook& look);
    void readStyled(const QStyledItemDelegate& delegate, const QModelIndex& index, CellLook& look);
    const FontLook& fontLook(const QFont& font);
    static FontLook lookOf(const QFont& font);
    static void setFont(const FontLook& font, CellLook& look);
    void setAlignment(Qt::Alignment alignment, CellLook& look) const;
    void setDecoration(const QVariant& decoration, CellLook& look);

    /// What makes two decorations the same one: the kind of value and its key.
    using IconKey = std::pair<int, qint64>;

    QStyleOptionViewItem option_; ///< of every cell of the view that was taken
    TooWide tooWide_ = TooWide::Wrapped;
    const QAbstractItemDelegate* lastDelegate_ = nullptr; ///< that was looked at
    const QStyledItemDelegate* lastStyled_ = nullptr; ///< the same, where it has to be asked
    FontLook ownFont_; ///< of the view
    std::array<FontLook, 8> fonts_; ///< that were met last
    std::size_t nextFont_ = 0; ///< the one that gives way
    bool alternates_ = false;
    Color alternateColor_ = 0;
    std::map<IconKey, Text> iconFiles_; ///< of the decorations that were met
};

} // namespace pelloric::qt
