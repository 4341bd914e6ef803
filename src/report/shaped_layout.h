// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/recorder.h"
#include "platform/cell_look.h"
#include "platform/progress.h"
#include "report/layout_engine.h"
#include "report/page_fields.h"
#include "report/report_fit.h"
#include "report/report_totals.h"

#include <deque>
#include <functional>
#include <optional>
#include <span>
#include <vector>

namespace pelloric {

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
};

/// Lays records out as report options ask: with key columns in every band, pages across or down
/// first, groups held together, rows of totals, and cells that look as their view shows them.
///
/// Page breaks, grid lines, header, footer and the room for texts follow the plain page, and so do
/// the cells unless looks are given. A row that would leave the paper begins another page, and a
/// last page without rows is never begun.
class ShapedLayout {
public:
    ShapedLayout(const ShapedSource& source, const Platform& platform, PageDocument& document,
        Recorder& recorder);

    /// Builds all pages. @throws RunTimeError as `LayoutEngine::build`; InvalidCall: a column that
    /// the options name is not there
    void build(const Progress& progress);

    /// Where the titles of the last page were asked for, when there is a page header: twips.
    double titleTop() const { return titleTop_; }

private:
    /// A cell of a row, measured.
    struct Cell {
        TextView text; ///< trimmed; lives in the document's store
        std::size_t firstLine = 0; ///< of the row's lines
        std::size_t lineCount = 0; ///< 0: nothing is printed
    };

    /// A row of the table or of totals.
    struct Row {
        std::int64_t record = 0; ///< from 1; 0: a row of totals
        bool startsGroup = false;
        double textHeight = 0; ///< twips
        std::vector<Cell> cells; ///< one per field
        std::vector<CellLine> lines;
        std::vector<CellLook> looks; ///< one per field; empty: none are asked for

        bool isTotal() const { return record == 0; }
    };

    /// What another band needs to lay the same row out again.
    struct PlannedRow {
        std::int64_t record = 0; ///< 0: a row of totals
        std::size_t total = 0; ///< of `totalTexts_`
    };

    /// A page of rows as it was cut in the first band.
    struct PlannedPage {
        std::vector<PlannedRow> rows;
        bool isFull = false; ///< its footer stands under the table
    };

    /// A column of the band that is being printed.
    struct BandColumn {
        int field = 0;
        double left = 0; ///< exact: twips
        double width = 0; ///< twips
        Twips edge = 0; ///< rounded left edge
        bool isPrinted = true;
    };

    /// A box over several cells whose rows are being printed.
    struct OpenBox {
        CellBox box;
        CellLook look;
        std::vector<CellLine> lines;
    };

    /// Where something stands: exact twips.
    struct Area {
        double left = 0;
        double right = 0;
        double top = 0;
        double bottom = 0;
    };

    using TotalTexts = std::vector<TextView>; ///< one per field

    void resolve();
    void resolveLines();
    void buildAcross();
    void buildDown();
    void beginPage(std::size_t band, bool isFirst);
    void startBand(std::size_t band);
    void drawTitles();
    double measureTitle(std::size_t field, const MeasuredFont& body) const;
    void printTitle(const BandColumn& column, Twips top);
    void fillPage();
    void refillPage(const PlannedPage& page);
    void planPage();
    bool mayStay(const Row& row, double bottom);
    void endPage(bool isFull);

    bool ensureRows(std::size_t count);
    void readNext();
    void readRow(std::int64_t record, Row& row);
    TextView readText(int field);
    void measureCell(int field, Row& row);
    void measureShown(int field, Row& row);
    void noteNumbers(const Row& row);
    void closeGroup();
    void addTotals(const Totals& totals, TextView name);
    void layTotals(std::size_t total, Row& row);
    bool beginsGroup(const Row& row) const;
    double groupHeight();
    Row takeSpare();

    void printRows();
    void fillBackgrounds(std::size_t at);
    void drawRowLines(std::size_t at);
    void printCells(std::size_t at);
    void printPlain(const BandColumn& column, const Row& row, const Cell& cell, Twips top);
    void printShown(const CellLook& look, std::span<const CellLine> lines, Area area);
    void printBox(std::size_t at, std::size_t place);
    double printMarks(const CellLook& look, const Area& area);
    void drawBranches(const CellLook& look, const Area& area);
    void drawCheckMark(CheckMark mark, double left, double top, double side);
    void underline(const CellLook& look, const CellLine& line, Tpoint at);
    void useFont(bool bold, bool italic, Color color);
    void usePen(const LinePen& pen);
    void drawLine(Tpoint from, Tpoint to);
    void fillBox(const Area& area, Color color);

    const MeasuredFont& font(bool bold, bool italic);
    const CellLook* lookOf(const Row& row, int field) const;
    const OpenBox* openBox(const CellLook* look) const;
    bool isSameBox(const Row& row, int field, const Row& other, int otherField) const;
    bool isBlanked(std::size_t at, int field) const;
    bool equalsLeft(const Row& row, int field) const;
    double rowHeight(const Row& row) const { return row.textHeight + 2 * padding_; }
    double marksWidth(const CellLook& look) const;
    double boxWidth(const CellLook& look, int field) const;
    bool isAnchor(const CellLook& look, std::int64_t record, int field) const;
    std::int32_t lookRow(std::int64_t record) const;

    ShapedSource source_;
    const Platform& platform_;
    PageDocument& document_;
    Recorder& recorder_;
    PageLines pageLines_;
    Progress progress_;
    std::int64_t stepsDone_ = 0;
    std::int64_t steps_ = 1;

    double padding_ = 0; ///< on each side of a text: twips
    MeasuredFont fonts_[2][2]; ///< of the body: by bold and italic
    double lineHeight_ = 0; ///< of the body font: twips
    std::vector<int> groupFields_;
    std::vector<int> totalFields_;
    std::vector<BandColumns> bands_;
    GridLook gridLook_;
    LinePen gridPen_;
    bool drawsHor_ = false;
    bool drawsVer_ = false;

    std::vector<TextView> titles_; ///< in the document's store
    double titleHeight_ = -1; ///< twips; below 0: not measured yet
    double titleTop_ = 0;

    std::vector<BandColumn> columns_;
    Twips tableLeft_ = 0;
    Twips tableRight_ = 0;
    Twips top_ = 0; ///< of the first row of the page
    double footerHeight_ = 0;

    std::deque<Row> rows_; ///< read, not printed yet
    std::vector<Row> spare_; ///< their memory is used again
    std::int64_t nextRecord_ = 1;
    bool isRead_ = false; ///< all records and totals have been read
    std::vector<TextView> groupTexts_; ///< of the row that was read last
    Totals groupTotals_;
    Totals allTotals_;
    std::vector<TotalTexts> totalTexts_;
    std::vector<OpenBox> boxes_;
    Text buffer_;

    std::vector<Row> page_; ///< the rows of the page
    std::vector<Twips> tops_; ///< of the page's rows, and the bottom of the last
    bool isFull_ = false; ///< the page's last row reaches the bottom margin
    std::vector<TextView> lastTexts_; ///< of the row before the page's first; empty: none
    std::vector<PlannedPage> plan_;
    std::optional<LinePen> pen_; ///< set last
};

} // namespace pelloric
