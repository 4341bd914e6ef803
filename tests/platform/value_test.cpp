// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/value.h"

#include "fakes/fake_object.h"
#include "report/table_row_set.h"
#include "support/errors.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

Text shown(const Value& value, char16_t separator = u'.')
{
    Text buffer;
    return Text(displayText(value, separator, buffer));
}

constexpr std::int64_t DayMs = 86400000;

} // namespace

TEST(Value, PrintsInItsGeneralForm)
{
    EXPECT_EQ(shown(Value()), u"");
    EXPECT_EQ(shown(Value::ofText(u" a ")), u" a ");
    EXPECT_EQ(shown(Value::ofNumber(1.5)), u"1.5");
    EXPECT_EQ(shown(Value::ofNumber(1.5), u','), u"1,5");
    EXPECT_EQ(shown(Value::ofNumber(0.1 + 0.2)), u"0.3");
    EXPECT_EQ(shown(Value::ofTruth(true)), u"True");
    EXPECT_EQ(shown(Value::ofTruth(false)), u"False");
}

TEST(Value, PrintsADateWithItsTimeUnlessItIsMidnight)
{
    struct Row {
        std::int64_t milliseconds;
        TextView text;
    };
    const Row rows[] = { { 0, u"1970-01-01" }, { 1000, u"1970-01-01 00:00:01" },
        { 999, u"1970-01-01" }, { -1000, u"1969-12-31 23:59:59" }, { 12714 * DayMs, u"2004-10-23" },
        { 11016 * DayMs, u"2000-02-29" }, { 12714 * DayMs + 45296000, u"2004-10-23 12:34:56" },
        { -719162 * DayMs, u"0001-01-01" } };
    for (const Row& row : rows)
        EXPECT_EQ(toUtf8(shown(Value::ofDate(row.milliseconds))), toUtf8(row.text));
}

TEST(Value, IsANumberWhereItCanBe)
{
    EXPECT_EQ(Value().toNumber(), 0);
    EXPECT_EQ(Value::ofNumber(2.5).toNumber(), 2.5);
    EXPECT_EQ(Value::ofTruth(true).toNumber(), -1);
    EXPECT_EQ(Value::ofText(u" 12abc").toNumber(), 12);
    EXPECT_EQ(Value::ofText(u"abc").toNumber(), 0);
}

TEST(Value, RefusesToBeWhatItIsNot)
{
    FakeObject object;
    TableRowSet rows(std::make_shared<TextStore>());
    const Value held = Value::ofObject(object);
    const Value table = Value::ofRows(rows);
    EXPECT_EQ(&held.toObject(), &object);
    EXPECT_EQ(&table.toRows(), &rows);
    for (const Value& value : { held, table }) {
        EXPECT_EQ(errorOf([&] { (void)value.toNumber(); }), ErrorNumber::TypeMismatch);
        EXPECT_EQ(errorOf([&] { shown(value); }), ErrorNumber::TypeMismatch);
        EXPECT_EQ(value.text(), u"");
    }
    EXPECT_EQ(errorOf([&] { held.toRows(); }), ErrorNumber::TypeMismatch);
    EXPECT_EQ(errorOf([&] { table.toObject(); }), ErrorNumber::ObjectMissing);
    EXPECT_EQ(errorOf([] { Value().toObject(); }), ErrorNumber::ObjectMissing);
}

} // namespace pelloric
