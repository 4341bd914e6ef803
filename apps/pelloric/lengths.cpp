// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "lengths.h"

#include "platform/units.h"

#include <QRegularExpression>

#include <array>

namespace pelloric::app {

namespace {

struct Unit {
    const char* name;
    double millimetres;
};

constexpr auto Units = std::to_array<Unit>({
    { "mm", 1 },
    { "cm", 10 },
    { "in", MmPerInch },
    { "\"", MmPerInch },
});

} // namespace

std::optional<double> millimetresOf(const QString& text, const QString& unit)
{
    static const QRegularExpression pattern(
        QStringLiteral("^\\s*(\\d+(?:\\.\\d+)?|\\.\\d+)\\s*(mm|cm|in|\")?\\s*$"),
        QRegularExpression::CaseInsensitiveOption);
    const auto match = pattern.match(text);
    if (!match.hasMatch())
        return std::nullopt;
    const QString given = match.captured(2).isEmpty() ? unit : match.captured(2).toLower();
    for (const Unit& known : Units) {
        if (given == QLatin1String(known.name))
            return match.captured(1).toDouble() * known.millimetres;
    }
    return std::nullopt;
}

std::optional<SizeMm> sizeOf(const QString& text)
{
    static const QRegularExpression pattern(
        QStringLiteral("^([^xX×]+)[xX×]([^xX×]+?)(mm|cm|in|\")?$"),
        QRegularExpression::CaseInsensitiveOption);
    const auto match = pattern.match(text.trimmed());
    if (!match.hasMatch())
        return std::nullopt;
    const QString unit
        = match.captured(3).isEmpty() ? QStringLiteral("mm") : match.captured(3).toLower();
    const auto width = millimetresOf(match.captured(1), unit);
    const auto height = millimetresOf(match.captured(2), unit);
    return width && height ? std::optional(SizeMm { *width, *height }) : std::nullopt;
}

} // namespace pelloric::app
