// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_surface.h"

#include <cstddef>
#include <optional>
#include <vector>

namespace pelloric {

/// Hands everything on to another surface, but draws lines that continue each other as one.
///
/// The lines between the cells of a table are recorded row by row; joined they make a file a
/// quarter smaller and look the same. Only solid upright and level lines are joined; `finish`
/// draws the last of them.
class JoinedLines final : public DrawingSurface {
public:
    /// @param target  borrowed
    explicit JoinedLines(DrawingSurface& target);

    /// Draws what is held back.
    void finish();

    void clear() override;
    void setFontName(TextView name) override { target_.setFontName(name); }
    void setFontSize(float size) override { target_.setFontSize(size); }
    void setFontBold(bool bold) override { target_.setFontBold(bold); }
    void setFontItalic(bool italic) override { target_.setFontItalic(italic); }
    void setFontTransparent(bool transparent) override { target_.setFontTransparent(transparent); }
    void setForeColor(Color color) override { pen_.color = color; }
    void setDrawWidth(std::int16_t width) override { pen_.width = width; }
    void setDrawStyle(std::int16_t style) override { pen_.style = style; }
    void setFillStyle(std::int16_t style) override { target_.setFillStyle(style); }
    void setFillColor(Color color) override { target_.setFillColor(color); }
    void setCurrentX(Twips x) override;
    void setCurrentY(Twips y) override;
    void line(Tpoint from, Tpoint to) override;
    void box(Tpoint corner, Tpoint opposite, Color outline) override;
    void print(TextView text) override;
    void picture(TextView filePath, Tpoint topLeft, Tpoint size) override;

private:
    struct Pen {
        Color color = 0;
        std::int16_t width = 1;
        std::int16_t style = SolidPen;

        bool operator==(const Pen&) const = default;
    };

    struct Segment {
        Tpoint from;
        Tpoint to;
    };

    /// The points where segments end, in the order in which they came.
    ///
    /// The rows of a table have their lines in the same order, so that the end that is looked for
    /// is mostly the one behind the last that was found; one far away is given up.
    class Ends {
    public:
        /// The segment that ends at a point; its end is then another.
        std::optional<std::size_t> move(Tpoint end, Tpoint newEnd);

        void add(Tpoint end, std::size_t segment);
        void clear();

    private:
        struct End {
            Tpoint point;
            std::size_t segment;
        };

        std::vector<End> ends_;
        std::size_t next_ = 0;
    };

    void usePen(const Pen& pen);
    void hold(Tpoint from, Tpoint to, Ends& ends);
    void beforeDrawing();

    DrawingSurface& target_;
    Pen pen_;
    Pen heldPen_;
    std::optional<Pen> usedPen_; ///< what the target has; nothing: unknown
    std::vector<Segment> held_;
    Ends upright_;
    Ends level_;
    Tpoint current_; ///< where the line that came last has ended
};

} // namespace pelloric
