// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/held_pages.h"

#include "platform/qt/qt_drawing_surface.h"
#include "platform/units.h"

#include <QPagedPaintDevice>
#include <QPainter>

namespace pelloric::qt {

bool paintHeldPages(
    const std::vector<HeldDrawing>& pages, QPagedPaintDevice& device, QtFonts& fonts)
{
    QPainter painter;
    if (!painter.begin(&device))
        return false;
    const double scale = device.logicalDpiX() / TwipsPerInch;
    painter.scale(scale, scale);
    QtDrawingSurface surface(painter, fonts);
    bool isFirst = true;
    for (const HeldDrawing& page : pages) {
        if (!isFirst && !device.newPage())
            return false;
        isFirst = false;
        page.drawOn(surface);
    }
    return painter.end();
}

} // namespace pelloric::qt
