// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/value.h"

#include <cstdint>
#include <span>

namespace pelloric {

/// The longest text of a cell, in code units (32 MB); a longer one is refused before it is copied.
inline constexpr std::size_t MostCellUnits = 1U << 24U;

/// Refuses a text that is longer than any cell may be.
/// @param record  from 1
/// @param field   from 0
/// @throws RunTimeError Overflow: names record and field
void requireCellLength(TextView text, std::int64_t record, int field);

/// A table of variant records with a cursor.
///
/// Positions count from 1; 0 stands before the first record and `recordCount() + 1` behind the
/// last. The bookmark of a record is its position.
class RowSet {
public:
    virtual ~RowSet() = default;

    /// The number of fields of every record.
    virtual int fieldCount() const = 0;

    /// @param field  0 to `fieldCount() - 1`
    /// @return       borrowed until the next call on this row set
    /// @throws RunTimeError SubscriptOutOfRange: no such field
    virtual TextView fieldName(int field) const = 0;

    /// The number of records.
    virtual std::int64_t recordCount() const = 0;

    /// Where the cursor stands, 0 to `recordCount() + 1`.
    virtual std::int64_t position() const = 0;

    /// Puts the cursor somewhere, kept within 0 to `recordCount() + 1`.
    virtual void setPosition(std::int64_t position) = 0;

    /// A field of the current record.
    ///
    /// @param field  0 to `fieldCount() - 1`
    /// @return       a text is borrowed until the next call, or as long as the text store lives
    ///               where `keepsTexts()` says so
    /// @throws RunTimeError SubscriptOutOfRange: no such field, or no current record
    virtual Value value(int field) = 0;

    /// Fields of the current record, from one on; only where `keepsTexts()` says that their texts
    /// stay.
    /// @throws RunTimeError as `value`
    virtual void values(int first, std::span<Value> into)
    {
        for (Value& each : into)
            each = value(first++);
    }

    /// Whether texts of this row set live in the text store that it shares with the document.
    virtual bool keepsTexts() const { return false; }

    bool isBeforeFirst() const { return position() <= 0; }
    bool isAfterLast() const { return position() > recordCount(); }

    // The moves of hosts that walk a set of their own; a build goes to positions.

    /// Stands on the first record, or behind the last of an empty set.
    void moveFirst() { setPosition(1); }
    /// One further; behind the last record it stays.
    void moveNext() { setPosition(position() + 1); }
    /// One back; before the first record it stays.
    void movePrevious() { setPosition(position() - 1); }
    /// @param records  how many further, back when negative; stops before the first record
    void moveRelative(std::int64_t records) { setPosition(position() + records); }
};

} // namespace pelloric
