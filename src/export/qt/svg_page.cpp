// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/svg_page.h"

#include "platform/numbers.h"
#include "platform/qt/glyph_runs.h"
#include "platform/qt/picture_files.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_text.h"
#include "platform/text_metrics.h"
#include "platform/units.h"

#include <QBuffer>
#include <QByteArray>
#include <QImage>
#include <QPainterPath>
#include <QRawFont>

#include <algorithm>
#include <array>
#include <cmath>

namespace pelloric::qt {

namespace {

constexpr double TwipsPerUnit = TwipsPerInch / 96;
constexpr int OutlineEm = 1000; ///< units that outlines are drawn in

/// Lengths of strokes and gaps by draw style: widths of the pen; those past a 0 do not count.
constexpr std::array<std::array<int, 6>, 5> Dashes { { {}, { 4, 2 }, { 1, 2 }, { 4, 2, 1, 2 },
    { 4, 2, 1, 2, 1, 2 } } };
constexpr std::int16_t NoPen = 5;

constexpr int HatchDistance = 8; ///< units

/// The lines of a tile of each hatch, by fill style from 2 on; diagonals run past the corners, so
/// that tiles join without a gap.
constexpr auto Hatches = std::to_array<const char*>({
    "M0 4H8",
    "M4 0V8",
    "M-1 1L1 -1M0 8L8 0M7 9L9 7",
    "M-1 7L1 9M0 0L8 8M7 -1L9 1",
    "M0 4H8M4 0V8",
    "M-1 1L1 -1M0 8L8 0M7 9L9 7M-1 7L1 9M0 0L8 8M7 -1L9 1",
});
constexpr std::int16_t FirstHatch = 2;

/// At most three digits behind the point, which is finer than any eye.
std::string number(double value)
{
    constexpr double Fraction = 1000;
    return toUtf8(formatNumber(std::nearbyint(value * Fraction) / Fraction));
}

std::string units(double twips) { return number(twips / TwipsPerUnit); }

std::string colorText(Color color)
{
    constexpr char Digits[] = "0123456789abcdef";
    std::string text = "#";
    for (const int shift : { 4, 0, 12, 8, 20, 16 }) // red is the lowest byte
        text += Digits[(static_cast<std::uint32_t>(color) >> shift) & 0xF];
    return text;
}

void appendAttribute(std::string& text, const char* name, const std::string& value)
{
    text.append(" ").append(name).append("=\"").append(value).append("\"");
}

/// A text as it may stand in a file: XML holds no control characters and no half pairs.
std::string escaped(TextView text)
{
    std::string result;
    for (const char byte : toUtf8(text)) {
        if (byte == '&')
            result += "&amp;";
        else if (byte == '<')
            result += "&lt;";
        else if (byte == '>')
            result += "&gt;";
        else if (byte == '"')
            result += "&quot;";
        else if (static_cast<unsigned char>(byte) >= 0x20)
            result += byte;
    }
    return result;
}

/// U+FFFE, U+FFFF and their like in the other planes stand in no file.
bool isNoCharacter(TextView text)
{
    std::size_t position = 0;
    return (nextCodePoint(text, position) & 0xFFFE) == 0xFFFE;
}

std::string pathData(const QPainterPath& path)
{
    std::string data;
    const auto add = [&](const char* command, const QPainterPath::Element& element) {
        data += command;
        data += number(element.x) + " " + number(element.y);
    };
    for (int at = 0; at < path.elementCount(); ++at) {
        const QPainterPath::Element element = path.elementAt(at);
        if (element.type == QPainterPath::MoveToElement)
            add(data.empty() ? "M" : "ZM", element);
        else if (element.type == QPainterPath::LineToElement)
            add("L", element);
        else
            add(element.type == QPainterPath::CurveToElement ? "C" : " ", element);
    }
    return data.empty() ? data : data + "Z";
}

/// The file of a picture as one that every viewer shows; empty: it cannot be read.
QByteArray pictureData(TextView path)
{
    const QImage image = loadPicture(path);
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    return !image.isNull() && image.save(&buffer, "PNG") ? bytes : QByteArray();
}

} // namespace

SvgPage::SvgPage(Tpoint size, TextView title, QtFonts& fonts)
    : fonts_(fonts)
    , size_(size)
    , title_(title)
{
}

std::string SvgPage::take()
{
    const std::string width = units(size_.x);
    const std::string height = units(size_.y);
    std::string file = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                       "<svg xmlns=\"http://www.w3.org/2000/svg\""
                       " xmlns:xlink=\"http://www.w3.org/1999/xlink\" version=\"1.1\"";
    appendAttribute(file, "width", width);
    appendAttribute(file, "height", height);
    appendAttribute(file, "viewBox", "0 0 " + width + " " + height);
    file += ">\n";
    if (!title_.empty())
        file += "<title>" + escaped(title_) + "</title>\n";
    if (!defs_.empty())
        file += "<defs>\n" + defs_ + "</defs>\n";
    return file + body_ + "</svg>\n";
}

void SvgPage::clear()
{
    body_ = "<rect width=\"" + units(size_.x) + "\" height=\"" + units(size_.y)
        + "\" fill=\"#ffffff\"/>\n";
    state_.current = {};
}

/// A line that ends where it begins is a dot of the pen's width.
void SvgPage::line(Tpoint from, Tpoint to)
{
    state_.current = to;
    if (state_.drawStyle == NoPen)
        return;
    if (from == to) {
        const double width = std::max<int>(1, state_.drawWidth);
        body_ += "<rect x=\"" + number(from.x / TwipsPerUnit - width / 2) + "\" y=\""
            + number(from.y / TwipsPerUnit - width / 2) + "\" width=\"" + number(width)
            + "\" height=\"" + number(width) + "\" fill=\"" + colorText(state_.foreColor)
            + "\"/>\n";
        return;
    }
    body_ += "<path d=\"M" + units(from.x) + " " + units(from.y) + "L" + units(to.x) + " "
        + units(to.y) + "\"" + stroke(state_.foreColor) + "/>\n";
}

void SvgPage::box(Tpoint corner, Tpoint opposite, Color outline)
{
    state_.current = opposite;
    const double width = std::abs(static_cast<double>(opposite.x) - corner.x);
    const double height = std::abs(static_cast<double>(opposite.y) - corner.y);
    body_ += "<rect x=\"" + units(std::min(corner.x, opposite.x)) + "\" y=\""
        + units(std::min(corner.y, opposite.y)) + "\" width=\"" + units(width) + "\" height=\""
        + units(height) + "\" fill=\"" + fill() + "\"" + stroke(outline) + "/>\n";
}

void SvgPage::print(TextView text)
{
    QtFace& face = fonts_.face(state_.fontName, state_.fontBold, state_.fontItalic);
    const double em = std::max(0.0, static_cast<double>(state_.fontSize) * TwipsPerPoint);
    const double lineHeight = std::nearbyint(face.lineHeight() / TwipsPerPoint * em);
    const Print print { face, em, lineHeight };
    if (em > 0 && !text.empty()) {
        if (!state_.fontTransparent)
            fillBehind(text, print);
        cutIntoRuns(text, face, runs_);
        for (const TextRun& run : runs_)
            printRun(run, print);
    }
    const double bottom = state_.current.y + lineHeight * static_cast<double>(lineCount(text));
    state_.current = { 0, roundToInt32(bottom) };
}

void SvgPage::picture(TextView filePath, Tpoint topLeft, Tpoint size)
{
    const QByteArray bytes = pictureData(filePath);
    if (bytes.isEmpty())
        return;
    body_ += "<image x=\"" + units(topLeft.x) + "\" y=\"" + units(topLeft.y) + "\" width=\""
        + units(size.x) + "\" height=\"" + units(size.y)
        + "\" preserveAspectRatio=\"none\" xlink:href=\"data:image/png;base64,"
        + bytes.toBase64().toStdString() + "\"/>\n";
}

void SvgPage::printRun(const TextRun& run, const Print& print)
{
    const double toTwips = print.em / TwipsPerPoint;
    const double x = state_.current.x + run.left * toTwips;
    const double top = state_.current.y + print.lineHeight * static_cast<double>(run.line);
    const double y = top + print.face.ascent() * toTwips;
    if (run.kind == RunKind::Box)
        printBox(run, print, x, y);
    else
        printGlyphs(shapeRun(run, print.face, OutlineEm), print, x, y);
    printUnseen(run, print, x, y);
}

/// Glyphs of a bold text whose face has no bold one get a pen around their outlines.
void SvgPage::printGlyphs(const ShapedRun& shaped, const Print& print, double x, double y)
{
    const double scale = print.em / TwipsPerUnit / OutlineEm;
    std::string glyphs;
    for (const QGlyphRun& run : shaped.glyphs) {
        const QRawFont font = run.rawFont();
        std::string uses;
        const QList<quint32> indexes = run.glyphIndexes();
        const QList<QPointF> positions = run.positions();
        for (qsizetype at = 0; at < indexes.size(); ++at) {
            const std::string name = outlineName(font, indexes[at]);
            if (name.empty())
                continue;
            uses += "<use xlink:href=\"#" + name + "\" x=\"" + number(positions[at].x()) + "\"";
            if (positions[at].y() != 0)
                appendAttribute(uses, "y", number(positions[at].y()));
            uses += "/>";
        }
        if (state_.fontBold && isBoldMadeUp(font) && !uses.empty())
            uses = "<g stroke=\"" + colorText(state_.foreColor) + "\" stroke-width=\""
                + number(font.lineThickness() * MadeUpBoldStroke) + "\">" + uses + "</g>";
        glyphs += uses;
    }
    if (glyphs.empty())
        return;
    constexpr double Fine = 1e6; // the scale is small and counts for a whole text
    const auto fine
        = [](double value) { return toUtf8(formatNumber(std::nearbyint(value * Fine) / Fine)); };
    body_ += "<g transform=\"matrix(" + fine(scale * shaped.squeeze) + " 0 0 " + fine(scale) + " "
        + units(x) + " " + units(y) + ")\" fill=\"" + colorText(state_.foreColor) + "\">" + glyphs
        + "</g>\n";
}

void SvgPage::printBox(const TextRun& run, const Print& print, double x, double y)
{
    const HollowBox box = hollowBox(run.advance * print.em / TwipsPerPoint, print.em);
    const auto edges = [&](double inset) {
        return "M" + units(x + box.left + inset) + " " + units(y + box.top + inset) + "H"
            + units(x + box.right - inset) + "V" + units(y + box.bottom - inset) + "H"
            + units(x + box.left + inset) + "Z";
    };
    body_ += "<path fill-rule=\"evenodd\" fill=\"" + colorText(state_.foreColor) + "\" d=\""
        + edges(0) + edges(box.stroke) + "\"/>\n";
}

/// The text itself, which is found, marked and copied.
void SvgPage::printUnseen(const TextRun& run, const Print& print, double x, double y)
{
    if (run.kind == RunKind::Box && isNoCharacter(run.text))
        return;
    body_ += "<text xml:space=\"preserve\" fill-opacity=\"0\" x=\"" + units(x) + "\" y=\""
        + units(y) + "\" font-size=\"" + units(print.em) + "\" textLength=\""
        + units(run.advance * print.em / TwipsPerPoint) + "\" lengthAdjust=\"spacingAndGlyphs\">"
        + escaped(run.text) + "</text>\n";
}

void SvgPage::fillBehind(TextView text, const Print& print)
{
    const double width = longestLineAdvance(text, print.face) * print.em / TwipsPerPoint;
    const double height = print.lineHeight * static_cast<double>(lineCount(text));
    body_ += "<rect x=\"" + units(state_.current.x) + "\" y=\"" + units(state_.current.y)
        + "\" width=\"" + units(width) + "\" height=\"" + units(height) + "\" fill=\"#ffffff\"/>\n";
}

/// The attributes of the pen.
std::string SvgPage::stroke(Color color) const
{
    if (state_.drawStyle == NoPen)
        return {};
    const int width = std::max<int>(1, state_.drawWidth);
    std::string text;
    appendAttribute(text, "stroke", colorText(color));
    appendAttribute(text, "stroke-width", std::to_string(width));
    const bool isDashed
        = state_.drawStyle > 0 && static_cast<std::size_t>(state_.drawStyle) < Dashes.size();
    if (!isDashed) {
        appendAttribute(text, "stroke-linecap", "square");
        return text;
    }
    std::string dashes;
    for (const int length : Dashes[static_cast<std::size_t>(state_.drawStyle)]) {
        if (length > 0)
            dashes += (dashes.empty() ? "" : " ") + std::to_string(length * width);
    }
    appendAttribute(text, "stroke-dasharray", dashes);
    return text;
}

/// What a rectangle is filled with: a colour, nothing, or a hatch in the fill colour.
std::string SvgPage::fill()
{
    if (state_.fillStyle == TransparentFill)
        return "none";
    const auto hatch = static_cast<std::size_t>(state_.fillStyle - FirstHatch);
    if (state_.fillStyle < FirstHatch || hatch >= Hatches.size())
        return colorText(state_.fillColor);
    std::string& name = hatches_[{ state_.fillColor, state_.fillStyle }];
    if (name.empty()) {
        name = "h" + std::to_string(hatches_.size());
        const std::string side = std::to_string(HatchDistance);
        defs_ += "<pattern id=\"" + name + "\" patternUnits=\"userSpaceOnUse\" width=\"" + side
            + "\" height=\"" + side + "\"><path d=\"" + Hatches[hatch]
            + "\" fill=\"none\" stroke=\"" + colorText(state_.fillColor)
            + "\" stroke-width=\"1\"/></pattern>\n";
    }
    return "url(#" + name + ")";
}

/// The name of a glyph's outline; empty: the glyph is blank.
std::string SvgPage::outlineName(const QRawFont& font, std::uint32_t glyph)
{
    const std::string face = (font.familyName() + QLatin1Char('/') + font.styleName()
        + QLatin1Char('/') + QString::number(font.weight()) + QLatin1Char('/')
        + QString::number(static_cast<int>(font.style()))
        + QLatin1Char(state_.fontItalic ? 'i' : ' '))
                                 .toStdString();
    const auto known = outlines_.find({ face, glyph });
    if (known != outlines_.end())
        return known->second;
    const std::string data = pathData(font.pathForGlyph(glyph));
    std::string name = data.empty() ? std::string() : "g" + std::to_string(outlines_.size());
    if (!data.empty())
        defs_ += "<path id=\"" + name + "\" d=\"" + data + "\"/>\n";
    outlines_[{ face, glyph }] = name;
    return name;
}

} // namespace pelloric::qt
