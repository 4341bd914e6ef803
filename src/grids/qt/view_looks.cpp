// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/view_looks.h"

#include "grids/qt/view_sections.h"
#include "platform/qt/picture_files.h"

#include <QAbstractItemView>
#include <QHeaderView>
#include <QIcon>
#include <QListView>
#include <QPainter>
#include <QPixmap>
#include <QStyledItemDelegate>
#include <QTableView>
#include <QTreeView>

#include <algorithm>
#include <typeinfo>

namespace pelloric::qt {

namespace {

constexpr int IconPixels = 64; ///< of a side; enough for paper at the height of a text

/// The members through which a view asks its delegate are protected; a derived type may name them.
struct OptionOfView : QAbstractItemView {
    static constexpr auto init = &OptionOfView::initViewItemOption;
};

struct OptionOfDelegate : QStyledItemDelegate {
    static constexpr auto init = &OptionOfDelegate::initStyleOption;
};

Color colorOf(const QColor& color) { return rgb(color.red(), color.green(), color.blue()); }

/// The colour of every other row on paper, which is white also where a view is dark.
Color alternateOnPaper(const QPalette& palette)
{
    const QColor OnWhite(0xF2, 0xF2, 0xF2);
    const bool isDark = palette.color(QPalette::Base).lightnessF() < 0.5F;
    return colorOf(isDark ? OnWhite : palette.color(QPalette::AlternateBase));
}

bool wrapsWords(const QAbstractItemView& view)
{
    if (const auto* table = qobject_cast<const QTableView*>(&view))
        return table->wordWrap();
    if (const auto* tree = qobject_cast<const QTreeView*>(&view))
        return tree->wordWrap();
    const auto* list = qobject_cast<const QListView*>(&view);
    return list && list->wordWrap();
}

TooWide tooWideOf(const QAbstractItemView& view)
{
    if (wrapsWords(view))
        return TooWide::Wrapped;
    switch (view.textElideMode()) {
    case Qt::ElideLeft:
        return TooWide::CutLeft;
    case Qt::ElideMiddle:
        return TooWide::CutMiddle;
    case Qt::ElideRight:
        break;
    case Qt::ElideNone:
        return TooWide::CutPlainly;
    }
    return TooWide::CutRight;
}

void setBackground(const QBrush& brush, CellLook& look)
{
    if (brush.style() != Qt::NoBrush && brush.color().alpha() > 0)
        look.background = colorOf(brush.color());
}

/// A brush, or a colour or picture as a brush; nothing: it is none of them.
std::optional<QBrush> brushOf(const QVariant& value)
{
    if (value.typeId() == QMetaType::QBrush)
        return *static_cast<const QBrush*>(value.constData());
    return value.canConvert<QBrush>() ? std::optional(value.value<QBrush>()) : std::nullopt;
}

CheckMark markOf(Qt::CheckState state)
{
    switch (state) {
    case Qt::Unchecked:
        return CheckMark::Off;
    case Qt::PartiallyChecked:
        return CheckMark::Partly;
    case Qt::Checked:
        break;
    }
    return CheckMark::On;
}

/// What a cell may be decorated with, as a picture; null: nothing that is shown.
QImage imageOf(const QVariant& decoration)
{
    switch (decoration.typeId()) {
    case QMetaType::QIcon:
        return decoration.value<QIcon>().pixmap(IconPixels, IconPixels).toImage();
    case QMetaType::QPixmap:
        return decoration.value<QPixmap>().toImage();
    case QMetaType::QImage:
        return decoration.value<QImage>();
    case QMetaType::QColor: {
        QImage plain(1, 1, QImage::Format_ARGB32);
        plain.fill(decoration.value<QColor>());
        return plain;
    }
    default:
        return {};
    }
}

qint64 keyOf(const QVariant& decoration)
{
    switch (decoration.typeId()) {
    case QMetaType::QIcon:
        return decoration.value<QIcon>().cacheKey();
    case QMetaType::QPixmap:
        return decoration.value<QPixmap>().cacheKey();
    case QMetaType::QImage:
        return decoration.value<QImage>().cacheKey();
    case QMetaType::QColor:
        return decoration.value<QColor>().rgba();
    default:
        return 0;
    }
}

/// A picture in the middle of a transparent square.
QImage squareOf(const QImage& picture)
{
    if (picture.width() == picture.height())
        return picture;
    const int side = std::max(picture.width(), picture.height());
    QImage square(side, side, QImage::Format_ARGB32_Premultiplied);
    square.fill(Qt::transparent);
    QImage pixels = picture;
    pixels.setDevicePixelRatio(1);
    QPainter painter(&square);
    painter.drawImage((side - picture.width()) / 2, (side - picture.height()) / 2, pixels);
    return square;
}

CellAlignment horizontalOf(Qt::Alignment alignment)
{
    if (alignment & Qt::AlignRight)
        return CellAlignment::Right;
    return alignment & Qt::AlignHCenter ? CellAlignment::Centre : CellAlignment::Left;
}

} // namespace

void ViewLooks::take(const QAbstractItemView& view)
{
    option_ = QStyleOptionViewItem();
    (view.*OptionOfView::init)(&option_);
    lastDelegate_ = nullptr;
    lastStyled_ = nullptr;
    ownFont_ = lookOf(option_.font);
    fonts_.fill(ownFont_);
    for (FontLook& known : fonts_)
        known.font = QFont(); // says nothing, so that the view's font stays as it is
    tooWide_ = tooWideOf(view);
    iconFiles_.clear();
    alternates_ = view.alternatingRowColors();
    alternateColor_ = alternateOnPaper(option_.palette);
}

void ViewLooks::read(const QAbstractItemView& view, const QModelIndex& index, CellLook& look)
{
    look = {};
    look.tooWide = tooWide_;
    if (const auto* const styled = styledDelegate(view.itemDelegateForIndex(index)))
        readStyled(*styled, index, look);
    else
        readPlain(index, look);
}

/// A delegate whose own reading of the model changes looks; null: it reads what is there.
const QStyledItemDelegate* ViewLooks::styledDelegate(const QAbstractItemDelegate* delegate)
{
    if (delegate == lastDelegate_)
        return lastStyled_;
    lastDelegate_ = delegate;
    const auto* const styled = qobject_cast<const QStyledItemDelegate*>(delegate);
    lastStyled_ = styled && typeid(*styled) != typeid(QStyledItemDelegate) ? styled : nullptr;
    return lastStyled_;
}

void ViewLooks::alternate(std::int32_t row, CellLook& look) const
{
    if (alternates_ && row % 2 == 0 && !look.background)
        look.background = alternateColor_;
}

void ViewLooks::readPlain(const QModelIndex& index, CellLook& look)
{
    const QVariant font = index.data(Qt::FontRole);
    if (font.isNull())
        setFont(ownFont_, look);
    else if (font.typeId() == QMetaType::QFont)
        setFont(fontLook(*static_cast<const QFont*>(font.constData())), look);
    else
        setFont(fontLook(font.value<QFont>()), look);
    const QVariant alignment = index.data(Qt::TextAlignmentRole);
    setAlignment(
        alignment.isNull() ? option_.displayAlignment : Qt::Alignment(alignment.toInt()), look);
    if (const auto foreground = brushOf(index.data(Qt::ForegroundRole)))
        look.foreground = colorOf(foreground->color());
    if (const auto background = brushOf(index.data(Qt::BackgroundRole)))
        setBackground(*background, look);
    const QVariant check = index.data(Qt::CheckStateRole);
    if (!check.isNull())
        look.check = markOf(static_cast<Qt::CheckState>(check.toInt()));
    setDecoration(index.data(Qt::DecorationRole), look);
}

void ViewLooks::readStyled(
    const QStyledItemDelegate& delegate, const QModelIndex& index, CellLook& look)
{
    QStyleOptionViewItem option = option_;
    option.index = index;
    (delegate.*OptionOfDelegate::init)(&option, index);
    setFont(lookOf(option.font), look);
    setAlignment(option.displayAlignment, look);
    const QColor text = option.palette.color(QPalette::Normal, QPalette::Text);
    if (text != option_.palette.color(QPalette::Normal, QPalette::Text))
        look.foreground = colorOf(text);
    setBackground(option.backgroundBrush, look);
    if (option.features.testFlag(QStyleOptionViewItem::HasCheckIndicator))
        look.check = markOf(option.checkState);
    if (option.features.testFlag(QStyleOptionViewItem::HasDecoration))
        setDecoration(option.icon, look);
}

/// Cells mostly share a few fonts, which are told apart by what they share; laying one over the
/// view's makes a font of its own.
const ViewLooks::FontLook& ViewLooks::fontLook(const QFont& font)
{
    for (const FontLook& known : fonts_) {
        if (font.isCopyOf(known.font) && font.resolveMask() == known.font.resolveMask())
            return known;
    }
    FontLook& known = fonts_[nextFont_];
    nextFont_ = (nextFont_ + 1) % fonts_.size();
    known = lookOf(font.resolve(option_.font));
    known.font = font;
    return known;
}

ViewLooks::FontLook ViewLooks::lookOf(const QFont& font)
{
    return { .font = font,
        .bold = font.weight() >= QFont::DemiBold,
        .italic = font.italic(),
        .underline = font.underline(),
        .strikethrough = font.strikeOut() };
}

void ViewLooks::setFont(const FontLook& font, CellLook& look)
{
    look.bold = font.bold;
    look.italic = font.italic;
    look.underline = font.underline;
    look.strikethrough = font.strikethrough;
}

/// Where the alignment says nothing, texts stand as the writing runs.
void ViewLooks::setAlignment(Qt::Alignment alignment, CellLook& look) const
{
    look.alignment = horizontalOf(alignment);
    const bool isMirrored
        = option_.direction == Qt::RightToLeft && !(alignment & Qt::AlignAbsolute);
    if (isMirrored && look.alignment != CellAlignment::Centre)
        look.alignment
            = look.alignment == CellAlignment::Left ? CellAlignment::Right : CellAlignment::Left;
    look.place = alignment & Qt::AlignVCenter ? CellPlace::Middle
        : alignment & Qt::AlignBottom         ? CellPlace::Bottom
                                              : CellPlace::Top;
}

void ViewLooks::setDecoration(const QVariant& decoration, CellLook& look)
{
    if (decoration.isNull())
        return;
    const auto [place, isNew]
        = iconFiles_.try_emplace(IconKey { decoration.typeId(), keyOf(decoration) });
    if (isNew) {
        const QImage picture = imageOf(decoration);
        place->second = picture.isNull() ? Text() : keepPicture(squareOf(picture));
    }
    look.icon = place->second;
}

GridLook ViewLooks::withoutLines() { return { .showsLines = false }; }

CellAlignment ViewLooks::titleAlignment(const QHeaderView& header, int section)
{
    const QVariant own = header.model()->headerData(section, Qt::Horizontal, Qt::TextAlignmentRole);
    return horizontalOf(own.isNull() ? header.defaultAlignment() : Qt::Alignment(own.toInt()));
}

void ViewLooks::readBranch(const QTreeView& tree, const QModelIndex& index, CellLook& look)
{
    const QAbstractItemModel& model = *tree.model();
    constexpr int MostLevels = 63;
    int level = 0;
    for (QModelIndex at = index.parent(); at.isValid() && at != tree.rootIndex(); at = at.parent())
        ++level;
    int above = level;
    for (QModelIndex at = index; above >= 0 && at.isValid(); at = at.parent(), --above) {
        if (above <= MostLevels && at.row() + 1 < model.rowCount(at.parent()))
            look.goesOn |= std::uint64_t { 1 } << static_cast<unsigned>(above);
    }
    const int steps = level + (tree.rootIsDecorated() ? 1 : 0);
    look.isBranch = true;
    look.level = static_cast<std::uint16_t>(level);
    look.indent = twipsOfPixels(steps * tree.indentation(), tree.logicalDpiX());
}

std::optional<double> ViewLooks::number(const QModelIndex& index)
{
    const QVariant value = index.data(Qt::DisplayRole);
    switch (value.typeId()) {
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::Short:
    case QMetaType::UShort:
    case QMetaType::Long:
    case QMetaType::ULong:
    case QMetaType::LongLong:
    case QMetaType::ULongLong:
    case QMetaType::Float:
    case QMetaType::Double:
        return value.toDouble();
    default:
        return std::nullopt;
    }
}

} // namespace pelloric::qt
