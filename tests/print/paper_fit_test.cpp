// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/paper_fit.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

const PaperForm A4 { u"A4", 210, 297 };
const PaperForm A4Lying { u"A4", 297, 210 };

/// Twips of A4 and of an 8k sheet.
constexpr PaperRequest A4Pages { .code = 9, .width = 11907, .height = 16840 };
constexpr PaperRequest EightKPages { .code = 0, .width = 15309, .height = 22113 };

} // namespace

TEST(PaperFit, KnowsAPaperUprightAndTurnedAndWithinAMillimetre)
{
    EXPECT_TRUE(isPaperOf(A4, 11907, 16840));
    EXPECT_TRUE(isPaperOf(A4, 16840, 11907));
    EXPECT_TRUE(isPaperOf(A4Lying, 11907, 16840));
    EXPECT_FALSE(isPaperOf(A4, 11907, 17000));
    EXPECT_FALSE(isPaperOf({ u"Japanese Postcard", 100, 148 }, 5670, 8505));
}

TEST(PaperFit, WarnsOfAnotherSizeOnly)
{
    EXPECT_EQ(paperWarning(A4Pages, A4), u"");
    EXPECT_EQ(paperWarning(A4Pages, std::nullopt), u"");
    EXPECT_EQ(paperWarning({}, A4), u"");
    EXPECT_EQ(paperWarning(EightKPages, A4),
        u"The pages are 270 x 390 mm, the printer's sheet is A4 (210 x 297 mm): what does not fit "
        u"on it is lost.");
    EXPECT_EQ(paperWarning(A4Pages, PaperForm { u"A3", 297, 420 }),
        u"The pages are 210 x 297 mm, the printer's sheet is A3 (297 x 420 mm).");
    EXPECT_NE(paperWarning(A4Pages, A4Lying), u"");
}

} // namespace pelloric
