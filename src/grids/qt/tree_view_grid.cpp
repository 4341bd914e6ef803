// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/tree_view_grid.h"

#include "grids/collection.h"
#include "grids/qt/cell_text.h"
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

#include <functional>
#include <iterator>
#include <vector>

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

/// Tells that the rows of a model are no longer those that were listed.
class ModelWatch {
public:
    /// Watches this model and no other, from now on.
    void watch(QAbstractItemModel& model)
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

    bool isChanged() const { return isChanged_; }

private:
    std::unique_ptr<QObject> context_;
    bool isChanged_ = true;
};

} // namespace

/// The view, and what was listed of it.
struct TreeViewGrid::Source {
    QPointer<QTreeView> tree; ///< null for a list
    QPointer<QListView> list; ///< null for a tree
    Twips listWidth = -1; ///< what was put; below 0: the view's own
    SectionMap columns;
    std::vector<QModelIndex> rows; ///< the first column of each row
    CellText text;
    ViewLooks looks;
    ModelWatch watch;

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

    /// Fetching may move rows, so that all of it is done before the first row is listed.
    void takeRows()
    {
        QAbstractItemView& shown = view();
        QAbstractItemModel& model = *shown.model();
        listBelow(shown.rootIndex(), [&](const QModelIndex& parent) { fetchAll(model, parent); });
        listBelow(shown.rootIndex(), [](const QModelIndex&) {});
        text.take(shown);
        looks.take(shown);
        watch.watch(model);
    }

    bool isHidden(int row, const QModelIndex& parent) const
    {
        return tree ? tree->isRowHidden(row, parent) : list->isRowHidden(row);
    }

    /// Walks the open branches; a branch that was never opened is never asked for its rows.
    void listBelow(
        const QModelIndex& root, const std::function<void(const QModelIndex&)>& beforeBranch)
    {
        struct Branch {
            QPersistentModelIndex parent;
            int next;
            int count;
        };
        const QAbstractItemModel& model = *view().model();
        std::vector<Branch> open;
        const auto enter = [&](const QModelIndex& parent) {
            beforeBranch(parent);
            open.push_back({ parent, 0, model.rowCount(parent) });
        };
        rows.clear();
        enter(root);
        while (!open.empty()) {
            Branch& branch = open.back();
            if (branch.next == branch.count) {
                open.pop_back();
                continue;
            }
            const int row = branch.next++;
            const QModelIndex index = model.index(row, 0, branch.parent);
            if (!index.isValid() || isHidden(row, branch.parent))
                continue;
            rows.push_back(index);
            if (tree && tree->isExpanded(index) && model.hasChildren(index))
                enter(index);
        }
    }

    /// The column of the branches: the model's number.
    int branchColumn() const
    {
        const int position = tree->treePosition();
        return position >= 0 ? position : logical(0);
    }

    void readBranch(const QModelIndex& index, CellLook& look) const
    {
        const QAbstractItemModel& model = *tree->model();
        constexpr int MostLevels = 63;
        int level = 0;
        for (QModelIndex at = index.parent(); at.isValid() && at != tree->rootIndex();
             at = at.parent())
            ++level;
        int above = level;
        for (QModelIndex at = index; above >= 0 && at.isValid(); at = at.parent(), --above) {
            if (above <= MostLevels && at.row() + 1 < model.rowCount(at.parent()))
                look.goesOn |= std::uint64_t { 1 } << static_cast<unsigned>(above);
        }
        const int steps = level + (tree->rootIsDecorated() ? 1 : 0);
        look.isBranch = true;
        look.level = static_cast<std::uint16_t>(level);
        look.indent = twipsOfPixels(steps * tree->indentation(), tree->logicalDpiX());
    }

    /// The text of a row in a column.
    TextView cell(int row, int column)
    {
        const QAbstractItemView& shown = view();
        const QModelIndex& first = this->row(row);
        const int section = logical(column);
        if (section > 0 && isSpanned(first))
            return {};
        return text.of(shown, first.siblingAtColumn(section));
    }

    const QModelIndex& row(int place) const
    {
        const auto at = static_cast<std::size_t>(place);
        if (watch.isChanged() || at >= rows.size())
            throw RunTimeError(ErrorNumber::SubscriptOutOfRange, phrase(u"the list has changed"));
        return rows[at];
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
    int count() const override { return static_cast<int>(source_.rows.size()); }

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
            if (source_->watch.isChanged())
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
    for (const int column : columns) {
        if (column < 0 || column >= source_->columns.count())
            throw RunTimeError(ErrorNumber::SubscriptOutOfRange, u"the list has changed");
        take(source_->cell(row - 1, column));
    }
}

/// Trees and lists draw no lines between cells.
GridLook TreeViewGrid::gridLook() { return ViewLooks::withoutLines(); }

void TreeViewGrid::readLook(std::int32_t row, std::int32_t column, CellLook& look)
{
    const QAbstractItemView& view = source_->view();
    const QModelIndex& index = source_->row(row - 1);
    const int logical = source_->logical(column);
    source_->looks.read(view, index.siblingAtColumn(logical), look);
    source_->looks.alternate(row, look);
    if (source_->isSpanned(index) && source_->logical(0) == 0)
        look.box = CellBox { row, row, 0, source_->columns.count() - 1 };
    if (source_->tree && logical == source_->branchColumn())
        source_->readBranch(index, look);
}

TextView TreeViewGrid::text(std::int32_t row, std::int32_t column)
{
    const QModelIndex& index = source_->row(row - 1);
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
    const QModelIndex& index = source_->row(row - 1);
    return selection && selection->rowIntersectsSelection(index.row(), index.parent());
}

std::optional<double> TreeViewGrid::number(std::int32_t row, std::int32_t column)
{
    return ViewLooks::number(source_->row(row - 1).siblingAtColumn(source_->logical(column)));
}

} // namespace pelloric::qt
