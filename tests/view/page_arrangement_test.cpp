// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/page_arrangement.h"

#include "document/page_document.h"
#include "support/errors.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

constexpr PageFacts Portrait { 11907, 16840, 1, 0, 1 };
constexpr PageFacts Landscape { 16840, 11907, 1, 0, 1 };

} // namespace

TEST(PageArrangement, GivesEachModeItsGrid)
{
    struct Case {
        OrderStyle style;
        PageFacts facts;
        PageGrid grid;
    };
    const Case cases[] = {
        { OrderStyle::Whole, Portrait, { 1, 1 } },
        { OrderStyle::One, Portrait, { 1, 1 } },
        { OrderStyle::Two, Portrait, { 2, 1 } },
        { OrderStyle::Two, { 11907, 11907, 1, 0, 1 }, { 2, 1 } },
        { OrderStyle::Two, Landscape, { 1, 2 } },
        { OrderStyle::Four, Portrait, { 2, 2 } },
        { OrderStyle::UserCustom, Portrait, { 1, 1 } },
        { OrderStyle::Six, Landscape, { 3, 2 } },
        { OrderStyle { 7 }, Portrait, { 1, 1 } },
        { OrderStyle { -1 }, Portrait, { 1, 1 } },
    };
    for (const Case& row : cases)
        EXPECT_EQ(gridOf(row.style, 15000, row.facts), row.grid) << static_cast<int>(row.style);
}

TEST(PageArrangement, TakesAsManyColumnsAsFitForMultiplePages)
{
    struct Case {
        double innerWidth;
        std::int16_t pages;
        PageGrid grid;
    };
    const Case cases[] = {
        { 36203.7, 7, { 3, 3 } },
        { 36203.7, 6, { 3, 2 } },
        { 100, 3, { 1, 3 } },
        { 0, 0, { 1, 1 } },
        { 23813.6, 2, { 2, 1 } }, // whole twips are divided
        { 15000, 32767, { 1, 32767 } },
        { 2e9, -5, { 1, 1 } },
    };
    for (const Case& row : cases) {
        PageFacts facts { 11907, 16840, row.pages, 0, 1 };
        if (row.innerWidth > 1e9)
            facts.myWidth = 2000000000;
        EXPECT_EQ(gridOf(OrderStyle::Multiple, row.innerWidth, facts), row.grid) << row.innerWidth;
    }
}

TEST(PageArrangement, RefusesAGridThatNoSixteenBitsHold)
{
    const PageFacts narrow { 1, 16840, 1, 0, 1 };
    const PageFacts none { 0, 16840, 1, 0, 1 };
    EXPECT_EQ(errorOf([&] { gridOf(OrderStyle::Multiple, 40000, narrow); }), ErrorNumber::Overflow);
    EXPECT_EQ(
        errorOf([&] { gridOf(OrderStyle::Multiple, 1e12, Portrait); }), ErrorNumber::Overflow);
    EXPECT_EQ(
        errorOf([&] { gridOf(OrderStyle::Multiple, 40000, none); }), ErrorNumber::DivisionByZero);
}

TEST(PageArrangement, FitsByTheLargerRatio)
{
    EXPECT_FLOAT_EQ(fittingDivisor(15000, 9000, { 1, 1 }, Portrait), 0.8045270442962646F);
    EXPECT_FLOAT_EQ(fittingDivisor(15000, 9000, { 2, 1 }, Portrait), 1.6090540885925293F);
    EXPECT_FLOAT_EQ(fittingDivisor(15000, 9000, { 1, 2 }, Landscape), 1.1378378868103027F);
    EXPECT_FLOAT_EQ(fittingDivisor(1000, 17040, { 1, 1 }, Portrait), 1.0F);
}

TEST(PageArrangement, CannotFitWithoutExtent)
{
    EXPECT_EQ(errorOf([] { fittingDivisor(200, 200, {}, Portrait); }), ErrorNumber::DivisionByZero);
    EXPECT_EQ(errorOf([] {
        fittingDivisor(900, 900, {}, { 0, 1, 1, 0, 1 });
    }),
        ErrorNumber::DivisionByZero);
    EXPECT_LT(fittingDivisor(0, 0, {}, Portrait), 0);
}

TEST(PageArrangement, LeavesAGapBetweenNeighbours)
{
    const PageGrid grid { 3, 3 };
    EXPECT_EQ(surfacePosition({ 100, 100 }, 0, grid, Portrait), (Tpoint { 100, 100 }));
    EXPECT_EQ(surfacePosition({ 100, 100 }, 2, grid, Portrait), (Tpoint { 24314, 100 }));
    EXPECT_EQ(surfacePosition({ 100, 100 }, 6, grid, Portrait), (Tpoint { 100, 34180 }));
}

TEST(PageArrangement, CentresHalfToEvenAndAtLeastAHundredTwipsFromTheEdge)
{
    EXPECT_EQ(centredPosition(30000, 20000, {}, Portrait), (Tpoint { 8946, 1480 }));
    EXPECT_EQ(centredPosition(12307, 17241, {}, Portrait), (Tpoint { 100, 100 }));
    EXPECT_EQ(centredPosition(100, 17243, {}, Portrait), (Tpoint { 100, 102 }));
}

TEST(PageArrangement, TakesItsFactsFromSetupAndDocument)
{
    PageDocument document;
    document.newPage();
    document.Totalpages = 9;
    const PageFacts facts = pageFactsOf(PageSetup {}, document);
    EXPECT_EQ(facts.myWidth, 11907);
    EXPECT_EQ(facts.myHeight, 16840);
    EXPECT_EQ(facts.Totalpages, 9);
    EXPECT_EQ(facts.currentPage, 1);
    EXPECT_EQ(facts.pageCount, 2);
}

} // namespace pelloric
