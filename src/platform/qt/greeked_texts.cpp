// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/greeked_texts.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace pelloric::qt {

namespace {

constexpr int BarAlpha = 110; ///< about as dark as small letters look from afar

constexpr double MiddleOfLine = 0.6; ///< where the bar lies below the corner: ems
constexpr double WideAdvance = 1; ///< of an ideograph: ems
constexpr double NarrowAdvance = 0.5; ///< of a letter: ems
constexpr char16_t FirstWide = 0x2E80;

constexpr int LargestSide = 8192; ///< of any viewport: device pixels

/// About how wide a text is; nobody sees it closer: ems.
double roughAdvance(TextView text)
{
    double ems = 0;
    for (const char16_t unit : text)
        ems += unit >= FirstWide ? WideAdvance : NarrowAdvance;
    return ems;
}

QRgb barOf(Color color)
{
    return qPremultiply(qRgba(color & 0xFF, (color >> 8) & 0xFF, (color >> 16) & 0xFF, BarAlpha));
}

} // namespace

GreekedTexts::GreekedTexts(QPainter& painter, const QRectF& visible)
    : painter_(painter)
    , visible_(visible)
    , toPixels_(painter.deviceTransform())
    , pixelsPerTwip_(std::abs(toPixels_.m22()))
{
}

bool GreekedTexts::makeImage()
{
    const QRect area = toPixels_.mapRect(visible_).toAlignedRect();
    if (area.isEmpty() || area.width() > LargestSide || area.height() > LargestSide)
        return false;
    if (image_.size() != area.size())
        image_ = QImage(area.size(), QImage::Format_ARGB32_Premultiplied);
    image_.fill(Qt::transparent);
    corner_ = area.topLeft();
    return true;
}

void GreekedTexts::add(QPointF corner, double em, TextView text, Color color)
{
    if (isEmpty_ && !makeImage())
        return;
    isEmpty_ = false;
    const QPointF begin
        = toPixels_.map(QPointF(corner.x(), corner.y() + MiddleOfLine * em)) - corner_;
    const double width = roughAdvance(text) * em * pixelsPerTwip_;
    const double row = std::floor(begin.y());
    const double left = std::max(0.0, std::floor(begin.x()));
    const double right = std::min<double>(
        image_.width(), std::max(std::floor(begin.x()) + 1, std::nearbyint(begin.x() + width)));
    if (!(row >= 0 && row < image_.height() && left < right))
        return;
    auto* const pixels = reinterpret_cast<QRgb*>(image_.scanLine(static_cast<int>(row)));
    std::fill(pixels + static_cast<int>(left), pixels + static_cast<int>(right), barOf(color));
}

void GreekedTexts::paint()
{
    if (isEmpty_)
        return;
    isEmpty_ = true;
    const QTransform before = painter_.transform();
    painter_.setTransform(toPixels_.inverted() * before);
    painter_.setRenderHint(QPainter::SmoothPixmapTransform, false);
    painter_.drawImage(corner_, image_);
    painter_.setRenderHint(QPainter::SmoothPixmapTransform, true);
    painter_.setTransform(before);
}

} // namespace pelloric::qt
