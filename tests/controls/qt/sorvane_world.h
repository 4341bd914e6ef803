// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"
#include "fakes/fake_services.h"
#include "fakes/temp_folder.h"
#include "grids/table_grid.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"
#include "support/recorded_pages.h"
#include <pelloric/sorvane.h>

#include <QCoreApplication>
#include <QImage>
#include <QScrollBar>
#include <QtGlobal>

#include <cmath>

namespace pelloric::qt {

/// Services with a settings file of their own, whose message boxes a test has to take.
class QuietPlatform : public QtPlatform {
public:
    QuietPlatform()
    {
        useMessages(messages);
        folders().setSystemDirectory(folder.path());
        deployDefaultSettings(record());
    }

    FakeMessages messages;
    TempFolder folder;
};

/// A canvas of 800 by 600 pixels that paints.
class SorvaneWorld {
public:
    SorvaneWorld()
        : sorvane(platform)
    {
        sorvane.canvas().strSCliectRect = u"full";
        sorvane.resize(800, 600);
        sorvane.show();
        QCoreApplication::processEvents();
    }

    /// A document of blank pages, shown from its first page on.
    void makePages(int pages)
    {
        canvas.clear();
        addPages(canvas.document(), pages - 1);
        canvas.setCurrentpage(1);
        canvas.showPage();
    }

    template <typename Widget = QWidget> Widget* child(const char* name) const
    {
        return sorvane.findChild<Widget*>(QString::fromLatin1(name));
    }

    QWidget* paper(int index) const
    {
        return sorvane.findChild<QWidget*>(QStringLiteral("paper(%1)").arg(index));
    }

    /// Where the canvas says that a surface stands: pixels of the viewport.
    QRectF expectedArea(int surface) const
    {
        const double scale = sorvane.logicalDpiX() / 1440.0 / canvas.view().divisor;
        const Tpoint at = canvas.view().surfaces.at(static_cast<std::size_t>(surface));
        return { at.x * scale, at.y * scale, canvas.page.myWidth * scale,
            canvas.page.myHeight * scale };
    }

    /// A pixel of a surface from a page's position: device-independent pixels of the control.
    QPoint onControl(int surface, Tpoint position) const
    {
        const double scale = sorvane.logicalDpiX() / 1440.0 / canvas.view().divisor;
        const QPoint pixel(static_cast<int>(std::floor(position.x * scale)),
            static_cast<int>(std::floor(position.y * scale)));
        return paper(surface)->mapTo(&sorvane, pixel);
    }

    QuietPlatform platform;
    Sorvane sorvane;
    Canvas& canvas = sorvane.canvas();
};

} // namespace pelloric::qt
