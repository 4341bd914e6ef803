// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/layout_engine.h"

#include "document/limits.h"
#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/row_set.h"
#include "platform/run_time_error.h"
#include "platform/services.h"
#include "report/page_frame.h"
#include "report/page_limit.h"
#include "report/report_style.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr Twips Padding = CellPadding / 2; ///< above, below and left of a cell's text

} // namespace

LayoutEngine::LayoutEngine(const ReportSource& source, const Platform& platform,
    PageDocument& document, Recorder& recorder)
    : source_(source)
    , platform_(platform)
    , document_(document)
    , recorder_(recorder)
    , pageLines_(source.style, source.setup, platform.clock, recorder)
    , records_(source.rows, source.widths.size(), source.bands.size() > 1,
          platform.decimalSeparator, document.store())
    , cells_(source.widths.size())
    , titlePatterns_(source.bands.size())
    , rowPatterns_(source.bands.size())
{
}

void LayoutEngine::build(const Progress& progress)
{
    const std::int64_t records = records_.count();
    const auto bands = static_cast<std::int64_t>(source_.bands.size());
    for (std::size_t field = 0; field < source_.widths.size(); ++field)
        titles_.push_back(document_.store().add(
            withoutCarriageReturns(source_.rows.fieldName(static_cast<int>(field)))));
    recorder_.setLineAttributes(gridPen(source_.style));
    startBand(0);
    drawHeader();
    const std::int64_t steps = std::max<std::int64_t>(1, records * bands);
    std::int64_t done = 0;
    tell(progress, done, steps);
    drawColumnTitles();
    platform_.loop.runOnce();
    for (record_ = 1; record_ <= records; ++record_) {
        tell(progress, ++done, steps);
        platform_.loop.keepAlive();
        ++rowsOnPage_;
        layoutRow();
    }
    const PageSetup& setup = source_.setup;
    pageLines_.drawPageFooter(
        document_.currentPage + 1, static_cast<double>(setup.myHeight) - setup.intButtom + LineGap);
}

/// Centres the columns of a band on the paper.
void LayoutEngine::startBand(std::size_t band)
{
    band_ = band;
    const ColPos& columns = source_.bands[band];
    const auto first = static_cast<std::size_t>(columns.StartCol - 1);
    const auto count = static_cast<std::size_t>(columns.EndCol) - first;
    const auto widths = source_.widths.subspan(first, count);
    const double room = static_cast<double>(source_.setup.myWidth) - tableWidthOf(widths);
    tableLeft_ = roundToInt32(room / 2);
    columns_.clear();
    double left = tableLeft_;
    for (std::size_t column = 0; column < count; ++column) {
        const double width = widths[column];
        columns_.push_back({ static_cast<int>(first + column), left, width, roundToInt32(left),
            width > CellPadding });
        left += width;
    }
    tableRight_ = roundToInt32(left);
}

void LayoutEngine::drawHeader()
{
    recorder_.moveTo({ tableLeft_, source_.setup.intTop });
    pageLines_.drawPageHeader(document_.currentPage + 1);
}

/// Draws the titles, or only the table's top edge, below the current position.
void LayoutEngine::drawColumnTitles()
{
    const ReportStyle& style = source_.style;
    if (!style.ShowHeaders && !style.GridHor)
        return;
    const Twips top = below(recorder_.currentY(), LineGap);
    if (!style.ShowHeaders) {
        drawLine({ tableLeft_, top }, { tableRight_, top });
        return;
    }
    if (hasText(style.headerTexts))
        titleTop_ = recorder_.currentY();
    if (titleHeight_ < 0)
        titleHeight_ = recorder_.rowTextHeight(
            source_.rows, source_.widths, false, platform_.decimalSeparator);
    drawTitleTexts(top);
    const Twips bottom = below(top, CellPadding + titleHeight_);
    drawRow(top, bottom, titlePatterns_[band_], true);
    recorder_.setCurrentY(bottom);
}

/// A title breaks as a cell does: a typed separator makes it taller, and breaks it only when it
/// holds a line feed as well.
void LayoutEngine::drawTitleTexts(Twips top)
{
    for (const BandColumn& column : columns_) {
        if (!column.isPrinted)
            continue;
        document_.structure.beginCell(column.field);
        const TextView title = titles_[static_cast<std::size_t>(column.field)];
        const double left = column.left + Padding;
        rowLines_.clear();
        breakPrinted(title, column.width - CellPadding, recorder_.measured(), rowLines_);
        recorder_.moveTo({ roundToInt32(left), below(top, Padding) });
        recorder_.printLines(rowLines_, left, column.width);
    }
    document_.structure.endTitles(document_.currentPage);
}

/// Places the current record as a row of the band, and ends the page where it is full.
void LayoutEngine::layoutRow()
{
    const PageSetup& setup = source_.setup;
    const double marginTop = static_cast<double>(setup.myHeight) - setup.intButtom;
    const Twips rowTop = recorder_.currentY();
    measureRow();
    printRow(rowTop);
    const Twips rowBottom = below(rowTop, CellPadding + rowHeight_);
    const bool pageIsFull = rowBottom > marginTop - Padding;
    if (source_.style.GridMerge)
        drawMergedLines(rowTop, rowBottom, pageIsFull);
    else
        drawRow(rowTop, rowBottom, rowPatterns_[band_], false);
    const bool isLastRecord = record_ == records_.count();
    if (pageIsFull)
        breakPage(below(rowBottom, LineGap));
    else if (isLastRecord && band_ + 1 < source_.bands.size())
        breakPage(roundToInt32(marginTop + LineGap));
    else
        recorder_.moveTo({ tableLeft_, rowBottom });
}

/// Measures the whole record in the first band, and only the band's cells in the others, where the
/// heights of the same rows are known.
void LayoutEngine::measureRow()
{
    rowLines_.clear();
    if (band_ > 0 && rowsOnPage_ <= pageRowHeights_.size()) {
        measureCells(static_cast<std::size_t>(columns_.front().field), columns_.size());
        rowHeight_ = pageRowHeights_[rowsOnPage_ - 1];
        return;
    }
    rowHeight_ = measureCells(0, source_.widths.size());
    if (source_.bands.size() > 1)
        pageRowHeights_.push_back(rowHeight_);
}

/// @return  the height that the tallest of the cells needs: twips
double LayoutEngine::measureCells(std::size_t first, std::size_t count)
{
    double tallest = 0;
    std::size_t field = first;
    for (RecordCell& cell : records_.read(record_, first, count)) {
        tallest = std::max(tallest, measureCell(cell, cells_[field], source_.widths[field]));
        ++field;
    }
    return tallest;
}

/// @return  the height that the cell's text needs: twips
double LayoutEngine::measureCell(RecordCell& cell, RowCell& row, double width)
{
    row.text = cell.text();
    row.printed = row.text;
    row.lineCount = 0;
    if (width <= CellPadding)
        return 0;
    const MeasuredFont& font = recorder_.measured();
    if (!cell.isMeasured) {
        CellText seen = readCellText(row.text, font);
        cell.isMeasured = !seen.hasCarriageReturn;
        if (seen.hasCarriageReturn) {
            row.printed = document_.store().add(withoutCarriageReturns(row.text));
            seen = readCellText(row.printed, font);
        }
        cell.width = seen.width;
        cell.hasLineFeed = seen.hasLineFeed;
        cell.hasSeparator = seen.hasSeparator;
    }
    row.width = cell.width;
    const double room = width - CellPadding;
    const bool fits = cell.width <= room;
    if (fits && !cell.hasLineFeed && !cell.hasSeparator)
        return font.lineHeight;
    row.firstLine = rowLines_.size();
    breakText(row.printed, room, font, rowLines_);
    const auto height = static_cast<double>(rowLines_.size() - row.firstLine) * font.lineHeight;
    if (!cell.hasLineFeed && cell.hasSeparator) {
        // A typed separator makes the row taller but does not break the printed text.
        rowLines_.resize(row.firstLine);
        if (!fits)
            wrapText(row.printed, room, font, rowLines_);
    }
    row.lineCount = rowLines_.size() - row.firstLine;
    return height;
}

void LayoutEngine::printRow(Twips rowTop)
{
    const Twips textTop = below(rowTop, Padding);
    for (const BandColumn& column : columns_) {
        if (!column.isPrinted)
            continue;
        document_.structure.beginCell(column.field);
        if (!(source_.style.GridMerge && isBlankedByMerging(column.field)))
            printCell(column, textTop);
    }
    document_.structure.endRow(document_.currentPage);
}

void LayoutEngine::printCell(const BandColumn& column, Twips textTop)
{
    const RowCell& cell = cells_[static_cast<std::size_t>(column.field)];
    const double left = column.left + Padding;
    if (cell.lineCount > 0) {
        recorder_.moveTo({ roundToInt32(left), textTop });
        const std::span<const CellLine> lines = rowLines_;
        recorder_.printLines(lines.subspan(cell.firstLine, cell.lineCount), left, column.width);
        return;
    }
    const Twips x = roundToInt32(left + (column.width - cell.width) / 2);
    recorder_.printStored({ cell.printed, cell.width, true }, { x, textTop });
}

/// Draws the lines of a row, which all rows of the band have alike.
/// @param pattern   theirs; nothing: it is not known yet
/// @param hasTopLine  as the titles have
void LayoutEngine::drawRow(
    Twips top, Twips bottom, std::optional<std::uint32_t>& pattern, bool hasTopLine)
{
    if (!pattern)
        pattern = document_.addLinePattern(linesOfRow(hasTopLine));
    recorder_.rowLines(top, bottom, *pattern);
}

std::vector<PatternLine> LayoutEngine::linesOfRow(bool hasTopLine) const
{
    const std::uint32_t pen = recorder_.penNumber();
    const auto upright = [&](Twips x) { return PatternLine { x, x, false, true, pen }; };
    const auto level = [&](bool atBottom) {
        return PatternLine { tableLeft_, tableRight_, atBottom, atBottom, pen };
    };
    std::vector<PatternLine> lines;
    if (source_.style.GridVer) {
        for (const BandColumn& column : columns_)
            lines.push_back(upright(column.edge));
        lines.push_back(upright(tableRight_));
    }
    if (source_.style.GridHor) {
        if (hasTopLine)
            lines.push_back(level(false));
        lines.push_back(level(true));
    }
    return lines;
}

/// Draws the lines that merged cells leave of a row.
void LayoutEngine::drawMergedLines(Twips rowTop, Twips rowBottom, bool pageIsFull)
{
    if (source_.style.GridVer) {
        bool isFirst = true;
        for (const BandColumn& column : columns_) {
            if (isFirst || !equalsLeft(column.field))
                drawLine({ column.edge, rowTop }, { column.edge, rowBottom });
            isFirst = false;
        }
        drawLine({ tableRight_, rowTop }, { tableRight_, rowBottom });
    }
    if (!source_.style.GridHor)
        return;
    for (const BandColumn& column : columns_) {
        if (pageIsFull || !equalsBelow(column.field))
            drawLine({ column.edge, rowBottom },
                { roundToInt32(column.left + column.width), rowBottom });
    }
}

/// Ends the page and goes on with the same rows in the next band, or with the next rows in the
/// first.
void LayoutEngine::breakPage(Twips footerTop)
{
    pageLines_.drawPageFooter(document_.currentPage + 1, footerTop);
    requireAnotherPage();
    recorder_.newPage();
    startBand((band_ + 1) % source_.bands.size());
    if (band_ > 0) {
        record_ -= static_cast<std::int64_t>(rowsOnPage_);
    } else {
        pageRowHeights_.clear();
        records_.keepFrom(record_); // the last row of this page stands above the next one
    }
    rowsOnPage_ = 0;
    drawHeader();
    drawColumnTitles();
    recorder_.setCurrentX(tableLeft_);
}

/// @throws RunTimeError Overflow: the document is full; says how many rows fit
void LayoutEngine::requireAnotherPage() const
{
    if (document_.Totalpages < MostPages)
        return;
    const bool isLastBand = band_ + 1 == source_.bands.size();
    const auto unfinished = static_cast<std::int64_t>(isLastBand ? 0 : rowsOnPage_);
    throw RunTimeError(
        ErrorNumber::Overflow, tooManyPages(record_ - unfinished, source_.rows.recordCount()));
}

void LayoutEngine::drawLine(Tpoint from, Tpoint to)
{
    recorder_.moveTo(from);
    recorder_.lineTo(to);
}

/// Whether the cell says the same as the one above or the one to its left; it looks across pages
/// and bands.
bool LayoutEngine::isBlankedByMerging(int field)
{
    return records_.holds(record_ - 1, field, textOf(field)) || equalsLeft(field);
}

bool LayoutEngine::equalsLeft(int field)
{
    return field > 0 && records_.holds(record_, field - 1, textOf(field));
}

bool LayoutEngine::equalsBelow(int field)
{
    return records_.holds(record_ + 1, field, textOf(field));
}

} // namespace pelloric
