// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/page_reading.h"

#include "controls/canvas.h"
#include "fakes/fake_platform.h"
#include "view/page_renderer.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// A canvas that shows one A4 page in a viewport.
class PageReading : public testing::Test {
protected:
    void view(Twips width, Twips height)
    {
        canvas.page.myWidth = 11907;
        canvas.page.myHeight = 16840;
        canvas.setViewport(width, height);
        canvas.showPage();
        canvas.OnDraw();
    }

    std::string bars()
    {
        return std::to_string(canvas.view().Hbar.value) + ","
            + std::to_string(canvas.view().Vbar.value);
    }

    FakePlatform platform;
    Canvas canvas { platform.services() };
};

} // namespace

TEST_F(PageReading, GoesDownAndThenToTheTopOfThePartToTheRight)
{
    view(8000, 10000); // the bars reach to 41 and 72, a large step of the second is 42
    std::vector<std::string> seen { bars() };
    while (readWithinPages(canvas, ReadingWay::On))
        seen.push_back(bars());
    EXPECT_EQ(seen,
        (std::vector<std::string> {
            "0,0", "0,42", "0,72", "27,0", "27,42", "27,72", "41,0", "41,42", "41,72" }));
    EXPECT_FALSE(readWithinPages(canvas, ReadingWay::On));
    seen.clear();
    while (readWithinPages(canvas, ReadingWay::Back))
        seen.push_back(bars());
    EXPECT_EQ(seen,
        (std::vector<std::string> {
            "41,30", "41,0", "14,72", "14,30", "14,0", "0,72", "0,30", "0,0" }));
}

TEST_F(PageReading, MovesNothingWhereAllIsSeen)
{
    view(20000, 20000);
    EXPECT_FALSE(readWithinPages(canvas, ReadingWay::On));
    EXPECT_FALSE(readWithinPages(canvas, ReadingWay::Back));
    EXPECT_TRUE(rests(canvas, ReadingWay::On));
    EXPECT_TRUE(rests(canvas, ReadingWay::Back));
}

TEST_F(PageReading, NeverMovesOnByMoreThanIsSeen)
{
    view(20000, 260); // the bar's own large step is rounded to 300 twips
    ASSERT_EQ(canvas.view().Vbar.largeChange, 3);
    readWithinPages(canvas, ReadingWay::On);
    EXPECT_EQ(canvas.view().Vbar.value, 2);
}

TEST_F(PageReading, TakesBarsToTheirStartAsMovingThemWould)
{
    view(8000, 10000);
    barsToEnd(canvas);
    EXPECT_EQ(bars(), "41,72");
    barsToStart(canvas);
    EXPECT_EQ(bars(), "0,0");
    EXPECT_EQ(canvas.view().offset, (Tpoint { 100, 100 }));
    EXPECT_EQ(canvas.view().previousVbar, 0);
}

TEST_F(PageReading, BringsADraggedPageIntoStepFirst)
{
    view(20000, 10000);
    canvas.Pan();
    canvas.mouseDown(0, 0);
    canvas.mouseUp(0, 2000);
    EXPECT_EQ(canvas.view().offset.y, 2100);
    EXPECT_TRUE(readWithinPages(canvas, ReadingWay::On));
    EXPECT_EQ(canvas.view().Vbar.value, 0);
    EXPECT_EQ(canvas.view().offset.y, 100);
    readWithinPages(canvas, ReadingWay::On);
    EXPECT_EQ(canvas.view().Vbar.value, 42);
    EXPECT_EQ(canvas.view().offset.y, 100 - 4200);
}

TEST_F(PageReading, ScrollsOffTheGreyEdgeThatALargeScaleShows)
{
    view(90, 90);
    ASSERT_TRUE(surfacesInView(canvas.view(), canvas.facts()).empty());
    keepPageInSight(canvas);
    EXPECT_EQ(surfacesInView(canvas.view(), canvas.facts()), std::vector<int> { 0 });
    EXPECT_EQ(bars(), "1,1");
}

TEST_F(PageReading, BringsAPartIntoSightByAsLittleAsItTakes)
{
    view(20000, 10000);
    const Tpoint before = canvas.view().offset;
    bringIntoSight(canvas, 0, { 0, 1000, 500, 1200 });
    EXPECT_EQ(canvas.view().offset, before);
    bringIntoSight(canvas, 0, { 0, 12000, 500, 12200 });
    EXPECT_EQ(canvas.view().offset.y, 10000 - 2000 - 12200); // a fifth stays free below
    bringIntoSight(canvas, 0, { 0, 500, 500, 700 });
    EXPECT_EQ(canvas.view().offset.y, 100); // no further than the bar reaches
    bringIntoSight(canvas, 1, { 0, 12000, 500, 12200 }); // no such surface
    EXPECT_EQ(canvas.view().offset.y, 100);
}

} // namespace pelloric
