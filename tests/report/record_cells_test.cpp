// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/record_cells.h"

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

/// Counts what is read of the records of another row set.
class CountedRows : public RowSet {
public:
    explicit CountedRows(RowSet& rows)
        : rows_(rows)
    {
    }

    int fieldCount() const override { return rows_.fieldCount(); }
    TextView fieldName(int field) const override { return rows_.fieldName(field); }
    std::int64_t recordCount() const override { return rows_.recordCount(); }
    std::int64_t position() const override { return rows_.position(); }
    void setPosition(std::int64_t position) override
    {
        ++moves;
        rows_.setPosition(position);
    }
    Value value(int field) override
    {
        ++reads;
        return rows_.value(field);
    }

    int reads = 0;
    int moves = 0;

private:
    RowSet& rows_;
};

/// Records "1.1", "1.2", ...
std::vector<std::vector<Text>> numbered(int records, int fields)
{
    std::vector<std::vector<Text>> result;
    for (int record = 1; record <= records; ++record) {
        auto& row = result.emplace_back();
        for (int field = 1; field <= fields; ++field)
            row.push_back(decimal(record) + u"." + decimal(field));
    }
    return result;
}

class RecordCellsTest : public ::testing::Test {
protected:
    static Text text(RecordCells& records, std::int64_t position, std::size_t field)
    {
        return Text(records.read(position, field, 1).front().text());
    }

    TextStore store;
};

} // namespace

TEST_F(RecordCellsTest, AreTrimmedOfBlanksOnly)
{
    TableRowSet rows = rowsOf({ { u"  a b ", u"\t", u"　" } });
    RecordCells records(rows, 3, false, u'.', store);
    EXPECT_EQ(text(records, 1, 0), u"a b");
    EXPECT_EQ(text(records, 1, 1), u"\t");
    EXPECT_EQ(text(records, 1, 2), u"　");
    EXPECT_EQ(store.capacityBytes(), 0U); // the row set keeps them
}

TEST_F(RecordCellsTest, FormatWhatIsNoText)
{
    TableRowSet rows(std::make_shared<TextStore>());
    for (const TextView name : { u"a", u"b", u"c" })
        rows.appendField(name);
    rows.addRecord();
    rows.setLast(0, Value::ofNumber(1.5));
    rows.setLast(1, Value::ofTruth(false));
    RecordCells records(rows, 3, false, u',', store);
    EXPECT_EQ(text(records, 1, 0), u"1,5");
    EXPECT_EQ(text(records, 1, 1), u"False");
    EXPECT_EQ(text(records, 1, 2), u"");
}

TEST_F(RecordCellsTest, CompareRecordsInEveryDirection)
{
    TableRowSet rows = rowsOf({ { u"a" }, { u" a " }, { u"A" }, { u"" } });
    RecordCells records(rows, 1, false, u'.', store);
    const auto look = [&](std::int64_t position) {
        const Text now = text(records, position, 0);
        return std::pair(records.holds(position - 1, 0, now), records.holds(position + 1, 0, now));
    };
    EXPECT_EQ(look(1), std::pair(false, true));
    EXPECT_EQ(look(2), std::pair(true, false));
    EXPECT_EQ(look(3), std::pair(false, false));
    EXPECT_EQ(look(4), std::pair(false, false));
    EXPECT_EQ(look(2), std::pair(true, false));
    EXPECT_EQ(look(1), std::pair(false, true));
    EXPECT_FALSE(records.holds(5, 0, u""));
    EXPECT_FALSE(records.holds(0, 0, u""));
}

TEST_F(RecordCellsTest, TreatTheEmptyTextAsAnythingElse)
{
    TableRowSet rows = rowsOf({ { u"" }, { u" " } });
    rows.addRecord();
    RecordCells records(rows, 1, false, u'.', store);
    EXPECT_TRUE(records.holds(1, 0, u""));
    EXPECT_TRUE(records.holds(2, 0, u""));
    EXPECT_TRUE(records.holds(3, 0, u""));
}

TEST_F(RecordCellsTest, KeepCopiesOfTextsThatTheRowSetOnlyLends)
{
    FakeRecords source({ u"A", u"B" }, { { u"a1", u"b1" }, { u"a2", u"b2" } });
    LateBoundRows rows(source);
    RecordCells records(rows, 2, false, u'.', store);
    records.read(1, 0, 2);
    source.rows = { { u"", u"" }, { u"", u"" } };
    EXPECT_EQ(text(records, 1, 0), u"a1");
    EXPECT_EQ(text(records, 1, 1), u"b1");
}

TEST_F(RecordCellsTest, AreReadOnceForAllBandsOfAPage)
{
    TableRowSet table = rowsOf(numbered(100, 6));
    CountedRows rows(table);
    RecordCells records(rows, 6, true, u'.', store);
    for (std::int64_t first = 1; first <= 100; first += 25) {
        records.keepFrom(first - 1);
        for (std::size_t band = 0; band < 3; ++band) {
            for (std::int64_t position = first; position < first + 25; ++position) {
                if (band == 0)
                    records.read(position, 0, 6);
                const auto cells = records.read(position, 2 * band, 2);
                EXPECT_EQ(cells[1].text(),
                    decimal(static_cast<int>(position)) + u"."
                        + decimal(static_cast<int>(2 * band + 2)));
                records.holds(position - 1, 0, u"x");
                records.holds(position + 1, 0, u"x");
            }
        }
    }
    EXPECT_EQ(rows.reads, 600);
    EXPECT_LE(rows.moves, 200);
}

TEST_F(RecordCellsTest, AreReadAgainWhereNoMoreMayBeKept)
{
    TableRowSet table = rowsOf(numbered(100, 6));
    CountedRows rows(table);
    RecordCells records(rows, 6, true, u'.', store, 6 * 16);
    for (std::size_t band = 0; band < 3; ++band) {
        for (std::int64_t position = 1; position <= 100; ++position) {
            const auto cells = records.read(position, 2 * band, 2);
            EXPECT_EQ(cells[0].text(),
                decimal(static_cast<int>(position)) + u"."
                    + decimal(static_cast<int>(2 * band + 1)));
        }
    }
    EXPECT_EQ(rows.reads, 600); // only what each band prints
}

} // namespace pelloric
