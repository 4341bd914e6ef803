// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/cell_lines.h"

#include "platform/numbers.h"

#include <cmath>

namespace pelloric {

namespace {

bool isBreak(char16_t unit) { return unit == u'\n' || unit == LineSeparator; }

bool isSurrogate(char16_t unit) { return (unit & 0xF800U) == 0xD800U; }

/// The largest sum of advances (at size 1) whose rounded width is at most `room`.
class WidthLimit {
public:
    WidthLimit(double room, float size)
        : size_(static_cast<double>(size))
        , room_(std::floor(room))
    {
    }

    bool holds(double advance) const { return roundHalfEven(advance * size_) <= room_; }

private:
    double size_;
    double room_;
};

} // namespace

CellText readCellText(TextView text, const MeasuredFont& font)
{
    CellText cell { .text = text };
    double advance = 0;
    for (std::size_t position = 0; position < text.size();) {
        const char16_t unit = text[position];
        if (unit <= u'\r' || unit == LineSeparator) {
            cell.hasLineFeed = cell.hasLineFeed || unit == u'\n';
            cell.hasSeparator = cell.hasSeparator || unit == LineSeparator;
            cell.hasCarriageReturn = cell.hasCarriageReturn || unit == u'\r';
        }
        if (isSurrogate(unit)) {
            advance += font.face->nextAdvance(text, position);
        } else {
            advance += font.face->unitAdvance(unit);
            ++position;
        }
    }
    if (!cell.hasCarriageReturn)
        cell.width = textWidth(advance, font.size);
    return cell;
}

Text withoutCarriageReturns(TextView text)
{
    Text result;
    result.reserve(text.size());
    for (const char16_t unit : text) {
        if (unit != u'\r')
            result.push_back(unit);
    }
    return result;
}

void wrapText(TextView text, double room, const MeasuredFont& font, std::vector<CellLine>& lines)
{
    const WidthLimit limit(room, font.size > 0 ? font.size : 0.0F);
    std::size_t start = 0;
    while (start < text.size()) {
        std::size_t end = start;
        double advance = font.face->nextAdvance(text, end);
        while (end < text.size()) {
            std::size_t next = end;
            const double wider = advance + font.face->nextAdvance(text, next);
            if (!limit.holds(wider))
                break;
            advance = wider;
            end = next;
        }
        lines.push_back({ text.substr(start, end - start), textWidth(advance, font.size), false });
        start = end;
    }
}

void breakText(TextView text, double room, const MeasuredFont& font, std::vector<CellLine>& lines)
{
    std::size_t start = 0;
    while (true) {
        std::size_t end = start;
        while (end < text.size() && !isBreak(text[end]))
            ++end;
        const TextView line = text.substr(start, end - start);
        const Twips width = font.width(line);
        if (width <= room)
            lines.push_back({ line, width, true });
        else
            wrapText(line, room, font, lines);
        if (end == text.size())
            return;
        start = end + 1;
    }
}

void breakPrinted(
    TextView text, double room, const MeasuredFont& font, std::vector<CellLine>& lines)
{
    if (text.find(u'\n') != TextView::npos)
        return breakText(text, room, font, lines);
    const Twips width = font.width(text);
    if (width <= room)
        lines.push_back({ text, width, true });
    else
        wrapText(text, room, font, lines);
}

} // namespace pelloric
