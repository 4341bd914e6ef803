// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/recorder.h"
#include "platform/progress.h"
#include "report/layout_engine.h"
#include "report/page_fields.h"
#include "report/shaped_rows.h"

#include <optional>
#include <span>
#include <unordered_map>
#include <vector>

namespace pelloric {

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

    /// How many bands the columns were cut into.
    std::size_t bandCount() const { return bands_.size(); }

    /// What the totals leave out.
    std::vector<LeftOut> leftOut() const { return rows_.leftOut(); }

private:
    /// What another band needs to lay the same row out again.
    struct PlannedRow {
        std::int64_t record = 0; ///< 0: a row of totals
        std::size_t total = 0; ///< which row of totals
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

    /// Where something stands: exact twips.
    struct Area {
        double left = 0;
        double right = 0;
        double top = 0;
        double bottom = 0;
    };

    void resolve();
    void resolveLines();
    void buildAcross();
    void buildDown();
    void beginPage(std::size_t band, bool isFirst);
    void startBand(std::size_t band);
    void drawTitles();
    void emptyPage();
    double measureTitle(std::size_t field, const MeasuredFont& body) const;
    void printTitle(const BandColumn& column, Twips top);
    void fillPage();
    void refillPage(const PlannedPage& page);
    void planPage();
    bool mayStay(const ShapedRow& row, double bottom);
    void endPage(bool isFull);

    void printRows();
    void fillBackgrounds(std::size_t at);
    void drawRowLines(std::size_t at);
    void ruleBelow(std::size_t at, bool isMerged);
    void recordRowLines(Twips top, Twips bottom);
    void printCells(std::size_t at);
    void printCell(std::size_t at, std::size_t place);
    void printPlain(const BandColumn& column, std::span<const CellLine> lines, Twips top);
    void printTotal(const BandColumn& column, std::span<const CellLine> lines, const Area& area);
    void printShown(const CellLook& look, std::span<const CellLine> lines, Area area);
    void printBox(std::size_t at, std::size_t place);
    double printMarks(const CellLook& look, const Area& area);
    TextView keptIcon(TextView file);
    void drawBranches(const CellLook& look, const Area& area);
    void drawCheckMark(CheckMark mark, double left, double top, double side);
    void underline(const CellLook& look, const CellLine& line, Tpoint at);
    void useFont(bool bold, bool italic, Color color);
    void usePen(const LinePen& pen);
    void drawLine(Tpoint from, Tpoint to);
    void fillBox(const Area& area, Color color);

    const CellLook* lookOf(const ShapedRow& row, int field) const;
    std::optional<Color> backgroundOf(const ShapedRow& row, const BandColumn& column) const;
    bool hasBackground(const ShapedRow& row) const;
    const BoxContent* boxOf(const CellLook* look) const;
    bool isSameBox(const ShapedRow& row, int field, const ShapedRow& other, int otherField) const;
    bool isBlanked(std::size_t at, int field) const;
    bool equalsLeft(const ShapedRow& row, int field) const;

    ShapedSource source_;
    const Platform& platform_;
    PageDocument& document_;
    Recorder& recorder_;
    PageLines pageLines_;
    Progress progress_;
    std::int64_t stepsDone_ = 0;
    std::int64_t steps_ = 1;

    std::vector<BandColumns> bands_;
    ShapedRows rows_; ///< reads `source_` and `bands_`
    double padding_; ///< on each side of a text: twips
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

    std::unordered_map<const char16_t*, TextView> icons_; ///< kept names by lent ones
    Text buffer_;

    std::vector<ShapedRow> page_; ///< the rows of the page
    std::vector<Twips> tops_; ///< of the page's rows, and the bottom of the last
    bool isFull_ = false; ///< the page's last row reaches the bottom margin
    std::vector<TextView> lastTexts_; ///< of the row before the page's first; empty: none
    std::vector<PlannedPage> plan_;
    std::optional<LinePen> pen_; ///< set last

    std::unordered_map<std::uint64_t, KnownStyle> styles_; ///< by colour, bold and italic
    std::optional<std::uint64_t> style_; ///< set last
    std::vector<PatternLine> rowLines_; ///< of the row that is drawn
    std::vector<PatternLine> patternLines_; ///< of the pattern that was drawn last
    std::uint32_t pattern_ = 0; ///< its number
};

} // namespace pelloric
