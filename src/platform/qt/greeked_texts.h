// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "platform/units.h"

#include <QImage>
#include <QRectF>
#include <QTransform>

class QPainter;

namespace pelloric::qt {

/// Texts that are too small to be read, as bars of faint colour, on a screen.
///
/// The bars of a page are gathered and painted at once, so that texts that share a row of pixels
/// cost and darken it no more than one of them.
class GreekedTexts {
public:
    /// @param painter  scaled to twips; borrowed
    /// @param visible  what is seen of the page: twips
    GreekedTexts(QPainter& painter, const QRectF& visible);

    /// Whether a text of that size is too small to be read.
    /// @param em  twips
    bool takes(double em) const { return em * pixelsPerTwip_ < SmallestEm; }

    /// Takes a text in.
    /// @param corner  its left top: twips
    /// @param em      twips
    void add(QPointF corner, double em, TextView text, Color color);

    /// Paints what was gathered.
    void paint();

private:
    static constexpr double SmallestEm = 1.5; ///< of a text that is drawn as such: device pixels

    bool makeImage();

    QPainter& painter_;
    QRectF visible_;
    QTransform toPixels_; ///< device pixels
    double pixelsPerTwip_;
    QImage image_; ///< the device pixels of what is seen
    QPoint corner_; ///< of the image: device pixels
    bool isEmpty_ = true;
};

} // namespace pelloric::qt
