// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/text.h"

#include <charconv>

namespace pelloric {

namespace {

constexpr char32_t Replacement = 0xFFFD;

bool isHighSurrogate(char16_t unit) { return unit >= 0xD800 && unit < 0xDC00; }

bool isLowSurrogate(char16_t unit) { return unit >= 0xDC00 && unit < 0xE000; }

/// @return  behind what was put
char16_t* putCodePoint(char16_t* out, char32_t codePoint)
{
    if (codePoint < 0x10000) {
        *out++ = static_cast<char16_t>(codePoint);
        return out;
    }
    const char32_t offset = codePoint - 0x10000;
    *out++ = static_cast<char16_t>(0xD800 + (offset >> 10));
    *out++ = static_cast<char16_t>(0xDC00 + (offset & 0x3FF));
    return out;
}

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

/// One lead byte form of UTF-8.
struct LeadForm {
    unsigned char mask;
    unsigned char value;
    int length;
    char32_t smallest; ///< a longer form of a smaller character is no character
};

constexpr LeadForm LeadForms[] = {
    { 0x80, 0x00, 1, 0 },
    { 0xE0, 0xC0, 2, 0x80 },
    { 0xF0, 0xE0, 3, 0x800 },
    { 0xF8, 0xF0, 4, 0x10000 },
};

/// Reads one character; a broken one is U+FFFD and takes one byte.
char32_t nextUtf8(std::string_view bytes, std::size_t& position)
{
    const auto byteAt = [&](std::size_t at) { return static_cast<unsigned char>(bytes[at]); };
    const unsigned char lead = byteAt(position);
    for (const LeadForm& form : LeadForms) {
        if ((lead & form.mask) != form.value)
            continue;
        const auto length = static_cast<std::size_t>(form.length);
        if (position + length > bytes.size())
            break;
        char32_t codePoint = lead & static_cast<unsigned char>(~form.mask);
        bool whole = true;
        for (std::size_t at = position + 1; at < position + length; ++at) {
            whole = whole && (byteAt(at) & 0xC0) == 0x80;
            codePoint = (codePoint << 6) | (byteAt(at) & 0x3F);
        }
        const bool surrogate = codePoint >= 0xD800 && codePoint < 0xE000;
        if (!whole || codePoint < form.smallest || codePoint > 0x10FFFF || surrogate)
            break;
        position += length;
        return codePoint;
    }
    ++position;
    return Replacement;
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

/// There are never more units than bytes.
void appendUtf8(Text& text, std::string_view bytes)
{
    const std::size_t begin = text.size();
    text.resize(begin + bytes.size());
    char16_t* out = text.data() + begin;
    for (std::size_t position = 0; position < bytes.size();) {
        const auto byte = static_cast<unsigned char>(bytes[position]);
        if (byte < 0x80) {
            *out++ = byte;
            ++position;
        } else {
            out = putCodePoint(out, nextUtf8(bytes, position));
        }
    }
    text.resize(static_cast<std::size_t>(out - text.data()));
}

std::string toUtf8(TextView text)
{
    std::string bytes;
    bytes.reserve(text.size());
    for (std::size_t position = 0; position < text.size();) {
        const char32_t codePoint = nextCodePoint(text, position);
        const bool half = codePoint >= 0xD800 && codePoint < 0xE000;
        appendCodePoint(bytes, half ? Replacement : codePoint);
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
