// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QString>

#include <optional>

namespace pelloric::app {

/// A length as a person writes it, in millimetres: "12", "12mm", "1.2cm", "0.5in".
/// @param unit  of a number that names none: "mm", "cm" or "in"
/// @return      nothing: it is no length
std::optional<double> millimetresOf(
    const QString& text, const QString& unit = QStringLiteral("mm"));

/// A width and a height: millimetres.
struct SizeMm {
    double width = 0;
    double height = 0;
};

/// A size as a person writes it: "100x150", "10x15cm", "4inx6in"; a unit at the end counts for
/// both.
/// @return  nothing: it is no size
std::optional<SizeMm> sizeOf(const QString& text);

} // namespace pelloric::app
