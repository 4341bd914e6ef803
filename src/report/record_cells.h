// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/row_set.h"
#include "platform/text.h"
#include "platform/units.h"

#include <span>
#include <vector>

namespace pelloric {

class TextStore;

/// A cell of a record: its trimmed text, and what a look over it has told.
struct RecordCell {
    const char16_t* units = nullptr; ///< in the document's store
    std::uint32_t length = 0;
    Twips width = 0; ///< of the whole text, once it is measured: twips
    bool isRead = false;
    bool isMeasured = false;
    bool hasLineFeed = false; ///< once it is measured
    bool hasSeparator = false; ///< once it is measured: one that somebody typed

    TextView text() const { return { units, length }; }
};

/// The records around the one that is being printed, each cell of which is read once.
///
/// A page of rows that is printed in several bands keeps its records for all of them; how many
/// cells are kept at most is limited, and those beyond are read again when they are asked for.
class RecordCells {
public:
    /// Cells that a page keeps, about 200 MB: pages of 250 rows of 32,767 columns.
    static constexpr std::size_t MostCells = 8U << 20U;

    /// @param rows        borrowed; its cursor goes where something is read
    /// @param fieldCount  how many fields are printed, from the first on
    /// @param keepsPages  whether records from `keepFrom` on are kept
    /// @param store       where texts are kept that the row set only lends; borrowed
    /// @param mostCells   that are kept
    RecordCells(RowSet& rows, std::size_t fieldCount, bool keepsPages, char16_t decimalSeparator,
        TextStore& store, std::size_t mostCells = MostCells);

    /// The number of records, as it was at the beginning.
    std::int64_t count() const { return count_; }

    /// Whether there is such a record.
    /// @param position  from 1
    bool exists(std::int64_t position) const { return position >= 1 && position <= count_; }

    /// The cells of an existing record from one field on, each of them read.
    ///
    /// @param first  field from 0
    /// @param count  of fields
    /// @return       valid until another record is asked for
    /// @throws RunTimeError Overflow: a text longer than `MostCellUnits`; or of the row set
    std::span<RecordCell> read(std::int64_t position, std::size_t first, std::size_t count);

    /// Whether a record exists and its cell holds this text; null and the empty text are equal.
    bool holds(std::int64_t position, int field, TextView text);

    /// Records before this one are not asked for any more.
    void keepFrom(std::int64_t position) { keepFrom_ = position; }

private:
    std::size_t slotOf(std::int64_t position) const;
    RecordCell* cellsOf(std::int64_t position);
    bool grow();
    void readKept(std::span<RecordCell> cells, std::int64_t position, int first);
    void take(const Value& value, std::int64_t position, int field, RecordCell& cell);

    RowSet& rows_;
    TextStore& store_;
    std::size_t fieldCount_;
    std::size_t mostCells_;
    std::int64_t count_;
    std::int64_t keepFrom_ = 0;
    bool keepsPages_;
    bool keepsTexts_;
    char16_t decimalSeparator_;
    std::vector<std::int64_t> held_; ///< the record in each slot; 0: none
    std::vector<RecordCell> cells_; ///< slot by slot
    std::vector<Value> values_;
    Text buffer_;
};

} // namespace pelloric
