// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/text_store.h"
#include "platform/row_set.h"

#include <memory>
#include <unordered_set>
#include <vector>

namespace pelloric {

/// A row set in memory: 8 bytes a cell, and texts in a store that the document shares.
class TableRowSet final : public RowSet {
public:
    /// @param store  where the texts of the cells are kept
    explicit TableRowSet(std::shared_ptr<TextStore> store);

    /// Appends a field; only while there are no records.
    void appendField(TextView name);

    /// Whether a field of exactly that name exists.
    bool fieldExists(TextView name) const;

    /// Texts that stand in another store are not copied any more.
    void borrow(std::shared_ptr<const TextStore> texts) { lent_ = std::move(texts); }

    /// Makes room for records that are going to be added.
    void reserveRecords(std::int64_t records);

    /// Adds a record of null values behind the last one.
    void addRecord();

    /// Sets a field of the last record; a text is copied into the store unless it is a borrowed
    /// one.
    ///
    /// @param field  0 to `fieldCount() - 1`
    /// @throws RunTimeError Overflow: a text longer than `MostCellUnits`; TypeMismatch: an object
    void setLast(int field, const Value& value);

    int fieldCount() const override { return static_cast<int>(names_.size()); }
    TextView fieldName(int field) const override;
    std::int64_t recordCount() const override { return records_; }
    std::int64_t position() const override { return position_; }
    void setPosition(std::int64_t position) override;
    Value value(int field) override;
    void values(int first, std::span<Value> into) override;
    bool keepsTexts() const override { return true; }

    /// Bytes that the cells hold, the texts aside.
    std::size_t memoryBytes() const;

private:
    /// A number as it is; anything else as one of those numbers that are no number: a tag, and
    /// what it tells.
    using Cell = std::uint64_t;

    /// What a cell does not hold itself.
    struct LargeValue {
        double number = 0; ///< of a date
        TextView text;
    };

    /// @throws RunTimeError SubscriptOutOfRange: the position is on no record
    void requireRecord() const;
    Cell cellOf(const Value& value);
    Cell cellOfDate(double milliseconds);
    Cell cellOfText(TextView text);
    Cell largeCell(std::uint64_t tag, const LargeValue& value);
    Value valueOf(Cell cell) const;

    std::shared_ptr<TextStore> store_;
    std::shared_ptr<const TextStore> lent_; ///< null: none
    std::size_t lentBlock_ = 0; ///< where the text before was
    std::vector<LargeValue> large_;
    std::vector<Text> names_;
    std::unordered_set<Text> knownNames_;
    std::vector<Cell> cells_;
    std::int64_t records_ = 0;
    std::int64_t position_ = 0;
};

} // namespace pelloric
