// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/table_row_set.h"

#include "fakes/fake_object.h"
#include "support/errors.h"

#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <limits>

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

TEST_F(TableRows, CopyNoTextThatIsLent)
{
    auto lender = std::make_shared<TextStore>();
    const TextView short_ = lender->add(u"lent");
    const TextView long_ = lender->add(Text(5000, u'l'));
    rows.borrow(lender);
    add(Value::ofText(short_), Value::ofText(u"of its own"));
    add(Value::ofText(long_), Value::ofText({}));
    lender.reset();
    rows.moveFirst();
    EXPECT_EQ(rows.value(0).text().data(), short_.data());
    EXPECT_EQ(rows.value(0).text(), u"lent");
    EXPECT_EQ(rows.value(1).text(), u"of its own");
    rows.moveNext();
    EXPECT_EQ(rows.value(0).text(), Text(5000, u'l'));
    EXPECT_EQ(rows.value(1).text(), u"");
}

TEST_F(TableRows, KeepNumbersDatesAndTextsOfEverySize)
{
    constexpr double Infinity = std::numeric_limits<double>::infinity();
    for (const double number : { 0.0, -0.0, 1e308, -1e308, 5e-324, Infinity, -Infinity })
        add(Value::ofNumber(number), Value::ofTruth(false));
    add(Value::ofNumber(-std::numeric_limits<double>::quiet_NaN()), Value());
    constexpr std::int64_t Day = 86'400'000;
    const std::vector<std::int64_t> dates { 0, -1, 1, -4000 * 365 * Day, 4000 * 365 * Day,
        -(1LL << 47U), (1LL << 47U) - 1, -90'000 * 365 * Day, 90'000 * 365 * Day };
    for (const std::int64_t date : dates)
        add(Value::ofDate(date), Value());
    const std::vector<std::size_t> lengths { 0, 1, 4095, 4096, 70'000, 600'000 };
    for (const std::size_t length : lengths)
        add(Value::ofText(Text(length, u'x')), Value::ofText(u"after"));
    rows.moveFirst();
    for (const double number : { 0.0, -0.0, 1e308, -1e308, 5e-324, Infinity, -Infinity }) {
        EXPECT_EQ(std::bit_cast<std::uint64_t>(rows.value(0).number()),
            std::bit_cast<std::uint64_t>(number));
        EXPECT_EQ(rows.value(1).kind(), ValueKind::Truth);
        EXPECT_EQ(rows.value(1).number(), 0);
        rows.moveNext();
    }
    EXPECT_EQ(rows.value(0).kind(), ValueKind::Number);
    EXPECT_TRUE(std::isnan(rows.value(0).number()));
    rows.moveNext();
    for (const std::int64_t date : dates) {
        EXPECT_EQ(rows.value(0).kind(), ValueKind::Date);
        EXPECT_EQ(rows.value(0).number(), static_cast<double>(date));
        rows.moveNext();
    }
    for (const std::size_t length : lengths) {
        EXPECT_EQ(rows.value(0).kind(), ValueKind::Text);
        EXPECT_EQ(rows.value(0).text(), Text(length, u'x'));
        EXPECT_EQ(rows.value(1).text(), u"after");
        rows.moveNext();
    }
}

TEST_F(TableRows, RefuseATextThatIsTooLongAndSayWhere)
{
    rows.addRecord();
    rows.addRecord();
    const Text longest(MostCellUnits, u'x');
    rows.setLast(0, Value::ofText(longest));
    try {
        rows.setLast(1, Value::ofText(longest + u'x'));
        ADD_FAILURE();
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::Overflow);
        EXPECT_NE(
            error.text().find(
                u"row 2, column 2 holds 16777217 characters, at most 16777216 can be printed"),
            Text::npos);
    }
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

TEST_F(TableRows, TakeEightBytesACell)
{
    rows.reserveRecords(1000);
    EXPECT_EQ(rows.memoryBytes(), 1000U * 2 * 8);
    rows.reserveRecords(-3);
    EXPECT_EQ(rows.recordCount(), 0);
}

} // namespace pelloric
