// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/record_texts.h"

#include "fakes/fake_object.h"
#include "report/late_bound_rows.h"
#include "report/table_row_set.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

TableRowSet rowsOf(const std::vector<std::vector<Text>>& records)
{
    TableRowSet rows(std::make_shared<TextStore>());
    for (std::size_t field = 0; field < records.front().size(); ++field)
        rows.appendField(decimal(static_cast<int>(field)));
    for (const auto& record : records) {
        rows.addRecord();
        for (std::size_t field = 0; field < record.size(); ++field)
            rows.setLast(static_cast<int>(field), Value::ofText(record[field]));
    }
    return rows;
}

} // namespace

TEST(RecordTexts, AreTrimmedOfBlanksOnly)
{
    TableRowSet rows = rowsOf({ { u"  a b ", u"\t", u"　" } });
    rows.moveFirst();
    RecordTexts texts(rows, 3, false, u'.');
    texts.readCurrent();
    EXPECT_EQ(texts.current(0), u"a b");
    EXPECT_EQ(texts.current(1), u"\t");
    EXPECT_EQ(texts.current(2), u"　");
    EXPECT_TRUE(texts.isStored(0));
}

TEST(RecordTexts, FormatWhatIsNoText)
{
    TableRowSet rows(std::make_shared<TextStore>());
    for (const TextView name : { u"a", u"b", u"c" })
        rows.appendField(name);
    rows.addRecord();
    rows.setLast(0, Value::ofNumber(1.5));
    rows.setLast(1, Value::ofTruth(false));
    rows.moveFirst();
    RecordTexts texts(rows, 3, false, u',');
    texts.readCurrent();
    EXPECT_EQ(texts.current(0), u"1,5");
    EXPECT_EQ(texts.current(1), u"False");
    EXPECT_EQ(texts.current(2), u"");
    EXPECT_FALSE(texts.isStored(0));
}

TEST(RecordTexts, CompareWithTheRecordsBesideInEveryDirectionOfTheCursor)
{
    TableRowSet rows = rowsOf({ { u"a" }, { u" a " }, { u"A" }, { u"" } });
    RecordTexts texts(rows, 1, true, u'.');
    const auto look = [&](std::int64_t position) {
        rows.setPosition(position);
        texts.readCurrent();
        EXPECT_EQ(rows.position(), position);
        const TextView now = texts.current(0);
        return std::pair(texts.previousEquals(0, now), texts.nextEquals(0, now));
    };
    EXPECT_EQ(look(1), std::pair(false, true));
    EXPECT_EQ(look(2), std::pair(true, false));
    EXPECT_EQ(look(3), std::pair(false, false));
    EXPECT_EQ(look(4), std::pair(false, false));
    EXPECT_EQ(look(2), std::pair(true, false));
    EXPECT_EQ(look(1), std::pair(false, true));
    EXPECT_EQ(look(4), std::pair(false, false));
    EXPECT_FALSE(texts.nextEquals(0, u""));
}

TEST(RecordTexts, TreatTheEmptyTextAsAnythingElse)
{
    TableRowSet rows = rowsOf({ { u"" }, { u" " } });
    rows.addRecord();
    RecordTexts texts(rows, 1, true, u'.');
    rows.setPosition(2);
    texts.readCurrent();
    EXPECT_TRUE(texts.previousEquals(0, u""));
    EXPECT_TRUE(texts.nextEquals(0, u""));
    rows.setPosition(1);
    texts.readCurrent();
    EXPECT_FALSE(texts.previousEquals(0, u""));
}

TEST(RecordTexts, KeepCopiesOfTextsThatTheRowSetOnlyLends)
{
    FakeRecords records({ u"A", u"B" }, { { u"a1", u"b1" }, { u"a2", u"b2" } });
    LateBoundRows rows(records);
    RecordTexts texts(rows, 2, true, u'.');
    texts.readCurrent();
    records.rows = { { u"", u"" }, { u"", u"" } };
    EXPECT_EQ(texts.current(0), u"a1");
    EXPECT_EQ(texts.current(1), u"b1");
    EXPECT_FALSE(texts.isStored(0));
    EXPECT_EQ(records.position, 1);
}

} // namespace pelloric
