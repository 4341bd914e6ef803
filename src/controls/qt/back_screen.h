// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/qt/page_surface.h"

#include <QWidget>

#include <optional>
#include <vector>

namespace pelloric::qt {

/// The grey viewport; draws the shadows of the pages that lie in it.
///
/// Where more pages are seen than there are page surfaces as widgets, it also stands in for the
/// surfaces of the rest: paints them and hands on the mouse over them.
class BackScreen final : public QWidget {
    Q_OBJECT

public:
    /// A page surface that is shown.
    struct Page {
        int surface = 0;
        PagePlace place;
        bool isWidget = true; ///< false: the viewport stands in for it

        bool operator==(const Page&) const = default;
    };

    /// @param host  borrowed
    BackScreen(SurfaceHost& host, QWidget* parent);

    /// Shows other pages, and paints them.
    void setPages(std::vector<Page> pages);

    /// Moves all that is seen, and the surfaces that are widgets; only what comes into sight is
    /// painted.
    /// @param moved  how far: pixels
    void movePages(QPoint moved);

    /// Tells where the pages are after they moved; paints nothing by itself.
    void takePages(std::vector<Page> pages) { pages_ = std::move(pages); }

    /// The grey for a palette: a middle one, or a dark one where windows are dark.
    static QColor grey(const QPalette& palette);

protected:
    void paintEvent(QPaintEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    void paintPage(const Page& page, QPainter& painter, const QRect& exposed);
    const Page* pageAt(QPoint position) const;
    static QPointF cornerOf(const Page& page);

    SurfaceHost& host_;
    std::vector<Page> pages_;
    std::optional<QPointF> pressed_; ///< the corner of the page that a button went down on: pixels
    int pressedSurface_ = 0; ///< of that page
};

} // namespace pelloric::qt
