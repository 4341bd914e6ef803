// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_surface.h"

#include "export/pdf_hatches.h"
#include "export/pdf_pictures.h"
#include "export/pdf_tags.h"
#include "platform/text_metrics.h"
#include "platform/units.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace pelloric::pdf {

namespace {

constexpr std::int64_t Hundred = 100;

/// Past this an em tells nothing on any paper.
constexpr double LargestEm = 1e6;

constexpr Color White = rgb(255, 255, 255);

constexpr std::int16_t NoPen = 5;

constexpr auto Dashes = std::to_array<std::uint8_t>({ 4, 2 });
constexpr auto Dots = std::to_array<std::uint8_t>({ 1, 2 });
constexpr auto DashDots = std::to_array<std::uint8_t>({ 4, 2, 1, 2 });
constexpr auto DashDotDots = std::to_array<std::uint8_t>({ 4, 2, 1, 2, 1, 2 });

/// By draw style.
constexpr auto DashPatterns = std::to_array<std::span<const std::uint8_t>>(
    { {}, Dashes, Dots, DashDots, DashDotDots, {}, {} });

std::int64_t hundredths(double twips)
{
    return static_cast<std::int64_t>(std::nearbyint(twips * Hundred));
}

double emOf(float size)
{
    const double em = static_cast<double>(size) * TwipsPerPoint;
    return em > 0 ? std::min(em, LargestEm) : 0;
}

} // namespace

PdfSurface::PdfSurface(
    PdfContent& content, GlyphFaces& faces, PdfFonts& fonts, PdfPictures& pictures)
    : content_(content)
    , faces_(faces)
    , fonts_(fonts)
    , pictures_(pictures)
{
}

void PdfSurface::setFontName(TextView name)
{
    if (state_.fontName == name)
        return;
    state_.fontName = name;
    isFontStale_ = true;
}

void PdfSurface::setFontSize(float size)
{
    isFontStale_ = isFontStale_ || state_.fontSize != size;
    state_.fontSize = size;
}

void PdfSurface::setFontBold(bool bold)
{
    isFontStale_ = isFontStale_ || state_.fontBold != bold;
    state_.fontBold = bold;
}

void PdfSurface::setFontItalic(bool italic)
{
    isFontStale_ = isFontStale_ || state_.fontItalic != italic;
    state_.fontItalic = italic;
}

/// A line without length is a dot as wide as the pen; readers leave out what has no length at all.
void PdfSurface::line(Tpoint from, Tpoint to)
{
    state_.current = to;
    if (!hasPen())
        return;
    announceShape();
    ContentPen pen = penOf(state_.foreColor);
    ContentPoint end = pointOf(to);
    if (from == to) {
        pen.dashes = {};
        --end.y;
    }
    content_.line(pointOf(from), end, pen);
}

void PdfSurface::box(Tpoint corner, Tpoint opposite, Color outline)
{
    state_.current = opposite;
    const ContentPen pen = penOf(outline);
    const ContentPen* const outlined = hasPen() ? &pen : nullptr;
    announceShape();
    if (state_.fillStyle != TransparentFill)
        content_.box(pointOf(corner), pointOf(opposite), state_.fillColor,
            hatchName(state_.fillStyle), outlined);
    else if (outlined)
        content_.frame(pointOf(corner), pointOf(opposite), pen);
}

void PdfSurface::print(TextView text)
{
    takeFont();
    if (tags_)
        tags_->beforeText();
    if (!text.empty() && em_ > 0)
        drawText(text);
    constexpr std::int64_t Lowest = std::numeric_limits<Twips>::max();
    const std::int64_t below = state_.current.y
        + std::int64_t { lineHeight_ } * static_cast<std::int64_t>(lineCount(text));
    state_.current = { 0, static_cast<Twips>(std::min(below, Lowest)) };
}

void PdfSurface::picture(TextView filePath, Tpoint topLeft, Tpoint size)
{
    if (size.x <= 0 || size.y <= 0)
        return;
    const std::string_view name = pictures_.nameOf(filePath);
    if (name.empty())
        return;
    announceShape();
    content_.object(
        name, pointOf({ topLeft.x, topLeft.y + size.y }), { size.x * Hundred, size.y * Hundred });
}

void PdfSurface::announceShape()
{
    if (tags_)
        tags_->beforeShape();
}

void PdfSurface::takeFont()
{
    if (!isFontStale_)
        return;
    isFontStale_ = false;
    GlyphFace& face = faces_.face(state_.fontName, state_.fontBold, state_.fontItalic);
    face_ = &codes_.try_emplace(&face, face, fonts_).first->second;
    em_ = emOf(state_.fontSize);
    ascent_ = hundredths(face.ascent() / TwipsPerPoint * em_);
    lineHeight_
        = static_cast<Twips>(std::nearbyint(face.metrics().lineHeight() / TwipsPerPoint * em_));
}

ContentPoint PdfSurface::pointOf(Tpoint point) const
{
    return { (std::int64_t { point.x } + place_.origin.x) * Hundred,
        (std::int64_t { place_.height } - place_.origin.y - point.y) * Hundred };
}

/// @param line      of the text, from 0
/// @param fromLeft  of the text: twips
ContentPoint PdfSurface::baselineAt(std::size_t line, double fromLeft) const
{
    const ContentPoint topLeft = pointOf(state_.current);
    const std::int64_t lines = std::int64_t { lineHeight_ } * static_cast<std::int64_t>(line);
    return { topLeft.x + hundredths(fromLeft), topLeft.y - lines * Hundred - ascent_ };
}

ContentPen PdfSurface::penOf(Color color) const
{
    const auto style = static_cast<std::size_t>(state_.drawStyle);
    const bool isKnown = state_.drawStyle >= 0 && style < DashPatterns.size();
    return { .color = color,
        .width = std::max<int>(1, state_.drawWidth) * place_.pixel,
        .dashes = isKnown ? DashPatterns[style] : std::span<const std::uint8_t>() };
}

bool PdfSurface::hasPen() const { return state_.drawStyle != NoPen; }

/// Nearly all texts hold nothing but plain characters.
void PdfSurface::drawText(TextView text)
{
    if (!state_.fontTransparent) {
        announceShape();
        fillBehind(text);
        if (tags_)
            tags_->resumeText();
    }
    if (drawAtOnce(text))
        return;
    const auto isPlain = [&](char16_t unit) { return face_->unit(unit).code != 0; };
    if (std::all_of(text.begin(), text.end(), isPlain)) {
        drawPlain({ .text = text });
    } else {
        cutIntoRuns(text, face_->face().metrics(), runs_);
        for (const TextRun& run : runs_)
            drawRun(run);
    }
    content_.endText();
}

/// Draws a text of plain characters of one font, as nearly all texts are.
/// @return  false: it is no such text; nothing was drawn
bool PdfSurface::drawAtOnce(TextView text)
{
    shown_.resize(2 * text.size());
    char* place = shown_.data();
    const std::uint16_t use = face_->unit(text.front()).use;
    for (const char16_t unit : text) {
        const GlyphCode code = face_->unit(unit);
        if (code.code == 0 || code.use != use)
            return false;
        if (isLongCode(code.code))
            *place++ = static_cast<char>(code.code >> 8U);
        *place++ = static_cast<char>(code.code & 0xFFU);
    }
    content_.moveTo(baselineAt(0, 0));
    const std::string_view shown(shown_.data(), static_cast<std::size_t>(place - shown_.data()));
    content_.glyphs(use, shown, { .em = em_, .stretch = 1, .color = state_.foreColor });
    return true;
}

void PdfSurface::drawRun(const TextRun& run)
{
    if (tags_ && run.kind == RunKind::Box)
        tags_->beforeShape();
    else if (tags_)
        tags_->resumeText();
    switch (run.kind) {
    case RunKind::Plain:
        drawPlain(run);
        break;
    case RunKind::Shaped:
        drawShaped(run);
        break;
    case RunKind::Box:
        drawBox(run);
        break;
    }
    content_.endText();
}

void PdfSurface::drawPlain(const TextRun& run)
{
    const TextState state { .em = em_, .stretch = 1, .color = state_.foreColor };
    content_.moveTo(baselineAt(run.line, toTwips(run.left)));
    std::uint16_t use = 0;
    bool isSlanted = false;
    for (std::size_t at = 0; at < run.text.size();) {
        const std::size_t here = at;
        const char16_t unit = run.text[at];
        const GlyphCode code = isHalfPair(unit) ? face_->character(nextCodePoint(run.text, at))
                                                : face_->unit(run.text[at++]);
        if (here == 0 || code.use != use) {
            // A slant counts from where its text begins.
            const bool leans = fonts_.use(code.use).drawn.isItalicMadeUp;
            if (here > 0 && leans != isSlanted) {
                const double before = face_->face().metrics().advanceOf(run.text.substr(0, here));
                content_.moveTo(baselineAt(run.line, toTwips(run.left + before)));
            }
            isSlanted = leans;
            use = code.use;
        }
        content_.glyph(code, state);
    }
}

/// A shaped run keeps within the width that it was measured with.
void PdfSurface::drawShaped(const TextRun& run)
{
    const ShapedText& shaped = face_->face().shaped(run.text);
    const double width = toTwips(run.advance);
    const double wanted = shaped.advance * em_;
    const double stretch = width > 0 && wanted > width ? width / wanted : 1;
    const TextState state { .em = em_, .stretch = stretch, .color = state_.foreColor };
    for (const ShapedGlyph& glyph : shaped.glyphs) {
        const GlyphCode code = fonts_.code(glyph.font, glyph.glyph, glyph.meaning);
        ContentPoint point = baselineAt(run.line, toTwips(run.left) + glyph.x * stretch * em_);
        point.y += hundredths(glyph.y * em_);
        content_.moveTo(point);
        content_.glyph(code, state);
    }
}

/// Two rectangles, one within the other, of which only the space between is filled.
void PdfSurface::drawBox(const TextRun& run)
{
    const HollowBox box = hollowBox(toTwips(run.advance), em_);
    const ContentPoint baseline = baselineAt(run.line, toTwips(run.left));
    const auto corner = [&](double x, double y) {
        return ContentPoint { baseline.x + hundredths(x), baseline.y - hundredths(y) };
    };
    content_.ring(corner(box.left, box.bottom), corner(box.right, box.top), hundredths(box.stroke),
        state_.foreColor);
}

void PdfSurface::fillBehind(TextView text)
{
    const double width = toTwips(longestLineAdvance(text, face_->face().metrics()));
    const std::int64_t height
        = std::int64_t { lineHeight_ } * static_cast<std::int64_t>(lineCount(text));
    const ContentPoint corner = pointOf(state_.current);
    content_.box(
        corner, { corner.x + hundredths(width), corner.y - height * Hundred }, White, {}, nullptr);
}

/// @param advance  at size 1
double PdfSurface::toTwips(double advance) const { return advance / TwipsPerPoint * em_; }

} // namespace pelloric::pdf
