// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_drawing_surface.h"

#include "platform/qt/glyph_runs.h"
#include "platform/qt/picture_files.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_text.h"
#include "platform/units.h"

#include <QFontMetricsF>
#include <QPaintEngine>
#include <QPainter>
#include <QPainterPath>
#include <QRawFont>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

namespace pelloric::qt {

namespace {

/// An em this close to whole pixels is taken as whole.
constexpr double WholePixel = 1e-4;

/// Past this an em tells nothing on any paper; the toolkit's numbers would overflow.
constexpr double LargestEm = 1e6;

/// Of larger fonts the toolkit makes hollow boxes; texts are drawn in one of this size, enlarged.
constexpr int MostPixels = 16384;

/// By draw style.
constexpr auto PenStyles = std::to_array({ Qt::SolidLine, Qt::DashLine, Qt::DotLine,
    Qt::DashDotLine, Qt::DashDotDotLine, Qt::NoPen, Qt::SolidLine });

/// By fill style.
constexpr auto BrushStyles = std::to_array({ Qt::SolidPattern, Qt::NoBrush, Qt::HorPattern,
    Qt::VerPattern, Qt::BDiagPattern, Qt::FDiagPattern, Qt::CrossPattern, Qt::DiagCrossPattern });

Qt::PenStyle penStyle(std::int16_t style)
{
    const auto at = static_cast<std::size_t>(style);
    return style >= 0 && at < PenStyles.size() ? PenStyles[at] : Qt::SolidLine;
}

Qt::BrushStyle brushStyle(std::int16_t style)
{
    const auto at = static_cast<std::size_t>(style);
    return style >= 0 && at < BrushStyles.size() ? BrushStyles[at] : Qt::SolidPattern;
}

QColor colorOf(Color color)
{
    return QColor(color & 0xFF, (color >> 8) & 0xFF, (color >> 16) & 0xFF);
}

QPointF pointOf(Tpoint point) { return QPointF(point.x, point.y); }

/// Draws bold glyphs; those of faces without a bold one are drawn twice, set apart by the pen that
/// would go around their outlines.
void drawBold(QPainter& painter, const ShapedRun& shaped, QPointF at)
{
    for (const QGlyphRun& glyphs : shaped.glyphs) {
        const QRawFont font = glyphs.rawFont();
        const bool isMadeUp = isBoldMadeUp(font);
        const QPointF half(isMadeUp ? font.lineThickness() * MadeUpBoldStroke / 2 : 0, 0);
        painter.drawGlyphRun(at - half, glyphs);
        if (isMadeUp)
            painter.drawGlyphRun(at + half, glyphs);
    }
}

bool keepsTexts(const QPainter& painter)
{
    const QPaintEngine* const engine = painter.paintEngine();
    const auto type = engine ? engine->type() : QPaintEngine::Raster;
    return type == QPaintEngine::Pdf || type == QPaintEngine::SVG || type == QPaintEngine::Picture;
}

} // namespace

QtDrawingSurface::QtDrawingSurface(QPainter& painter, QtFonts& fonts, const SurfaceOptions& options)
    : painter_(painter)
    , fonts_(fonts)
    , options_(options)
    , isPaper_(keepsTexts(painter))
{
    painter_.setRenderHint(QPainter::Antialiasing, false);
    painter_.setRenderHint(QPainter::TextAntialiasing, true);
    painter_.setRenderHint(QPainter::SmoothPixmapTransform, true);
    if (options_.isScreen && !options_.visible.isEmpty())
        greeked_.emplace(painter_, options_.visible);
}

QtDrawingSurface::~QtDrawingSurface()
{
    if (greeked_)
        greeked_->paint();
}

void QtDrawingSurface::clear()
{
    if (!options_.page.isEmpty())
        painter_.fillRect(options_.page, Qt::white);
    current_ = {};
}

void QtDrawingSurface::setFontName(TextView name)
{
    if (fontName_ == name)
        return;
    fontName_ = name;
    isFontStale_ = true;
}

void QtDrawingSurface::setFontSize(float size)
{
    isFontStale_ = isFontStale_ || fontSize_ != size;
    fontSize_ = size;
}

void QtDrawingSurface::setFontBold(bool bold)
{
    isFontStale_ = isFontStale_ || bold_ != bold;
    bold_ = bold;
}

void QtDrawingSurface::setFontItalic(bool italic)
{
    isFontStale_ = isFontStale_ || italic_ != italic;
    italic_ = italic;
}

void QtDrawingSurface::setFontTransparent(bool transparent) { isFontTransparent_ = transparent; }

void QtDrawingSurface::setForeColor(Color color) { foreColor_ = color; }

void QtDrawingSurface::setDrawWidth(std::int16_t width) { drawWidth_ = width; }

void QtDrawingSurface::setDrawStyle(std::int16_t style) { drawStyle_ = style; }

void QtDrawingSurface::setFillStyle(std::int16_t style) { fillStyle_ = style; }

void QtDrawingSurface::setFillColor(Color color) { fillColor_ = color; }

void QtDrawingSurface::setCurrentX(Twips x) { current_.x = x; }

void QtDrawingSurface::setCurrentY(Twips y) { current_.y = y; }

void QtDrawingSurface::line(Tpoint from, Tpoint to)
{
    current_ = to;
    if (!isVisible(QRectF(pointOf(from), pointOf(to)).normalized()))
        return;
    if (from == to) {
        QPen pen = penOf(foreColor_);
        pen.setStyle(pen.style() == Qt::NoPen ? Qt::NoPen : Qt::SolidLine);
        setPen(pen);
        painter_.drawPoint(pointOf(from));
        return;
    }
    takeLinePen();
    painter_.drawLine(pointOf(from), pointOf(to));
}

void QtDrawingSurface::box(Tpoint corner, Tpoint opposite, Color outline)
{
    const QRectF area = QRectF(pointOf(corner), pointOf(opposite)).normalized();
    current_ = opposite;
    if (!isVisible(area))
        return;
    QBrush brush(colorOf(fillColor_), brushStyle(fillStyle_));
    // Hatches keep to device pixels as pens do.
    const QTransform transform = painter_.transform();
    if (transform.m11() != 0 && transform.m22() != 0)
        brush.setTransform(QTransform::fromScale(1 / transform.m11(), 1 / transform.m22()));
    setPen(penOf(outline));
    painter_.setBrush(brush);
    painter_.drawRect(area);
    painter_.setBrush(Qt::NoBrush);
}

/// A line that nobody can read has about the height of its em.
bool QtDrawingSurface::printGreeked(TextView text)
{
    const double em = emOfSize();
    if (!greeked_ || !greeked_->takes(em))
        return false;
    QPointF corner = pointOf(current_);
    while (true) {
        const TextView line = text.substr(0, text.find(u'\n'));
        if (!line.empty() && em > 0)
            greeked_->add(corner, em, line, foreColor_);
        corner.ry() += em;
        if (line.size() == text.size())
            break;
        text.remove_prefix(line.size() + 1);
    }
    moveBelow(corner.y());
    return true;
}

void QtDrawingSurface::print(TextView text)
{
    if (printGreeked(text))
        return;
    takeFont();
    const double bottom = current_.y + lineHeight() * static_cast<double>(lineCount(text));
    const QRectF& visible = options_.visible;
    const bool isOutside = !visible.isEmpty()
        && (current_.y > visible.bottom() || bottom < visible.top()
            || current_.x > visible.right());
    if (!isOutside && !text.empty() && em_ > 0)
        drawText(text);
    moveBelow(bottom);
}

/// The current point after a text.
void QtDrawingSurface::moveBelow(double y)
{
    constexpr double Lowest = std::numeric_limits<Twips>::max();
    current_ = { 0, static_cast<Twips>(std::min(std::nearbyint(y), Lowest)) };
}

void QtDrawingSurface::picture(TextView filePath, Tpoint topLeft, Tpoint size)
{
    if (imagePath_ != filePath) {
        imagePath_ = filePath;
        image_ = loadPicture(filePath);
    }
    const QRectF area(pointOf(topLeft), QSizeF(size.x, size.y));
    if (image_.isNull() || !isVisible(area))
        return;
    painter_.setRenderHint(QPainter::SmoothPixmapTransform);
    painter_.drawImage(area, image_);
}

double QtDrawingSurface::emOfSize() const
{
    const double em
        = static_cast<double>(fontSize_) * static_cast<double>(options_.divisor) * TwipsPerPoint;
    return em > 0 ? std::min(em, LargestEm) : 0;
}

void QtDrawingSurface::takeFont()
{
    if (!isFontStale_)
        return;
    isFontStale_ = false;
    face_ = &fonts_.face(fontName_, bold_, italic_);
    em_ = emOfSize();
    const int pixels = std::clamp(static_cast<int>(std::nearbyint(em_)), 1, MostPixels);
    fontScale_ = std::abs(em_ - pixels) < WholePixel ? 1 : em_ / pixels;
    font_ = isPaper_ ? face_->font(pixels) : face_->installedFont(pixels);
}

void QtDrawingSurface::drawText(TextView text)
{
    cutIntoRuns(text, *face_, runs_);
    if (!isFontTransparent_) {
        const double width = toTwips(longestLineAdvance(text, *face_));
        const double height = lineHeight() * static_cast<double>(lineCount(text));
        painter_.fillRect(QRectF(current_.x, current_.y, width, height), Qt::white);
    }
    setPen(colorOf(foreColor_));
    for (const TextRun& run : runs_)
        drawRun(run);
}

void QtDrawingSurface::drawRun(const TextRun& run)
{
    const double top = current_.y + lineHeight() * static_cast<double>(run.line);
    const QPointF baseline(current_.x + toTwips(run.left), top + toTwips(face_->ascent()));
    if (run.kind == RunKind::Box)
        drawBox(run, baseline);
    else
        drawGlyphs(run, baseline);
}

/// A shaped run is squeezed where it would leave its measured width.
void QtDrawingSurface::drawGlyphs(const TextRun& run, QPointF baseline)
{
    const QString string = borrowedString(run.text);
    double squeeze = 1;
    QFont font = font_;
    if (run.kind == RunKind::Shaped) {
        font.setStyleStrategy(QFont::PreferAntialias);
        const double width = toTwips(run.advance);
        const double shaped = QFontMetricsF(font).horizontalAdvance(string) * fontScale_;
        squeeze = squeezeFor(shaped, width);
    }
    painter_.setFont(font);
    const bool isScaled = fontScale_ != 1 || squeeze != 1;
    const QTransform before = isScaled ? painter_.transform() : QTransform();
    if (isScaled) {
        painter_.translate(baseline);
        painter_.scale(fontScale_ * squeeze, fontScale_);
    }
    const QPointF at = isScaled ? QPointF() : baseline;
    const bool isPlainAscii
        = std::ranges::all_of(run.text, [](char16_t unit) { return unit < 0x80; });
    if (isPaper_ || !bold_ || (isPlainAscii && !face_->isBoldMadeUp()))
        painter_.drawText(at, string);
    else
        drawBold(painter_, shapeRun(run, *face_, font_.pixelSize()), at);
    if (isScaled)
        painter_.setTransform(before);
}

void QtDrawingSurface::drawBox(const TextRun& run, QPointF baseline)
{
    const HollowBox box = hollowBox(toTwips(run.advance), em_);
    const QRectF outer(QPointF(box.left, box.top), QPointF(box.right, box.bottom));
    const double stroke = box.stroke;
    QPainterPath path;
    path.addRect(outer.translated(baseline));
    path.addRect(outer.adjusted(stroke, stroke, -stroke, -stroke).translated(baseline));
    painter_.setRenderHint(QPainter::Antialiasing, true);
    painter_.fillPath(path, colorOf(foreColor_));
    painter_.setRenderHint(QPainter::Antialiasing, false);
}

/// @param advance  at size 1
double QtDrawingSurface::toTwips(double advance) const { return advance / TwipsPerPoint * em_; }

/// Whole twips, as the current point moves where texts are recorded.
double QtDrawingSurface::lineHeight() const { return std::nearbyint(toTwips(face_->lineHeight())); }

void QtDrawingSurface::setPen(const QPen& pen)
{
    painter_.setPen(pen);
    linePen_.reset();
}

/// Neighbouring lines mostly have the same pen.
void QtDrawingSurface::takeLinePen()
{
    const LinePenKey key { foreColor_, drawWidth_, drawStyle_ };
    if (linePen_ == key)
        return;
    painter_.setPen(penOf(foreColor_));
    linePen_ = key;
}

QPen QtDrawingSurface::penOf(Color color) const
{
    QPen pen(colorOf(color), std::max<int>(1, drawWidth_), penStyle(drawStyle_));
    pen.setCosmetic(true);
    pen.setJoinStyle(Qt::MiterJoin);
    if (pen.style() != Qt::SolidLine)
        pen.setCapStyle(Qt::FlatCap);
    return pen;
}

bool QtDrawingSurface::isVisible(const QRectF& area) const
{
    const QRectF& visible = options_.visible;
    return visible.isEmpty()
        || (area.left() <= visible.right() && area.right() >= visible.left()
            && area.top() <= visible.bottom() && area.bottom() >= visible.top());
}

} // namespace pelloric::qt
