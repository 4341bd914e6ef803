// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/margin_sketch.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

MarginSketch sketchOf(double width, double height)
{
    MarginSketch sketch;
    sketch.setSize(width, height);
    return sketch;
}

} // namespace

TEST(MarginSketch, StandsInItsFrame)
{
    EXPECT_EQ(sketchRect(3300, 6600, true), (SketchRect { 150, 300, 3000, 6000 }));
    EXPECT_EQ(sketchRect(3300, 6600, false), (SketchRect { 150, 2550, 3000, 1500 }));
    EXPECT_EQ(sketchRect(0, 0, true).height, 0);
}

TEST(MarginSketch, PlacesItsLinesAtTheMargins)
{
    const MarginSketch sketch = sketchOf(3000, 6000);
    EXPECT_EQ(sketch.linePosition(Margin::Top), 284);
    EXPECT_EQ(sketch.linePosition(Margin::Right), 2716);
    EXPECT_EQ(sketch.linePosition(Margin::Bottom), 5716);
    EXPECT_EQ(sketch.linePosition(Margin::Left), 284);
}

TEST(MarginSketch, ShowsWhichWayALineMoves)
{
    MarginSketch sketch = sketchOf(3000, 6000);
    sketch.mouseMove(Margin::Top, 500, 10);
    EXPECT_EQ(sketch.pointer(), SketchPointer::NorthSouth);
    sketch.mouseMove(Margin::Left, 284.2, 10);
    EXPECT_EQ(sketch.pointer(), SketchPointer::Default);
    sketch.mouseMove(Margin::Right, 10, 500);
    EXPECT_EQ(sketch.pointer(), SketchPointer::WestEast);
}

TEST(MarginSketch, DragsALineAndKeepsItOffTheOppositeMargin)
{
    MarginSketch sketch = sketchOf(3000, 6000);
    sketch.mouseDown(Margin::Top, 0, 5);
    EXPECT_FALSE(sketch.isDragging());
    sketch.mouseMove(Margin::Top, 0, 0);
    sketch.mouseDown(Margin::Top, 0, 5);
    EXPECT_EQ(sketch.linePosition(Margin::Top), 289);
    sketch.mouseMove(Margin::Top, 0, 100);
    EXPECT_EQ(sketch.linePosition(Margin::Top), 389);
    sketch.mouseMove(Margin::Top, 0, 285);
    EXPECT_EQ(sketch.linePosition(Margin::Top), 389);
    EXPECT_EQ(sketch.mouseUp(), Margin::Top);
    EXPECT_EQ(sketch.margin(Margin::Top), 389);
    EXPECT_EQ(sketch.mouseUp(), std::nullopt);
}

TEST(MarginSketch, StopsEachLineAtTheOppositeMargin)
{
    struct Case {
        Margin line;
        double step;
        double margin;
    };
    const Case cases[] = {
        { Margin::Top, 100, 684 },
        { Margin::Left, 100, 684 },
        { Margin::Right, -100, 684 },
        { Margin::Bottom, -100, 684 },
    };
    for (const Case& row : cases) {
        MarginSketch sketch = sketchOf(1000, 1000);
        sketch.mouseMove(row.line, 0, 0);
        sketch.mouseDown(row.line, 0, 0);
        for (int move = 0; move < 20; ++move)
            sketch.mouseMove(row.line, row.step, row.step);
        EXPECT_EQ(sketch.mouseUp(), row.line);
        EXPECT_EQ(sketch.margin(row.line), row.margin) << static_cast<int>(row.line);
    }
}

TEST(MarginSketch, KeepsADraggedLineOnTheSheet)
{
    struct Case {
        Margin line;
        double step;
    };
    const Case cases[] = {
        { Margin::Top, -100 },
        { Margin::Left, -100 },
        { Margin::Right, 100 },
        { Margin::Bottom, 100 },
    };
    for (const Case& row : cases) {
        MarginSketch sketch = sketchOf(1000, 1000);
        sketch.mouseMove(row.line, 0, 0);
        sketch.mouseDown(row.line, 0, 0);
        for (int move = 0; move < 20; ++move)
            sketch.mouseMove(row.line, row.step, row.step);
        EXPECT_EQ(sketch.mouseUp(), row.line);
        EXPECT_EQ(sketch.margin(row.line), 84) << static_cast<int>(row.line);
        sketch.mouseMove(row.line, 0, 0);
        sketch.mouseDown(row.line, row.step, row.step);
        sketch.mouseUp();
        EXPECT_EQ(sketch.margin(row.line), 84) << static_cast<int>(row.line);
    }
}

TEST(MarginSketch, RulesATableInsideTheMargins)
{
    const MarginSketch sketch = sketchOf(1000, 800);
    const auto lines = sketch.ruledLines();
    ASSERT_EQ(lines.size(), 3U);
    const double row = 284 + 284.0 / 3;
    EXPECT_EQ(lines[0], (SketchLine { 284, row, 716, row }));
    EXPECT_DOUBLE_EQ(lines[1].y1, 284 + 2 * 284.0 / 3);
    EXPECT_EQ(lines[2], (SketchLine { 568, 284, 568, lines[1].y1 }));
}

TEST(MarginSketch, EndsItsTableWhateverTheMarginsAre)
{
    for (const double margin : { -1e300, -1e9, 1e300, -284.0 }) {
        MarginSketch sketch = sketchOf(6000, 8000);
        for (const Margin which : AllMargins)
            sketch.setMargin(which, margin);
        EXPECT_LE(sketch.ruledLines().size(), 200U);
    }
}

TEST(MarginSketch, RulesAFrameOfAnySizeWithAnEnd)
{
    for (const double size : { 1e9, 1e18, 1e300 })
        EXPECT_LT(sketchOf(size, size).ruledLines().size(), 20000U) << size;
}

} // namespace pelloric
