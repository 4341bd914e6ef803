// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/page_renderer.h"

#include "document/page_document.h"
#include "platform/drawing_surface.h"
#include "platform/text_runs.h"

#include <algorithm>
#include <cmath>

namespace pelloric {

namespace {

/// Bounds that no face and no screen exceeds, for what is skipped must not be seen: twips.
constexpr double LineHeightPerPoint = 80; ///< four times the size itself
constexpr double TwipsPerPixel = 30; ///< of a coarse screen

/// Whether pen and rectangle of a line may reach into the visible part.
bool mayShow(const LineRecord& line, std::int16_t penWidth, const ReplayOptions& options)
{
    if (!options.visible)
        return true;
    const PageRect& seen = *options.visible;
    const double pen = (std::abs(penWidth) + 1) * TwipsPerPixel * std::abs(options.divisor);
    return std::min(line.pt1.x, line.pt2.x) - pen <= seen.right
        && std::max(line.pt1.x, line.pt2.x) + pen >= seen.left
        && std::min(line.pt1.y, line.pt2.y) - pen <= seen.bottom
        && std::max(line.pt1.y, line.pt2.y) + pen >= seen.top;
}

/// Whether a text may reach into the visible part; how wide it is remains unknown.
bool mayShow(const TextRecord& text, float size, const ReplayOptions& options)
{
    if (!options.visible)
        return true;
    const double line = std::abs(size) * LineHeightPerPoint;
    if (text.pt.y - line > options.visible->bottom)
        return false;
    if (text.pt.y + line >= options.visible->top)
        return true;
    const auto lines = static_cast<double>(lineCount(text.text()));
    return text.pt.y + line * lines >= options.visible->top;
}

void drawPicture(const MapLocation& place, DrawingSurface& surface)
{
    surface.picture(
        place.strFilePath, { place.nLeft, place.nTop }, { place.nWidth, place.nHeight });
}

/// Whether a picture may reach into the visible part.
bool mayShow(const PictureRecord& picture, const ReplayOptions& options)
{
    return !options.visible
        || (picture.pt.x <= options.visible->right && picture.pt.y <= options.visible->bottom
            && picture.pt.x + picture.size.x >= options.visible->left
            && picture.pt.y + picture.size.y >= options.visible->top);
}

void drawPictures(std::span<const PictureRecord> pictures, PictureLayer layer,
    const ReplayOptions& options, DrawingSurface& surface)
{
    for (const PictureRecord& picture : pictures) {
        if (picture.layer == layer && mayShow(picture, options))
            surface.picture(picture.file, picture.pt, picture.size);
    }
}

} // namespace

ReplayOptions paperReplay(const Font& font)
{
    return { .reportFontName = font.name,
        .reportFontSize = font.size,
        .isCleared = false,
        .hasPicture = false,
        .resetsFill = true,
        .makesTextsTransparent = true };
}

PageRenderer::PageRenderer(const PageDocument& document)
    : document_(document)
{
}

void PageRenderer::replay(int page, const ReplayOptions& options, DrawingSurface& surface) const
{
    const auto lines = document_.lines(page);
    const auto texts = document_.texts(page);
    const auto pictures = document_.reportPictures(page);
    if (options.isCleared)
        surface.clear();
    surface.setFontName(options.reportFontName);
    surface.setFontSize(options.reportFontSize / options.divisor);
    const MapLocation* const place = document_.picture(page);
    if (place != nullptr && options.hasPicture)
        drawPicture(*place, surface);
    drawPictures(pictures, PictureLayer::Behind, options, surface);
    for (const LineRecord line : lines) {
        const LinePen& pen = document_.pen(line.pen);
        if (mayShow(line, pen.LineWidth, options))
            drawLine(line, pen, surface);
    }
    if (options.resetsFill)
        surface.setFillStyle(TransparentFill);
    drawPictures(pictures, PictureLayer::Cells, options, surface);
    Text buffer;
    for (const TextRecord text : texts) {
        if (mayShow(text, document_.style(text.style).font.size, options))
            drawText(text, options, surface, buffer);
    }
    drawPictures(pictures, PictureLayer::Above, options, surface);
}

/// A filled record has the fill colour all over, its outline too.
void PageRenderer::drawLine(
    const LineRecord& line, const LinePen& pen, DrawingSurface& surface) const
{
    surface.setDrawWidth(pen.LineWidth);
    surface.setDrawStyle(pen.LineStyle);
    surface.setForeColor(pen.LineColor);
    if (pen.FillStyle == TransparentFill) {
        surface.setFillStyle(TransparentFill);
        surface.line(line.pt1, line.pt2);
        return;
    }
    surface.setFillColor(pen.FillColor);
    surface.setFillStyle(pen.FillStyle);
    surface.box(line.pt1, line.pt2, pen.FillColor);
}

void PageRenderer::drawText(const TextRecord& text, const ReplayOptions& options,
    DrawingSurface& surface, Text& buffer) const
{
    const TextStyle& style = document_.style(text.style);
    if (options.makesTextsTransparent)
        surface.setFontTransparent(true);
    surface.setFontBold(style.font.bold);
    surface.setFontItalic(style.font.italic);
    surface.setFontName(style.font.name);
    surface.setFontSize(style.font.size / options.divisor);
    surface.setForeColor(style.color);
    surface.setCurrentX(text.pt.x);
    surface.setCurrentY(text.pt.y);
    surface.print(options.fillPageCount ? withPageCount(text.text(), document_.Totalpages, buffer)
                                        : text.text());
}

} // namespace pelloric
