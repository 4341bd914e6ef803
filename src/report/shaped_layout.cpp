// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/shaped_layout.h"

#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/row_set.h"
#include "platform/services.h"
#include "report/chosen_rows.h"
#include "report/page_frame.h"
#include "report/report_style.h"
#include "report/shown_text.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr double Padding = CellPadding / 2.0; ///< above, below and left of a cell's text

} // namespace

ShapedLayout::ShapedLayout(const ShapedSource& source, const Platform& platform,
    PageDocument& document, Recorder& recorder)
    : source_(source)
    , platform_(platform)
    , document_(document)
    , recorder_(recorder)
    , pageLines_(source.style, source.setup, platform.clock, recorder)
    , rows_(source_, platform, document, bands_)
    , padding_(rows_.padding())
{
}

void ShapedLayout::build(const Progress& progress)
{
    progress_ = progress;
    resolve();
    resolveLines();
    const auto records = source_.rows.recordCount();
    startBand(0);
    steps_ = std::max<std::int64_t>(1, records * static_cast<std::int64_t>(bands_.size()));
    tell(progress_, stepsDone_, steps_);
    platform_.loop.runOnce();
    if (source_.options.pageOrder == PageOrder::AcrossThenDown)
        buildAcross();
    else
        buildDown();
}

/// Finds the columns that the options name, and cuts the bands.
void ShapedLayout::resolve()
{
    const ReportOptions& options = source_.options;
    std::vector<Text> names;
    for (int field = 0; field < static_cast<int>(source_.widths.size()); ++field) {
        names.emplace_back(source_.rows.fieldName(field));
        titles_.push_back(document_.store().add(names.back()));
    }
    rows_.resolve(names);
    const std::vector<int> keys = keyFieldsOf(options, names);
    bands_ = cutKeyedBands(source_.widths, keys, source_.setup.myWidth, source_.setup.intLeft);
    const ReportStyle& style = source_.style;
    if (hasText(style.footerTexts)) {
        const Font& footer = style.footer.font;
        footerHeight_ = textHeight(
            platform_.metrics.face(footer.name, footer.bold, footer.italic), footer.size);
    }
}

/// A view's own grid lines stand for those of the settings.
void ShapedLayout::resolveLines()
{
    const ReportStyle& style = source_.style;
    gridPen_ = gridPen(style);
    drawsHor_ = style.GridHor;
    drawsVer_ = style.GridVer;
    if (source_.looks == nullptr)
        return;
    const GridLook grid = source_.looks->gridLook();
    drawsHor_ = drawsVer_ = grid.showsLines;
    gridPen_.LineStyle = grid.lineStyle;
    gridPen_.LineColor = grid.lineColor;
}

void ShapedLayout::buildAcross()
{
    bool isFirst = true;
    do {
        for (std::size_t band = 0; band < bands_.size(); ++band) {
            beginPage(band, isFirst);
            isFirst = false;
            if (band == 0)
                fillPage();
            printRows();
            endPage(isFull_);
            if (page_.empty())
                return;
        }
    } while (rows_.ensure(1));
}

/// The first band decides where pages end; the others follow it.
void ShapedLayout::buildDown()
{
    bool isFirst = true;
    do {
        beginPage(0, isFirst);
        isFirst = false;
        fillPage();
        planPage();
        printRows();
        endPage(isFull_);
    } while (!page_.empty() && rows_.ensure(1));
    for (std::size_t band = 1; band < bands_.size() && !page_.empty(); ++band) {
        lastTexts_.clear();
        rows_.forgetBoxes();
        for (const PlannedPage& page : plan_) {
            beginPage(band, false);
            refillPage(page);
            printRows();
            endPage(page.isFull);
        }
    }
}

void ShapedLayout::beginPage(std::size_t band, bool isFirst)
{
    if (!isFirst)
        recorder_.newPage();
    startBand(band);
    recorder_.moveTo({ tableLeft_, source_.setup.intTop });
    pageLines_.drawPageHeader(document_.currentPage + 1);
    drawTitles();
    top_ = recorder_.currentY();
}

/// Centres the columns of a band on the paper.
void ShapedLayout::startBand(std::size_t band)
{
    double width = 0;
    for (const int field : bands_[band])
        width += source_.widths[static_cast<std::size_t>(field)];
    tableLeft_ = roundToInt32((static_cast<double>(source_.setup.myWidth) - width) / 2);
    columns_.clear();
    double left = tableLeft_;
    for (const int field : bands_[band]) {
        const double ofField = source_.widths[static_cast<std::size_t>(field)];
        columns_.push_back({ field, left, ofField, roundToInt32(left), ofField > 2 * padding_ });
        left += ofField;
    }
    tableRight_ = roundToInt32(left);
}

/// Draws the titles, or only the table's top edge, below the current position.
void ShapedLayout::drawTitles()
{
    const ReportStyle& style = source_.style;
    if (!style.ShowHeaders && !drawsHor_)
        return;
    const Twips top = below(recorder_.currentY(), LineGap);
    usePen(gridPen_);
    if (!style.ShowHeaders) {
        drawLine({ tableLeft_, top }, { tableRight_, top });
        recorder_.moveTo({ tableLeft_, top });
        return;
    }
    if (hasText(style.headerTexts))
        titleTop_ = recorder_.currentY();
    const MeasuredFont& body = rows_.font(style.body.font.bold, style.body.font.italic);
    if (titleHeight_ < 0) {
        for (std::size_t field = 0; field < titles_.size(); ++field)
            titleHeight_ = std::max(titleHeight_, measureTitle(field, body));
    }
    for (const BandColumn& column : columns_) {
        if (!column.isPrinted)
            continue;
        document_.structure.beginCell(column.field);
        printTitle(column, top);
    }
    document_.structure.endTitles(document_.currentPage);
    const Twips bottom = below(top, 2 * padding_ + titleHeight_);
    if (drawsVer_) {
        for (const BandColumn& column : columns_)
            drawLine({ column.edge, top }, { column.edge, bottom });
        drawLine({ tableRight_, top }, { tableRight_, bottom });
    }
    if (drawsHor_) {
        drawLine({ tableLeft_, top }, { tableRight_, top });
        drawLine({ tableLeft_, bottom }, { tableRight_, bottom });
    }
    recorder_.setCurrentY(bottom);
}

double ShapedLayout::measureTitle(std::size_t field, const MeasuredFont& body) const
{
    const TextView title = trimmed(titles_[field]);
    const double room = source_.widths[field] - 2 * padding_;
    if (source_.looks == nullptr)
        return cellTextHeight(title, room + CellPadding, body);
    std::vector<CellLine> lines;
    if (room > 0)
        wrapWords(title, room, body, lines);
    return static_cast<double>(lines.size()) * body.lineHeight;
}

void ShapedLayout::printTitle(const BandColumn& column, Twips top)
{
    const TextView title = titles_[static_cast<std::size_t>(column.field)];
    const Font& face = source_.style.body.font;
    const MeasuredFont& body = rows_.font(face.bold, face.italic);
    useFont(face.bold, face.italic, roundToInt32(source_.style.body.color));
    const double room = column.width - 2 * padding_;
    std::vector<CellLine> lines;
    if (source_.looks != nullptr) {
        wrapWords(trimmed(title), room, body, lines);
        CellLook look;
        look.bold = face.bold;
        look.italic = face.italic;
        look.alignment = source_.looks->titleAlignment(
            source_.lookColumns[static_cast<std::size_t>(column.field)]);
        printShown(look, lines,
            { column.left, column.left + column.width, static_cast<double>(top),
                top + 2 * padding_ + titleHeight_ });
        return;
    }
    breakPrinted(title, room, body, lines);
    const double left = column.left + padding_;
    recorder_.moveTo({ roundToInt32(left), below(top, padding_) });
    recorder_.printLines(lines, left, column.width);
}

void ShapedLayout::emptyPage()
{
    for (ShapedRow& row : page_)
        rows_.giveBack(std::move(row));
    page_.clear();
}

/// Takes rows until one reaches the bottom margin, or a group or a row belongs on the next page.
void ShapedLayout::fillPage()
{
    const double limit
        = static_cast<double>(source_.setup.myHeight) - source_.setup.intButtom - Padding;
    emptyPage();
    isFull_ = false;
    Twips bottom = top_;
    while (!isFull_ && rows_.ensure(1)) {
        const Twips next = below(bottom, rows_.height(rows_.next()));
        if (!page_.empty() && !mayStay(rows_.next(), next))
            break;
        bottom = next;
        page_.push_back(rows_.takeNext());
        isFull_ = bottom > limit;
    }
}

/// Whether a row may follow others on the page.
bool ShapedLayout::mayStay(const ShapedRow& row, double bottom)
{
    const double height = source_.setup.myHeight;
    if (bottom + (footerHeight_ > 0 ? LineGap + footerHeight_ : 0) > height) {
        isFull_ = true;
        return false;
    }
    if (!source_.options.keepsGroups || !row.startsGroup)
        return true;
    const double limit = height - source_.setup.intButtom - Padding;
    const double own = rows_.height(row);
    const double rest = rows_.groupHeight() - own;
    return bottom + rest <= limit || top_ + rest + own > limit;
}

void ShapedLayout::planPage()
{
    PlannedPage& page = plan_.emplace_back();
    page.isFull = isFull_;
    for (const ShapedRow& row : page_)
        page.rows.push_back({ row.record, row.total });
}

void ShapedLayout::refillPage(const PlannedPage& page)
{
    emptyPage();
    for (const PlannedRow& planned : page.rows)
        page_.push_back(rows_.takeAgain(planned.record, planned.total));
}

void ShapedLayout::endPage(bool isFull)
{
    const PageSetup& setup = source_.setup;
    const double bottom = static_cast<double>(setup.myHeight) - setup.intButtom;
    pageLines_.drawPageFooter(document_.currentPage + 1,
        isFull && !tops_.empty() ? below(tops_.back(), LineGap) : bottom + LineGap);
    pen_.reset();
    style_.reset();
}

} // namespace pelloric
