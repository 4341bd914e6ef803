// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"
#include "controls/qt/back_screen.h"
#include "controls/qt/canvas_scrolling.h"
#include "controls/qt/page_surface.h"
#include "document/page_document.h"

#include <functional>
#include <map>
#include <optional>
#include <vector>

class QLabel;

namespace pelloric::qt {

class PageGuest;
class ProgressArea;
class QtFonts;
class StartIcon;

/// The child areas of a canvas: shows what the canvas says, and hands on what people do.
///
/// There is a widget for page surface 0 and for each that lies in the viewport, but for no more
/// than some dozens; the viewport stands in for the rest. What is out of sight costs nothing.
class CanvasAreas final : public CanvasObserver, private SurfaceHost {
public:
    /// What the right mouse button tells the host.
    struct RightButton {
        std::function<void()> pressed;
        std::function<void()> released;
    };

    /// @param control  the areas become its children; borrowed
    /// @param canvas   borrowed
    /// @param fonts    what pages are painted with; borrowed
    CanvasAreas(QWidget& control, Canvas& canvas, QtFonts& fonts, RightButton rightButton);
    ~CanvasAreas() override;
    CanvasAreas(const CanvasAreas&) = delete;
    CanvasAreas& operator=(const CanvasAreas&) = delete;

    /// Fills the control with its areas and lays the pages out in the viewport.
    /// @param edge  what stays free around them: pixels
    void fill(int edge);

    /// What wheel, pinch and keys are handed on to.
    CanvasScrolling& scrolling() { return scrolling_; }

    /// Has what is painted marked on the screen, and the mouse seen first.
    /// @param guest  borrowed, or null
    void setGuest(PageGuest* guest) { guest_ = guest; }

    /// Paints the pages that are seen anew.
    void repaintPages();

    /// The texts of the pages of which some part is seen, in their order.
    QString shownText() const;

    void viewChanged() override;
    void viewScrolled() override;
    void progressChanged() override;

private:
    /// What pages look like: as long as it stays, a move of the pages only moves pixels.
    struct Look {
        float divisor = 1;
        PageFacts facts;
        PageGrid grid;
        MuliPageType window;
        std::size_t surfaces = 0;
        bool multiPage = false;
        bool visible = false;
        bool small = false;

        bool operator==(const Look&) const = default;
    };

    void paintSurface(
        int surface, QPainter& painter, QPointF origin, const QRect& exposed) override;
    QString surfaceText(int surface) const override;
    bool takesMouse(int surface, const QMouseEvent& event, QPointF at) override;
    void mouseMoved() override;
    void mousePressed(Qt::MouseButton button, QPointF at) override;
    void mouseReleased(Qt::MouseButton button, QPointF at) override;

    void tellReader();
    void setViewport();
    bool isAtStart() const;
    void showBars();
    void showCursor();
    void showSurfaces();
    void scrollSurfaces();
    std::vector<BackScreen::Page> placeSurfaces();
    std::vector<PageSurface*> takeSpareSurfaces(const std::vector<int>& shown);
    std::vector<int> shownSurfaces() const;
    Look look() const;
    QPoint firstCorner() const;
    PageSurface& surfaceFor(int index, std::vector<PageSurface*>& spare);
    QSizeF pixelsPerTwip() const;
    QRectF pageArea(int surface) const;
    void passPaintThroughShowPage();
    std::optional<int> pageShownOn(int surface) const;
    void replay(int page, QPainter& painter, const QRectF& visible);

    QWidget& control_;
    Canvas& canvas_;
    QtFonts& fonts_;
    RightButton rightButton_;
    PageGuest* guest_ = nullptr;
    BackScreen* backScreen_;
    StartIcon* startIcon_;
    ProgressArea* progress_;
    QLabel* hand_;
    CanvasScrolling scrolling_;
    std::map<int, PageSurface*> surfaces_; ///< those that exist; 0 is always there
    Look shownLook_;
    std::uint32_t shownDocument_ = 0; ///< that screen readers were told of
    std::vector<int> shownPages_; ///< that screen readers were told of
    QPoint shownCorner_; ///< of surface 0 when the surfaces were placed last: pixels
    bool isPainting_ = false;
    bool showsHand_ = false;
};

} // namespace pelloric::qt
