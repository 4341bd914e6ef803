// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QByteArray>
#include <QFile>
#include <QFontDatabase>
#include <QString>
#include <QtEndian>

#include <gtest/gtest.h>

namespace pelloric::qt {

/// An installed font file under another name, which has as many letters.
inline QByteArray renamedFont(const QString& path, const QByteArray& name, const QByteArray& other)
{
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << "not installed: " << path.toStdString();
    QByteArray font = file.readAll();
    const auto wide = [](const QByteArray& letters) {
        QByteArray units;
        for (const char letter : letters)
            units.append('\0').append(letter);
        return units;
    };
    font.replace(name, other);
    font.replace(wide(name), wide(other));
    return font;
}

/// "Locked Sans", which may not be embedded.
inline bool loadLockedFont()
{
    QByteArray font = renamedFont(QStringLiteral("/usr/share/fonts/truetype/dejavu/DejaVuSans.ttf"),
        "DejaVu Sans", "Locked Sans");
    constexpr qsizetype OffsetInEntry = 8;
    constexpr qsizetype RightsInTable = 8;
    const char* const entry = font.constData() + font.indexOf("OS/2") + OffsetInEntry;
    const auto rights = static_cast<qsizetype>(qFromBigEndian<quint32>(entry)) + RightsInTable;
    font[rights] = 0;
    font[rights + 1] = 2;
    return QFontDatabase::addApplicationFontFromData(font) >= 0;
}

/// "Curved Roman", whose outlines are of the CFF kind, with real bold and italic faces lacking.
inline bool loadCffFont()
{
    const QByteArray font = renamedFont(
        QStringLiteral("/usr/share/fonts/opentype/urw-base35/NimbusRoman-Regular.otf"),
        "Nimbus Roman", "Curved Roman");
    return QFontDatabase::addApplicationFontFromData(font) >= 0;
}

} // namespace pelloric::qt
