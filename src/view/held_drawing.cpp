// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/held_drawing.h"

namespace pelloric {

void HeldDrawing::drawOn(DrawingSurface& surface) const
{
    for (const auto& step : steps_)
        step(surface);
}

void HeldDrawing::clear()
{
    steps_.emplace_back([](DrawingSurface& surface) { surface.clear(); });
}

void HeldDrawing::setFontName(TextView name)
{
    steps_.emplace_back(
        [kept = Text(name)](DrawingSurface& surface) { surface.setFontName(kept); });
}

void HeldDrawing::setFontSize(float size)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setFontSize(size); });
}

void HeldDrawing::setFontBold(bool bold)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setFontBold(bold); });
}

void HeldDrawing::setFontItalic(bool italic)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setFontItalic(italic); });
}

void HeldDrawing::setFontTransparent(bool transparent)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setFontTransparent(transparent); });
}

void HeldDrawing::setForeColor(Color color)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setForeColor(color); });
}

void HeldDrawing::setDrawWidth(std::int16_t width)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setDrawWidth(width); });
}

void HeldDrawing::setDrawStyle(std::int16_t style)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setDrawStyle(style); });
}

void HeldDrawing::setFillStyle(std::int16_t style)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setFillStyle(style); });
}

void HeldDrawing::setFillColor(Color color)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setFillColor(color); });
}

void HeldDrawing::setCurrentX(Twips x)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setCurrentX(x); });
}

void HeldDrawing::setCurrentY(Twips y)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.setCurrentY(y); });
}

void HeldDrawing::line(Tpoint from, Tpoint to)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.line(from, to); });
}

void HeldDrawing::box(Tpoint corner, Tpoint opposite, Color outline)
{
    steps_.emplace_back([=](DrawingSurface& surface) { surface.box(corner, opposite, outline); });
}

void HeldDrawing::print(TextView text)
{
    steps_.emplace_back([kept = Text(text)](DrawingSurface& surface) { surface.print(kept); });
}

void HeldDrawing::picture(TextView filePath, Tpoint topLeft, Tpoint size)
{
    steps_.emplace_back([kept = Text(filePath), topLeft, size](
                            DrawingSurface& surface) { surface.picture(kept, topLeft, size); });
}

} // namespace pelloric
