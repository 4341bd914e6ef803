// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_state.h"
#include "platform/text_runs.h"

#include <cstdint>
#include <map>
#include <string>
#include <utility>
#include <vector>

class QRawFont;

namespace pelloric::qt {

class QtFace;
class QtFonts;
struct ShapedRun;

/// A page that is written as an SVG picture, 96 units an inch.
///
/// Glyphs are outlines, each kept once, so that the page looks the same in every viewer, whatever
/// fonts it has. Over each text lies the same text unseen, so that it can be found, marked and
/// copied. Widths of pens and distances of hatches are units.
class SvgPage final : public StatefulSurface {
public:
    /// @param fonts  borrowed
    SvgPage(Tpoint size, TextView title, QtFonts& fonts);

    /// The whole file; to be asked for once, when all is drawn.
    std::string take();

    void clear() override;
    void line(Tpoint from, Tpoint to) override;
    void box(Tpoint corner, Tpoint opposite, Color outline) override;
    void print(TextView text) override;
    void picture(TextView filePath, Tpoint topLeft, Tpoint size) override;

private:
    /// The text that is being printed: its face, and the height of its em in twips.
    struct Print {
        QtFace& face;
        double em;
        double lineHeight; ///< twips
    };

    void printRun(const TextRun& run, const Print& print);
    void printGlyphs(const ShapedRun& shaped, const Print& print, double x, double y);
    void printBox(const TextRun& run, const Print& print, double x, double y);
    void printUnseen(const TextRun& run, const Print& print, double x, double y);
    void fillBehind(TextView text, const Print& print);
    std::string stroke(Color color) const;
    std::string fill();
    std::string outlineName(const QRawFont& font, std::uint32_t glyph);

    QtFonts& fonts_;
    Tpoint size_;
    Text title_;
    std::string defs_; ///< outlines and hatches
    std::string body_;
    std::map<std::pair<std::string, std::uint32_t>, std::string> outlines_; ///< by face and glyph
    std::map<std::pair<Color, std::int16_t>, std::string> hatches_;
    std::vector<TextRun> runs_;
};

} // namespace pelloric::qt
