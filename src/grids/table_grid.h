// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/kept_cells.h"
#include "document/text_store.h"
#include "platform/automation_object.h"
#include "platform/cell_look.h"
#include "platform/units.h"

#include <optional>
#include <vector>

namespace pelloric {

/// A column of an in-memory table.
struct TableColumn {
    Text title;
    Twips width = 0; ///< -1: the default width, which a reader replaces on the grid
    CellAlignment alignment = CellAlignment::Left; ///< of the title, where cells have looks
    /// Where cells have looks: how wide the column is shown; nothing: not known.
    std::optional<Twips> shownWidth {};
};

/// A flex grid over a table of texts in memory: `Cols`, `Rows`, `ColWidth`, `TextMatrix`.
///
/// Row 0 holds the titles, the rows that were added follow. The texts of all cells stand one behind
/// the other in one store, which whoever reads them can share, so that a table of a million rows
/// costs little more than its texts.
class TableGrid final : public AutomationObject, public KeptCells, public CellLooks {
public:
    /// Empty ones count: a wide table of few values takes its room all the same.
    static constexpr std::uint64_t MostCells = 1ULL << 29U;

    /// A table without rows.
    explicit TableGrid(std::vector<TableColumn> columns);

    /// Makes room, so that adding moves nothing.
    void reserve(std::size_t rows);

    /// Adds columns at the right, empty in the rows that are there.
    /// @param count   how many columns there are then; not fewer than now
    /// @param column  what each of the new ones is
    /// @throws RunTimeError Overflow: more than `MostCells`; the table is as before
    void widen(std::size_t count, const TableColumn& column);

    /// Adds a row at the end.
    ///
    /// @param cells  left to right; cells that are missing at the end are empty
    /// @throws RunTimeError SubscriptOutOfRange: more cells than columns; Overflow: a row of 2^32
    ///         code units or more, or more than `MostCells`; the table is as before
    /// @param looks  numbers of the looks of these cells; others have look 0; may be empty
    void addRow(std::span<const TextView> cells, std::span<const std::uint16_t> looks = {});

    /// What cells look like besides their texts, by the numbers that rows name; a table without
    /// rows is given them.
    void setLooks(std::vector<CellLook> looks);
    const std::vector<CellLook>& looks() const { return looks_; }
    /// The number of a cell's look; 0 where there are none.
    std::uint16_t lookNumber(std::int64_t row, int column) const;

    int columnCount() const { return static_cast<int>(columns_.size()); }
    /// The number of rows that were added; the row of titles does not count.
    std::int64_t rowCount() const { return static_cast<std::int64_t>(rowStarts_.size()); }
    const TableColumn& column(int column) const;

    /// @param row     0 the first that was added
    /// @param column  from 0
    /// @return        valid as long as the texts are kept
    /// @throws RunTimeError SubscriptOutOfRange
    TextView cell(std::int64_t row, int column) const;

    std::optional<MemberId> findMember(TextView name) override;
    const void* memberTable() const override;
    Value get(MemberId member, std::span<const Value> arguments) override;
    void put(MemberId member, std::span<const Value> arguments, const Value& value) override;

    std::shared_ptr<const TextStore> keptTexts() const override { return store_; }
    void rowTexts(std::int32_t row, std::span<TextView> into) const override;

    bool hasLooks() const override { return !looks_.empty(); }
    CellLooks* cellLooks() override { return hasLooks() ? this : nullptr; }
    TextView text(std::int32_t row, std::int32_t column) override { return cell(row - 1, column); }
    GridLook gridLook() override { return {}; }
    void readLook(std::int32_t row, std::int32_t column, CellLook& look) override;
    CellAlignment titleAlignment(std::int32_t column) override;
    bool isMarked(std::int32_t) override { return false; }
    std::optional<double> number(std::int32_t, std::int32_t) override { return std::nullopt; }

private:
    void requireRoom(std::size_t rows, std::size_t columns) const;

    std::vector<TableColumn> columns_;
    std::shared_ptr<TextStore> store_; ///< lives on where pages show its texts
    std::vector<const char16_t*> rowStarts_; ///< a row's cells, one behind the other
    std::vector<std::uint32_t> cellEnds_; ///< where a cell ends, counted from its row's start
    std::vector<CellLook> looks_;
    std::vector<std::uint16_t> cellLooks_; ///< numbers of looks, of every cell; empty without looks
};

} // namespace pelloric
