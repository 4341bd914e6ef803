// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/shaped_layout.h"

#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/row_set.h"
#include "platform/services.h"
#include "report/chosen_rows.h"
#include "report/report_style.h"
#include "report/shown_text.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr double Padding = CellPadding / 2.0; ///< above, below and left of a cell's text
constexpr Twips LineGap = 144; ///< between header line and titles, and above the footer

Twips below(Twips y, double distance) { return roundToInt32(static_cast<double>(y) + distance); }

bool hasText(const SlotTexts& slots)
{
    return std::any_of(slots.begin(), slots.end(), [](const Text& text) { return !text.empty(); });
}

} // namespace

ShapedLayout::ShapedLayout(const ShapedSource& source, const Platform& platform,
    PageDocument& document, Recorder& recorder)
    : source_(source)
    , platform_(platform)
    , document_(document)
    , recorder_(recorder)
    , pageLines_(source.style, source.setup, platform.clock, recorder)
    , padding_(Padding * source.scale)
    , groupTotals_({}, {})
    , allTotals_({}, {})
{
}

void ShapedLayout::build(const Progress& progress)
{
    progress_ = progress;
    lineHeight_ = font(source_.style.body.font.bold, source_.style.body.font.italic).lineHeight;
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
    groupFields_ = fieldsNamed(names, options.groupColumns);
    for (const Aggregation& total : options.totals)
        totalFields_.push_back(fieldsNamed(names, { &total.column, 1 }).front());
    groupTotals_ = Totals(options.totals, totalFields_);
    allTotals_ = groupTotals_;
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
    gridPen_ = { .LineColor = style.GridLineColor, .FillColor = style.HeaderColor };
    drawsHor_ = style.GridHor;
    drawsVer_ = style.GridVer;
    if (source_.looks == nullptr)
        return;
    gridLook_ = source_.looks->gridLook();
    drawsHor_ = drawsVer_ = gridLook_.showsLines;
    gridPen_.LineStyle = gridLook_.lineStyle;
    gridPen_.LineColor = gridLook_.lineColor;
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
    } while (ensureRows(1));
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
    } while (!page_.empty() && ensureRows(1));
    for (std::size_t band = 1; band < bands_.size() && !page_.empty(); ++band) {
        lastTexts_.clear();
        boxes_.clear();
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
    const MeasuredFont& body = font(style.body.font.bold, style.body.font.italic);
    if (titleHeight_ < 0) {
        for (std::size_t field = 0; field < titles_.size(); ++field)
            titleHeight_ = std::max(titleHeight_, measureTitle(field, body));
    }
    for (const BandColumn& column : columns_) {
        if (column.isPrinted)
            printTitle(column, top);
    }
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
    const MeasuredFont& body = font(face.bold, face.italic);
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
    breakText(title, room, body, lines);
    const double left = column.left + padding_;
    recorder_.moveTo({ roundToInt32(left), below(top, padding_) });
    recorder_.printLines(lines, left, column.width);
}

/// Takes rows until one reaches the bottom margin, or a group or a row belongs on the next page.
void ShapedLayout::fillPage()
{
    const double limit
        = static_cast<double>(source_.setup.myHeight) - source_.setup.intButtom - Padding;
    for (Row& row : page_)
        spare_.push_back(std::move(row));
    page_.clear();
    isFull_ = false;
    Twips bottom = top_;
    while (!isFull_ && ensureRows(1)) {
        const Twips next = below(bottom, rowHeight(rows_.front()));
        if (!page_.empty() && !mayStay(rows_.front(), next))
            break;
        bottom = next;
        page_.push_back(std::move(rows_.front()));
        rows_.pop_front();
        isFull_ = bottom > limit;
    }
}

/// Whether a row may follow others on the page.
bool ShapedLayout::mayStay(const Row& row, double bottom)
{
    const double height = source_.setup.myHeight;
    if (bottom + (footerHeight_ > 0 ? LineGap + footerHeight_ : 0) > height) {
        isFull_ = true;
        return false;
    }
    if (!source_.options.keepsGroups || !row.startsGroup)
        return true;
    const double limit = height - source_.setup.intButtom - Padding;
    const double rest = groupHeight() - rowHeight(row);
    return bottom + rest <= limit || top_ + rest + rowHeight(row) > limit;
}

void ShapedLayout::planPage()
{
    PlannedPage& page = plan_.emplace_back();
    page.isFull = isFull_;
    std::size_t totals = 0;
    for (const PlannedPage& earlier : plan_) {
        for (const PlannedRow& row : earlier.rows)
            totals += row.record == 0 ? 1U : 0U;
    }
    for (const Row& row : page_)
        page.rows.push_back({ row.record, row.isTotal() ? totals++ : 0 });
}

void ShapedLayout::refillPage(const PlannedPage& page)
{
    for (Row& row : page_)
        spare_.push_back(std::move(row));
    page_.clear();
    for (const PlannedRow& planned : page.rows) {
        Row row = takeSpare();
        if (planned.record > 0)
            readRow(planned.record, row);
        else
            layTotals(planned.total, row);
        page_.push_back(std::move(row));
    }
}

void ShapedLayout::endPage(bool isFull)
{
    const PageSetup& setup = source_.setup;
    const double bottom = static_cast<double>(setup.myHeight) - setup.intButtom;
    pageLines_.drawPageFooter(document_.currentPage + 1,
        isFull && !tops_.empty() ? below(tops_.back(), LineGap) : bottom + LineGap);
    pen_.reset();
}

/// Reads ahead. @return  whether there are so many rows to print
bool ShapedLayout::ensureRows(std::size_t count)
{
    while (rows_.size() < count && !isRead_)
        readNext();
    return rows_.size() >= count;
}

void ShapedLayout::readNext()
{
    platform_.loop.keepAlive();
    if (nextRecord_ > source_.rows.recordCount()) {
        closeGroup();
        if (nextRecord_ > 1)
            addTotals(allTotals_, u"Total");
        isRead_ = true;
        return;
    }
    Row row = takeSpare();
    readRow(nextRecord_++, row);
    row.startsGroup = beginsGroup(row);
    if (row.startsGroup)
        closeGroup();
    noteNumbers(row);
    groupTexts_.clear();
    for (const int field : groupFields_)
        groupTexts_.push_back(row.cells[static_cast<std::size_t>(field)].text);
    rows_.push_back(std::move(row));
}

/// Adds the totals of the group that has ended.
void ShapedLayout::closeGroup()
{
    if (groupTexts_.empty())
        return;
    Text name;
    for (const TextView text : groupTexts_) {
        name += name.empty() ? u"" : u" ";
        name += text;
    }
    addTotals(groupTotals_, name);
    groupTotals_.clear();
}

bool ShapedLayout::beginsGroup(const Row& row) const
{
    if (groupFields_.empty())
        return false;
    if (groupTexts_.empty())
        return true;
    for (std::size_t at = 0; at < groupFields_.size(); ++at) {
        if (row.cells[static_cast<std::size_t>(groupFields_[at])].text != groupTexts_[at])
            return true;
    }
    return false;
}

/// The height of the group that begins with the first row that was read ahead; no further than a
/// page is high.
double ShapedLayout::groupHeight()
{
    double height = rowHeight(rows_.front());
    for (std::size_t at = 1; height <= source_.setup.myHeight && ensureRows(at + 1); ++at) {
        if (rows_[at].startsGroup)
            break;
        height += rowHeight(rows_[at]);
    }
    return height;
}

ShapedLayout::Row ShapedLayout::takeSpare()
{
    Row row;
    if (!spare_.empty()) {
        row = std::move(spare_.back());
        spare_.pop_back();
    }
    row.record = 0;
    row.startsGroup = false;
    row.textHeight = 0;
    row.cells.assign(source_.widths.size(), {});
    row.lines.clear();
    row.looks.clear();
    return row;
}

void ShapedLayout::readRow(std::int64_t record, Row& row)
{
    source_.rows.setPosition(record);
    row.record = record;
    if (source_.looks != nullptr)
        row.looks.resize(row.cells.size());
    for (std::size_t place = 0; place < row.cells.size(); ++place) {
        const auto field = static_cast<int>(place);
        row.cells[place].text = readText(field);
        if (source_.looks != nullptr) {
            source_.looks->readLook(lookRow(record), source_.lookColumns[place], row.looks[place]);
            measureShown(field, row);
        } else {
            measureCell(field, row);
        }
    }
}

/// A trimmed text without carriage returns that the document keeps.
TextView ShapedLayout::readText(int field)
{
    const Value value = source_.rows.value(field);
    const bool isKept = source_.rows.keepsTexts() && value.kind() == ValueKind::Text;
    const TextView text = trimmed(displayText(value, platform_.decimalSeparator, buffer_));
    if (text.find(u'\r') != TextView::npos)
        return document_.store().add(withoutCarriageReturns(text));
    return isKept ? text : document_.store().add(text);
}

/// A plain cell: lines that fit are centred, others are wrapped at any character.
void ShapedLayout::measureCell(int field, Row& row)
{
    const auto place = static_cast<std::size_t>(field);
    const double room = source_.widths[place] - 2 * padding_;
    Cell& cell = row.cells[place];
    if (room <= 0)
        return;
    const Font& face = source_.style.body.font;
    const MeasuredFont& body = font(face.bold, face.italic);
    const CellText read = readCellText(cell.text, body);
    cell.firstLine = row.lines.size();
    double lines = 1;
    if (read.width <= room && !read.hasLineFeed && !read.hasSeparator) {
        row.lines.push_back({ cell.text, read.width, true });
    } else {
        breakText(cell.text, room, body, row.lines);
        lines = static_cast<double>(row.lines.size() - cell.firstLine);
        if (!read.hasLineFeed && read.hasSeparator) {
            // A typed separator makes the row taller but does not break the printed text.
            row.lines.resize(cell.firstLine);
            if (read.width <= room)
                row.lines.push_back({ cell.text, read.width, true });
            else
                wrapText(cell.text, room, body, row.lines);
        }
    }
    cell.lineCount = row.lines.size() - cell.firstLine;
    row.textHeight = std::max(row.textHeight, lines * body.lineHeight);
}

/// A cell as the view shows it: wrapped between words or cut, in its own font.
void ShapedLayout::measureShown(int field, Row& row)
{
    const auto place = static_cast<std::size_t>(field);
    const CellLook& look = row.looks[place];
    Cell& cell = row.cells[place];
    const MeasuredFont& face = font(look.bold, look.italic);
    row.textHeight = std::max(row.textHeight, static_cast<double>(face.lineHeight));
    if (look.check != CheckMark::None && !cell.text.empty())
        cell.text = trimmed(cell.text.substr(1)); // the box is drawn
    const double width = look.box ? boxWidth(look, field) : source_.widths[place];
    const double room = width - 2 * padding_ - look.indent - marksWidth(look);
    if (look.box && !isAnchor(look, row.record, field))
        return;
    const bool isEmpty = cell.text.empty() && look.check == CheckMark::None;
    if (room <= 0 || (isEmpty && !look.box))
        return;
    cell.firstLine = row.lines.size();
    if (look.tooWide == TooWide::Wrapped)
        wrapWords(cell.text, room, face, row.lines);
    else
        cutLines(cell.text, room, look.tooWide, face, document_.store(), row.lines);
    cell.lineCount = row.lines.size() - cell.firstLine;
    const double height = static_cast<double>(cell.lineCount) * face.lineHeight;
    const double rows = look.box ? look.box->lastRow - look.box->firstRow + 1 : 1;
    row.textHeight = std::max(row.textHeight, height / rows);
    if (!look.box)
        return;
    const std::span<const CellLine> lines = row.lines;
    const auto own = lines.subspan(cell.firstLine, cell.lineCount);
    boxes_.push_back({ *look.box, look, { own.begin(), own.end() } });
    cell.lineCount = 0;
}

void ShapedLayout::noteNumbers(const Row& row)
{
    for (std::size_t place = 0; place < totalFields_.size(); ++place) {
        const int field = totalFields_[place];
        const TextView text = row.cells[static_cast<std::size_t>(field)].text;
        std::optional<double> number;
        if (source_.number)
            number = source_.number(row.record, field);
        if (!number)
            number = shownNumber(text, platform_.decimalSeparator);
        groupTotals_.add(place, number, !text.empty());
        allTotals_.add(place, number, !text.empty());
    }
}

/// One row per function; the name stands in the first column that holds no total, or before the
/// first total.
void ShapedLayout::addTotals(const Totals& totals, TextView name)
{
    for (std::size_t number = 0; number < totals.rowCount(); ++number) {
        TotalTexts texts(titles_.size());
        for (std::size_t place = 0; place < texts.size(); ++place)
            texts[place] = document_.store().add(
                totals.text(number, static_cast<int>(place), platform_.decimalSeparator));
        const Text label = Text(name) + u": " + Text(functionName(totals.function(number)));
        const auto first = static_cast<std::size_t>(bands_.front().front());
        texts[first] = document_.store().add(
            texts[first].empty() ? label : label + u" " + Text(texts[first]));
        totalTexts_.push_back(std::move(texts));
        Row row = takeSpare();
        layTotals(totalTexts_.size() - 1, row);
        rows_.push_back(std::move(row));
    }
}

void ShapedLayout::layTotals(std::size_t total, Row& row)
{
    const MeasuredFont& face = font(true, source_.style.body.font.italic);
    row.textHeight = face.lineHeight;
    for (std::size_t place = 0; place < row.cells.size(); ++place) {
        Cell& cell = row.cells[place];
        cell.text = totalTexts_[total][place];
        const double room = source_.widths[place] - 2 * padding_;
        if (cell.text.empty() || room <= 0)
            continue;
        cell.firstLine = row.lines.size();
        wrapWords(cell.text, room, face, row.lines);
        cell.lineCount = row.lines.size() - cell.firstLine;
        row.textHeight
            = std::max(row.textHeight, static_cast<double>(cell.lineCount) * face.lineHeight);
    }
}

const MeasuredFont& ShapedLayout::font(bool bold, bool italic)
{
    MeasuredFont& measured = fonts_[bold ? 1 : 0][italic ? 1 : 0];
    if (measured.face == nullptr) {
        const Font& body = source_.style.body.font;
        FaceMetrics& face = platform_.metrics.face(body.name, bold, italic);
        measured = { &face, body.size, textHeight(face, body.size) };
    }
    return measured;
}

/// The width of a box in the first band that holds one of its columns.
double ShapedLayout::boxWidth(const CellLook& look, int field) const
{
    for (const BandColumns& band : bands_) {
        if (std::find(band.begin(), band.end(), field) == band.end())
            continue;
        double width = 0;
        for (const int other : band) {
            const int column = source_.lookColumns[static_cast<std::size_t>(other)];
            if (column >= look.box->firstColumn && column <= look.box->lastColumn)
                width += source_.widths[static_cast<std::size_t>(other)];
        }
        return width;
    }
    return source_.widths[static_cast<std::size_t>(field)];
}

/// Whether the content of a box is read in this cell.
bool ShapedLayout::isAnchor(const CellLook& look, std::int64_t record, int field) const
{
    return look.box->firstRow == lookRow(record)
        && look.box->firstColumn == source_.lookColumns[static_cast<std::size_t>(field)];
}

std::int32_t ShapedLayout::lookRow(std::int64_t record) const
{
    return source_.lookRows.empty()
        ? static_cast<std::int32_t>(source_.firstLookRow + record - 1)
        : static_cast<std::int32_t>(source_.lookRows[static_cast<std::size_t>(record - 1)]);
}

double ShapedLayout::marksWidth(const CellLook& look) const
{
    return look.check != CheckMark::None ? lineHeight_ : 0;
}

} // namespace pelloric
