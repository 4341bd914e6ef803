// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// The members of a canvas that choose what is seen of its document.

#include "controls/canvas.h"

#include "platform/platform.h"
#include "platform/services.h"

namespace pelloric {

void Canvas::showWholePage()
{
    changeView([&] { pelloric::showWholePage(view_, facts()); });
}

void Canvas::showPage()
{
    changeView([&] { pelloric::showPage(view_, facts()); });
}

void Canvas::showAllPage()
{
    changeView([this] {
        platform_.loop.runOnce();
        pelloric::showAllPage(view_, facts()); // what there is after the messages
    });
}

void Canvas::showMuliPage(std::int16_t nPages)
{
    changeView([&] {
        const OrderStyle style = fitMuliPage(view_, facts(), nPages);
        platform_.loop.runOnce();
        placeMuliPage(view_, facts(), style); // what there is after the messages
    });
}

void Canvas::SetShowStyle(std::int16_t nPages, std::int16_t nStartPage, std::int16_t nEndPage)
{
    setShowStyle(view_, nPages, nStartPage, nEndPage);
}

void Canvas::zoomIn()
{
    changeView([&] { pelloric::zoomIn(view_, facts()); });
}

void Canvas::zoomOut()
{
    changeView([&] { pelloric::zoomOut(view_, facts()); });
}

void Canvas::setDispScale(float scale)
{
    changeView([&] { pelloric::setDispScale(view_, facts(), scale); });
}

void Canvas::setVerticalDir(bool portrait)
{
    if (isBusy())
        return;
    changeView([&] { pelloric::setVerticalDir(view_, style_, page, facts(), portrait); });
}

void Canvas::OnDraw()
{
    changeView([&] { layOutAgain(view_, facts()); });
}

void Canvas::setMouse()
{
    changeView([this] { pelloric::setMouse(view_); }, &CanvasObserver::viewScrolled);
}

void Canvas::Pan()
{
    changeView([this] { pan(view_); }, &CanvasObserver::viewScrolled);
}

void Canvas::setViewport(Twips width, Twips height)
{
    view_.viewportWidth = width;
    view_.viewportHeight = height;
}

void Canvas::setHbar(std::int32_t value)
{
    changeView([&] { pelloric::setHbar(view_, facts(), value); }, &CanvasObserver::viewScrolled);
}

void Canvas::setVbar(std::int32_t value)
{
    changeView([&] { pelloric::setVbar(view_, facts(), value); }, &CanvasObserver::viewScrolled);
}

void Canvas::mouseMove()
{
    changeView([this] { pelloric::mouseMove(view_); }, &CanvasObserver::viewScrolled);
}

void Canvas::mouseDown(double x, double y) { pelloric::mouseDown(view_, x, y); }

void Canvas::mouseUp(double x, double y)
{
    changeView([&] { pelloric::mouseUp(view_, facts(), x, y); }, &CanvasObserver::viewScrolled);
}

void Canvas::movePages(Tpoint first)
{
    changeView([&] { pelloric::movePages(view_, facts(), first); }, &CanvasObserver::viewScrolled);
}

void Canvas::bringIntoStep()
{
    changeView([this] { pelloric::bringIntoStep(view_, facts()); });
}

void Canvas::zoomAbout(float scale, double x, double y)
{
    changeView([&] { pelloric::zoomAbout(view_, facts(), scale, x, y); });
}

} // namespace pelloric
