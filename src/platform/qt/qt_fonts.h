// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text_metrics.h"

#include <QFont>
#include <QFontMetricsF>
#include <QString>

#include <map>
#include <vector>

namespace pelloric::qt {

/// How a face is asked for.
struct FaceKey {
    Text name;
    bool bold = false;
    bool italic = false;

    // The analyser takes the 0 of a comparison for a null. NOLINTNEXTLINE(modernize-use-nullptr)
    auto operator<=>(const FaceKey&) const = default;
};

/// An installed face: its measures, and the fonts that paint it as it was measured.
///
/// Fonts are unhinted, unkerned and unshaped, so that painting keeps to the measured width.
class QtFace final : public InstalledFace {
public:
    /// @param family  an installed family
    QtFace(const QString& family, bool bold, bool italic);

    /// From the top of a line to its baseline at size 1: twips.
    double ascent() const { return ascent_; }

    /// Whether the family has no bold face of its own, so that a bold one is made up.
    bool isBoldMadeUp() const { return isBoldMadeUp_; }

    /// The font whose em is `pixels` high, 1 or more.
    QFont font(int pixels) const;

    /// The same, never bolder than the family's own faces.
    QFont installedFont(int pixels) const;

    const QString& family() const { return family_; }

protected:
    double glyphAdvance(char32_t codePoint) override;
    bool hasGlyph(char32_t codePoint) override;

private:
    QtFace(const QString& family, const QFont& reference);

    QString family_;
    QFont reference_;
    QFontMetricsF metrics_;
    double ascent_;
    bool isBoldMadeUp_;
};

/// A family that was asked for, is not installed, and is answered by another.
struct FontNote {
    Text asked;
    Text taken;

    bool operator==(const FontNote&) const = default;
};

/// Resolves faces by name and keeps what was resolved.
///
/// A name that asks for a Song-style face, such as "宋体" or the number that a saved document holds
/// in place of a name, is answered by the first installed one of a short list of Song-style
/// families. Any other family that is not installed is answered as the system's font matching has
/// it. The Song-style list fills in for characters that a family lacks.
class QtFonts {
public:
    QtFonts();
    QtFonts(const QtFonts&) = delete;
    QtFonts& operator=(const QtFonts&) = delete;

    /// The face, or its substitute's; lives as long as this object.
    QtFace& face(TextView name, bool bold, bool italic);

    /// The installed family that stands for a name.
    static QString resolve(const QString& name);

    /// What was taken for families that are not installed, each said once; a Song-style face for a
    /// Song-style name is what was meant, and needs no note.
    const std::vector<FontNote>& notes() const { return notes_; }

    /// Whether there is any font to draw with.
    static bool hasAny();

    /// Lets widgets, too, show "宋体" and the names that stand for it in the substitute family.
    static void installSubstitutions();

private:
    QtFace& resolvedFace(const FaceKey& key);
    void note(const QString& asked, const QString& taken);

    std::map<FaceKey, QtFace*> byName_;
    std::map<FaceKey, std::unique_ptr<QtFace>> byFamily_;
    FaceKey lastKey_;
    QtFace* last_ = nullptr;
    std::vector<FontNote> notes_;
};

} // namespace pelloric::qt
