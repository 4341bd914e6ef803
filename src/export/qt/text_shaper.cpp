// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/text_shaper.h"

#include "platform/qt/qt_text.h"

#include <QFontMetricsF>
#include <QGlyphRun>
#include <QRawFont>
#include <QTextLayout>

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr double VeryWide = 1e7;

/// Characters that are drawn together, and their glyphs.
struct Cluster {
    QString text;
    std::vector<pdf::ShapedGlyph> glyphs;
    bool isRightToLeft = false;
    std::uint32_t blank = 0; ///< a glyph of the same font that leaves no mark
};

double inEms(double pixels) { return pixels / ShapingPixels; }

bool standsAt(const pdf::ShapedGlyph& one, const pdf::ShapedGlyph& other)
{
    return one.glyph == other.glyph && one.x == other.x && one.y == other.y;
}

/// The glyphs of the characters from `begin` on, as many as make one cluster.
Cluster clusterAt(const QTextLayout& layout, int begin, int end,
    const std::function<pdf::DrawnFont(const QRawFont&)>& drawn)
{
    const QTextLine line = layout.lineAt(0);
    const double baseline = line.y() + line.ascent();
    Cluster cluster { layout.text().mid(begin, end - begin), {} };
    for (const QGlyphRun& run : layout.glyphRuns(begin, end - begin)) {
        const pdf::DrawnFont font = drawn(run.rawFont());
        const QList<quint32> glyphs = run.glyphIndexes();
        const QList<QPointF> points = run.positions();
        cluster.isRightToLeft = run.isRightToLeft();
        cluster.blank = run.rawFont().glyphIndexesForString(QStringLiteral(" ")).value(0);
        for (qsizetype at = 0; at < glyphs.size(); ++at)
            cluster.glyphs.push_back(
                { font, glyphs[at], {}, inEms(points[at].x()), inEms(baseline - points[at].y()) });
    }
    return cluster;
}

/// Parts of a ligature are told apart by the toolkit's cursor but have the same glyphs.
std::vector<Cluster> clustersOf(
    const QTextLayout& layout, const std::function<pdf::DrawnFont(const QRawFont&)>& drawn)
{
    std::vector<Cluster> clusters;
    const int size = static_cast<int>(layout.text().size());
    for (int begin = 0; begin < size;) {
        int end = begin + 1;
        while (end < size && !layout.isValidCursorPosition(end))
            ++end;
        Cluster cluster = clusterAt(layout, begin, end, drawn);
        const bool isSame = !clusters.empty() && !clusters.back().glyphs.empty()
            && !cluster.glyphs.empty()
            && standsAt(clusters.back().glyphs.front(), cluster.glyphs.front());
        if (isSame)
            clusters.back().text += cluster.text;
        else if (!cluster.glyphs.empty())
            clusters.push_back(std::move(cluster));
        begin = end;
    }
    return clusters;
}

/// Readers turn texts that are read from the right round character by character, so that a ligature
/// may stand for one only; blanks within it stand for the others.
void addBlanks(Cluster& cluster, std::size_t characters)
{
    constexpr double Thousand = 1000;
    const pdf::ShapedGlyph last = cluster.glyphs.back();
    const double width = last.font.program->advance(last.glyph) / Thousand;
    const double parts = static_cast<double>(characters - cluster.glyphs.size() + 1);
    for (double part = 1; part < parts; ++part)
        cluster.glyphs.push_back(
            { last.font, cluster.blank, {}, last.x + width * part / parts, last.y });
}

/// Gives the characters to the glyphs one by one, the rest of them to the last.
void giveMeanings(Cluster& cluster)
{
    const QList<uint> characters = cluster.text.toUcs4();
    const auto count = static_cast<std::size_t>(characters.size());
    if (cluster.isRightToLeft && cluster.blank != 0 && count > cluster.glyphs.size())
        addBlanks(cluster, count);
    std::vector<Text> meanings(cluster.glyphs.size());
    for (qsizetype at = 0; at < characters.size(); ++at) {
        const auto glyph = std::min(static_cast<std::size_t>(at), meanings.size() - 1);
        const char32_t character = characters[at];
        meanings[glyph] += toText(QString::fromUcs4(&character, 1));
    }
    if (cluster.isRightToLeft)
        std::reverse(meanings.begin(), meanings.end());
    for (std::size_t at = 0; at < meanings.size(); ++at)
        cluster.glyphs[at].meaning = meanings[at];
}

} // namespace

void layOut(QTextLayout& layout)
{
    QTextOption option(Qt::AlignLeft | Qt::AlignAbsolute);
    option.setWrapMode(QTextOption::NoWrap);
    option.setTextDirection(Qt::LayoutDirectionAuto);
    layout.setTextOption(option);
    layout.beginLayout();
    layout.createLine().setLineWidth(VeryWide);
    layout.endLayout();
}

pdf::ShapedText shape(
    TextView text, QFont font, const std::function<pdf::DrawnFont(const QRawFont&)>& drawn)
{
    font.setStyleStrategy(QFont::PreferAntialias);
    const QString string = toQString(text);
    QTextLayout layout(string, font);
    layout.setCacheEnabled(true);
    layOut(layout);
    pdf::ShapedText shaped;
    shaped.advance = inEms(QFontMetricsF(font).horizontalAdvance(string));
    std::vector<Cluster> clusters = clustersOf(layout, drawn);
    std::stable_sort(
        clusters.begin(), clusters.end(), [](const Cluster& one, const Cluster& other) {
            return one.glyphs.front().x < other.glyphs.front().x;
        });
    for (Cluster& cluster : clusters) {
        giveMeanings(cluster);
        for (pdf::ShapedGlyph& glyph : cluster.glyphs)
            shaped.glyphs.push_back(std::move(glyph));
    }
    return shaped;
}

} // namespace pelloric::qt
