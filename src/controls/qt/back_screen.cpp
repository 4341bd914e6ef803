// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/back_screen.h"

#include <QPaintEvent>
#include <QPainter>

#include <algorithm>

namespace pelloric::qt {

namespace {

constexpr int ShadowReach = 7; ///< of a large page: pixels
constexpr int ShadowDrop = 2; ///< how much lower than the page it lies: pixels
constexpr int ShadowPart = 10; ///< a small page's shadow reaches so small a part of its width
constexpr int ShadowAlpha = 14; ///< of each of its rings

constexpr int MiddleLightness = 128; ///< below this a palette is a dark one

/// Rings of the same faint black, one within the other, add up to a soft edge.
void drawShadow(QPainter& painter, const QRect& page)
{
    const int reach = std::min(ShadowReach, page.width() / ShadowPart);
    painter.setBrush(QColor(0, 0, 0, ShadowAlpha));
    for (int ring = reach; ring > 0; --ring) {
        const QRect area = page.translated(0, std::min(ShadowDrop, reach));
        painter.drawRoundedRect(area.adjusted(-ring, -ring, ring, ring), ring, ring);
    }
}

} // namespace

BackScreen::BackScreen(QWidget* parent)
    : QWidget(parent)
{
    setObjectName(QStringLiteral("Backscreen"));
    setAccessibleName(tr("Pages"));
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void BackScreen::setPages(std::vector<QRect> pages)
{
    if (pages_ == pages)
        return;
    pages_ = std::move(pages);
    update();
}

QColor BackScreen::grey(const QPalette& palette)
{
    const bool isDark = palette.color(QPalette::Window).lightness() < MiddleLightness;
    return isDark ? QColor(0x3C, 0x3F, 0x43) : QColor(0xA9, 0xAD, 0xB2);
}

void BackScreen::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    painter.fillRect(event->rect(), grey(palette()));
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    const QRect near = event->rect().adjusted(
        -2 * ShadowReach, -2 * ShadowReach, 2 * ShadowReach, 2 * ShadowReach);
    for (const QRect& page : pages_) {
        if (page.intersects(near))
            drawShadow(painter, page);
    }
}

} // namespace pelloric::qt
