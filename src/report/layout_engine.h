// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/recorder.h"
#include "platform/progress.h"
#include "report/column_bands.h"
#include "report/page_fields.h"
#include "report/record_cells.h"

#include <memory>
#include <optional>
#include <span>
#include <vector>

namespace pelloric {

class RowSet;
struct PageSetup;
struct Platform;
struct ReportStyle;

/// What a report is laid out from; all of it is borrowed.
struct ReportSource {
    const ReportStyle& style;
    const PageSetup& setup;
    RowSet& rows; ///< its cursor is left where the layout ended
    std::span<const double> widths; ///< twips; one per printed column
    std::span<const ColPos> bands; ///< at least one
};

/// Lays the records of a row set out into pages, from the current, empty page on.
///
/// Every page of rows is printed once per band before the next rows follow. A row is as high as the
/// tallest cell of its whole record, so it is equally high in every band.
class LayoutEngine {
public:
    LayoutEngine(const ReportSource& source, const Platform& platform, PageDocument& document,
        Recorder& recorder);

    /// Builds all pages.
    ///
    /// @param progress  told before the rows and at each of them; there is at least one step
    /// @throws RunTimeError Overflow: more than 32767 pages, or a position past 32 bits; Cancelled:
    ///         by the message loop or the progress, before the rows or at any of them; or an error
    ///         of the row set
    void build(const Progress& progress);

    /// Where the titles of the last page were asked for, when there is a page header: twips.
    double titleTop() const { return titleTop_; }

private:
    /// A column of the band that is being printed.
    struct BandColumn {
        int field = 0; ///< from 0
        double left = 0; ///< exact left edge: twips
        double width = 0; ///< twips
        Twips edge = 0; ///< rounded left edge
        bool isPrinted = true; ///< false: too narrow to hold text
    };

    /// A cell of the row that is being placed.
    struct RowCell {
        TextView text; ///< in the document's store
        TextView printed; ///< without carriage returns
        Twips width = 0; ///< twips
        std::size_t firstLine = 0; ///< of `rowLines_`
        std::size_t lineCount = 0; ///< 0: a single line that fits
    };

    void startBand(std::size_t band);
    void drawHeader();
    void drawColumnTitles();
    void drawTitleTexts(Twips top);
    void layoutRow();
    void measureRow();
    double measureCells(std::size_t first, std::size_t count);
    double measureCell(RecordCell& cell, RowCell& row, double width);
    void printRow(Twips rowTop);
    void printCell(const BandColumn& column, Twips textTop);
    void drawRow(Twips top, Twips bottom, std::optional<std::uint32_t>& pattern, bool hasTopLine);
    std::vector<PatternLine> linesOfRow(bool hasTopLine) const;
    void drawMergedLines(Twips rowTop, Twips rowBottom, bool pageIsFull);
    void breakPage(Twips footerTop);
    void requireAnotherPage() const;
    void drawLine(Tpoint from, Tpoint to);
    TextView textOf(int field) const { return cells_[static_cast<std::size_t>(field)].text; }
    bool isBlankedByMerging(int field);
    bool equalsLeft(int field);
    bool equalsBelow(int field);

    ReportSource source_;
    const Platform& platform_;
    PageDocument& document_;
    Recorder& recorder_;
    PageLines pageLines_;

    std::vector<TextView> titles_; ///< in the document's store
    double titleHeight_ = -1; ///< twips; below 0: not measured yet
    double titleTop_ = 0;

    std::size_t band_ = 0; ///< from 0
    std::vector<BandColumn> columns_;
    Twips tableLeft_ = 0;
    Twips tableRight_ = 0;

    RecordCells records_;
    std::int64_t record_ = 1; ///< the one that is being placed, from 1
    std::vector<RowCell> cells_; ///< one per field
    std::vector<CellLine> rowLines_;
    std::vector<std::optional<std::uint32_t>> titlePatterns_; ///< by band
    std::vector<std::optional<std::uint32_t>> rowPatterns_; ///< by band
    double rowHeight_ = 0; ///< of the texts: twips
    std::vector<double> pageRowHeights_; ///< of the rows on the pages of the present rows
    std::size_t rowsOnPage_ = 0;
};

} // namespace pelloric
