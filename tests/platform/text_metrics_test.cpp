// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/text_metrics.h"

#include "fakes/fake_metrics.h"
#include "support/errors.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// Counts how often an advance is asked for.
class CountingFace : public FaceMetrics {
public:
    CountingFace()
        : FaceMetrics(24)
    {
    }

    int asked = 0;

protected:
    double measureAdvance(char32_t) override
    {
        ++asked;
        return 10;
    }
};

} // namespace

TEST(TextMetrics, SumAdvancesOfCharacters)
{
    FakeFace face;
    EXPECT_EQ(face.advanceOf(u""), 0);
    EXPECT_EQ(face.advanceOf(u"ab\r\n\t"), 50);
    EXPECT_EQ(face.advanceOf(u"中\U0001F600"), 40);
    EXPECT_EQ(textWidth(10, 8.1F), 81);
    EXPECT_EQ(textWidth(5, 0.5F), 2);
    EXPECT_EQ(textWidth(7, 0.5F), 4);
    EXPECT_EQ(textHeight(face, 9), 216);
}

TEST(TextMetrics, MeasureNothingForASizeOfZeroOrLess)
{
    FakeFace face;
    for (const float size : { 0.0F, -1.0F }) {
        EXPECT_EQ(textWidth(1000, size), 0);
        EXPECT_EQ(textHeight(face, size), 0);
    }
}

TEST(TextMetrics, OverflowPast32Bits)
{
    FakeFace face;
    EXPECT_EQ(errorOf([] { textWidth(1e10, 9); }), ErrorNumber::Overflow);
    EXPECT_EQ(errorOf([&] { textHeight(face, 1e30F); }), ErrorNumber::Overflow);
}

TEST(TextMetrics, AskForEachAdvanceOnce)
{
    CountingFace face;
    for (int round = 0; round < 3; ++round)
        face.advanceOf(u"aab中\U0001F600\U0001F600");
    EXPECT_EQ(face.asked, 4);
}

} // namespace pelloric
