// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/cff_charset.h"

#include <gtest/gtest.h>

#include <string>

namespace pelloric::pdf {

namespace {

std::string bytes(std::initializer_list<int> numbers) { return { numbers.begin(), numbers.end() }; }

/// A font of five glyphs.
/// @param keys     what the top dictionary says first
/// @param charset  the table behind all
std::string font(const std::string& keys, const std::string& charset)
{
    // Head, names, top dictionary (one entry), strings, global subroutines, glyphs.
    const std::string head = bytes({ 1, 0, 4, 1 });
    const std::string names = bytes({ 0, 1, 1, 1, 2, 'F' });
    const std::string none = bytes({ 0, 0 });
    const std::string glyphs = bytes({ 0, 5, 1, 1, 2, 3, 4, 5, 6, 14, 14, 14, 14, 14 });
    const std::size_t dictionarySize = keys.size() + 8;
    const std::size_t glyphsAt = head.size() + names.size() + 5 + dictionarySize + 4;
    const auto place = [](std::size_t at) {
        return bytes({ 28, static_cast<int>(at >> 8U), static_cast<int>(at & 0xFFU) });
    };
    const std::string dictionary
        = keys + place(glyphsAt + glyphs.size()) + bytes({ 15 }) + place(glyphsAt) + bytes({ 17 });
    return head + names + bytes({ 0, 1, 1, 1, static_cast<int>(dictionarySize) + 1 }) + dictionary
        + none + none + glyphs + charset;
}

const std::string KeyedByCid = bytes({ 139, 139, 139, 12, 30 });

using Cids = std::vector<std::uint16_t>;

} // namespace

TEST(CffCharset, ReadsEachGlyphsIdentifier)
{
    const std::string list = bytes({ 0, 0, 7, 1, 0, 0, 9, 2, 1 });
    EXPECT_EQ(cidsOfCff(font(KeyedByCid, list)), (Cids { 0, 7, 256, 9, 513 }));
}

TEST(CffCharset, ReadsRangesOfIdentifiers)
{
    EXPECT_EQ(
        cidsOfCff(font(KeyedByCid, bytes({ 1, 0, 7, 1, 1, 0, 1 }))), (Cids { 0, 7, 8, 256, 257 }));
    EXPECT_EQ(
        cidsOfCff(font(KeyedByCid, bytes({ 2, 1, 0, 0, 3 }))), (Cids { 0, 256, 257, 258, 259 }));
}

TEST(CffCharset, HasNoneForAFontThatIsKeyedByNames)
{
    EXPECT_EQ(cidsOfCff(font("", bytes({ 0, 0, 7, 1, 0, 0, 9, 2, 1 }))), Cids());
}

TEST(CffCharset, EndsAtTheEndOfADamagedTable)
{
    const std::string whole = font(KeyedByCid, bytes({ 2, 1, 0, 0, 3 }));
    for (std::size_t size = 0; size < whole.size(); ++size)
        EXPECT_LE(cidsOfCff(whole.substr(0, size)).size(), 5U);
    EXPECT_EQ(cidsOfCff(""), Cids());
}

} // namespace pelloric::pdf
