// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_content.h"

#include "export/pdf_syntax.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdlib>

namespace pelloric::pdf {

namespace {

constexpr std::int64_t Hundred = 100;

/// From twips to points, the unit of pages.
constexpr std::string_view Scale = ".05 0 0 .05 0 0 cm\n";

/// How far a made-up italic leans, of its height: by 12 degrees, as on screen.
constexpr std::string_view Slant = ".2126";

/// A made-up bold face is outlined by this part of its underline's thickness.
constexpr double BoldOutline = 0.5;

constexpr double Thousand = 1000;

} // namespace

PdfContent::PdfContent(const PdfFonts& fonts)
    : fonts_(fonts)
{
}

void PdfContent::begin()
{
    stream_ = Scale;
    fill_ = 0;
    isPatternFill_ = false;
    pen_ = { .color = 0, .width = -1 };
    isJoinRound_ = false;
    font_ = 0;
    stretch_ = 1;
    isBold_ = false;
    isPathOpen_ = false;
    isTextOpen_ = false;
    isStringOpen_ = false;
}

const std::string& PdfContent::end()
{
    leaveText();
    endPath();
    return stream_;
}

void PdfContent::line(ContentPoint from, ContentPoint to, const ContentPen& pen)
{
    leaveText();
    if (!(pen == pen_) || isJoinRound_)
        setPen(pen);
    appendPoint(from);
    stream_ += "m ";
    appendPoint(to);
    stream_ += "l\n";
    isPathOpen_ = true;
}

void PdfContent::box(ContentPoint corner, ContentPoint opposite, Color fill,
    std::string_view pattern, const ContentPen* pen)
{
    leaveText();
    endPath();
    if (pen)
        setPen(*pen);
    if (pattern.empty()) {
        setFill(fill);
    } else {
        stream_ += "/Hatch cs ";
        appendColor(stream_, fill);
        stream_.append("/").append(pattern).append(" scn\n");
        isPatternFill_ = true;
        hasHatches_ = true;
    }
    appendRectangle(corner, opposite, pen && !pen->dashes.empty());
    stream_ += pen ? "B\n" : "f\n";
}

void PdfContent::frame(ContentPoint corner, ContentPoint opposite, const ContentPen& pen)
{
    leaveText();
    endPath();
    setPen(pen);
    appendRectangle(corner, opposite, !pen.dashes.empty());
    stream_ += "S\n";
}

void PdfContent::ring(
    ContentPoint corner, ContentPoint opposite, std::int64_t thickness, Color fill)
{
    leaveText();
    endPath();
    setFill(fill);
    appendRectangle(corner, opposite, false);
    appendRectangle({ corner.x + thickness, corner.y + thickness },
        { opposite.x - thickness, opposite.y - thickness }, false);
    stream_ += "f*\n";
}

void PdfContent::object(std::string_view name, ContentPoint corner, ContentPoint size)
{
    leaveText();
    endPath();
    stream_ += "q ";
    appendLength(size.x);
    stream_ += " 0 0 ";
    appendLength(size.y);
    stream_ += ' ';
    appendPoint(corner);
    stream_.append("cm /").append(name).append(" Do Q\n");
}

void PdfContent::beginMark(std::string_view tag, std::string_view properties, bool isText)
{
    endString();
    endPath();
    if (isText)
        beginTextObject();
    else
        endTextObject();
    stream_.append("/").append(tag).append(properties).append("BDC\n");
}

void PdfContent::endMark()
{
    endString();
    endPath();
    stream_ += "EMC\n";
}

void PdfContent::endPath()
{
    if (isPathOpen_)
        stream_ += "S\n";
    isPathOpen_ = false;
}

void PdfContent::endString()
{
    if (isStringOpen_)
        stream_ += ")Tj\n";
    isStringOpen_ = false;
}

void PdfContent::beginTextObject()
{
    if (isTextOpen_)
        return;
    endPath();
    stream_ += "BT\n";
    isTextOpen_ = true;
    isSkewed_ = false;
    textLine_ = {};
}

void PdfContent::endTextObject()
{
    if (isTextOpen_)
        stream_ += "ET\n";
    isTextOpen_ = false;
}

void PdfContent::leaveText()
{
    endString();
    endTextObject();
}

void PdfContent::beginString(std::uint16_t number, const TextState& state)
{
    endString();
    const FontUse& use = fonts_.use(number);
    beginTextObject();
    setFont(use, state);
    setBold(use, state);
    if (isMoved_ || use.drawn.isItalicMadeUp != isSkewed_)
        place(use.drawn.isItalicMadeUp);
    stream_ += '(';
    isStringOpen_ = true;
    isMoved_ = false;
    shownUse_ = number;
}

void PdfContent::setFont(const FontUse& use, const TextState& state)
{
    setFill(state.color);
    if (font_ != use.number || em_ != state.em) {
        stream_ += "/F";
        appendInteger(stream_, static_cast<std::int64_t>(use.number));
        stream_ += ' ';
        appendNumber(stream_, state.em);
        stream_ += " Tf\n";
        font_ = use.number;
        em_ = state.em;
    }
    if (stretch_ != state.stretch) {
        appendNumber(stream_, state.stretch * Hundred);
        stream_ += " Tz\n";
        stretch_ = state.stretch;
    }
}

/// A made-up bold face is filled and outlined.
void PdfContent::setBold(const FontUse& use, const TextState& state)
{
    const bool isBold = use.drawn.isBoldMadeUp;
    if (isBold) {
        const double thickness = use.drawn.program->facts().underline / Thousand * state.em;
        setPen({ .color = state.color, .width = thickness * BoldOutline }, true);
    }
    if (isBold != isBold_)
        stream_ += isBold ? "2 Tr\n" : "0 Tr\n";
    isBold_ = isBold;
}

/// Upright texts move from line to line; a slant would slant the moves too.
void PdfContent::place(bool isSkewed)
{
    if (isSkewed || isSkewed_) {
        stream_ += "1 0 ";
        stream_ += isSkewed ? Slant : "0";
        stream_ += " 1 ";
        appendPoint(target_);
        stream_ += "Tm\n";
    } else {
        appendPoint({ target_.x - textLine_.x, target_.y - textLine_.y });
        stream_ += "Td";
    }
    textLine_ = target_;
    isSkewed_ = isSkewed;
}

void PdfContent::setFill(Color color)
{
    if (fill_ == color && !isPatternFill_)
        return;
    appendColor(stream_, color);
    stream_ += "rg\n";
    fill_ = color;
    isPatternFill_ = false;
}

/// The ends of solid lines stand out by half a width, those of dashes do not.
void PdfContent::setPen(const ContentPen& pen, bool isRound)
{
    if (pen == pen_ && isRound == isJoinRound_)
        return;
    endPath();
    const bool isFirst = pen_.width < 0;
    if (pen.color != pen_.color) {
        appendColor(stream_, pen.color);
        stream_ += "RG\n";
    }
    if (pen.width != pen_.width) {
        appendNumber(stream_, pen.width);
        stream_ += " w\n";
    }
    if (isFirst || pen.dashes.data() != pen_.dashes.data() || pen.width != pen_.width) {
        if (!pen.dashes.empty() || !pen_.dashes.empty()) {
            stream_ += '[';
            for (const std::uint8_t dash : pen.dashes) {
                appendNumber(stream_, dash * pen.width);
                stream_ += ' ';
            }
            stream_ += "]0 d\n";
        }
        if (isFirst || pen.dashes.empty() != pen_.dashes.empty())
            stream_ += pen.dashes.empty() ? "2 J\n" : "0 J\n";
    }
    if (isRound != isJoinRound_)
        stream_ += isRound ? "1 j\n" : "0 j\n";
    pen_ = pen;
    isJoinRound_ = isRound;
}

/// Dashes begin at the top left corner and go round by the right.
void PdfContent::appendRectangle(ContentPoint corner, ContentPoint opposite, bool isDashed)
{
    const ContentPoint low { std::min(corner.x, opposite.x), std::min(corner.y, opposite.y) };
    const ContentPoint high { std::max(corner.x, opposite.x), std::max(corner.y, opposite.y) };
    if (!isDashed) {
        appendPoint(low);
        appendPoint({ high.x - low.x, high.y - low.y });
        stream_ += "re ";
        return;
    }
    appendPoint({ low.x, high.y });
    stream_ += "m ";
    for (const ContentPoint point : { high, ContentPoint { high.x, low.y }, low }) {
        appendPoint(point);
        stream_ += "l ";
    }
    stream_ += "h ";
}

void PdfContent::appendPoint(ContentPoint point)
{
    if (point.x % Hundred != 0 || point.y % Hundred != 0) {
        appendLength(point.x);
        stream_ += ' ';
        appendLength(point.y);
        stream_ += ' ';
        return;
    }
    std::array<char, 48> text {};
    char* end = std::to_chars(text.data(), text.data() + 24, point.x / Hundred).ptr;
    *end++ = ' ';
    end = std::to_chars(end, end + 23, point.y / Hundred).ptr;
    *end++ = ' ';
    stream_.append(text.data(), end);
}

void PdfContent::appendLength(std::int64_t hundredths)
{
    if (hundredths % Hundred == 0)
        appendInteger(stream_, hundredths / Hundred);
    else
        appendNumber(stream_, static_cast<double>(hundredths) / Hundred, 2);
}

} // namespace pelloric::pdf
