// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_surface.h"

#include <functional>
#include <vector>

namespace pelloric {

/// Keeps what is drawn, to draw it on another surface later, as often as is wanted.
class HeldDrawing final : public DrawingSurface {
public:
    /// Draws all of it.
    void drawOn(DrawingSurface& surface) const;

    void clear() override;
    void setFontName(TextView name) override;
    void setFontSize(float size) override;
    void setFontBold(bool bold) override;
    void setFontItalic(bool italic) override;
    void setFontTransparent(bool transparent) override;
    void setForeColor(Color color) override;
    void setDrawWidth(std::int16_t width) override;
    void setDrawStyle(std::int16_t style) override;
    void setFillStyle(std::int16_t style) override;
    void setFillColor(Color color) override;
    void setCurrentX(Twips x) override;
    void setCurrentY(Twips y) override;
    void line(Tpoint from, Tpoint to) override;
    void box(Tpoint corner, Tpoint opposite, Color outline) override;
    void print(TextView text) override;
    void picture(TextView filePath, Tpoint topLeft, Tpoint size) override;

private:
    std::vector<std::function<void(DrawingSurface&)>> steps_;
};

} // namespace pelloric
