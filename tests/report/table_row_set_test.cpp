// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/table_row_set.h"

#include "fakes/fake_object.h"
#include "support/errors.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

class TableRows : public ::testing::Test {
protected:
    TableRows()
    {
        rows.appendField(u"A");
        rows.appendField(u"B");
    }

    void add(const Value& a, const Value& b)
    {
        rows.addRecord();
        rows.setLast(0, a);
        rows.setLast(1, b);
    }

    TableRowSet rows { std::make_shared<TextStore>() };
};

} // namespace

TEST_F(TableRows, KnowsItsFieldsByTheirExactNames)
{
    EXPECT_EQ(rows.fieldCount(), 2);
    EXPECT_EQ(rows.fieldName(1), u"B");
    EXPECT_TRUE(rows.fieldExists(u"A"));
    EXPECT_FALSE(rows.fieldExists(u"a"));
    EXPECT_FALSE(rows.fieldExists(u"A "));
    EXPECT_EQ(errorOf([&] { rows.fieldName(2); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { rows.fieldName(-1); }), ErrorNumber::SubscriptOutOfRange);
}

TEST_F(TableRows, KeepEveryKindOfValue)
{
    Text given = u"text";
    add(Value::ofText(given), Value::ofNumber(-1.5));
    given = u"gone";
    add(Value::ofTruth(true), Value::ofDate(86400000));
    rows.addRecord();
    rows.moveFirst();
    EXPECT_EQ(rows.value(0).text(), u"text");
    EXPECT_EQ(rows.value(1).number(), -1.5);
    rows.moveNext();
    EXPECT_EQ(rows.value(0).kind(), ValueKind::Truth);
    EXPECT_EQ(rows.value(0).number(), -1);
    EXPECT_EQ(rows.value(1).kind(), ValueKind::Date);
    EXPECT_EQ(rows.value(1).number(), 86400000);
    rows.moveNext();
    EXPECT_EQ(rows.value(0).kind(), ValueKind::Null);
    EXPECT_TRUE(rows.keepsTexts());
}

TEST_F(TableRows, RefuseAnObjectInACell)
{
    FakeObject object;
    rows.addRecord();
    EXPECT_EQ(
        errorOf([&] { rows.setLast(0, Value::ofObject(object)); }), ErrorNumber::TypeMismatch);
}

TEST_F(TableRows, HoldTheCursorWithinOneStepOfTheRecords)
{
    add({}, {});
    add({}, {});
    EXPECT_TRUE(rows.isBeforeFirst());
    rows.movePrevious();
    EXPECT_EQ(rows.position(), 0);
    rows.moveFirst();
    EXPECT_EQ(rows.position(), 1);
    rows.moveRelative(-5);
    EXPECT_EQ(rows.position(), 0);
    rows.moveRelative(9);
    EXPECT_EQ(rows.position(), 3);
    EXPECT_TRUE(rows.isAfterLast());
    rows.moveNext();
    EXPECT_EQ(rows.position(), 3);
    EXPECT_EQ(errorOf([&] { rows.value(0); }), ErrorNumber::SubscriptOutOfRange);
    rows.setPosition(2);
    EXPECT_EQ(errorOf([&] { rows.value(2); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { rows.value(-1); }), ErrorNumber::SubscriptOutOfRange);
}

TEST_F(TableRows, MoveFirstOnAnEmptySetIsNoError)
{
    rows.moveFirst();
    EXPECT_TRUE(rows.isAfterLast());
}

TEST_F(TableRows, TakeSixteenBytesACell)
{
    rows.reserveRecords(1000);
    EXPECT_EQ(rows.memoryBytes(), 1000U * 2 * 16);
    rows.reserveRecords(-3);
    EXPECT_EQ(rows.recordCount(), 0);
}

} // namespace pelloric
