// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_surface.h"
#include "platform/numbers.h"

#include <string>

namespace pelloric {

/// A surface that draws nothing and logs one line per call: the call's name and its arguments.
///
/// @tparam Surface  `DrawingSurface` or an interface derived from it
template <class Surface> class LoggingSurface : public Surface {
public:
    void clear() override { add("clear"); }
    void setFontName(TextView name) override { add("font name " + toUtf8(name)); }
    void setFontSize(float size) override { add("font size " + toUtf8(formatSingle(size))); }
    void setFontBold(bool bold) override { add("bold " + std::to_string(bold)); }
    void setFontItalic(bool italic) override { add("italic " + std::to_string(italic)); }
    void setFontTransparent(bool on) override { add("transparent " + std::to_string(on)); }
    void setForeColor(Color color) override { add("fore colour " + std::to_string(color)); }
    void setDrawWidth(std::int16_t width) override { add("draw width " + std::to_string(width)); }
    void setDrawStyle(std::int16_t style) override { add("draw style " + std::to_string(style)); }
    void setFillStyle(std::int16_t style) override { add("fill style " + std::to_string(style)); }
    void setFillColor(Color color) override { add("fill colour " + std::to_string(color)); }
    void setCurrentX(Twips x) override { add("x " + std::to_string(x)); }
    void setCurrentY(Twips y) override { add("y " + std::to_string(y)); }
    void line(Tpoint from, Tpoint to) override { add("line " + show(from) + " " + show(to)); }
    void box(Tpoint corner, Tpoint opposite, Color outline) override
    {
        add("box " + show(corner) + " " + show(opposite) + " " + std::to_string(outline));
    }
    void print(TextView text) override { add("print " + toUtf8(text)); }
    void picture(TextView filePath, Tpoint topLeft, Tpoint size) override
    {
        add("picture " + toUtf8(filePath) + " " + show(topLeft) + " " + show(size));
    }

    /// Every call since the last `forget`, each ended by a line feed.
    const std::string& log() const { return log_; }

    void forget() { log_.clear(); }

protected:
    void add(const std::string& call) { log_ += call + "\n"; }

private:
    static std::string show(Tpoint point)
    {
        return std::to_string(point.x) + "," + std::to_string(point.y);
    }

    std::string log_;
};

/// A drawing surface that logs its calls.
using FakeSurface = LoggingSurface<DrawingSurface>;

} // namespace pelloric
