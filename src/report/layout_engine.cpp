// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/layout_engine.h"

#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/row_set.h"
#include "platform/services.h"
#include "report/report_style.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr Twips Padding = CellPadding / 2; ///< above, below and left of a cell's text
constexpr Twips LineGap = 144; ///< between header line and titles, and above the footer

/// A position further down, checked for 32 bits.
Twips below(Twips y, double distance) { return roundToInt32(static_cast<double>(y) + distance); }

LinePen gridPen(const ReportStyle& style)
{
    return { .LineColor = style.GridLineColor, .FillColor = style.HeaderColor };
}

bool hasText(const SlotTexts& slots)
{
    return std::any_of(slots.begin(), slots.end(), [](const Text& text) { return !text.empty(); });
}

} // namespace

LayoutEngine::LayoutEngine(const ReportSource& source, const Platform& platform,
    PageDocument& document, Recorder& recorder)
    : source_(source)
    , platform_(platform)
    , document_(document)
    , recorder_(recorder)
    , pageLines_(source.style, source.setup, platform.clock, recorder)
    , records_(source.rows, source.widths.size(), source.style.GridMerge, platform.decimalSeparator)
    , cells_(source.widths.size())
{
}

void LayoutEngine::build(ProgressListener& progress)
{
    const std::int64_t records = source_.rows.recordCount();
    const auto bands = static_cast<std::int64_t>(source_.bands.size());
    for (std::size_t field = 0; field < source_.widths.size(); ++field)
        titles_.push_back(document_.store().add(
            withoutCarriageReturns(source_.rows.fieldName(static_cast<int>(field)))));
    recorder_.setLineAttributes(gridPen(source_.style));
    startBand(0);
    drawHeader();
    progress.begin(std::max<std::int64_t>(1, records * bands));
    drawColumnTitles();
    source_.rows.moveFirst();
    platform_.loop.runOnce();
    while (!source_.rows.isAfterLast()) {
        progress.advance();
        ++rowsOnPage_;
        layoutRow();
        source_.rows.moveNext();
    }
    progress.end();
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
    if (style.GridVer) {
        for (const BandColumn& column : columns_)
            drawLine({ column.edge, top }, { column.edge, bottom });
        drawLine({ tableRight_, top }, { tableRight_, bottom });
    }
    if (style.GridHor) {
        drawLine({ tableLeft_, top }, { tableRight_, top });
        drawLine({ tableLeft_, bottom }, { tableRight_, bottom });
    }
    recorder_.setCurrentY(bottom);
}

/// A title breaks as a cell does: a typed separator makes it taller, and breaks it only when it
/// holds a line feed as well.
void LayoutEngine::drawTitleTexts(Twips top)
{
    for (const BandColumn& column : columns_) {
        if (!column.isPrinted)
            continue;
        const TextView title = titles_[static_cast<std::size_t>(column.field)];
        const double left = column.left + Padding;
        const double room = column.width - CellPadding;
        const MeasuredFont& font = recorder_.measured();
        const Twips width = font.width(title);
        rowLines_.clear();
        if (title.find(u'\n') != TextView::npos)
            breakText(title, room, font, rowLines_);
        else if (width <= room)
            rowLines_.push_back({ title, width, true });
        else
            wrapText(title, room, font, rowLines_);
        recorder_.moveTo({ roundToInt32(left), below(top, Padding) });
        recorder_.printLines(rowLines_, left, column.width);
    }
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
    if (source_.style.GridVer)
        drawVerticalLines(rowTop, rowBottom);
    if (source_.style.GridHor)
        drawRowLine(rowBottom, pageIsFull);
    const bool isLastRecord = source_.rows.position() == source_.rows.recordCount();
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
    records_.readCurrent();
    rowLines_.clear();
    if (band_ > 0 && rowsOnPage_ <= pageRowHeights_.size()) {
        for (const BandColumn& column : columns_)
            measureCell(column.field, column.width);
        rowHeight_ = pageRowHeights_[rowsOnPage_ - 1];
        return;
    }
    rowHeight_ = 0;
    for (std::size_t field = 0; field < source_.widths.size(); ++field)
        rowHeight_
            = std::max(rowHeight_, measureCell(static_cast<int>(field), source_.widths[field]));
    if (source_.bands.size() > 1)
        pageRowHeights_.push_back(rowHeight_);
}

/// @return  the height that the cell's text needs: twips
double LayoutEngine::measureCell(int field, double width)
{
    if (width <= CellPadding)
        return 0;
    const MeasuredFont& font = recorder_.measured();
    RowCell& cell = cells_[static_cast<std::size_t>(field)];
    cell.text = readCellText(records_.current(field), font);
    cell.isStored = records_.isStored(field);
    cell.lineCount = 0;
    if (cell.text.hasCarriageReturn) {
        const Text cleaned = withoutCarriageReturns(cell.text.text);
        cell.text = readCellText(document_.store().add(cleaned), font);
        cell.isStored = true;
    }
    const double room = width - CellPadding;
    const bool fits = cell.text.width <= room;
    if (fits && !cell.text.hasLineFeed && !cell.text.hasSeparator)
        return font.lineHeight;
    if (!cell.isStored) {
        cell.text.text = document_.store().add(cell.text.text);
        cell.isStored = true;
    }
    cell.firstLine = rowLines_.size();
    breakText(cell.text.text, room, font, rowLines_);
    const auto height = static_cast<double>(rowLines_.size() - cell.firstLine) * font.lineHeight;
    if (!cell.text.hasLineFeed && cell.text.hasSeparator) {
        // A typed separator makes the row taller but does not break the printed text.
        rowLines_.resize(cell.firstLine);
        if (!fits)
            wrapText(cell.text.text, room, font, rowLines_);
    }
    cell.lineCount = rowLines_.size() - cell.firstLine;
    return height;
}

void LayoutEngine::printRow(Twips rowTop)
{
    const Twips textTop = below(rowTop, Padding);
    for (const BandColumn& column : columns_) {
        if (column.isPrinted && !(source_.style.GridMerge && isBlankedByMerging(column.field)))
            printCell(column, textTop);
    }
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
    const TextView text = cell.isStored ? cell.text.text : document_.store().add(cell.text.text);
    const Twips x = roundToInt32(left + (column.width - cell.text.width) / 2);
    recorder_.printStored({ text, cell.text.width, true }, { x, textTop });
}

void LayoutEngine::drawVerticalLines(Twips rowTop, Twips rowBottom)
{
    bool isFirst = true;
    for (const BandColumn& column : columns_) {
        if (isFirst || !source_.style.GridMerge || !equalsLeft(column.field))
            drawLine({ column.edge, rowTop }, { column.edge, rowBottom });
        isFirst = false;
    }
    drawLine({ tableRight_, rowTop }, { tableRight_, rowBottom });
}

void LayoutEngine::drawRowLine(Twips rowBottom, bool pageIsFull)
{
    if (!source_.style.GridMerge) {
        drawLine({ tableLeft_, rowBottom }, { tableRight_, rowBottom });
        return;
    }
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
    recorder_.newPage();
    startBand((band_ + 1) % source_.bands.size());
    if (band_ > 0)
        source_.rows.moveRelative(-static_cast<std::int64_t>(rowsOnPage_));
    else
        pageRowHeights_.clear();
    rowsOnPage_ = 0;
    drawHeader();
    drawColumnTitles();
    recorder_.setCurrentX(tableLeft_);
}

void LayoutEngine::drawLine(Tpoint from, Tpoint to)
{
    recorder_.moveTo(from);
    recorder_.lineTo(to);
}

/// Whether the cell says the same as the one above or the one to its left; it looks across pages
/// and bands.
bool LayoutEngine::isBlankedByMerging(int field) const
{
    return records_.previousEquals(field, records_.current(field)) || equalsLeft(field);
}

bool LayoutEngine::equalsLeft(int field) const
{
    return field > 0 && records_.current(field - 1) == records_.current(field);
}

bool LayoutEngine::equalsBelow(int field) const
{
    return records_.nextEquals(field, records_.current(field));
}

} // namespace pelloric
