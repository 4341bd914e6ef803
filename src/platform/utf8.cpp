// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/utf8.h"

#include <cstddef>

namespace pelloric {

namespace {

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
    return NoCharacter;
}

/// A whole character of three bytes, as most outside of ASCII are; 0: it is no such one.
char16_t threeByteUnit(std::string_view bytes, std::size_t position)
{
    if (position + 3 > bytes.size())
        return 0;
    const auto byteAt = [&](std::size_t at) { return static_cast<unsigned char>(bytes[at]); };
    const unsigned lead = byteAt(position);
    const unsigned second = byteAt(position + 1);
    const unsigned third = byteAt(position + 2);
    if ((lead & 0xF0U) != 0xE0U || (second & 0xC0U) != 0x80U || (third & 0xC0U) != 0x80U)
        return 0;
    const unsigned unit = ((lead & 0xFU) << 12U) | ((second & 0x3FU) << 6U) | (third & 0x3FU);
    const bool isHalf = unit >= 0xD800 && unit < 0xE000;
    return unit < 0x800 || isHalf ? char16_t { 0 } : static_cast<char16_t>(unit);
}

} // namespace

char16_t* putUtf8(char16_t* out, std::string_view bytes)
{
    for (std::size_t position = 0; position < bytes.size();) {
        const auto byte = static_cast<unsigned char>(bytes[position]);
        if (byte < 0x80) {
            *out++ = byte;
            ++position;
        } else if (const char16_t unit = threeByteUnit(bytes, position); unit != 0) {
            *out++ = unit;
            position += 3;
        } else {
            out = putCodePoint(out, nextUtf8(bytes, position));
        }
    }
    return out;
}

} // namespace pelloric
