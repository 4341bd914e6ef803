// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// What is drawn of the rows of a page; what they are is decided in shaped_layout.cpp.

#include "platform/numbers.h"
#include "report/page_frame.h"
#include "report/report_style.h"
#include "report/shaped_layout.h"

#include <algorithm>

namespace pelloric {

namespace {

constexpr double Trace = 1e-6; ///< rounding leaves of a line's height

} // namespace

void ShapedLayout::printRows()
{
    tops_.assign(1, top_);
    for (const ShapedRow& row : page_)
        tops_.push_back(below(tops_.back(), rows_.height(row)));
    for (std::size_t at = 0; at < page_.size() && source_.looks != nullptr; ++at)
        fillBackgrounds(at);
    usePen(gridPen_);
    if (drawsHor_ && !page_.empty() && hasBackground(page_.front()))
        drawLine({ tableLeft_, top_ }, { tableRight_, top_ }); // half of it was filled over
    for (std::size_t at = 0; at < page_.size(); ++at) {
        usePen(gridPen_);
        drawRowLines(at);
        printCells(at);
        if (!page_[at].isTotal())
            tell(progress_, ++stepsDone_, steps_);
    }
    lastTexts_.clear();
    if (page_.empty() || page_.back().isTotal())
        return;
    for (const ShapedCell& cell : page_.back().cells)
        lastTexts_.push_back(cell.text);
    if (columns_.back().field == bands_.back().back())
        rows_.closeBoxes(page_.back().record);
}

/// Neighbouring cells of one colour get one box.
void ShapedLayout::fillBackgrounds(std::size_t at)
{
    const ShapedRow& row = page_[at];
    if (row.looks.empty())
        return;
    for (std::size_t first = 0; first < columns_.size();) {
        const auto color = backgroundOf(row, columns_[first]);
        std::size_t end = first + 1;
        while (end < columns_.size() && backgroundOf(row, columns_[end]) == color)
            ++end;
        const double right = end < columns_.size() ? columns_[end].left : tableRight_;
        if (color)
            fillBox({ columns_[first].left, right, static_cast<double>(tops_[at]),
                        static_cast<double>(tops_[at + 1]) },
                *color);
        first = end;
    }
}

bool ShapedLayout::hasBackground(const ShapedRow& row) const
{
    return std::any_of(columns_.begin(), columns_.end(),
        [&](const BandColumn& column) { return backgroundOf(row, column).has_value(); });
}

std::optional<Color> ShapedLayout::backgroundOf(
    const ShapedRow& row, const BandColumn& column) const
{
    const CellLook* look = lookOf(row, column.field);
    if (look == nullptr)
        return std::nullopt;
    if (const BoxContent* const box = boxOf(look))
        look = &box->look;
    return look->background;
}

void ShapedLayout::drawRowLines(std::size_t at)
{
    const ShapedRow& row = page_[at];
    const bool isMerged = source_.style.GridMerge && !row.isTotal();
    const std::uint32_t pen = recorder_.penNumber();
    const auto upright = [&](Twips x) { rowLines_.push_back({ x, x, false, true, pen }); };
    rowLines_.clear();
    if (drawsVer_) {
        for (std::size_t place = 0; place < columns_.size(); ++place) {
            const int field = columns_[place].field;
            const bool isOpen = place > 0
                && ((isMerged && equalsLeft(row, field))
                    || isSameBox(row, columns_[place - 1].field, row, field));
            if (!isOpen)
                upright(columns_[place].edge);
        }
        upright(tableRight_);
    }
    if (drawsHor_)
        ruleBelow(at, isMerged);
    recordRowLines(tops_[at], tops_[at + 1]);
}

/// Rules the bottom of a row where no cell goes on below it.
void ShapedLayout::ruleBelow(std::size_t at, bool isMerged)
{
    const ShapedRow& row = page_[at];
    const std::uint32_t pen = recorder_.penNumber();
    const auto level = [&](Twips left, Twips right) {
        rowLines_.push_back({ left, right, true, true, pen });
    };
    const ShapedRow* const next = at + 1 < page_.size() ? &page_[at + 1] : nullptr;
    if (!isMerged && (next == nullptr || row.looks.empty())) {
        level(tableLeft_, tableRight_);
        return;
    }
    const auto isOpen = [&](int field) {
        if (next == nullptr)
            return false;
        if (isSameBox(row, field, *next, field))
            return true;
        const auto place = static_cast<std::size_t>(field);
        return isMerged && !next->isTotal() && next->cells[place].text == row.cells[place].text;
    };
    for (std::size_t first = 0; first < columns_.size(); ++first) {
        if (isOpen(columns_[first].field))
            continue;
        std::size_t end = first;
        // A merged row's columns each have a line of their own, as on the plain page.
        while (!isMerged && end + 1 < columns_.size() && !isOpen(columns_[end + 1].field))
            ++end;
        level(
            columns_[first].edge, end + 1 < columns_.size() ? columns_[end + 1].edge : tableRight_);
        first = end;
    }
}

/// Neighbouring rows mostly have the same lines.
void ShapedLayout::recordRowLines(Twips top, Twips bottom)
{
    if (rowLines_.empty())
        return;
    if (rowLines_ != patternLines_) {
        patternLines_ = rowLines_;
        pattern_ = document_.addLinePattern(rowLines_);
    }
    recorder_.rowLines(top, bottom, pattern_);
}

void ShapedLayout::printCells(std::size_t at)
{
    for (std::size_t place = 0; place < columns_.size(); ++place) {
        if (!columns_[place].isPrinted)
            continue;
        document_.structure.beginCell(columns_[place].field);
        printCell(at, place);
    }
    document_.structure.endRow(document_.currentPage);
}

void ShapedLayout::printCell(std::size_t at, std::size_t place)
{
    const ShapedRow& row = page_[at];
    const BandColumn& column = columns_[place];
    const CellLook* const look = lookOf(row, column.field);
    const auto lines = row.linesOf(row.cells[static_cast<std::size_t>(column.field)]);
    const Area area { column.left, column.left + column.width, static_cast<double>(tops_[at]),
        static_cast<double>(tops_[at + 1]) };
    if (row.isTotal())
        printTotal(column, lines, area);
    else if (look == nullptr && !(source_.style.GridMerge && isBlanked(at, column.field)))
        printPlain(column, lines, tops_[at]);
    else if (look != nullptr && look->box)
        printBox(at, place);
    else if (look != nullptr)
        printShown(*look, lines, area);
}

void ShapedLayout::printPlain(const BandColumn& column, std::span<const CellLine> lines, Twips top)
{
    const ColoredFont& body = source_.style.body;
    useFont(body.font.bold, body.font.italic, roundToInt32(body.color));
    const double left = column.left + padding_;
    recorder_.moveTo({ roundToInt32(left), below(top, padding_) });
    recorder_.printLines(lines, left, column.width);
}

void ShapedLayout::printTotal(
    const BandColumn& column, std::span<const CellLine> lines, const Area& area)
{
    CellLook look;
    look.bold = true;
    look.italic = source_.style.body.font.italic;
    if (column.field != bands_.front().front())
        look.alignment = CellAlignment::Right;
    printShown(look, lines, area);
}

void ShapedLayout::printShown(const CellLook& look, std::span<const CellLine> lines, Area area)
{
    if (look.isBranch)
        drawBranches(look, area);
    if (lines.empty())
        return;
    const MeasuredFont& face = rows_.font(look.bold, look.italic);
    area.left += padding_ + look.indent;
    area.right -= padding_;
    const double block = static_cast<double>(lines.size()) * face.lineHeight;
    const double room = area.bottom - area.top;
    double y = area.top + padding_;
    if (look.place == CellPlace::Middle)
        y = area.top + std::max(padding_, (room - block) / 2);
    else if (look.place == CellPlace::Bottom)
        y = area.top + std::max(padding_, room - padding_ - block);
    area.top = y;
    area.left += printMarks(look, area);
    useFont(
        look.bold, look.italic, look.foreground.value_or(roundToInt32(source_.style.body.color)));
    for (const CellLine& line : lines) {
        double x = area.left;
        if (look.alignment == CellAlignment::Right)
            x = std::max(x, area.right - line.width);
        else if (look.alignment == CellAlignment::Centre)
            x = std::max(x, (area.left + area.right - line.width) / 2);
        const Tpoint at { roundToInt32(x), roundToInt32(y) };
        if (!line.text.empty())
            recorder_.printStored(line, at);
        if (look.underline || look.strikethrough)
            underline(look, line, at);
        y += face.lineHeight;
    }
}

/// Prints a box at its first row and column on the page: as many lines as its part there holds.
void ShapedLayout::printBox(std::size_t at, std::size_t place)
{
    const ShapedRow& row = page_[at];
    const int field = columns_[place].field;
    const bool isBegun = (at > 0 && isSameBox(page_[at - 1], field, row, field))
        || (place > 0 && isSameBox(row, columns_[place - 1].field, row, field));
    const BoxContent* const box = boxOf(lookOf(row, field));
    if (isBegun || box == nullptr)
        return;
    std::size_t lastRow = at;
    while (lastRow + 1 < page_.size() && isSameBox(page_[lastRow + 1], field, row, field))
        ++lastRow;
    std::size_t last = place;
    while (last + 1 < columns_.size() && isSameBox(row, columns_[last + 1].field, row, field))
        ++last;
    const Area area { columns_[place].left, columns_[last].left + columns_[last].width,
        static_cast<double>(tops_[at]), static_cast<double>(tops_[lastRow + 1]) };
    const double room
        = area.right - area.left - 2 * padding_ - box->look.indent - rows_.marksWidth(box->look);
    std::vector<CellLine> lines;
    if (room > 0)
        rows_.breakShown(box->text, box->look, room, lines);
    const double height = area.bottom - area.top - 2 * padding_;
    const double lineHeight = rows_.font(box->look.bold, box->look.italic).lineHeight;
    const auto held = static_cast<std::size_t>(std::max(1.0, height / lineHeight + Trace));
    lines.resize(std::min(lines.size(), held));
    printShown(box->look, lines, area);
}

/// Fonts are looked up once for each look that they have.
void ShapedLayout::useFont(bool bold, bool italic, Color color)
{
    const std::uint64_t look = std::uint64_t { static_cast<std::uint32_t>(color) }
        | std::uint64_t { bold } << 32U | std::uint64_t { italic } << 33U;
    if (style_ == look)
        return;
    const auto [known, isNew] = styles_.try_emplace(look);
    if (isNew) {
        Font wanted = source_.style.body.font;
        wanted.bold = bold;
        wanted.italic = italic;
        recorder_.setTextFont(wanted, color);
        known->second = recorder_.textStyle();
    } else {
        recorder_.setTextStyle(known->second);
    }
    style_ = look;
}

void ShapedLayout::usePen(const LinePen& pen)
{
    if (pen_ == pen)
        return;
    pen_ = pen;
    recorder_.setLineAttributes(pen);
}

void ShapedLayout::drawLine(Tpoint from, Tpoint to)
{
    recorder_.moveTo(from);
    recorder_.lineTo(to);
}

void ShapedLayout::fillBox(const Area& area, Color color)
{
    usePen({ .LineColor = color, .FillStyle = SolidFill, .FillColor = color });
    drawLine({ roundToInt32(area.left), roundToInt32(area.top) },
        { roundToInt32(area.right), roundToInt32(area.bottom) });
}

const CellLook* ShapedLayout::lookOf(const ShapedRow& row, int field) const
{
    return row.looks.empty() ? nullptr : &row.looks[static_cast<std::size_t>(field)];
}

const BoxContent* ShapedLayout::boxOf(const CellLook* look) const
{
    return look != nullptr && look->box ? rows_.box(*look->box) : nullptr;
}

bool ShapedLayout::isSameBox(
    const ShapedRow& row, int field, const ShapedRow& other, int otherField) const
{
    const CellLook* const one = lookOf(row, field);
    const CellLook* const two = lookOf(other, otherField);
    return one != nullptr && two != nullptr && one->box && one->box == two->box;
}

/// Whether merging leaves the cell blank: it says the same as the one above or to its left.
bool ShapedLayout::isBlanked(std::size_t at, int field) const
{
    const auto place = static_cast<std::size_t>(field);
    const TextView text = page_[at].cells[place].text;
    if (at > 0 ? !page_[at - 1].isTotal() && page_[at - 1].cells[place].text == text
               : !lastTexts_.empty() && lastTexts_[place] == text)
        return true;
    return equalsLeft(page_[at], field);
}

bool ShapedLayout::equalsLeft(const ShapedRow& row, int field) const
{
    const auto place = static_cast<std::size_t>(field);
    return field > 0 && row.cells[place - 1].text == row.cells[place].text;
}

} // namespace pelloric
