// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/recorder.h"

#include "platform/drawing_surface.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/row_set.h"
#include "platform/run_time_error.h"
#include "platform/text_runs.h"

#include <algorithm>
#include <utility>

namespace pelloric {

namespace {

Twips sum(Twips a, Twips b)
{
    const std::int64_t exact = std::int64_t { a } + b;
    return static_cast<Twips>(exact) == exact ? static_cast<Twips>(exact)
                                              : roundToInt32(static_cast<double>(exact));
}

/// The height of a line: twips.
/// @throws RunTimeError Overflow: no text of the font can be measured
Twips lineHeightOf(FaceMetrics& face, const Font& font)
{
    try {
        return pelloric::textHeight(face, font.size);
    } catch (const RunTimeError& error) {
        throw RunTimeError(error.number(),
            phrase(u"a font of %1 points is too large to be measured; choose a smaller size",
                { formatSingle(font.size) }));
    }
}

} // namespace

Recorder::Recorder(PageDocument& document, TextMetrics& metrics)
    : document_(document)
    , metrics_(metrics)
{
    documentReplaced();
}

void Recorder::drawOn(DrawingSurface* surface, float divisor)
{
    surface_ = surface;
    divisor_ = divisor;
}

void Recorder::clear()
{
    document_.clear();
    point_ = {};
    if (surface_ != nullptr)
        surface_->clear();
    documentReplaced();
}

void Recorder::documentReplaced()
{
    penNumber_ = document_.penNumber(pen_);
    setTextFont(style_.font, style_.color);
}

void Recorder::restore(const RecorderState& state)
{
    pen_ = state.pen;
    style_ = state.style;
    documentReplaced();
    moveTo(state.point);
}

void Recorder::newPage()
{
    document_.newPage();
    point_ = {};
    if (surface_ != nullptr)
        surface_->clear();
}

void Recorder::setLineAttributes(const LinePen& pen)
{
    pen_ = pen;
    penNumber_ = document_.penNumber(pen);
    applyLineAttributes();
}

void Recorder::setTextFont(const Font& font, Color color)
{
    FaceMetrics& face = metrics_.face(font.name, font.bold, font.italic);
    const MeasuredFont measured { &face, font.size, lineHeightOf(face, font) };
    TextStyle style { font, color };
    styleNumber_ = document_.styleNumber(style);
    style_ = std::move(style);
    measured_ = measured;
    applyTextFont();
}

void Recorder::setTextStyle(const KnownStyle& known)
{
    styleNumber_ = known.number;
    style_ = known.style;
    measured_ = known.measured;
    applyTextFont();
}

void Recorder::moveTo(Tpoint point)
{
    point_ = point;
    if (surface_ != nullptr) {
        surface_->setCurrentX(point.x);
        surface_->setCurrentY(point.y);
    }
}

void Recorder::lineTo(Tpoint end)
{
    applyLineAttributes();
    document_.append(LineRecord { point_, end, penNumber_ });
    if (surface_ != nullptr)
        surface_->line(point_, end);
    point_ = end;
}

void Recorder::rowLines(Twips top, Twips bottom, std::uint32_t pattern)
{
    const std::span<const PatternLine> lines = document_.linePattern(pattern);
    if (lines.empty())
        return;
    document_.appendRow(top, bottom, pattern);
    if (surface_ != nullptr) {
        applyLineAttributes();
        for (const PatternLine& line : lines) {
            const LineRecord record = line.in(top, bottom);
            surface_->line(record.pt1, record.pt2);
        }
    }
    point_ = lines.back().in(top, bottom).pt2;
}

void Recorder::printText(TextView text, bool newLine)
{
    const std::size_t lastLine = text.rfind(u'\n') + 1; // 0 without a line feed
    const double breaks = static_cast<double>(lineCount(text)) - 1;
    const Twips lastTop = roundToInt32(point_.y + breaks * measured_.lineHeight);
    const Tpoint after = newLine
        ? Tpoint { 0, sum(lastTop, measured_.lineHeight) }
        : Tpoint { sum(point_.x, measured_.width(text.substr(lastLine))), lastTop };
    record(document_.store().add(text));
    moveTo(after);
}

Twips Recorder::textWidth(TextView text) const
{
    return pelloric::textWidth(longestLineAdvance(text, *measured_.face), measured_.size);
}

void Recorder::printCentred(TextView text, double x, double width, Twips y)
{
    moveTo({ roundToInt32(x + (width - textWidth(text)) / 2), y });
    printText(text, true);
}

void Recorder::wrappingPrint(TextView text, double cellWidth)
{
    lines_.clear();
    wrapText(document_.store().add(text), cellWidth - CellPadding, measured_, lines_);
    printLines(lines_, point_.x, cellWidth);
}

void Recorder::cellText(TextView text, double cellWidth, double left, Twips top)
{
    setCurrentY(top);
    const TextView stored = document_.store().add(withoutCarriageReturns(text));
    const Twips startX = point_.x;
    lines_.clear();
    breakText(stored, cellWidth - CellPadding, measured_, lines_);
    const auto firstEnd = std::find_if(
        lines_.begin(), lines_.end(), [](const CellLine& line) { return line.fits; });
    const auto wrapped = static_cast<std::size_t>(firstEnd - lines_.begin());
    // Only the very first line can begin elsewhere: after it the current x is `left`.
    const TextView first = stored.substr(0, stored.find_first_of(u"\n\u2605"));
    std::size_t piecesOfFirst = 0;
    std::size_t length = 0;
    while (piecesOfFirst < wrapped && length < first.size())
        length += lines_[piecesOfFirst++].text.size();
    const std::span<const CellLine> lines = lines_;
    printLines(lines.first(piecesOfFirst), startX, cellWidth);
    printLines(lines.subspan(piecesOfFirst), left, cellWidth);
    setCurrentX(roundToInt32(left));
}

void Recorder::printLines(std::span<const CellLine> lines, double left, double width)
{
    const Twips start = roundToInt32(left);
    for (const CellLine& line : lines) {
        const Twips x = line.fits ? roundToInt32(left + (width - line.width) / 2) : start;
        printStored(line, { x, point_.y });
        moveTo({ start, point_.y });
    }
}

void Recorder::printStored(const CellLine& line, Tpoint point)
{
    moveTo(point);
    const Tpoint after { 0, sum(point.y, measured_.lineHeight) };
    record(line.text);
    moveTo(after);
}

double Recorder::rowTextHeight(
    RowSet& rows, std::span<const double> widths, bool useValues, char16_t decimalSeparator)
{
    double tallest = 0;
    Text buffer;
    const auto fields = std::min(widths.size(), static_cast<std::size_t>(rows.fieldCount()));
    for (std::size_t field = 0; field < fields; ++field) {
        if (widths[field] <= CellPadding)
            continue;
        const int number = static_cast<int>(field);
        const TextView text = useValues ? displayText(rows.value(number), decimalSeparator, buffer)
                                        : rows.fieldName(number);
        tallest = std::max(tallest, cellTextHeight(trimmed(text), widths[field], measured_));
    }
    return tallest;
}

void Recorder::record(TextView stored)
{
    if (stored.size() > 0xFFFFFFFFU)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"a text of more than 4294967295 characters cannot be recorded"));
    applyTextFont();
    document_.append(TextRecord {
        point_, stored.data(), static_cast<std::uint32_t>(stored.size()), styleNumber_ });
    document_.structure.addText(document_.currentPage);
    if (surface_ != nullptr)
        surface_->print(stored);
}

void Recorder::applyLineAttributes()
{
    if (surface_ == nullptr)
        return;
    surface_->setFillColor(pen_.FillColor);
    surface_->setFillStyle(pen_.FillStyle);
    surface_->setForeColor(pen_.LineColor);
    surface_->setDrawStyle(pen_.LineStyle);
    surface_->setDrawWidth(pen_.LineWidth);
}

void Recorder::applyTextFont()
{
    if (surface_ == nullptr)
        return;
    surface_->setFontBold(style_.font.bold);
    surface_->setFontItalic(style_.font.italic);
    surface_->setFontName(style_.font.name);
    surface_->setFontSize(style_.font.size / divisor_);
    surface_->setForeColor(style_.color);
}

double cellTextHeight(TextView text, double width, const MeasuredFont& font)
{
    CellText cell = readCellText(text, font);
    Text copy;
    if (cell.hasCarriageReturn) {
        copy = withoutCarriageReturns(text);
        cell = readCellText(copy, font);
    }
    const double room = width - CellPadding;
    if (!cell.hasLineFeed && !cell.hasSeparator && cell.width <= room)
        return font.lineHeight;
    std::vector<CellLine> lines;
    breakText(cell.text, room, font, lines);
    return static_cast<double>(font.lineHeight) * static_cast<double>(lines.size());
}

} // namespace pelloric
