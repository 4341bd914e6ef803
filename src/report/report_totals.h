// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <pelloric/options.h>

#include <optional>
#include <vector>

namespace pelloric {

/// Adds up the numbers of columns, for the rows of a group or of a whole report.
class Totals {
public:
    /// @param fields  of the aggregations, in their order: from 0
    Totals(std::span<const Aggregation> aggregations, std::span<const int> fields);

    /// Forgets all rows.
    void clear();

    /// Takes a cell into account.
    ///
    /// @param place   which of the aggregations
    /// @param number  what the cell shows; nothing: no number, which only counts when it is a text
    /// @param isText  whether the cell shows anything
    void add(std::size_t place, std::optional<double> number, bool isText);

    /// How many rows of totals there are: one per function that occurs.
    std::size_t rowCount() const { return functions_.size(); }
    AggregateFunction function(std::size_t row) const { return functions_[row]; }

    /// The text of a field in a row of totals; empty where nothing is to be said.
    Text text(std::size_t row, int field, char16_t decimalSeparator) const;

private:
    /// A sum that loses no small part to a large one.
    struct Column {
        AggregateFunction function = AggregateFunction::Sum;
        int field = 0;
        double sum = 0;
        double lost = 0;
        std::int64_t numbers = 0;
        std::int64_t texts = 0;
        double least = 0;
        double most = 0;
    };

    std::vector<Column> columns_;
    std::vector<AggregateFunction> functions_;
};

/// What a row of totals is called: "Sum", "Count", "Mean", "Minimum", "Maximum".
TextView functionName(AggregateFunction function);

/// The number that a text shows as a whole, with the decimal separator of the texts; nothing: it
/// shows no number.
std::optional<double> shownNumber(TextView text, char16_t decimalSeparator);

} // namespace pelloric
