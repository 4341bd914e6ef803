// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <optional>
#include <vector>

namespace pelloric {

/// Units of the page sketch that stand for ten millimetres.
inline constexpr double SketchScale = 284;
/// Spacing of the ruled table inside the margins: sketch units.
inline constexpr double SketchColumnStep = 284;
inline constexpr double SketchRowStep = 284.0 / 3;
/// How far the pointer test of a margin line reaches: sketch units.
inline constexpr double HoverTolerance = 0.1;
/// A frame in which an A4 sheet in portrait has its own proportions: sketch units.
inline constexpr double SketchFrameWidth = 6264;
inline constexpr double SketchFrameHeight = 8859;

/// The margins in the numbering of their lines.
enum class Margin { Top = 0, Right = 1, Bottom = 2, Left = 3 };
inline constexpr auto AllMargins
    = std::to_array<Margin>({ Margin::Top, Margin::Right, Margin::Bottom, Margin::Left });

/// Whether a margin's line runs across the sketch, and so moves up and down.
constexpr bool isHorizontalLine(Margin margin)
{
    return margin == Margin::Top || margin == Margin::Bottom;
}

/// A rectangle in its frame: sketch units.
struct SketchRect {
    double left = 0;
    double top = 0;
    double width = 0;
    double height = 0;

    bool operator==(const SketchRect&) const = default;
};

/// One line of the ruled table: sketch units.
struct SketchLine {
    double x1 = 0;
    double y1 = 0;
    double x2 = 0;
    double y2 = 0;

    bool operator==(const SketchLine&) const = default;
};

/// Pointers over a margin line, in the numbering of window systems of the time.
enum class SketchPointer { Default = 0, NorthSouth = 7, WestEast = 9 };

/// Where the sketch stands in its frame.
///
/// In landscape the height is the width times width over height: the proportion is turned over.
SketchRect sketchRect(double frameWidth, double frameHeight, bool portrait);

double toSketchUnits(double millimetres);
double toMillimetres(double sketchUnits);

/// The sketch of a page whose margin lines can be dragged: lengths are sketch units.
class MarginSketch {
public:
    double margin(Margin margin) const { return margins_[index(margin)]; }

    /// Sets a margin and places its line.
    void setMargin(Margin margin, double length);

    double width() const { return width_; }
    double height() const { return height_; }
    /// Takes the size of the picture and places all lines.
    void setSize(double width, double height);

    /// Top of a horizontal line, left edge of an upright one, held within what a window can place.
    double linePosition(Margin margin) const;

    /// The pointer moves inside a line's own picture; while a line is dragged it follows, but
    /// neither past the opposite margin nor off the sheet.
    void mouseMove(Margin line, double x, double y);
    /// A button goes down on a line: over a line a drag begins.
    void mouseDown(Margin line, double x, double y);
    /// A button is released: the dragged margin is what its line says now.
    /// @return  the margin that was dragged, or nothing
    std::optional<Margin> mouseUp();

    SketchPointer pointer() const { return pointer_; }
    bool isDragging() const { return dragging_; }

    /// The ruled table inside the margins, rows first; what lies off the sketch is left out.
    std::vector<SketchLine> ruledLines() const;

private:
    static std::size_t index(Margin margin) { return static_cast<std::size_t>(margin); }
    double placeOf(Margin margin) const;
    bool isHover(Margin line, double x, double y) const;
    bool isOnSheet(Margin line, double position) const;
    bool staysInside(Margin line, double position) const;

    std::array<double, 4> margins_ { SketchScale, SketchScale, SketchScale, SketchScale };
    std::array<double, 4> positions_ {}; ///< Top or Left of the lines
    double width_ = 0;
    double height_ = 0;
    SketchPointer pointer_ = SketchPointer::Default;
    Margin dragLine_ = Margin::Top;
    bool dragging_ = false;
    bool overLine_ = false;
};

} // namespace pelloric
