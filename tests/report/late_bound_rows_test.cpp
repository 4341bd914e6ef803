// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/late_bound_rows.h"

#include "fakes/fake_object.h"
#include "support/errors.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

using Cursor = FakeRecords::Cursor;

std::vector<std::vector<Text>> fiveRecords()
{
    return { { u"1" }, { u"2" }, { u"3" }, { u"4" }, { u"5" } };
}

} // namespace

TEST(LateBoundRows, WalkToAnyRecordWithTheMembersOfAPlainCursor)
{
    for (const Cursor cursor : { Cursor::Steps, Cursor::StepsWithoutMove }) {
        FakeRecords records({ u"A" }, fiveRecords(), cursor);
        LateBoundRows rows(records);
        EXPECT_EQ(rows.recordCount(), 5);
        EXPECT_EQ(rows.fieldName(0), u"A");
        for (const int from : { 0, 1, 3, 5, 6 }) {
            for (const int to : { 1, 2, 4, 5 }) {
                rows.setPosition(from);
                rows.setPosition(to);
                EXPECT_EQ(records.position, to) << from;
                EXPECT_EQ(rows.value(0).text(), Text(1, static_cast<char16_t>(u'0' + to)));
            }
        }
    }
}

TEST(LateBoundRows, KnowWhereAPlainCursorStands)
{
    for (const int position : { 0, 1, 3, 4 }) {
        FakeRecords records({ u"A" }, { { u"1" }, { u"2" }, { u"3" } }, Cursor::Steps);
        records.position = position;
        const LateBoundRows rows(records);
        EXPECT_EQ(rows.position(), position);
        EXPECT_EQ(records.position, position) << "asking leaves the cursor where it was";
    }
}

TEST(LateBoundRows, TakeOneStepToANeighbour)
{
    FakeRecords records({ u"A" }, { { u"1" }, { u"2" }, { u"3" } }, Cursor::Steps);
    LateBoundRows rows(records);
    rows.moveFirst();
    records.moves = 0;
    rows.moveNext();
    rows.moveNext();
    rows.movePrevious();
    EXPECT_EQ(records.moves, 3);
    rows.setPosition(rows.position());
    EXPECT_EQ(records.moves, 3);
}

TEST(LateBoundRows, NameTheMemberThatAPlainCursorLacks)
{
    FakeObject records;
    records.number(u"RecordCount", 0);
    EXPECT_EQ(errorOf([&] { const LateBoundRows rows(records); }), ErrorNumber::NoSuchMember);
}

TEST(LateBoundRows, RefuseACursorThatNeverComesToItsFirstRecord)
{
    FakeRecords records({ u"A" }, { { u"1" } }, Cursor::Steps);
    records.rows.resize(9, { u"1" }); // the record count stays 1
    records.position = 7;
    EXPECT_EQ(errorOf([&] { const LateBoundRows rows(records); }), ErrorNumber::InvalidCall);
}

TEST(LateBoundRows, LeaveAnEmptySetAlone)
{
    FakeRecords records({ u"A" }, {}, Cursor::Steps);
    records.position = 0;
    LateBoundRows rows(records);
    rows.moveFirst();
    EXPECT_TRUE(rows.isAfterLast());
    EXPECT_EQ(records.moves, 0);
}

} // namespace pelloric
