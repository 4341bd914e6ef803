// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/row_set.h"

#include <pelloric/options.h>

#include <vector>

namespace pelloric {

class CellLooks;
class GridTable;

/// Some records and fields of a row set, in an order of their own; walked in place.
class ChosenRows final : public RowSet {
public:
    /// @param rows     borrowed; its cursor is moved
    /// @param fields   of the row set, from 0, left to right
    /// @param records  of the row set, from 1, in order
    ChosenRows(RowSet& rows, std::vector<int> fields, std::vector<std::int64_t> records);

    int fieldCount() const override { return static_cast<int>(fields_.size()); }
    TextView fieldName(int field) const override;
    std::int64_t recordCount() const override { return static_cast<std::int64_t>(records_.size()); }
    std::int64_t position() const override { return position_; }
    void setPosition(std::int64_t position) override;
    Value value(int field) override;
    bool keepsTexts() const override { return rows_.keepsTexts(); }

    const std::vector<int>& fields() const { return fields_; }
    const std::vector<std::int64_t>& records() const { return records_; }

private:
    int fieldOf(int field) const;

    RowSet& rows_;
    std::vector<int> fields_;
    std::vector<std::int64_t> records_;
    std::int64_t position_ = 0;
};

/// The fields of the columns with these titles.
/// @param names  the titles of the fields
/// @throws RunTimeError InvalidCall: there is no column of that title
std::vector<int> fieldsNamed(std::span<const Text> titles, std::span<const Text> names);

/// The key columns that the options ask for, from 0.
/// @throws RunTimeError InvalidCall: there is no column of that title
std::vector<int> keyFieldsOf(const ReportOptions& options, std::span<const Text> titles);

/// The records that the options choose, from 1, in order.
///
/// @param looks     tells which rows are marked, or null
/// @param firstRow  the row of the looks that the first record shows
/// @throws RunTimeError InvalidCall: marked rows are asked for and no row is marked, or the grid
///         knows no marks
std::vector<std::int64_t> chosenRecords(RowSet& rows, const ReportOptions& options,
    CellLooks* looks, std::int32_t firstRow, char16_t decimalSeparator);

} // namespace pelloric
