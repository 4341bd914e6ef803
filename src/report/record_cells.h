// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/row_set.h"
#include "platform/text.h"

#include <array>
#include <vector>

namespace pelloric {

/// The trimmed texts of the record that is being printed, and, where cells are merged, of the
/// records before and behind it.
class RecordTexts {
public:
    /// @param rows        borrowed; its cursor is put back after every look aside
    /// @param fieldCount  how many fields are read, from the first on
    /// @param neighbours  whether the records before and behind are read too
    RecordTexts(RowSet& rows, std::size_t fieldCount, bool neighbours, char16_t decimalSeparator);

    /// Reads the record under the row set's cursor; texts handed out before are gone unless the
    /// row set keeps them.
    void readCurrent();

    /// A trimmed text of the current record; null gives the empty text.
    TextView current(int field) const { return at(1).texts[static_cast<std::size_t>(field)]; }

    /// Whether that text lives in the store that row set and document share.
    bool isStored(int field) const { return at(1).stored[static_cast<std::size_t>(field)] != 0; }

    /// Whether the record before exists and holds this text in the field.
    bool previousEquals(int field, TextView text) const { return equals(0, field, text); }

    /// Whether the record behind exists and holds this text in the field.
    bool nextEquals(int field, TextView text) const { return equals(2, field, text); }

private:
    struct Record {
        std::int64_t position = -1; ///< -1: nothing read
        std::vector<TextView> texts;
        std::vector<std::uint8_t> stored;
        std::vector<Text> buffers; ///< texts of values that the row set does not keep
    };

    const Record& at(std::size_t place) const { return records_[order_[place]]; }
    void read(std::size_t place, std::int64_t position);
    bool equals(std::size_t place, int field, TextView text) const;
    bool exists(std::int64_t position) const;

    RowSet& rows_;
    bool neighbours_;
    char16_t decimalSeparator_;
    std::array<Record, 3> records_;
    std::array<std::size_t, 3> order_ { 0, 1, 2 }; ///< previous, current, next
};

} // namespace pelloric
