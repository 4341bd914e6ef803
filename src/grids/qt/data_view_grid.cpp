// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/data_view_grid.h"

#include "grids/collection.h"
#include "grids/qt/held_grid.h"
#include "grids/qt/table_view_grid.h"
#include "platform/member_names.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <pelloric/grids.h>

#include <QAbstractItemModel>
#include <QHeaderView>
#include <QItemSelectionModel>
#include <QTableView>

#include <iterator>

namespace pelloric::qt {

namespace {

enum Member { DataSource, ColumnsMember, Col, MemberCount };

constexpr TextView Names[] = { u"DataSource", u"Columns", u"col" };
static_assert(std::size(Names) == MemberCount);

enum ColumnMember { Width, Caption, ColumnMemberCount };

constexpr TextView ColumnNames[] = { u"Width", u"Caption" };
static_assert(std::size(ColumnNames) == ColumnMemberCount);

QTableView& alive(const QPointer<QTableView>& view)
{
    if (!view || !view->model())
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"the grid is gone"));
    return *view;
}

/// One column, pointed at by the collection.
class Column final : public AutomationObject {
public:
    explicit Column(const QPointer<QTableView>& view)
        : view_(view)
    {
    }

    void pointAt(int logical) { logical_ = logical; }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(ColumnNames, name);
    }

    const void* memberTable() const override { return ColumnNames; }

    Value get(MemberId member, std::span<const Value>) override
    {
        const QTableView& table = alive(view_);
        if (member == Width)
            return Value::ofNumber(sectionWidth(*table.horizontalHeader(), logical_));
        if (member != Caption)
            refuseMember(ColumnNames, member);
        title_ = columnTitle(*table.model(), logical_);
        return Value::ofText(viewOf(title_));
    }

    void put(MemberId member, std::span<const Value>, const Value& value) override
    {
        if (member != Width)
            refuseMember(ColumnNames, member);
        const Twips width = roundToInt32(value.toNumber());
        setSectionWidth(*alive(view_).horizontalHeader(), logical_, width);
    }

private:
    const QPointer<QTableView>& view_;
    int logical_ = 0;
    QString title_;
};

} // namespace

/// The columns in the order in which they are seen, counted from 0.
class DataViewGrid::Columns final : public Collection {
public:
    explicit Columns(const QPointer<QTableView>& view)
        : Collection(0)
        , view_(view)
        , column_(view)
    {
        take();
    }

    void take() { map_ = SectionMap::all(*alive(view_).horizontalHeader()); }

    const SectionMap& map() const { return map_; }

private:
    int count() const override { return map_.count(); }

    AutomationObject& itemAt(int place) override
    {
        column_.pointAt(map_.logical(place));
        return column_;
    }

    const QPointer<QTableView>& view_;
    SectionMap map_;
    Column column_;
};

DataViewGrid::DataViewGrid(QTableView& view)
    : view_(&view)
    , columns_(std::make_unique<Columns>(view_))
{
}

DataViewGrid::~DataViewGrid() = default;

std::optional<MemberId> DataViewGrid::findMember(TextView name)
{
    return findMemberName(Names, name);
}

const void* DataViewGrid::memberTable() const { return Names; }

Value DataViewGrid::get(MemberId member, std::span<const Value> arguments)
{
    switch (member) {
    case DataSource:
        return Value::ofRows(takeRows());
    case ColumnsMember:
        columns_->take();
        return arguments.empty() ? Value::ofObject(*columns_) : columns_->item(arguments);
    case Col:
        return Value::ofNumber(column());
    default:
        refuseMember(Names, member);
    }
}

void DataViewGrid::put(MemberId member, std::span<const Value>, const Value& value)
{
    if (member != Col)
        refuseMember(Names, member);
    const Value index[] = { value };
    setColumn(indexArgument(index, 0, 0, columns_->map().count() - 1));
}

CellLooks* DataViewGrid::cellLooks()
{
    if (shown_)
        shown_->takeAnew();
    else
        shown_ = std::make_unique<TableViewGrid>(view());
    return shown_.get();
}

bool DataViewGrid::takesRows(MemberId member) { return member == DataSource; }

QTableView& DataViewGrid::view() const { return alive(view_); }

RowSet& DataViewGrid::takeRows()
{
    QTableView& table = view();
    fetchAll(*table.model(), table.rootIndex());
    columns_->take();
    rows_.take(*table.model(), table.rootIndex(), SectionMap::shown(*table.verticalHeader()),
        columns_->map());
    return rows_;
}

int DataViewGrid::column() const
{
    const QModelIndex current = view().currentIndex();
    return current.isValid() ? view().horizontalHeader()->visualIndex(current.column()) : column_;
}

/// Moves the current cell within its row and selects nothing.
void DataViewGrid::setColumn(int column)
{
    QTableView& table = view();
    column_ = column;
    const QModelIndex current = table.currentIndex();
    const QModelIndex next = table.model()->index(
        current.isValid() ? current.row() : 0, columns_->map().logical(column), table.rootIndex());
    if (next.isValid())
        table.selectionModel()->setCurrentIndex(next, QItemSelectionModel::NoUpdate);
}

std::unique_ptr<QObject> dataGrid(QTableView& view)
{
    return std::make_unique<HeldGrid>(std::make_shared<DataViewGrid>(view));
}

} // namespace pelloric::qt
