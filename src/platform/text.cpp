// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/text.h"

#include "platform/utf8.h"

#include <charconv>

namespace pelloric {

namespace {

bool isHighSurrogate(char16_t unit) { return unit >= 0xD800 && unit < 0xDC00; }

bool isLowSurrogate(char16_t unit) { return unit >= 0xDC00 && unit < 0xE000; }

void appendByte(std::string& bytes, char32_t value) { bytes.push_back(static_cast<char>(value)); }

void appendCodePoint(std::string& bytes, char32_t codePoint)
{
    if (codePoint < 0x80) {
        appendByte(bytes, codePoint);
    } else if (codePoint < 0x800) {
        appendByte(bytes, 0xC0 | (codePoint >> 6));
        appendByte(bytes, 0x80 | (codePoint & 0x3F));
    } else if (codePoint < 0x10000) {
        appendByte(bytes, 0xE0 | (codePoint >> 12));
        appendByte(bytes, 0x80 | ((codePoint >> 6) & 0x3F));
        appendByte(bytes, 0x80 | (codePoint & 0x3F));
    } else {
        appendByte(bytes, 0xF0 | (codePoint >> 18));
        appendByte(bytes, 0x80 | ((codePoint >> 12) & 0x3F));
        appendByte(bytes, 0x80 | ((codePoint >> 6) & 0x3F));
        appendByte(bytes, 0x80 | (codePoint & 0x3F));
    }
}

} // namespace

TextView trimmed(TextView text)
{
    std::size_t first = 0;
    std::size_t last = text.size();
    while (first < last && text[first] == u' ')
        ++first;
    while (last > first && text[last - 1] == u' ')
        --last;
    return text.substr(first, last - first);
}

Text replaceAll(TextView text, TextView from, TextView to)
{
    if (from.empty())
        return Text(text);
    Text result;
    std::size_t start = 0;
    for (std::size_t found = text.find(from); found != TextView::npos;
         found = text.find(from, start)) {
        result.append(text.substr(start, found - start));
        result.append(to);
        start = found + from.size();
    }
    result.append(text.substr(start));
    return result;
}

bool contains(TextView text, TextView part) { return text.find(part) != TextView::npos; }

int characterLength(TextView text, std::size_t position)
{
    const bool pair = isHighSurrogate(text[position]) && position + 1 < text.size()
        && isLowSurrogate(text[position + 1]);
    return pair ? 2 : 1;
}

char32_t nextCodePoint(TextView text, std::size_t& position)
{
    const char16_t unit = text[position];
    if (characterLength(text, position) == 1) {
        ++position;
        return unit;
    }
    const char16_t low = text[position + 1];
    position += 2;
    return 0x10000 + ((static_cast<char32_t>(unit) - 0xD800) << 10) + (low - 0xDC00U);
}

Text fromUtf8(std::string_view bytes)
{
    Text text;
    appendUtf8(text, bytes);
    return text;
}

void appendUtf8(Text& text, std::string_view bytes)
{
    const std::size_t begin = text.size();
    text.resize(begin + bytes.size());
    char16_t* const end = putUtf8(text.data() + begin, bytes);
    text.resize(static_cast<std::size_t>(end - text.data()));
}

std::string toUtf8(TextView text)
{
    std::string bytes;
    bytes.reserve(text.size());
    for (std::size_t position = 0; position < text.size();) {
        const char32_t codePoint = nextCodePoint(text, position);
        const bool half = codePoint >= 0xD800 && codePoint < 0xE000;
        appendCodePoint(bytes, half ? NoCharacter : codePoint);
    }
    return bytes;
}

Text onOneLine(TextView text)
{
    Text line = replaceAll(text, u"\r\n", u" ");
    for (char16_t& unit : line) {
        if (unit == u'\r' || unit == u'\n')
            unit = u' ';
    }
    return line;
}

Text decimal(std::int64_t number)
{
    char digits[24];
    const auto end = std::to_chars(digits, digits + sizeof digits, number).ptr;
    return { digits, end };
}

} // namespace pelloric
