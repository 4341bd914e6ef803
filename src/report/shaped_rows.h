// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/cell_lines.h"
#include "platform/cell_look.h"
#include "report/report_fit.h"
#include "report/report_totals.h"

#include <deque>
#include <functional>
#include <map>
#include <optional>
#include <span>
#include <utility>
#include <vector>

namespace pelloric {

class PageDocument;
class RowSet;
struct Platform;
struct ReportStyle;

/// What a shaped report is laid out from; all of it is borrowed.
struct ShapedSource {
    const ReportStyle& style;
    const PageSetup& setup;
    RowSet& rows; ///< its cursor is left where the layout ended
    std::span<const double> widths; ///< twips; one per printed column, shrunk already
    const ReportOptions& options;
    double scale = 1; ///< what widths and body font were shrunk by
    CellLooks* looks = nullptr; ///< null: no looks are asked for or known
    std::span<const int> lookColumns; ///< of the grid, one per printed column
    std::span<const std::int64_t> lookRows; ///< of the looks, one per record; empty: in order
    std::int32_t firstLookRow = 1; ///< what the first record shows, where `lookRows` is empty
    /// Tells the number that a cell shows: record from 1, field from 0. May be empty.
    std::function<std::optional<double>(std::int64_t record, int field)> number;

    /// The row of the looks that a record shows.
    std::int32_t lookRow(std::int64_t record) const;
};

/// A cell of a row, measured.
struct ShapedCell {
    TextView text; ///< trimmed; lives in the document's store
    std::size_t firstLine = 0; ///< of the row's lines
    std::size_t lineCount = 0; ///< 0: nothing is printed
};

/// A row of the table or of totals, measured.
struct ShapedRow {
    std::int64_t record = 0; ///< from 1; 0: a row of totals
    std::size_t total = 0; ///< which row of totals
    bool startsGroup = false;
    double textHeight = 0; ///< twips
    std::vector<ShapedCell> cells; ///< one per field
    std::vector<CellLine> lines;
    std::vector<CellLook> looks; ///< one per field; empty: none are asked for

    bool isTotal() const { return record == 0; }

    std::span<const CellLine> linesOf(const ShapedCell& cell) const
    {
        return std::span(lines).subspan(cell.firstLine, cell.lineCount);
    }
};

/// What a box over several cells shows, read at the first of its cells that is printed.
struct BoxContent {
    CellLook look;
    TextView text; ///< lives in the document's store
};

/// Reads the records of a shaped report one after the other and measures them; rows of totals come
/// behind the groups and at the end.
class ShapedRows {
public:
    /// @param document  keeps the texts
    /// @param bands     of the fields; borrowed, and cut before the first row is read
    ShapedRows(const ShapedSource& source, const Platform& platform, PageDocument& document,
        const std::vector<BandColumns>& bands);

    /// Finds the columns that the options name.
    /// @throws RunTimeError InvalidCall: there is no column of that title
    void resolve(std::span<const Text> titles);

    /// What the totals of the rows read so far leave out.
    std::vector<LeftOut> leftOut() const;

    /// Reads ahead. @return  whether there are so many rows to print
    bool ensure(std::size_t count);

    /// The next row; there is one.
    const ShapedRow& next() const { return rows_.front(); }
    ShapedRow takeNext();

    /// Gives the memory of a row back.
    void giveBack(ShapedRow row) { spare_.push_back(std::move(row)); }

    /// A row that was taken before, for another band.
    ShapedRow takeAgain(std::int64_t record, std::size_t total);

    /// The height of the group that begins with the next row; no further than a page is high.
    double groupHeight();

    double height(const ShapedRow& row) const { return row.textHeight + 2 * padding_; }
    double padding() const { return padding_; }

    /// The body font, upright or slanted, plain or bold.
    const MeasuredFont& font(bool bold, bool italic) const;
    /// The height of a line of the body font: twips.
    double lineHeight() const;

    /// The room that check box and icon take before a text: twips.
    double marksWidth(const CellLook& look) const;

    /// The lines of a text in a room, broken or cut as a look says.
    void breakShown(
        TextView text, const CellLook& look, double room, std::vector<CellLine>& lines) const;

    /// What a box shows; null: no row of it was read.
    const BoxContent* box(const CellBox& box) const;
    /// Boxes that end with the row of a record, or before it, are not needed any more.
    void closeBoxes(std::int64_t record);
    /// Another band begins.
    void forgetBoxes() { boxes_.clear(); }

private:
    using TotalTexts = std::vector<TextView>; ///< one per field
    using BoxKey = std::pair<std::int32_t, std::int32_t>; ///< last row and first column

    void readNext();
    void readRow(std::int64_t record, ShapedRow& row);
    TextView readText(int field);
    void measureCell(int field, ShapedRow& row);
    void measureShown(int field, ShapedRow& row);
    void openBox(int field, ShapedRow& row);
    char16_t separatorOf(int field);
    void noteNumbers(const ShapedRow& row);
    std::optional<ShownNumber> numberOf(
        std::int64_t record, int field, TextView text, char16_t separator) const;
    void closeGroup();
    void addTotals(const Totals& totals, TextView name);
    void layTotals(std::size_t total, ShapedRow& row);
    bool beginsGroup(const ShapedRow& row) const;
    double boxWidth(const CellBox& box, int field) const;
    ShapedRow takeSpare();

    const ShapedSource& source_;
    const Platform& platform_;
    PageDocument& document_;
    const std::vector<BandColumns>& bands_;
    double padding_; ///< on each side of a text: twips
    mutable MeasuredFont fonts_[2][2]; ///< of the body: by bold and italic
    std::vector<int> groupFields_;
    std::vector<int> totalFields_;
    std::vector<char16_t> separators_; ///< decimal ones of the totals' fields

    std::deque<ShapedRow> rows_; ///< read, not taken yet
    std::vector<ShapedRow> spare_; ///< their memory is used again
    std::int64_t nextRecord_ = 1;
    bool isRead_ = false; ///< all records and totals have been read
    std::vector<TextView> groupTexts_; ///< of the row that was read last
    TotalWords words_; ///< none is empty
    Totals groupTotals_;
    Totals allTotals_;
    std::vector<TotalTexts> totalTexts_;
    std::map<BoxKey, BoxContent> boxes_;
    Text buffer_;
};

} // namespace pelloric
