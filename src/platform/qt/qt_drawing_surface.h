// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/drawing_surface.h"
#include "platform/qt/greeked_texts.h"
#include "platform/text_runs.h"

#include <QFont>
#include <QImage>
#include <QPen>
#include <QRectF>

#include <optional>
#include <vector>

class QPainter;

namespace pelloric::qt {

class QtFace;
class QtFonts;

/// How a surface stands to the page it shows.
struct SurfaceOptions {
    float divisor = 1.0F; ///< display divisor; font sizes arrive divided by it, > 0
    QRectF
        page {}; ///< what `clear` makes white: twips; empty: nothing, the paper is blank by itself
    QRectF visible {}; ///< what lies outside need not be drawn: twips; empty: everything is drawn
    bool isScreen = false; ///< texts too small to be read become faint bars; needs `visible`
};

/// A page on a painter that is scaled to twips, so that the painter's scale carries the zoom.
///
/// Texts stand at explicit baselines with the fonts they were measured with. A bold face that has
/// to be made up is drawn twice on a screen or an image, where the toolkit leaves it thin under a
/// scaled painter, and once on paper, where a second text would be copied along.
class QtDrawingSurface final : public DrawingSurface {
public:
    /// @param painter  active, 1 unit = 1 twip; borrowed, its font, pen and brush are changed
    /// @param fonts    borrowed
    QtDrawingSurface(QPainter& painter, QtFonts& fonts, const SurfaceOptions& options = {});
    /// Draws what is still gathered.
    ~QtDrawingSurface() override;
    QtDrawingSurface(const QtDrawingSurface&) = delete;
    QtDrawingSurface& operator=(const QtDrawingSurface&) = delete;

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
    /// What tells the pen of one line from another's.
    struct LinePenKey {
        Color color = 0;
        std::int16_t width = 1;
        std::int16_t style = SolidPen;

        bool operator==(const LinePenKey&) const = default;
    };

    bool printGreeked(TextView text);
    void moveBelow(double y);
    double emOfSize() const;
    void takeFont();
    void drawText(TextView text);
    void drawRun(const TextRun& run);
    void drawGlyphs(const TextRun& run, QPointF baseline);
    void drawBox(const TextRun& run, QPointF baseline);
    double toTwips(double advance) const;
    double lineHeight() const;
    void setPen(const QPen& pen);
    void takeLinePen();
    QPen penOf(Color color) const;
    bool isVisible(const QRectF& area) const;

    QPainter& painter_;
    QtFonts& fonts_;
    SurfaceOptions options_;
    std::optional<GreekedTexts> greeked_; ///< on a screen
    bool isPaper_; ///< PDF, SVG and the like: keeps texts as texts

    Text fontName_;
    float fontSize_ = 0;
    bool bold_ = false;
    bool italic_ = false;
    bool isFontStale_ = true;
    QtFace* face_ = nullptr;
    QFont font_;
    double em_ = 0; ///< twips
    double fontScale_ = 1; ///< from the font's whole pixels to the em
    std::vector<TextRun> runs_;

    bool isFontTransparent_ = true;
    Color foreColor_ = 0;
    std::int16_t drawWidth_ = 1;
    std::int16_t drawStyle_ = SolidPen;
    std::int16_t fillStyle_ = TransparentFill;
    Color fillColor_ = 0;
    std::optional<LinePenKey> linePen_; ///< of the painter, when a line set it last
    Tpoint current_;
    Text imagePath_;
    QImage image_;
};

} // namespace pelloric::qt
