// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/tree_view_grid.h"

#include "grids/collection.h"
#include "grids/qt/cell_text.h"
#include "grids/qt/listed_rows.h"
#include "grids/qt/view_looks.h"
#include "grids/qt/view_sections.h"
#include "platform/member_names.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QHeaderView>
#include <QItemSelectionModel>
#include <QListView>
#include <QPointer>
#include <QTreeView>

#include <iterator>

namespace pelloric::qt {

namespace {

enum GridMember { ColumnHeaders, ListItems, GridMemberCount };

constexpr TextView GridNames[] = { u"ColumnHeaders", u"ListItems" };
static_assert(std::size(GridNames) == GridMemberCount);

enum HeaderMember { HeaderWidth, HeaderText, HeaderMemberCount };

constexpr TextView HeaderNames[] = { u"Width", u"Text" };
static_assert(std::size(HeaderNames) == HeaderMemberCount);

enum ItemMember { ItemText, SubItems, ItemMemberCount };

constexpr TextView ItemNames[] = { u"Text", u"SubItems" };
static_assert(std::size(ItemNames) == ItemMemberCount);

} // namespace

/// The view, and what was listed of it.
struct TreeViewGrid::Source {
    QPointer<QTreeView> tree; ///< null for a list
    QPointer<QListView> list; ///< null for a tree
    Twips listWidth = -1; ///< what was put; below 0: the view's own
    SectionMap columns;
    ListedRows rows;
    CellText text;
    ViewLooks looks;

    QAbstractItemView& view() const
    {
        QAbstractItemView* const view = tree ? static_cast<QAbstractItemView*>(tree.data()) : list;
        if (!view || !view->model())
            throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"the grid is gone"));
        return *view;
    }

    void takeColumns()
    {
        view();
        columns = tree ? SectionMap::all(*tree->header()) : SectionMap(1);
    }

    /// The model's number of a column.
    int logical(int place) const { return tree ? columns.logical(place) : list->modelColumn(); }

    /// A single column without a header has one blank as its title.
    QString title(int place) const
    {
        const QAbstractItemView& shown = view();
        if (columns.count() == 1 && (!tree || tree->isHeaderHidden()))
            return QStringLiteral(" ");
        return columnTitle(*shown.model(), logical(place));
    }

    /// Whether the first column of a row reaches over all the others.
    bool isSpanned(const QModelIndex& row) const
    {
        return tree && tree->isFirstColumnSpanned(row.row(), row.parent());
    }

    Twips width(int place) const
    {
        const QAbstractItemView& shown = view();
        if (tree)
            return sectionWidth(*tree->header(), logical(place));
        return listWidth >= 0 ? listWidth
                              : twipsOfPixels(shown.viewport()->width(), shown.logicalDpiX());
    }

    void setWidth(int place, Twips width)
    {
        view();
        if (tree)
            setSectionWidth(*tree->header(), logical(place), width);
        else
            listWidth = width;
    }

    void takeRows()
    {
        QAbstractItemView& shown = view();
        rows.take({ .model = *shown.model(),
            .root = shown.rootIndex(),
            .isHidden
            = [this](int row, const QModelIndex& parent) { return isHidden(row, parent); },
            .isOpen = [this](const QModelIndex& row) { return tree && tree->isExpanded(row); } });
        text.take(shown);
        looks.take(shown);
    }

    bool isHidden(int row, const QModelIndex& parent) const
    {
        return tree ? tree->isRowHidden(row, parent) : list->isRowHidden(row);
    }

    /// The column of the branches: the model's number.
    int branchColumn() const
    {
        const int position = tree->treePosition();
        return position >= 0 ? position : logical(0);
    }

    /// Tells the texts of a row in some columns; what does not hang on the column is asked once.
    /// @param places  of the columns as they are seen, from 0
    template <typename Take> void cells(int row, std::span<const int> places, const Take& take)
    {
        const QAbstractItemView& shown = view();
        const QAbstractItemModel& model = *shown.model();
        const QModelIndex first = rows.at(row);
        const QModelIndex parent = first.parent();
        const bool isFirstSpanned = isSpanned(first);
        for (const int place : places) {
            if (place < 0 || place >= columns.count() || rows.isChanged())
                throw RunTimeError(
                    ErrorNumber::SubscriptOutOfRange, phrase(u"the list has changed"));
            const int section = logical(place);
            take(section > 0 && isFirstSpanned
                    ? TextView()
                    : text.of(shown, model.index(first.row(), section, parent)));
        }
    }

    /// The text of a row in a column.
    TextView cell(int row, int column)
    {
        TextView shown;
        cells(row, { &column, 1 }, [&](TextView told) { shown = told; });
        return shown;
    }
};

/// One column header, pointed at by the collection.
class TreeViewGrid::Header final : public AutomationObject {
public:
    explicit Header(Source& source)
        : source_(source)
    {
    }

    void pointAt(int place) { place_ = place; }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(HeaderNames, name);
    }

    const void* memberTable() const override { return HeaderNames; }

    Value get(MemberId member, std::span<const Value>) override
    {
        if (member == HeaderWidth)
            return Value::ofNumber(source_.width(place_));
        if (member != HeaderText)
            refuseMember(HeaderNames, member);
        title_ = source_.title(place_);
        return Value::ofText(viewOf(title_));
    }

    void put(MemberId member, std::span<const Value>, const Value& value) override
    {
        if (member != HeaderWidth)
            refuseMember(HeaderNames, member);
        source_.setWidth(place_, roundToInt32(value.toNumber()));
    }

private:
    Source& source_;
    int place_ = 0;
    QString title_;
};

/// The column headers, counted from 1.
class TreeViewGrid::Headers final : public Collection {
public:
    explicit Headers(Source& source)
        : Collection(1)
        , source_(source)
        , header_(source)
    {
    }

private:
    int count() const override { return source_.columns.count(); }

    AutomationObject& itemAt(int place) override
    {
        header_.pointAt(place);
        return header_;
    }

    Source& source_;
    Header header_;
};

/// One row, pointed at by the collection.
class TreeViewGrid::ListItem final : public AutomationObject {
public:
    explicit ListItem(Source& source)
        : source_(source)
    {
    }

    void pointAt(int place) { place_ = place; }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(ItemNames, name);
    }

    const void* memberTable() const override { return ItemNames; }

    Value get(MemberId member, std::span<const Value> arguments) override
    {
        if (member == ItemText)
            return Value::ofText(source_.cell(place_, 0));
        if (member != SubItems)
            refuseMember(ItemNames, member);
        const int column = indexArgument(arguments, 0, 1, source_.columns.count() - 1);
        return Value::ofText(source_.cell(place_, column));
    }

    void put(MemberId member, std::span<const Value>, const Value&) override
    {
        refuseMember(ItemNames, member);
    }

private:
    Source& source_;
    int place_ = 0;
};

/// The rows, counted from 1.
class TreeViewGrid::Items final : public Collection {
public:
    explicit Items(Source& source)
        : Collection(1)
        , source_(source)
        , item_(source)
    {
    }

private:
    int count() const override { return source_.rows.count(); }

    AutomationObject& itemAt(int place) override
    {
        item_.pointAt(place);
        return item_;
    }

    Source& source_;
    ListItem item_;
};

TreeViewGrid::TreeViewGrid(QTreeView& view)
    : TreeViewGrid(std::make_unique<Source>())
{
    source_->tree = &view;
    source_->takeColumns();
}

TreeViewGrid::TreeViewGrid(QListView& view)
    : TreeViewGrid(std::make_unique<Source>())
{
    source_->list = &view;
    source_->takeColumns();
}

TreeViewGrid::TreeViewGrid(std::unique_ptr<Source> source)
    : source_(std::move(source))
    , headers_(std::make_unique<Headers>(*source_))
    , items_(std::make_unique<Items>(*source_))
{
}

TreeViewGrid::~TreeViewGrid() = default;

std::optional<MemberId> TreeViewGrid::findMember(TextView name)
{
    return findMemberName(GridNames, name);
}

const void* TreeViewGrid::memberTable() const { return GridNames; }

Value TreeViewGrid::get(MemberId member, std::span<const Value> arguments)
{
    switch (member) {
    case ColumnHeaders:
        if (!arguments.empty())
            return headers_->item(arguments);
        source_->takeColumns();
        return Value::ofObject(*headers_);
    case ListItems:
        if (!arguments.empty()) {
            if (source_->rows.isChanged())
                source_->takeRows();
            return items_->item(arguments);
        }
        source_->takeRows();
        return Value::ofObject(*items_);
    default:
        refuseMember(GridNames, member);
    }
}

void TreeViewGrid::put(MemberId member, std::span<const Value>, const Value&)
{
    refuseMember(GridNames, member);
}

void TreeViewGrid::readRow(
    std::int32_t row, std::span<const int> columns, const std::function<void(TextView text)>& take)
{
    source_->cells(row - 1, columns, take);
}

/// Trees and lists draw no lines between cells.
GridLook TreeViewGrid::gridLook() { return ViewLooks::withoutLines(); }

void TreeViewGrid::readLook(std::int32_t row, std::int32_t column, CellLook& look)
{
    const QAbstractItemView& view = source_->view();
    const QModelIndex& index = source_->rows.at(row - 1);
    const int logical = source_->logical(column);
    source_->looks.read(view, index.siblingAtColumn(logical), look);
    source_->looks.alternate(row, look);
    if (source_->isSpanned(index) && source_->logical(0) == 0)
        look.box = CellBox { row, row, 0, source_->columns.count() - 1 };
    if (source_->tree && logical == source_->branchColumn())
        ViewLooks::readBranch(*source_->tree, index, look);
}

TextView TreeViewGrid::text(std::int32_t row, std::int32_t column)
{
    const QModelIndex& index = source_->rows.at(row - 1);
    return source_->text.of(source_->view(), index.siblingAtColumn(source_->logical(column)));
}

CellAlignment TreeViewGrid::titleAlignment(std::int32_t column)
{
    source_->view();
    return source_->tree
        ? ViewLooks::titleAlignment(*source_->tree->header(), source_->logical(column))
        : CellAlignment::Left;
}

bool TreeViewGrid::isMarked(std::int32_t row)
{
    const QItemSelectionModel* const selection = source_->view().selectionModel();
    const QModelIndex& index = source_->rows.at(row - 1);
    return selection && selection->rowIntersectsSelection(index.row(), index.parent());
}

std::optional<double> TreeViewGrid::number(std::int32_t row, std::int32_t column)
{
    return ViewLooks::number(source_->rows.at(row - 1).siblingAtColumn(source_->logical(column)));
}

} // namespace pelloric::qt
