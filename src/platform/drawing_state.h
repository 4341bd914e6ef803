// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_surface.h"

namespace pelloric {

/// The attributes of a drawing surface and its current point.
struct DrawingState {
    Text fontName {};
    float fontSize = 0; ///< points
    bool fontBold = false;
    bool fontItalic = false;
    bool fontTransparent = true;
    Color foreColor = 0;
    std::int16_t drawWidth = 1;
    std::int16_t drawStyle = SolidPen;
    std::int16_t fillStyle = TransparentFill;
    Color fillColor = 0;
    Tpoint current {}; ///< twips
};

/// A surface that keeps its attributes until it draws.
class StatefulSurface : public DrawingSurface {
public:
    void setFontName(TextView name) override { state_.fontName = name; }
    void setFontSize(float size) override { state_.fontSize = size; }
    void setFontBold(bool bold) override { state_.fontBold = bold; }
    void setFontItalic(bool italic) override { state_.fontItalic = italic; }
    void setFontTransparent(bool transparent) override { state_.fontTransparent = transparent; }
    void setForeColor(Color color) override { state_.foreColor = color; }
    void setDrawWidth(std::int16_t width) override { state_.drawWidth = width; }
    void setDrawStyle(std::int16_t style) override { state_.drawStyle = style; }
    void setFillStyle(std::int16_t style) override { state_.fillStyle = style; }
    void setFillColor(Color color) override { state_.fillColor = color; }
    void setCurrentX(Twips x) override { state_.current.x = x; }
    void setCurrentY(Twips y) override { state_.current.y = y; }

protected:
    DrawingState state_;
};

} // namespace pelloric
