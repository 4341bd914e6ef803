// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/characters.h"

#include <algorithm>
#include <array>

namespace pelloric {

namespace {

struct KindRange {
    char32_t first;
    char32_t last;
    CharacterKind kind;
};

/// In ascending order; what lies between the ranges is plain.
constexpr auto KindRanges = std::to_array<KindRange>({
    { 0x0000, 0x0008, CharacterKind::Nothing },
    { 0x0009, 0x0009, CharacterKind::Tab },
    { 0x000A, 0x000A, CharacterKind::LineFeed },
    { 0x000B, 0x001F, CharacterKind::Nothing },
    { 0x007F, 0x009F, CharacterKind::Nothing },
    { 0x00AD, 0x00AD, CharacterKind::Nothing }, // soft hyphen: texts break at any character
    { 0x0300, 0x036F, CharacterKind::Shaped }, // combining marks
    { 0x0483, 0x0489, CharacterKind::Shaped },
    { 0x0590, 0x061B, CharacterKind::Shaped }, // Hebrew to Myanmar
    { 0x061C, 0x061C, CharacterKind::Joiner },
    { 0x061D, 0x109F, CharacterKind::Shaped },
    { 0x1100, 0x11FF, CharacterKind::Shaped }, // parts of Hangul syllables
    { 0x135D, 0x135F, CharacterKind::Shaped },
    { 0x1700, 0x18AF, CharacterKind::Shaped }, // Philippine scripts, Khmer, Mongolian
    { 0x1900, 0x1CFF, CharacterKind::Shaped }, // Limbu to the Vedic signs
    { 0x1DC0, 0x1DFF, CharacterKind::Shaped },
    { 0x200B, 0x200B, CharacterKind::Nothing },
    { 0x200C, 0x200F, CharacterKind::Joiner },
    { 0x2028, 0x2029, CharacterKind::Nothing },
    { 0x202A, 0x202E, CharacterKind::Joiner },
    { 0x2060, 0x2064, CharacterKind::Nothing },
    { 0x2066, 0x206F, CharacterKind::Joiner },
    { 0x20D0, 0x20FF, CharacterKind::Shaped },
    { 0x2DE0, 0x2DFF, CharacterKind::Shaped },
    { 0x302A, 0x302F, CharacterKind::Shaped },
    { 0x3099, 0x309A, CharacterKind::Shaped },
    { 0xA66F, 0xA67D, CharacterKind::Shaped },
    { 0xA800, 0xABFF, CharacterKind::Shaped }, // Syloti Nagri to Meetei Mayek
    { 0xD7B0, 0xD7FF, CharacterKind::Shaped },
    { 0xFB1D, 0xFDFF, CharacterKind::Shaped }, // Hebrew and Arabic presentation forms
    { 0xFE00, 0xFE0F, CharacterKind::Joiner },
    { 0xFE20, 0xFE2F, CharacterKind::Shaped },
    { 0xFE70, 0xFEFE, CharacterKind::Shaped },
    { 0xFEFF, 0xFEFF, CharacterKind::Nothing },
    { 0xFFF9, 0xFFFB, CharacterKind::Nothing },
    { 0x10000, 0x1FFFF, CharacterKind::Shaped }, // old and minor scripts, emoji
    { 0xE0000, 0xE0FFF, CharacterKind::Joiner },
});

} // namespace

CharacterKind characterKind(char32_t codePoint)
{
    const auto range = std::ranges::lower_bound(KindRanges, codePoint, {}, &KindRange::last);
    const bool isInside = range != KindRanges.end() && range->first <= codePoint;
    return isInside ? range->kind : CharacterKind::Plain;
}

} // namespace pelloric
