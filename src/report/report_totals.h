// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "report/shown_number.h"

#include <pelloric/options.h>

#include <optional>
#include <span>
#include <vector>

namespace pelloric {

/// Adds up the numbers of columns, for the rows of a group or of a whole report.
///
/// Totals have as many decimals as the most precise of their cells, a mean up to two more; they
/// are grouped where one of their cells is.
class Totals {
public:
    /// @param fields      of the aggregations, in their order: from 0
    /// @param separators  the decimal separators of their texts, in the same order
    Totals(std::span<const Aggregation> aggregations, std::span<const int> fields,
        std::span<const char16_t> separators);

    /// Forgets all rows.
    void clear();

    /// Takes a cell into account.
    ///
    /// @param place   which of the aggregations
    /// @param number  what the cell shows; nothing: no number, which only counts when it is a text
    /// @param isText  whether the cell shows anything
    void add(std::size_t place, std::optional<ShownNumber> number, bool isText);

    /// How many rows of totals there are: one per function that occurs.
    std::size_t rowCount() const { return functions_.size(); }
    AggregateFunction function(std::size_t row) const { return functions_[row]; }

    /// The text of a field in a row of totals; empty where nothing is to be said: no cell shows a
    /// number, and they are not just counted.
    Text text(std::size_t row, int field) const;

    /// How many texts an aggregation left out because they show no number.
    std::int64_t leftOut(std::size_t place) const;

private:
    /// A sum that loses no small part to a large one.
    struct Column {
        AggregateFunction function = AggregateFunction::Sum;
        int field = 0;
        char16_t separator = u'.';
        char16_t grouping = 0; ///< 0: no cell is grouped
        int decimals = 0;
        double sum = 0;
        double lost = 0;
        std::int64_t numbers = 0;
        std::int64_t texts = 0;
        double least = 0;
        double most = 0;
    };

    static Text shown(const Column& column, double number, int decimals);
    static Text meanOf(const Column& column);

    std::vector<Column> columns_;
    std::vector<AggregateFunction> functions_;
};

/// The words of totals in English.
TotalWords englishTotalWords();

/// These words, the empty ones in the language in force.
TotalWords completed(const TotalWords& given);

/// What the row of a function is called.
const Text& wordOf(const TotalWords& words, AggregateFunction function);

} // namespace pelloric
