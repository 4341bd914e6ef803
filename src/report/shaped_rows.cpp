// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/shaped_rows.h"

#include "document/page_document.h"
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

/// The characters that stand for check boxes in the texts of views.
constexpr TextView CheckBoxes = u"☐▣☑";

/// A data grid's texts have no box.
TextView withoutCheckBox(TextView text)
{
    const bool hasBox = !text.empty() && CheckBoxes.find(text.front()) != TextView::npos;
    return hasBox ? trimmed(text.substr(1)) : text;
}

constexpr double IconRoom = 1.2; ///< of a line's height: an icon and what keeps the text from it

} // namespace

std::int32_t ShapedSource::lookRow(std::int64_t record) const
{
    return static_cast<std::int32_t>(lookRows.empty()
            ? firstLookRow + record - 1
            : lookRows[static_cast<std::size_t>(record - 1)]);
}

ShapedRows::ShapedRows(const ShapedSource& source, const Platform& platform, PageDocument& document,
    const std::vector<BandColumns>& bands)
    : source_(source)
    , platform_(platform)
    , document_(document)
    , bands_(bands)
    , padding_(CellPadding / 2.0 * source.scale)
    , groupTotals_({}, {}, {})
    , allTotals_({}, {}, {})
{
}

void ShapedRows::resolve(std::span<const Text> titles)
{
    const ReportOptions& options = source_.options;
    groupFields_ = fieldsNamed(titles, options.groupColumns);
    words_ = completed(options.totalWords);
    for (const Aggregation& total : options.totals) {
        totalFields_.push_back(fieldsNamed(titles, { &total.column, 1 }).front());
        separators_.push_back(total.function == AggregateFunction::Count
                ? platform_.decimalSeparator
                : separatorOf(totalFields_.back()));
    }
    groupTotals_ = Totals(options.totals, totalFields_, separators_);
    allTotals_ = groupTotals_;
}

bool ShapedRows::ensure(std::size_t count)
{
    while (rows_.size() < count && !isRead_)
        readNext();
    return rows_.size() >= count;
}

ShapedRow ShapedRows::takeNext()
{
    ShapedRow row = std::move(rows_.front());
    rows_.pop_front();
    return row;
}

ShapedRow ShapedRows::takeAgain(std::int64_t record, std::size_t total)
{
    ShapedRow row = takeSpare();
    if (record > 0)
        readRow(record, row);
    else
        layTotals(total, row);
    return row;
}

double ShapedRows::groupHeight()
{
    double sum = height(rows_.front());
    for (std::size_t at = 1; sum <= source_.setup.myHeight && ensure(at + 1); ++at) {
        if (rows_[at].startsGroup)
            break;
        sum += height(rows_[at]);
    }
    return sum;
}

const MeasuredFont& ShapedRows::font(bool bold, bool italic) const
{
    MeasuredFont& measured = fonts_[bold ? 1 : 0][italic ? 1 : 0];
    if (measured.face == nullptr) {
        const Font& body = source_.style.body.font;
        FaceMetrics& face = platform_.metrics.face(body.name, bold, italic);
        measured = { &face, body.size, textHeight(face, body.size) };
    }
    return measured;
}

double ShapedRows::lineHeight() const
{
    const Font& body = source_.style.body.font;
    return font(body.bold, body.italic).lineHeight;
}

double ShapedRows::marksWidth(const CellLook& look) const
{
    return (look.check != CheckMark::None ? lineHeight() : 0)
        + (look.icon.empty() ? 0 : IconRoom * lineHeight());
}

void ShapedRows::breakShown(
    TextView text, const CellLook& look, double room, std::vector<CellLine>& lines) const
{
    const MeasuredFont& face = font(look.bold, look.italic);
    if (look.tooWide == TooWide::Wrapped)
        wrapWords(text, room, face, lines);
    else
        cutLines(text, room, look.tooWide, face, document_.store(), lines);
}

const BoxContent* ShapedRows::box(const CellBox& box) const
{
    const auto found = boxes_.find({ box.lastRow, box.firstColumn });
    return found != boxes_.end() ? &found->second : nullptr;
}

void ShapedRows::closeBoxes(std::int64_t record)
{
    boxes_.erase(boxes_.begin(), boxes_.lower_bound({ source_.lookRow(record) + 1, 0 }));
}

void ShapedRows::readNext()
{
    platform_.loop.keepAlive();
    if (nextRecord_ > source_.rows.recordCount()) {
        closeGroup();
        if (nextRecord_ > 1)
            addTotals(allTotals_, words_.total);
        isRead_ = true;
        return;
    }
    ShapedRow row = takeSpare();
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

bool ShapedRows::beginsGroup(const ShapedRow& row) const
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

ShapedRow ShapedRows::takeSpare()
{
    ShapedRow row;
    if (!spare_.empty()) {
        row = std::move(spare_.back());
        spare_.pop_back();
    }
    row.record = 0;
    row.total = 0;
    row.startsGroup = false;
    row.textHeight = 0;
    row.cells.assign(source_.widths.size(), {});
    row.lines.clear();
    return row;
}

void ShapedRows::readRow(std::int64_t record, ShapedRow& row)
{
    source_.rows.setPosition(record);
    row.record = record;
    row.looks.resize(source_.looks != nullptr ? row.cells.size() : 0);
    for (std::size_t place = 0; place < row.cells.size(); ++place) {
        const auto field = static_cast<int>(place);
        row.cells[place].text = readText(field);
        if (source_.looks == nullptr) {
            measureCell(field, row);
            continue;
        }
        CellLook& look = row.looks[place];
        source_.looks->readLook(source_.lookRow(record), source_.lookColumns[place], look);
        look.indent = roundToInt32(look.indent * source_.scale);
        measureShown(field, row);
    }
}

/// A trimmed text without carriage returns that the document keeps.
TextView ShapedRows::readText(int field)
{
    const Value value = source_.rows.value(field);
    const bool isKept = source_.rows.keepsTexts() && value.kind() == ValueKind::Text;
    const TextView text = trimmed(displayText(value, platform_.decimalSeparator, buffer_));
    if (text.find(u'\r') != TextView::npos)
        return document_.store().add(withoutCarriageReturns(text));
    return isKept ? text : document_.store().add(text);
}

/// A plain cell: lines that fit are centred, others are wrapped at any character.
void ShapedRows::measureCell(int field, ShapedRow& row)
{
    const auto place = static_cast<std::size_t>(field);
    const double room = source_.widths[place] - 2 * padding_;
    ShapedCell& cell = row.cells[place];
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
void ShapedRows::measureShown(int field, ShapedRow& row)
{
    const auto place = static_cast<std::size_t>(field);
    const CellLook& look = row.looks[place];
    ShapedCell& cell = row.cells[place];
    const double lineHeight = font(look.bold, look.italic).lineHeight;
    row.textHeight = std::max(row.textHeight, lineHeight);
    if (look.check != CheckMark::None)
        cell.text = withoutCheckBox(cell.text); // it is drawn
    if (look.box)
        return openBox(field, row);
    const double room = source_.widths[place] - 2 * padding_ - look.indent - marksWidth(look);
    const bool isEmpty = cell.text.empty() && look.check == CheckMark::None && look.icon.empty();
    if (room <= 0 || isEmpty)
        return;
    cell.firstLine = row.lines.size();
    breakShown(cell.text, look, room, row.lines);
    cell.lineCount = row.lines.size() - cell.firstLine;
    row.textHeight = std::max(row.textHeight, static_cast<double>(cell.lineCount) * lineHeight);
}

/// Reads what a box shows at the first of its cells; rows and columns that are not printed may be
/// those where the view has it.
void ShapedRows::openBox(int field, ShapedRow& row)
{
    const auto place = static_cast<std::size_t>(field);
    const CellLook& look = row.looks[place];
    const CellBox& box = *look.box;
    const auto [content, isNew] = boxes_.try_emplace({ box.lastRow, box.firstColumn });
    if (!isNew)
        return;
    const bool isAnchor = box.firstRow == source_.lookRow(row.record)
        && box.firstColumn == source_.lookColumns[place];
    TextView text = row.cells[place].text;
    if (!isAnchor) {
        text = trimmed(source_.looks->text(box.firstRow, box.firstColumn));
        if (look.check != CheckMark::None)
            text = withoutCheckBox(text);
        text = document_.store().add(withoutCarriageReturns(text));
    }
    content->second = { look, text };
    const double room = boxWidth(box, field) - 2 * padding_ - look.indent - marksWidth(look);
    if (room <= 0)
        return;
    std::vector<CellLine> lines;
    breakShown(text, look, room, lines);
    const double height
        = static_cast<double>(lines.size()) * font(look.bold, look.italic).lineHeight;
    row.textHeight = std::max(row.textHeight, height / (box.lastRow - box.firstRow + 1));
}

/// The width of a box in the first band that holds one of its columns.
double ShapedRows::boxWidth(const CellBox& box, int field) const
{
    for (const BandColumns& band : bands_) {
        if (std::find(band.begin(), band.end(), field) == band.end())
            continue;
        double width = 0;
        for (const int other : band) {
            const int column = source_.lookColumns[static_cast<std::size_t>(other)];
            if (column >= box.firstColumn && column <= box.lastColumn)
                width += source_.widths[static_cast<std::size_t>(other)];
        }
        return width;
    }
    return source_.widths[static_cast<std::size_t>(field)];
}

} // namespace pelloric
