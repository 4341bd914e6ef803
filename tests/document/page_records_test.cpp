// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/page_records.h"

#include "document/text_store.h"

#include <gtest/gtest.h>

#include <array>

namespace pelloric {

namespace {

TextRecord textAt(Tpoint point, TextView text, std::uint32_t style = 0)
{
    return { point, text.data(), static_cast<std::uint32_t>(text.size()), style };
}

void expectEqual(const TextRecord& text, const TextRecord& expected)
{
    EXPECT_EQ(text.pt, expected.pt);
    EXPECT_EQ(text.text(), expected.text());
    EXPECT_EQ(text.style, expected.style);
}

/// Walks the texts of a list, and asks for each by its number.
void expectTexts(const TextList& list, const std::vector<TextRecord>& expected)
{
    const TextRange range(list);
    ASSERT_EQ(range.size(), expected.size());
    std::size_t index = 0;
    for (const TextRecord text : range) {
        expectEqual(text, expected[index]);
        expectEqual(range[index], expected[index]);
        ++index;
    }
    EXPECT_EQ(index, expected.size());
    EXPECT_EQ(std::vector<TextRecord>(range.begin(), range.end()).size(), expected.size());
}

void expectLines(const LineRange& range, const std::vector<LineRecord>& expected)
{
    ASSERT_EQ(range.size(), expected.size());
    std::size_t index = 0;
    for (const LineRecord line : range) {
        EXPECT_EQ(line, expected[index]);
        EXPECT_EQ(range[index], expected[index]);
        ++index;
    }
    EXPECT_EQ(index, expected.size());
    EXPECT_EQ(std::vector<LineRecord>(range.begin(), range.end()), expected);
}

} // namespace

TEST(LineList, HandsOutRowsAndSingleLinesInTheOrderInWhichTheyCame)
{
    LinePatterns patterns;
    LineList list;
    const LineRange range(list, patterns);
    EXPECT_TRUE(range.empty());
    EXPECT_EQ(range.begin(), range.end());
    const auto grid = std::to_array<PatternLine>(
        { { 10, 10, false, true, 1 }, { 20, 20, false, true, 1 }, { 10, 20, true, true, 2 } });
    const auto cross = std::to_array<PatternLine>({ { 1, 9, true, false, 3 } });
    const std::uint32_t first = patterns.add(grid);
    const std::uint32_t second = patterns.add(cross);
    list.append({ { 5, 6 }, { 7, 8 }, 4 });
    list.append({ { 1, 2 }, { 3, 4 }, 5 });
    list.appendRow(100, 130, first, 3);
    list.appendRow(-5, 0, second, 1);
    list.append({ { 0, 0 }, { 0, 0 }, 6 });
    expectLines(range,
        { { { 5, 6 }, { 7, 8 }, 4 }, { { 1, 2 }, { 3, 4 }, 5 }, { { 10, 100 }, { 10, 130 }, 1 },
            { { 20, 100 }, { 20, 130 }, 1 }, { { 10, 130 }, { 20, 130 }, 2 },
            { { 1, 0 }, { 9, -5 }, 3 }, { { 0, 0 }, { 0, 0 }, 6 } });
}

TEST(LineList, HoldsARowOfManyLinesIn12Bytes)
{
    LinePatterns patterns;
    const std::vector<PatternLine> lines(10);
    const std::uint32_t pattern = patterns.add(lines);
    LineList list;
    for (int row = 0; row < 1000; ++row)
        list.appendRow(row, row + 1, pattern, lines.size());
    list.shrinkToFit();
    EXPECT_EQ(list.size(), 10'000U);
    EXPECT_EQ(list.memoryBytes(), 12'000U);
}

TEST(TextList, HandsOutTextsOfEveryHeightStyleAndLength)
{
    TextStore store;
    const TextView a = store.add(u"a text");
    const TextView b = store.add(u"another");
    const Text longText(70'000, u'x');
    const TextView large = store.add(longText);
    const TextView c = store.add(u"c");
    const std::vector<TextRecord> texts { textAt({ 1, 10 }, a), textAt({ 2, 10 }, b),
        textAt({ 3, 10 }, a), textAt({ 4, 10 }, a.substr(2)), textAt({ 5, 11 }, a),
        textAt({ 6, 11 }, a, 1), textAt({ 7, 11 }, large, 1), textAt({ 8, 11 }, c, 1),
        textAt({ 9, 11 }, {}, 1), textAt({ 10, 11 }, c, 1), textAt({ -11, -12 }, large, 2) };
    TextList list;
    for (const TextRecord& text : texts)
        list.append(text);
    expectTexts(list, texts);
    list.shrinkToFit();
    expectTexts(list, texts);
}

TEST(TextList, FindsTextsOnBothSidesOfWhatARunReaches)
{
    const Text units(200'000, u'y');
    const TextView all = units;
    std::vector<TextRecord> texts;
    for (const std::size_t start :
        std::initializer_list<std::size_t> { 0, 65'535, 65'536, 131'000, 0, 199'999 })
        texts.push_back(textAt({ 0, 0 }, all.substr(start, 1)));
    texts.push_back(textAt({ 0, 0 }, all.substr(0, 65'535)));
    texts.push_back(textAt({ 0, 0 }, all.substr(0, 65'536)));
    texts.push_back(textAt({ 0, 0 }, all.substr(1, 65'535)));
    TextList list;
    for (const TextRecord& text : texts)
        list.append(text);
    expectTexts(list, texts);
}

TEST(TextList, HoldsTheCellsOfARowIn8BytesEach)
{
    TextStore store;
    TextList list;
    for (int row = 0; row < 1000; ++row) {
        for (int column = 0; column < 8; ++column)
            list.append(textAt({ column, row }, store.add(u"cell")));
    }
    list.shrinkToFit();
    EXPECT_LE(list.memoryBytes(), 1000U * (8 * 8 + 24));
    EXPECT_EQ(TextRange(list).back().pt, (Tpoint { 7, 999 }));
}

} // namespace pelloric
