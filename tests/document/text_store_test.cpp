// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/text_store.h"

#include <gtest/gtest.h>

#include <vector>

namespace pelloric {

TEST(TextStore, KeepsEveryTextWhereItIs)
{
    TextStore store;
    std::vector<std::pair<Text, TextView>> kept;
    for (int length = 0; length < 3000; length += 7) {
        const Text text(
            static_cast<std::size_t>(length), static_cast<char16_t>(u'a' + length % 26));
        kept.emplace_back(text, store.add(text));
    }
    for (const auto& [text, view] : kept)
        EXPECT_EQ(view, text);
}

TEST(TextStore, TakesAnEmptyTextAndOneLargerThanItsBlocks)
{
    TextStore store;
    EXPECT_EQ(store.add({}), TextView());
    const Text large(5000000, u'x');
    const TextView before = store.add(u"before");
    EXPECT_EQ(store.add(large), large);
    EXPECT_EQ(store.add(u"after"), u"after");
    EXPECT_EQ(before, u"before");
}

TEST(TextStore, FindsATextByItsPlace)
{
    TextStore store;
    std::vector<std::pair<Text, std::uint64_t>> placed;
    const Text block(1U << 17U, u'b');
    for (int index = 0; index < 40; ++index) {
        placed.emplace_back(decimal(index), store.place(decimal(index)));
        placed.emplace_back(Text(), store.place({}));
        placed.emplace_back(block, store.place(block));
        store.add(u"between");
    }
    const Text large(3'000'000, u'l');
    placed.emplace_back(large, store.place(large));
    placed.emplace_back(u"after", store.place(u"after"));
    for (const auto& [text, place] : placed)
        EXPECT_EQ(TextView(store.at(place), text.size()), text);
}

TEST(TextStore, TellsThePlaceOfItsOwnTextsOnly)
{
    TextStore store;
    std::vector<TextView> texts;
    for (int index = 0; index < 20000; ++index)
        texts.push_back(store.add(decimal(index)));
    std::size_t block = 0;
    for (const std::size_t at : { 19999U, 10U, 11U, 7000U, 6999U }) {
        const auto place = store.placeOf(texts[at].substr(1), block);
        ASSERT_TRUE(place) << at;
        EXPECT_EQ(store.at(*place), texts[at].data() + 1);
    }
    const Text other = u"other";
    EXPECT_FALSE(store.placeOf(other, block));
    EXPECT_FALSE(TextStore().placeOf(other, block));
}

TEST(TextStore, TellsNoPlaceFarWithinALargeText)
{
    TextStore store;
    const TextView large = store.add(Text(3'000'000, u'l'));
    std::size_t block = 0;
    EXPECT_TRUE(store.placeOf(large, block));
    EXPECT_FALSE(store.placeOf(large.substr(2'000'000), block));
}

TEST(TextStore, WastesLittle)
{
    TextStore store;
    const Text text(100, u'x');
    for (int copy = 0; copy < 100000; ++copy)
        store.add(text);
    EXPECT_GE(store.capacityBytes(), 100000U * 200);
    EXPECT_LE(store.capacityBytes(), 100000U * 200 * 5 / 4);
}

} // namespace pelloric
