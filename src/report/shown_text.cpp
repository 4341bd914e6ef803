// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/shown_text.h"

#include "document/text_store.h"

namespace pelloric {

namespace {

constexpr TextView Dots = u"…";

/// Whether a line may be broken on either side of the character.
bool isIdeograph(char16_t unit)
{
    return (unit >= 0x2E80 && unit <= 0x9FFF) || (unit >= 0xAC00 && unit <= 0xD7AF)
        || (unit >= 0xF900 && unit <= 0xFAFF) || (unit >= 0xFF00 && unit <= 0xFFEF);
}

bool breaksBehind(TextView text, std::size_t at)
{
    const char16_t unit = text[at];
    return unit == u' ' || unit == u'-' || isIdeograph(unit)
        || (at + 1 < text.size() && isIdeograph(text[at + 1]));
}

TextView withoutEndBlanks(TextView text)
{
    while (!text.empty() && text.back() == u' ')
        text.remove_suffix(1);
    return text;
}

void append(TextView text, const MeasuredFont& font, std::vector<CellLine>& lines)
{
    lines.push_back({ text, font.width(text), true });
}

/// The longest beginning of a text that ends with a word and fits; at least one character.
std::size_t firstLineLength(TextView text, double room, const MeasuredFont& font)
{
    double advance = 0;
    std::size_t lastBreak = 0;
    for (std::size_t at = 0; at < text.size();) {
        std::size_t behind = at;
        const double width = font.face->nextAdvance(text, behind);
        const bool isBlank = text[at] == u' ';
        if (!isBlank && textWidth(advance + width, font.size) > room)
            return lastBreak > 0 ? lastBreak : std::max(at, behind * (at == 0 ? 1U : 0U));
        advance += width;
        if (breaksBehind(text, behind - 1))
            lastBreak = behind;
        at = behind;
    }
    return text.size();
}

void wrapLine(TextView line, double room, const MeasuredFont& font, std::vector<CellLine>& lines)
{
    if (font.width(line) <= room) {
        append(line, font, lines);
        return;
    }
    while (!line.empty()) {
        const std::size_t length = firstLineLength(line, room, font);
        append(withoutEndBlanks(line.substr(0, length)), font, lines);
        line.remove_prefix(length);
    }
}

template <typename Action> void forEachLine(TextView text, const Action& action)
{
    for (;;) {
        const std::size_t end = text.find(u'\n');
        action(text.substr(0, end));
        if (end == TextView::npos)
            return;
        text.remove_prefix(end + 1);
    }
}

/// How many code units from an end stay when so much width is left for them.
std::size_t keptFront(TextView text, double room, const MeasuredFont& font)
{
    double advance = 0;
    for (std::size_t at = 0; at < text.size();) {
        std::size_t behind = at;
        advance += font.face->nextAdvance(text, behind);
        if (textWidth(advance, font.size) > room)
            return at;
        at = behind;
    }
    return text.size();
}

std::size_t keptBack(TextView text, double room, const MeasuredFont& font)
{
    std::size_t kept = 0;
    double advance = 0;
    while (kept < text.size()) {
        std::size_t begin = text.size() - kept - 1;
        const bool isLowHalf = text[begin] >= 0xDC00 && text[begin] <= 0xDFFF;
        if (isLowHalf && begin > 0)
            --begin;
        std::size_t behind = begin;
        advance += font.face->nextAdvance(text, behind);
        if (textWidth(advance, font.size) > room)
            break;
        kept = text.size() - begin;
    }
    return kept;
}

Text shortened(TextView line, double room, TooWide where, const MeasuredFont& font)
{
    if (where == TooWide::CutPlainly)
        return Text(line.substr(0, keptFront(line, room, font)));
    const double left = room - font.width(Dots);
    if (where == TooWide::CutLeft)
        return Text(Dots) + Text(line.substr(line.size() - keptBack(line, left, font)));
    if (where == TooWide::CutMiddle)
        return Text(line.substr(0, keptFront(line, left / 2, font))) + Text(Dots)
            + Text(line.substr(line.size() - keptBack(line, left / 2, font)));
    return Text(line.substr(0, keptFront(line, left, font))) + Text(Dots);
}

} // namespace

void wrapWords(TextView text, double room, const MeasuredFont& font, std::vector<CellLine>& lines)
{
    forEachLine(text, [&](TextView line) { wrapLine(line, room, font, lines); });
}

void cutLines(TextView text, double room, TooWide where, const MeasuredFont& font, TextStore& store,
    std::vector<CellLine>& lines)
{
    forEachLine(text, [&](TextView line) {
        const bool fits = font.width(line) <= room;
        append(fits ? line : store.add(shortened(line, room, where, font)), font, lines);
    });
}

} // namespace pelloric
