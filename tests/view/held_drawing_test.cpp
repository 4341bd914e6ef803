// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/held_drawing.h"

#include "fakes/fake_surface.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

void drawAll(DrawingSurface& surface, Text text)
{
    surface.clear();
    surface.setFontName(text);
    surface.setFontSize(12);
    surface.setFontBold(true);
    surface.setFontItalic(true);
    surface.setFontTransparent(false);
    surface.setForeColor(1);
    surface.setDrawWidth(2);
    surface.setDrawStyle(3);
    surface.setFillStyle(4);
    surface.setFillColor(5);
    surface.setCurrentX(6);
    surface.setCurrentY(7);
    surface.line({ 1, 2 }, { 3, 4 });
    surface.box({ 5, 6 }, { 7, 8 }, 9);
    surface.print(text);
    surface.picture(text, { 1, 2 }, { 3, 4 });
}

} // namespace

TEST(HeldDrawing, DrawsEverythingAsItWasDrawnAsOftenAsIsWanted)
{
    FakeSurface direct;
    drawAll(direct, u"text");
    HeldDrawing held;
    drawAll(held, u"text");
    for (int time = 0; time < 2; ++time) {
        FakeSurface surface;
        held.drawOn(surface);
        EXPECT_EQ(surface.log(), direct.log());
    }
}

} // namespace pelloric
