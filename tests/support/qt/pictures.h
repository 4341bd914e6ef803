// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "support/qt/run_program.h"

#include <QImage>

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>

namespace pelloric::qt {

/// At which documents are looked at: pixels an inch.
inline constexpr int Dpi = 150;

/// Shades that differ by less are the same ink, drawn by another anti-aliasing.
inline constexpr int SameShade = 96;

/// Darker than this is ink; the thinnest lines on paper are grey.
inline constexpr int InkShade = 224;

/// A page of a PDF file as poppler draws it, in shades of grey.
/// @param folder  for the image file
/// @param page    from 1
inline QImage paperPicture(const QString& document, const QString& folder, int page = 1)
{
    const QString file = folder + QStringLiteral("/page");
    const QString number = QString::number(page);
    const ProgramResult result = runProgram(QStringLiteral("pdftoppm"),
        { QStringLiteral("-r"), QString::number(Dpi), QStringLiteral("-f"), number,
            QStringLiteral("-l"), number, QStringLiteral("-png"), QStringLiteral("-singlefile"),
            document, file });
    EXPECT_EQ(result.status, 0) << result.errors.toStdString();
    return QImage(file + QStringLiteral(".png")).convertToFormat(QImage::Format_Grayscale8);
}

inline int shadeAt(const QImage& image, int x, int y) { return image.constScanLine(y)[x]; }

/// The smallest rectangle that holds all ink.
/// @param lightest  lighter than this is paper
inline QRect inkOf(const QImage& image, int lightest = InkShade)
{
    QRect ink;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (shadeAt(image, x, y) < lightest)
                ink |= QRect(x, y, 1, 1);
        }
    }
    return ink;
}

/// Whether a pixel of one picture is found in the other within a pixel's distance.
inline bool isFound(const QImage& one, const QImage& other, int x, int y)
{
    const int shade = shadeAt(one, x, y);
    for (int nearY = std::max(0, y - 1); nearY <= std::min(one.height() - 1, y + 1); ++nearY) {
        for (int nearX = std::max(0, x - 1); nearX <= std::min(one.width() - 1, x + 1); ++nearX) {
            if (std::abs(shadeAt(other, nearX, nearY) - shade) < SameShade)
                return true;
        }
    }
    return false;
}

/// The part of all pixels that one picture has and the other has not.
inline double differenceOf(const QImage& one, const QImage& other)
{
    int different = 0;
    for (int y = 0; y < one.height(); ++y) {
        for (int x = 0; x < one.width(); ++x) {
            const bool isSame = std::abs(shadeAt(one, x, y) - shadeAt(other, x, y)) < SameShade
                || (isFound(one, other, x, y) && isFound(other, one, x, y));
            different += isSame ? 0 : 1;
        }
    }
    return static_cast<double>(different) / (one.width() * one.height());
}

/// How far the edges of two rectangles lie apart at most: pixels.
inline int farthestEdge(const QRect& one, const QRect& other)
{
    return std::max({ std::abs(one.left() - other.left()), std::abs(one.top() - other.top()),
        std::abs(one.right() - other.right()), std::abs(one.bottom() - other.bottom()) });
}

} // namespace pelloric::qt
