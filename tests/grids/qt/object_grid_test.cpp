// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/object_grid.h"

#include "grids/qt/grid_for.h"
#include "grids/qt/late_bound.h"
#include "platform/numbers.h"
#include "platform/row_set.h"
#include "support/errors.h"

#include <QStandardItemModel>
#include <QVariant>

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

/// One header of a list, published by its members.
class HostHeader : public QObject {
    Q_OBJECT
    Q_PROPERTY(QString Text MEMBER text CONSTANT)
    Q_PROPERTY(double Width MEMBER width)

public:
    using QObject::QObject;

    QString text;
    double width = 0;
};

class HostHeaders : public QObject {
    Q_OBJECT
    Q_PROPERTY(int Count READ count CONSTANT)

public:
    HostHeaders()
    {
        first_.text = QStringLiteral("first");
        second_.text = QStringLiteral("second");
    }

    int count() const { return 2; }

    Q_INVOKABLE QObject* Item(int index)
    {
        return index == 1 ? &first_ : index == 2 ? &second_ : nullptr;
    }

private:
    HostHeader first_;
    HostHeader second_;
};

/// A host's own grid, with members of every form.
class HostGrid : public QObject {
    Q_OBJECT
    Q_PROPERTY(int Cols READ cols CONSTANT)
    Q_PROPERTY(QVariant Rows READ rows CONSTANT)
    Q_PROPERTY(short Height MEMBER height)
    Q_PROPERTY(HostHeaders* ColumnHeaders READ headers CONSTANT)
    Q_PROPERTY(QObject* Nothing READ nothing CONSTANT)
    Q_PROPERTY(QAbstractItemModel* DataSource READ source CONSTANT)

public:
    int cols() const { return 3; }
    QVariant rows() const { return 4; }
    HostHeaders* headers() { return &headers_; }
    QObject* nothing() const { return nullptr; }
    QAbstractItemModel* source() { return &source_; }

    Q_INVOKABLE QString TextMatrix(int row, int column) const
    {
        return QStringLiteral("%1/%2").arg(row).arg(column);
    }

    Q_INVOKABLE QVariant ColWidth(const QVariant& column) const { return widths[column.toInt()]; }
    Q_INVOKABLE void ColWidth(const QVariant& column, const QVariant& width)
    {
        widths[column.toInt()] = width.toDouble();
    }

    Q_INVOKABLE double RowHeight(int row) const { return heights[row]; }
    Q_INVOKABLE void setRowHeight(int row, double height) { heights[row] = height; }

    Q_INVOKABLE void Fail() { throw RunTimeError(ErrorNumber::Overflow); }

    double widths[3] = { 1000, -1, 0 };
    double heights[4] = {};
    short height = 0;
    QStandardItemModel source_ { 5, 2 };

private:
    HostHeaders headers_;
};

class ObjectGridTest : public testing::Test {
protected:
    HostGrid host_;
    std::unique_ptr<AutomationObject> object_ = gridFor(host_);
    LateBound grid_ { *object_ };
};

} // namespace

TEST_F(ObjectGridTest, ReadsPropertiesAndIndexedMembers)
{
    EXPECT_EQ(grid_.get(u"Cols").number(), 3);
    EXPECT_EQ(grid_.get(u"Rows").number(), 4);
    EXPECT_EQ(grid_.text(u"TextMatrix", 2, 1), u"2/1");
    EXPECT_EQ(grid_.get(u"ColWidth", 1).number(), -1);
}

TEST_F(ObjectGridTest, WritesByTheSameNameOrBySetAndTheName)
{
    grid_.put(u"ColWidth", 1, 2000);
    EXPECT_EQ(host_.widths[1], 2000);
    grid_.put(u"RowHeight", 2, 300);
    EXPECT_EQ(host_.heights[2], 300);
    EXPECT_EQ(grid_.get(u"RowHeight", 2).number(), 300);
}

TEST_F(ObjectGridTest, WholePropertiesRoundHalfToEvenAndOverflow)
{
    grid_.put(u"Height", Value::ofNumber(2.5));
    EXPECT_EQ(host_.height, 2);
    grid_.put(u"Height", Value::ofText(u" 12 cm"));
    EXPECT_EQ(host_.height, 12);
    EXPECT_EQ(
        errorOf([&] { grid_.put(u"Height", Value::ofNumber(70000)); }), ErrorNumber::Overflow);
    EXPECT_EQ(host_.height, 12);
}

TEST_F(ObjectGridTest, ObjectsAreReachedByTheirMembers)
{
    LateBound headers = grid_.child(u"ColumnHeaders");
    EXPECT_EQ(headers.get(u"Count").number(), 2);
    EXPECT_EQ(headers.item(1).get(u"Text").text(), u"first");
    EXPECT_EQ(headers.item(2).get(u"Text").text(), u"second");
    headers.item(2).put(u"Width", Value::ofNumber(99.5));
    EXPECT_EQ(headers.item(2).get(u"Width").number(), 99.5);
    EXPECT_EQ(LateBound(grid_.get(u"ColumnHeaders", 2).toObject()).get(u"Text").text(), u"second");
    EXPECT_EQ(errorOf([&] { headers.item(3); }), ErrorNumber::ObjectMissing);
    EXPECT_EQ(errorOf([&] { grid_.child(u"Nothing"); }), ErrorNumber::ObjectMissing);
}

TEST_F(ObjectGridTest, ObjectsOfAClassShareTheirIds)
{
    HostGrid other;
    const auto object = gridFor(other);
    EXPECT_EQ(object->memberTable(), object_->memberTable());
    const MemberId member = memberOf(*object_, u"TextMatrix");
    const Value indexes[] = { Value::ofNumber(1), Value::ofNumber(2) };
    EXPECT_EQ(object->get(member, indexes).text(), u"1/2");
}

TEST_F(ObjectGridTest, AModelIsARecordSet)
{
    RowSet& rows = grid_.get(u"DataSource").toRows();
    EXPECT_EQ(rows.recordCount(), 5);
    EXPECT_EQ(rows.fieldCount(), 2);
}

TEST_F(ObjectGridTest, RefusesMembersThatTheObjectDoesNotPublish)
{
    for (const TextView name : { u"ListItems", u"cols", u"destroyed", u"" })
        EXPECT_EQ(errorOf([&] { grid_.get(name); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { grid_.get(u"Cols", 1); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { grid_.get(u"TextMatrix", 1); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { grid_.put(u"Cols", Value::ofNumber(1)); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { grid_.put(u"Nothing", 1, 2); }), ErrorNumber::NoSuchMember);
}

TEST_F(ObjectGridTest, TheErrorsOfAMemberPassThrough)
{
    EXPECT_EQ(errorOf([&] { grid_.get(u"Fail"); }), ErrorNumber::Overflow);
}

TEST(ObjectGrid, AnObjectThatIsGoneIsTheObjectMissingError)
{
    auto host = std::make_unique<HostGrid>();
    const auto object = gridFor(*host);
    LateBound grid(*object);
    host.reset();
    EXPECT_EQ(errorOf([&] { grid.get(u"Cols"); }), ErrorNumber::ObjectMissing);
}

} // namespace pelloric::qt

#include "object_grid_test.moc"
