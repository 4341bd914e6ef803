// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_fonts.h"

#include "platform/qt/glyph_runs.h"
#include "platform/qt/qt_text.h"
#include "platform/units.h"

#include <QFontDatabase>
#include <QFontInfo>
#include <QRawFont>
#include <QStringList>

#include <algorithm>
#include <array>

namespace pelloric::qt {

namespace {

/// At this size, a multiple of the units that outlines are drawn in, advances are exact.
constexpr int ReferencePixels = 2048;

/// Names kept before the table of names is emptied: a document may hold any number of them.
constexpr std::size_t MostNames = 4096;

/// Song-style families, the best first.
QStringList substitutes()
{
    return { QStringLiteral("SimSun"), QStringLiteral("NSimSun"), QStringLiteral("AR PL UMing CN"),
        QStringLiteral("Noto Serif CJK SC"), QStringLiteral("WenQuanYi Zen Hei") };
}

/// What names of Song-style families hold, whatever their letters' case.
constexpr auto SongMarks = std::to_array<TextView>(
    { u"宋", u"明體", u"明体", u"SimSun", u"Song", u"MingLiU", u"UMing" });

/// Whether a name asks for a Song-style face. A number stands for a name that was not kept, and so
/// does an empty name.
bool isSongStyle(const QString& name)
{
    bool isNumber = false;
    name.toDouble(&isNumber);
    return name.isEmpty() || isNumber || std::ranges::any_of(SongMarks, [&](TextView mark) {
        return name.contains(borrowed(mark), Qt::CaseInsensitive);
    });
}

/// The first installed Song-style family; empty: there is none.
QString songFamily()
{
    for (const QString& substitute : substitutes()) {
        if (QFontDatabase::hasFamily(substitute))
            return substitute;
    }
    return {};
}

/// Whether files can hold the outlines of a font; those of the old PostScript format have no
/// tables.
bool holdsTables(const QFont& font)
{
    return !QRawFont::fromFont(font).fontTable("head").isEmpty();
}

bool hasStyle(const QString& family, bool bold, bool italic)
{
    return std::ranges::any_of(QFontDatabase::styles(family), [&](const QString& style) {
        return QFontDatabase::bold(family, style) == bold
            && QFontDatabase::italic(family, style) == italic;
    });
}

/// A family as the toolkit is asked for it. One that is installed in several formats, each under a
/// foundry of its own, is asked for in a format that files can hold.
QString embeddableFamily(const QString& family, bool bold, bool italic)
{
    const auto isEmbeddable = [&](const QString& name) {
        QFont font(name);
        font.setBold(bold);
        font.setItalic(italic);
        return holdsTables(font);
    };
    if (isEmbeddable(family))
        return family;
    const QString withFoundry = family + QStringLiteral(" [");
    for (const QString& other : QFontDatabase::families()) {
        if (other.startsWith(withFoundry) && hasStyle(other, bold, italic) && isEmbeddable(other))
            return other;
    }
    return family;
}

QStringList familiesOf(const QString& family, bool bold, bool italic)
{
    QStringList families { embeddableFamily(family, bold, italic) };
    for (const QString& substitute : substitutes()) {
        if (substitute != family && QFontDatabase::hasFamily(substitute))
            families.append(substitute);
    }
    return families;
}

QFont preparedFont(const QString& family, bool bold, bool italic, int pixels)
{
    QFont font;
    font.setFamilies(familiesOf(family, bold, italic));
    font.setBold(bold);
    font.setItalic(italic);
    font.setPixelSize(pixels);
    font.setKerning(false);
    font.setHintingPreference(QFont::PreferNoHinting);
    font.setStyleStrategy(
        static_cast<QFont::StyleStrategy>(QFont::PreferNoShaping | QFont::PreferAntialias));
    return font;
}

double lineHeightOf(const QFont& reference)
{
    const QFontMetricsF metrics(reference);
    return (metrics.ascent() + metrics.descent()) / ReferencePixels * TwipsPerPoint;
}

} // namespace

QtFace::QtFace(const QString& family, bool bold, bool italic)
    : QtFace(family, preparedFont(family, bold, italic, ReferencePixels))
{
}

QtFace::QtFace(const QString& family, const QFont& reference)
    : InstalledFace(lineHeightOf(reference))
    , family_(family)
    , reference_(reference)
    , metrics_(reference)
    , ascent_(metrics_.ascent() / ReferencePixels * TwipsPerPoint)
    , isBoldMadeUp_(reference.bold() && !hasBoldFace(family))
{
}

QFont QtFace::font(int pixels) const
{
    QFont font(reference_);
    font.setPixelSize(pixels);
    return font;
}

QFont QtFace::installedFont(int pixels) const
{
    QFont plain = font(pixels);
    if (isBoldMadeUp_)
        plain.setBold(false);
    return plain;
}

/// A character that no face has is as wide as what the face has in its place. It is not measured as
/// a text, for a shaper would put more than one glyph there.
double QtFace::glyphAdvance(char32_t codePoint)
{
    if (!hasGlyph(codePoint)) {
        const QList<QPointF> advances
            = QRawFont::fromFont(reference_).advancesForGlyphIndexes({ 0 });
        return advances.isEmpty() ? 0 : advances.first().x() / ReferencePixels * TwipsPerPoint;
    }
    const QString character = QString::fromUcs4(&codePoint, 1);
    return metrics_.horizontalAdvance(character) / ReferencePixels * TwipsPerPoint;
}

bool QtFace::hasGlyph(char32_t codePoint) { return metrics_.inFontUcs4(codePoint); }

QtFonts::QtFonts() = default;

QtFace& QtFonts::face(TextView name, bool bold, bool italic)
{
    const bool isLast
        = last_ && lastKey_.bold == bold && lastKey_.italic == italic && lastKey_.name == name;
    if (!isLast) {
        FaceKey key { Text(name), bold, italic };
        const auto known = byName_.find(key);
        last_ = known != byName_.end() ? known->second : &resolvedFace(key);
        lastKey_ = std::move(key);
    }
    return *last_;
}

QString QtFonts::resolve(const QString& name)
{
    if (!name.isEmpty() && QFontDatabase::hasFamily(name))
        return name;
    if (QString song = songFamily(); !song.isEmpty() && isSongStyle(name))
        return song;
    const QString matched = QFontInfo(name.isEmpty() ? QFont() : QFont(name)).family();
    return matched.left(matched.lastIndexOf(QStringLiteral(" ["))); // without its foundry
}

bool QtFonts::hasAny() { return QFontMetricsF(QFont()).inFont(QLatin1Char('0')); }

void QtFonts::installSubstitutions()
{
    for (const QString& name : { QStringLiteral("宋体"), QStringLiteral("0") })
        QFont::insertSubstitutions(name, substitutes());
}

QtFace& QtFonts::resolvedFace(const FaceKey& key)
{
    if (byName_.size() >= MostNames)
        byName_.clear();
    const QString name = toQString(key.name);
    const QString family = resolve(name);
    note(name, family);
    const FaceKey familyKey { toText(family), key.bold, key.italic };
    auto& face = byFamily_[familyKey];
    if (!face)
        face = std::make_unique<QtFace>(family, key.bold, key.italic);
    byName_[key] = face.get();
    return *face;
}

void QtFonts::note(const QString& asked, const QString& taken)
{
    const bool isMeant = asked.isEmpty() || asked.compare(taken, Qt::CaseInsensitive) == 0
        || (isSongStyle(asked) && substitutes().contains(taken));
    const FontNote note { toText(asked), toText(taken) };
    if (!isMeant && notes_.size() < MostNames && std::ranges::find(notes_, note) == notes_.end())
        notes_.push_back(note);
}

} // namespace pelloric::qt
