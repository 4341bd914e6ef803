// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/view_state.h"

#include "report/report_style.h"
#include "support/errors.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace pelloric {

namespace {

using Surfaces = std::vector<Tpoint>;
using Pages = std::vector<std::optional<int>>;

/// A view on a document of A4 portrait pages.
class ViewTest : public ::testing::Test {
protected:
    void addPages(std::int16_t count)
    {
        facts.Totalpages = static_cast<std::int16_t>(facts.Totalpages + count);
        facts.pageCount += count;
        facts.currentPage = static_cast<std::int16_t>(facts.pageCount - 1);
    }

    void setViewport(Twips width, Twips height)
    {
        view.viewportWidth = width;
        view.viewportHeight = height;
    }

    void showMuliPage(std::int16_t nPages)
    {
        placeMuliPage(view, facts, fitMuliPage(view, facts, nPages));
    }

    Pages pages() const
    {
        Pages shown;
        for (std::size_t surface = 0; surface < view.surfaces.size(); ++surface)
            shown.push_back(pageOnSurface(view, facts, static_cast<int>(surface)));
        return shown;
    }

    ViewState view;
    PageFacts facts { 11907, 16840, 1, 0, 1 };
    PageSetup setup;
    ReportStyle style;
};

} // namespace

TEST_F(ViewTest, FitsAWholePageByTheLargerRatio)
{
    showWholePage(view, facts);
    EXPECT_FLOAT_EQ(view.divisor, 0.8045270442962646F);
    EXPECT_DOUBLE_EQ(view.innerWidth, 12067.90566444397);
    EXPECT_DOUBLE_EQ(view.innerHeight, 7240.743398666382);
    EXPECT_EQ(view.style, OrderStyle::Whole);
    EXPECT_EQ(view.Hbar, ScrollBar {});
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 100, 0, 42, 4 }));
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, 100 } }));
    EXPECT_TRUE(view.baseVisible);
}

TEST_F(ViewTest, PutsAllPagesInAsManyColumnsAsFit)
{
    addPages(6);
    setDispScale(view, facts, 0.4F);
    showAllPage(view, facts);
    EXPECT_FLOAT_EQ(view.divisor, 2.413581132888794F);
    EXPECT_EQ(view.grid, (PageGrid { 3, 3 }));
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 300, 0, 126, 13 }));
    EXPECT_FALSE(view.Hbar.enabled);
    EXPECT_EQ(view.surfaces,
        (Surfaces { { 100, 100 }, { 12207, 100 }, { 24314, 100 }, { 100, 17140 }, { 12207, 17140 },
            { 24314, 17140 }, { 100, 34180 } }));
    EXPECT_EQ(pages(), (Pages { 0, 1, 2, 3, 4, 5, 6 }));
    EXPECT_FALSE(showsPageWindow(view));
}

TEST_F(ViewTest, PutsTwoLandscapePagesOneAboveTheOther)
{
    facts.myWidth = 16840;
    facts.myHeight = 11907;
    addPages(4);
    setShowStyle(view, 2, 2, 3);
    showMuliPage(2);
    EXPECT_FLOAT_EQ(view.divisor, 1.1378378868103027F);
    EXPECT_EQ(view.grid, (PageGrid { 1, 2 }));
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 144, 0, 60, 6 }));
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, 100 }, { 100, 12207 } }));
    EXPECT_EQ(pages(), (Pages { 2, 3 }));
    EXPECT_TRUE(showsPageWindow(view));
}

TEST_F(ViewTest, LoadsSurfacesPastTheLastPageAndLeavesThemBlank)
{
    addPages(1);
    setShowStyle(view, 4, 1, 4);
    showMuliPage(4);
    EXPECT_EQ(view.style, OrderStyle::Four);
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 200, 0, 84, 8 }));
    EXPECT_EQ(pages(), (Pages { 1, std::nullopt, std::nullopt, std::nullopt }));
}

TEST_F(ViewTest, BeginsAWindowAtTheFirstPageAtLeast)
{
    addPages(4);
    setShowStyle(view, 2, -3, -2);
    showMuliPage(2);
    EXPECT_EQ(view.window, (MuliPageType { 2, -3, -2 }));
    EXPECT_EQ(pages(), (Pages { 0, 1 }));
}

TEST_F(ViewTest, PlacesAsManySurfacesAsTheWindowSaysWhateverTheArgument)
{
    addPages(9);
    setShowStyle(view, 3, 0, 2);
    showMuliPage(6);
    EXPECT_EQ(view.style, OrderStyle::Six);
    EXPECT_EQ(view.surfaces.size(), 3U);
}

TEST_F(ViewTest, KeepsTheModeForAnyOtherNumberOfPages)
{
    addPages(9);
    setShowStyle(view, 2, 0, 1);
    showMuliPage(4);
    showMuliPage(3);
    EXPECT_EQ(view.style, OrderStyle::Four);
    EXPECT_EQ(view.grid, (PageGrid { 2, 2 }));
    EXPECT_EQ(view.surfaces.size(), 2U);
}

TEST_F(ViewTest, ShowsTheCurrentPageAfterAWindowWasTakenAway)
{
    addPages(4);
    facts.currentPage = 2;
    setShowStyle(view, 2, 2, 3);
    showMuliPage(2);
    setShowStyle(view, 0, 0, 0);
    showWholePage(view, facts);
    EXPECT_TRUE(view.multiPage);
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, 100 } }));
    EXPECT_EQ(pages(), (Pages { 2 }));
}

TEST_F(ViewTest, ClearingEndsAnArrangementButKeepsWindowModeAndBars)
{
    addPages(4);
    setShowStyle(view, 2, 0, 1);
    showMuliPage(2);
    endArrangement(view);
    EXPECT_FALSE(view.multiPage);
    EXPECT_EQ(view.surfaces.size(), 1U);
    EXPECT_EQ(view.window, (MuliPageType { 2, 0, 1 }));
    EXPECT_EQ(view.style, OrderStyle::Two);
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 28, 0, 24, 2 }));
}

TEST_F(ViewTest, ShowPageCentresOnceWhenAsked)
{
    setViewport(30000, 20000);
    layOutAgain(view, facts);
    view.ReSetLeftTop = true;
    showPage(view, facts);
    EXPECT_EQ(view.surfaces, (Surfaces { { 8946, 1480 } }));
    EXPECT_FALSE(view.ReSetLeftTop);
    showPage(view, facts);
    EXPECT_EQ(view.surfaces, (Surfaces { { 8946, 1480 } }));
}

TEST_F(ViewTest, ShowPageLaysOutAgainOnlyWhenItLeavesAnotherGrid)
{
    setViewport(5000, 6000);
    showPage(view, facts);
    EXPECT_FALSE(view.Hbar.enabled);
    addPages(3);
    setShowStyle(view, 4, 0, 3);
    showMuliPage(4);
    EXPECT_TRUE(view.Vbar.enabled);
    showPage(view, facts);
    EXPECT_EQ(view.grid, PageGrid {});
    EXPECT_EQ(view.style, OrderStyle::One);
    EXPECT_FALSE(view.Vbar.enabled);
    EXPECT_EQ(pages(), (Pages { 3 }));
}

TEST_F(ViewTest, ShowPageNeedsAPage)
{
    view.style = OrderStyle::Whole;
    facts.currentPage = -1;
    showPage(view, facts);
    EXPECT_EQ(view.style, OrderStyle::Whole);
    EXPECT_FALSE(view.baseVisible);
    for (const std::int16_t page : { std::int16_t { -2 }, std::int16_t { 1 } }) {
        facts.currentPage = page;
        EXPECT_EQ(errorOf([&] { showPage(view, facts); }), ErrorNumber::SubscriptOutOfRange);
        EXPECT_EQ(pages(), (Pages { std::nullopt }));
    }
}

TEST_F(ViewTest, ANewDocumentStartsWithoutAWindow)
{
    addPages(4);
    setShowStyle(view, 4, 1, 4);
    showMuliPage(4);
    showNewDocument(view, facts);
    EXPECT_EQ(view.window, (MuliPageType { 0, 0, 4 }));
    EXPECT_EQ(view.style, OrderStyle::One);
    EXPECT_FALSE(view.multiPage);
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, 100 } }));
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 28, 0, 24, 2 }));
}

TEST_F(ViewTest, ScrollRangeOfOnePage)
{
    setViewport(12000, 10000);
    layOutAgain(view, facts);
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 72, 0, 42, 4 }));
    EXPECT_EQ(view.Hbar, ScrollBar {});
}

TEST_F(ViewTest, AStepOfABarMovesAHundredTwips)
{
    setViewport(5000, 6000);
    layOutAgain(view, facts);
    setHbar(view, facts, 1);
    setVbar(view, facts, 5);
    setVbar(view, facts, 3);
    EXPECT_EQ(view.surfaces, (Surfaces { { 0, -200 } }));
    layOutAgain(view, facts);
    EXPECT_EQ(view.Hbar, (ScrollBar { true, 71, 1, 29, 3 }));
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 112, 3, 39, 4 }));
    EXPECT_EQ(view.surfaces, (Surfaces { { 0, -200 } }));
}

TEST_F(ViewTest, ABarThatIsNotNeededResetsTheLeftOffsetOnly)
{
    setViewport(5000, 6000);
    layOutAgain(view, facts);
    setHbar(view, facts, 10);
    setVbar(view, facts, 10);
    setViewport(30000, 20000);
    layOutAgain(view, facts);
    EXPECT_EQ(view.Hbar.value, 0);
    EXPECT_EQ(view.Vbar.value, 0);
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, -900 } }));
}

TEST_F(ViewTest, APreviousValueAboveTheMaximumLowersTheBarOnly)
{
    setViewport(20000, 6000);
    layOutAgain(view, facts);
    setVbar(view, facts, 112);
    setViewport(20000, 16000);
    layOutAgain(view, facts);
    EXPECT_EQ(view.Vbar.maximum, 12);
    EXPECT_EQ(view.Vbar.value, 12);
    EXPECT_EQ(view.previousVbar, 112);
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, -11100 } }));
    setVbar(view, facts, 0);
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, 100 } }));
}

TEST_F(ViewTest, StepsOfAShortBarAreAtLeastOne)
{
    setViewport(20000, 16830);
    layOutAgain(view, facts);
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 4, 0, 4, 1 }));
    setViewport(20000, 0);
    layOutAgain(view, facts);
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 172, 0, 1, 1 }));
}

TEST_F(ViewTest, AScrollRangePastSixteenBitsIsAnError)
{
    addPages(300);
    EXPECT_EQ(errorOf([&] { showAllPage(view, facts); }), ErrorNumber::Overflow);
    EXPECT_EQ(view.surfaces.size(), 301U);
    EXPECT_EQ(errorOf([&] { setHbar(view, facts, 32768); }), ErrorNumber::Overflow);
    EXPECT_EQ(view.previousHbar, 0);
}

TEST_F(ViewTest, ZoomsByDoublingAndHalvingTheDivisor)
{
    setDispScale(view, facts, 0.75F);
    EXPECT_FLOAT_EQ(view.divisor, 1.3333333730697632F);
    zoomIn(view, facts);
    EXPECT_FLOAT_EQ(view.divisor, 2.6666667461395264F);
    zoomOut(view, facts);
    EXPECT_EQ(view.divisor, 1 / 0.75F);
    EXPECT_DOUBLE_EQ(view.innerWidth, 20000.000596046448);
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 52, 0, 36, 4 }));
}

TEST_F(ViewTest, AScaleOfZeroChangesNothing)
{
    setDispScale(view, facts, 0.5F);
    EXPECT_EQ(errorOf([&] { setDispScale(view, facts, 0); }), ErrorNumber::DivisionByZero);
    EXPECT_EQ(errorOf([&] { setDispScale(view, facts, 1e-45F); }), ErrorNumber::Overflow);
    EXPECT_EQ(view.divisor, 2.0F);
    EXPECT_EQ(view.innerWidth, 30000);
}

TEST_F(ViewTest, ANegativeScaleIsStoredAndLeavesNoRoom)
{
    setDispScale(view, facts, -2);
    EXPECT_EQ(view.divisor, -0.5F);
    EXPECT_EQ(view.innerWidth, 0);
    EXPECT_EQ(view.innerHeight, 0);
    EXPECT_TRUE(view.Hbar.enabled);
}

TEST_F(ViewTest, ZoomingNeverEndsInAnInfiniteDivisor)
{
    std::optional<ErrorNumber> error;
    for (int step = 0; step < 200 && !error; ++step)
        error = errorOf([&] { zoomIn(view, facts); });
    EXPECT_EQ(error, ErrorNumber::Overflow);
    for (int step = 0; step < 400; ++step)
        zoomOut(view, facts);
    EXPECT_EQ(view.divisor, 0);
    EXPECT_EQ(view.Vbar.maximum, 172);
}

TEST_F(ViewTest, ADragMovesThePagesOnceByItsWholeTwips)
{
    mouseMove(view);
    mouseDown(view, 100.5, 201.5);
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, 100 } }));
    mouseUp(view, facts, 600.5, 101);
    mouseUp(view, facts, 900, 900);
    EXPECT_EQ(view.surfaces, (Surfaces { { 600, -1 } }));
}

TEST_F(ViewTest, NothingIsDraggedOutsidePanMode)
{
    pan(view);
    setMouse(view);
    mouseDown(view, 0, 0);
    mouseUp(view, facts, 500, 0);
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, 100 } }));
    mouseMove(view);
    EXPECT_TRUE(view.pan);
}

TEST_F(ViewTest, AnotherOrientationExchangesTheSizes)
{
    setVerticalDir(view, style, setup, facts, false);
    EXPECT_EQ(setup.myWidth, 16840);
    EXPECT_EQ(setup.myHeight, 11907);
    EXPECT_FALSE(view.portrait);
    EXPECT_EQ(view.Hbar, (ScrollBar { true, 20, 0, 18, 2 }));
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 33, 0, 24, 2 }));
    EXPECT_EQ(style.printableWidthTenth, 1457);
    EXPECT_EQ(style.printableHeightTenth, 964);
}

TEST_F(ViewTest, ThePresentOrientationOnlyTakesThePrintableSizeAnew)
{
    setup.intTop = 907;
    setup.intButtom = 1021;
    setup.intLeft = setup.intRight = 680;
    setVerticalDir(view, style, setup, facts, true);
    EXPECT_EQ(setup.myWidth, 11907);
    EXPECT_EQ(style.printableWidthTenth, 1055);
    EXPECT_EQ(style.printableHeightTenth, 1491);
}

TEST_F(ViewTest, ATurnedHeightPastSixteenBitsChangesNothing)
{
    setup.myHeight = 32768;
    facts.myHeight = 32768;
    const PageSetup before = setup;
    EXPECT_EQ(
        errorOf([&] { setVerticalDir(view, style, setup, facts, false); }), ErrorNumber::Overflow);
    EXPECT_EQ(setup, before);
    EXPECT_TRUE(view.portrait);
    setup.myHeight = facts.myHeight = 32767;
    setVerticalDir(view, style, setup, facts, false);
    EXPECT_EQ(setup.myWidth, 32767);
}

TEST_F(ViewTest, KnowsWhichOfManySurfacesAreSeen)
{
    addPages(32766);
    facts.myWidth = 100;
    facts.myHeight = 100;
    EXPECT_EQ(errorOf([&] { showAllPage(view, facts); }), std::nullopt);
    EXPECT_EQ(view.surfaces.size(), 32767U);
    const std::vector<int> seen = surfacesInView(view, facts);
    EXPECT_FALSE(seen.empty());
    EXPECT_LT(seen.size(), 32767U);
    EXPECT_EQ(seen.front(), 0);
}

TEST_F(ViewTest, MovesPagesToAnyPositionThatABarReaches)
{
    setViewport(20000, 10000); // the vertical bar reaches to 72
    layOutAgain(view, facts);
    movePages(view, facts, { 5000, -2349 });
    EXPECT_EQ(view.surfaces, (Surfaces { { 100, -2349 } }));
    EXPECT_EQ(view.Vbar.value, 24);
    EXPECT_EQ(view.previousVbar, 24);
    movePages(view, facts, { 0, 800 });
    EXPECT_EQ(view.offset.y, 100);
    movePages(view, facts, { 0, -99999 });
    EXPECT_EQ(view.offset.y, -7100);
    EXPECT_EQ(view.Vbar.value, 72);
}

TEST_F(ViewTest, BringsPagesBackThatAnotherViewportHasLeftOutOfSight)
{
    setViewport(5000, 6000);
    layOutAgain(view, facts);
    setVbar(view, facts, 112);
    setViewport(20000, 16000);
    layOutAgain(view, facts);
    bringIntoStep(view, facts);
    EXPECT_EQ(view.Vbar, (ScrollBar { true, 12, 12, 11, 1 }));
    EXPECT_EQ(view.surfaces, (Surfaces { { 3946, -1100 } })); // centred where there is no bar
    setViewport(20000, 30000);
    layOutAgain(view, facts);
    EXPECT_EQ(view.offset.y, -1100);
    bringIntoStep(view, facts);
    EXPECT_EQ(view.surfaces, (Surfaces { { 3946, 6480 } }));
    EXPECT_FALSE(view.ReSetLeftTop);
}

TEST_F(ViewTest, KeepsThePartOfThePageUnderAPointWhenItZooms)
{
    setViewport(6000, 6000);
    layOutAgain(view, facts);
    setVbar(view, facts, 50);
    setHbar(view, facts, 20);
    const double x = 3000 * 1.0 - view.offset.x;
    const double y = 2000 * 1.0 - view.offset.y;
    zoomAbout(view, facts, 1.25F, 3000, 2000);
    EXPECT_EQ(view.offset.x, std::nearbyint(3000 * 0.8 - x));
    EXPECT_EQ(view.offset.y, std::nearbyint(2000 * 0.8 - y));
    zoomAbout(view, facts, 0.2F, 3000, 2000);
    EXPECT_EQ(view.offset, (Tpoint { 8946, 6480 })); // all of it is seen, and centred
}

TEST_F(ViewTest, KeepsThePageInViewWhileTheCurrentOneDoesNotExist)
{
    addPages(4);
    facts.currentPage = 2;
    showPage(view, facts);
    EXPECT_EQ(pageInView(view, facts), 2);
    facts.currentPage = -1;
    showPage(view, facts);
    EXPECT_EQ(pageInView(view, facts), 2);
    facts.currentPage = 3;
    EXPECT_EQ(pageInView(view, facts), 3);
    facts.currentPage = -4;
    facts.pageCount = 1;
    EXPECT_EQ(pageInView(view, facts), std::nullopt);
}

} // namespace pelloric
