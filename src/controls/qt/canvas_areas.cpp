// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/canvas_areas.h"

#include "controls/qt/hand_cursor.h"
#include "controls/qt/member_calls.h"
#include "controls/qt/page_guest.h"
#include "controls/qt/progress_area.h"
#include "controls/qt/start_icon.h"
#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/qt/qt_drawing_surface.h"
#include "platform/qt/qt_text.h"
#include "platform/units.h"
#include "view/page_renderer.h"
#include "view/page_texts.h"

#include <QAccessible>
#include <QCoreApplication>
#include <QCursor>
#include <QLabel>
#include <QPainter>

#include <algorithm>
#include <cmath>
#include <limits>

namespace pelloric::qt {

namespace {

/// So many page surfaces are widgets; the toolkit takes long to move thousands of them.
constexpr std::size_t MostSurfaces = 64;

/// Reaches the pages of no document: a coordinate beyond all 32-bit twips has no meaning.
Twips wholeTwips(double twips)
{
    constexpr double Smallest = std::numeric_limits<Twips>::min();
    constexpr double Largest = std::numeric_limits<Twips>::max();
    return static_cast<Twips>(std::clamp(twips, Smallest, Largest));
}

int wholePixel(double position)
{
    constexpr double Reach = std::numeric_limits<int>::max() / 4.0;
    return static_cast<int>(std::nearbyint(std::clamp(position, -Reach, Reach)));
}

QLabel* makeHolder(QWidget& control, const char* name, const QString& accessibleName)
{
    auto* const holder = new QLabel(&control);
    holder->setObjectName(QString::fromLatin1(name));
    holder->setAccessibleName(accessibleName);
    holder->hide();
    return holder;
}

} // namespace

CanvasAreas::CanvasAreas(QWidget& control, Canvas& canvas, QtFonts& fonts, RightButton rightButton)
    : control_(control)
    , canvas_(canvas)
    , fonts_(fonts)
    , rightButton_(std::move(rightButton))
    , backScreen_(new BackScreen(*this, &control))
    , startIcon_(new StartIcon(&control))
    , progress_(new ProgressArea(&control))
    , hand_(makeHolder(control, "imgPan",
          QCoreApplication::translate("pelloric::qt::CanvasAreas", "Hand cursor")))
    , scrolling_(control, *backScreen_, canvas)
{
    makeHolder(
        control, "PicHouse", QCoreApplication::translate("pelloric::qt::CanvasAreas", "Picture"));
    makeHolder(
        control, "PicIcon", QCoreApplication::translate("pelloric::qt::CanvasAreas", "Picture"));
    hand_->setPixmap(handPicture(control.devicePixelRatioF()));
    auto* const base = new PageSurface(*this, backScreen_);
    base->hide();
    surfaces_[0] = base;
    canvas_.observe(*this);
}

CanvasAreas::~CanvasAreas() { canvas_.forget(*this); }

void CanvasAreas::fill(int edge)
{
    const int bar = scrolling_.extent();
    const QRect all = control_.rect().adjusted(edge, edge, -edge, -edge);
    const QSize view(std::max(0, all.width() - bar), std::max(0, all.height() - bar));
    const QRect viewport(all.topLeft(), view);
    backScreen_->setGeometry(viewport);
    startIcon_->setGeometry(viewport);
    scrolling_.placeAround(viewport);
    const int progressHeight = std::max(bar, progress_->sizeHint().height());
    progress_->setGeometry(
        all.left(), all.bottom() + 1 - progressHeight, all.width(), progressHeight);
    setViewport();
}

void CanvasAreas::setViewport()
{
    const double width = backScreen_->width() * TwipsPerInch / control_.logicalDpiX();
    const double height = backScreen_->height() * TwipsPerInch / control_.logicalDpiY();
    MemberCalls::endQuietly([&] {
        canvas_.setViewport(roundToInt32(width), roundToInt32(height));
        canvas_.OnDraw();
    });
    viewChanged();
}

void CanvasAreas::viewChanged()
{
    if (isPainting_)
        return;
    startIcon_->setVisible(isAtStart());
    showBars();
    showCursor();
    showSurfaces();
    tellReader();
}

void CanvasAreas::viewScrolled()
{
    if (isPainting_)
        return;
    if (look() != shownLook_) {
        viewChanged();
        return;
    }
    showBars();
    showCursor();
    scrollSurfaces();
    tellReader();
}

void CanvasAreas::progressChanged() { progress_->showProgress(canvas_.progress()); }

/// Before a document is shown; a build hides the pages, too, but not for long.
bool CanvasAreas::isAtStart() const { return !canvas_.view().baseVisible && !canvas_.isBuilding(); }

/// There is nothing to scroll at the start.
void CanvasAreas::showBars()
{
    if (isAtStart())
        scrolling_.showNothing();
    else
        scrolling_.show(canvas_.view());
}

void CanvasAreas::showCursor()
{
    if (showsHand_ == canvas_.view().pan)
        return;
    showsHand_ = canvas_.view().pan;
    backScreen_->setCursor(showsHand_ ? QCursor(hand_->pixmap()) : QCursor(Qt::ArrowCursor));
}

QSizeF CanvasAreas::pixelsPerTwip() const
{
    const double perTwip = 1 / (TwipsPerInch * canvas_.view().divisor);
    return { control_.logicalDpiX() * perTwip, control_.logicalDpiY() * perTwip };
}

/// Surface 0 stands at the nearest whole pixel and the others at whole pixels from it, so that all
/// of them move by the same pixels.
QPoint CanvasAreas::firstCorner() const
{
    if (!hasScale(canvas_.view()))
        return {};
    const QSizeF scale = pixelsPerTwip();
    const Tpoint first = canvas_.view().surfaces.front();
    return { wholePixel(first.x * scale.width()), wholePixel(first.y * scale.height()) };
}

QRectF CanvasAreas::pageArea(int surface) const
{
    const QSizeF scale = pixelsPerTwip();
    const Tpoint first = canvas_.view().surfaces.front();
    const Tpoint at = canvas_.view().surfaces[static_cast<std::size_t>(surface)];
    const double across = std::nearbyint((static_cast<double>(at.x) - first.x) * scale.width());
    const double down = std::nearbyint((static_cast<double>(at.y) - first.y) * scale.height());
    return { std::nearbyint(first.x * scale.width()) + across,
        std::nearbyint(first.y * scale.height()) + down, canvas_.page.myWidth * scale.width(),
        canvas_.page.myHeight * scale.height() };
}

std::vector<int> CanvasAreas::shownSurfaces() const
{
    if (!canvas_.view().baseVisible || !hasScale(canvas_.view()))
        return {};
    std::vector<int> shown = surfacesInView(canvas_.view(), canvas_.facts());
    if (shown.empty() || shown.front() != 0)
        shown.insert(shown.begin(), 0);
    return shown;
}

CanvasAreas::Look CanvasAreas::look() const
{
    const ViewState& view = canvas_.view();
    return { .divisor = view.divisor,
        .facts = canvas_.facts(),
        .grid = view.grid,
        .window = view.window,
        .surfaces = view.surfaces.size(),
        .multiPage = view.multiPage,
        .visible = view.baseVisible,
        .small = canvas_.strSCliectRect == u"small" };
}

void CanvasAreas::showSurfaces()
{
    shownLook_ = look();
    shownCorner_ = firstCorner();
    backScreen_->setPages(placeSurfaces());
    for (const auto& [index, surface] : surfaces_)
        surface->update();
}

/// The surfaces move with the pixels of the viewport first, so that placing them paints nothing.
void CanvasAreas::scrollSurfaces()
{
    const QPoint moved = firstCorner() - std::exchange(shownCorner_, firstCorner());
    backScreen_->movePages(moved);
    backScreen_->takePages(placeSurfaces());
}

std::vector<PageSurface*> CanvasAreas::takeSpareSurfaces(const std::vector<int>& shown)
{
    std::vector<PageSurface*> spare;
    for (auto known = surfaces_.begin(); known != surfaces_.end();) {
        const auto [index, surface] = *known;
        if (index == 0 || std::ranges::binary_search(shown, index)) {
            ++known;
            continue;
        }
        spare.push_back(surface);
        known = surfaces_.erase(known);
    }
    return spare;
}

/// Surfaces that went out of sight serve those that came into it.
std::vector<BackScreen::Page> CanvasAreas::placeSurfaces()
{
    const std::vector<int> shown = shownSurfaces();
    std::vector<PageSurface*> spare = takeSpareSurfaces(shown);
    std::vector<BackScreen::Page> pages;
    pages.reserve(shown.size());
    for (const int index : shown) {
        const PagePlace place = placeOf(pageArea(index));
        const bool isWidget = surfaces_.contains(index) || surfaces_.size() < MostSurfaces;
        pages.push_back({ index, place, isWidget });
        if (!isWidget)
            continue;
        PageSurface& surface = surfaceFor(index, spare);
        surface.place(place);
        surface.show();
    }
    surfaces_.at(0)->setVisible(!shown.empty());
    for (PageSurface* surface : spare) {
        surface->hide();
        surface->setObjectName({});
        surface->deleteLater(); // it may be the one that a mouse button is being released over
    }
    return pages;
}

PageSurface& CanvasAreas::surfaceFor(int index, std::vector<PageSurface*>& spare)
{
    PageSurface*& surface = surfaces_[index];
    if (surface)
        return *surface;
    if (spare.empty()) {
        surface = new PageSurface(*this, backScreen_);
    } else {
        surface = spare.back();
        spare.pop_back();
    }
    surface->setIndex(index);
    surface->raise();
    return *surface;
}

void CanvasAreas::paintSurface(int surface, QPainter& painter, QPointF origin, const QRect& exposed)
{
    if (canvas_.strSCliectRect == u"small" || !hasScale(canvas_.view()))
        return;
    passPaintThroughShowPage();
    const std::optional<int> page = pageShownOn(surface);
    if (!page)
        return;
    const QSizeF scale = pixelsPerTwip();
    painter.translate(origin);
    painter.scale(scale.width(), scale.height());
    const QRectF visible = painter.transform().inverted().mapRect(QRectF(exposed));
    painter.save();
    replay(*page, painter, visible);
    painter.restore();
    if (guest_)
        MemberCalls::endQuietly([&] { guest_->paintOver(*page, painter, visible); });
}

/// A page that stands alone stays while the current one does not exist.
std::optional<int> CanvasAreas::pageShownOn(int surface) const
{
    const auto page = pageOnSurface(canvas_.view(), canvas_.facts(), surface);
    if (!page && !canvas_.view().multiPage)
        return pageInView(canvas_.view(), canvas_.facts());
    return page;
}

void CanvasAreas::repaintPages()
{
    backScreen_->update();
    for (const auto& [index, surface] : surfaces_)
        surface->update();
}

QString CanvasAreas::surfaceText(int surface) const
{
    const std::optional<int> page = pageShownOn(surface);
    if (!page || canvas_.isBuilding())
        return {};
    QString text;
    MemberCalls::endQuietly([&] {
        text = toQString(
            asTable(placedTexts(canvas_.document(), *page, canvas_.platform().metrics)));
    });
    return text;
}

QString CanvasAreas::shownText() const
{
    QStringList texts;
    for (const int surface : surfacesInView(canvas_.view(), canvas_.facts()))
        texts.append(surfaceText(surface));
    return texts.join(QLatin1Char('\f'));
}

/// Only where a reader listens, and only when other pages are seen.
void CanvasAreas::tellReader()
{
    if (!QAccessible::isActive() || canvas_.isBuilding())
        return;
    std::vector<int> pages;
    for (const int surface : surfacesInView(canvas_.view(), canvas_.facts()))
        pages.push_back(pageShownOn(surface).value_or(-1));
    if (pages == shownPages_ && shownDocument_ == canvas_.documentNumber())
        return;
    shownPages_ = std::move(pages);
    shownDocument_ = canvas_.documentNumber();
    QAccessibleEvent changed(&control_, QAccessible::DocumentContentChanged);
    QAccessible::updateAccessibility(&changed);
}

bool CanvasAreas::takesMouse(int surface, const QMouseEvent& event, QPointF at)
{
    if (!guest_ || !hasScale(canvas_.view()))
        return false;
    const std::optional<int> page = pageShownOn(surface);
    const QSizeF scale = pixelsPerTwip();
    return page
        && guest_->takesMouse(*page, event, { at.x() / scale.width(), at.y() / scale.height() });
}

/// Every paint outside an arrangement goes through `showPage`: the mode becomes `One`. Where the
/// page was to be centred the areas follow after the paint, so that no paint asks for another.
void CanvasAreas::passPaintThroughShowPage()
{
    if (canvas_.view().multiPage)
        return;
    const Tpoint before = canvas_.view().offset;
    isPainting_ = true;
    MemberCalls::endQuietly([&] { canvas_.showPage(); });
    isPainting_ = false;
    if (canvas_.view().offset != before)
        QMetaObject::invokeMethod(
            &control_, [this] { viewChanged(); }, Qt::QueuedConnection);
}

void CanvasAreas::replay(int page, QPainter& painter, const QRectF& visible)
{
    const ViewState& view = canvas_.view();
    const PageRect part { wholeTwips(std::floor(visible.left())),
        wholeTwips(std::floor(visible.top())), wholeTwips(std::ceil(visible.right())),
        wholeTwips(std::ceil(visible.bottom())) };
    QtDrawingSurface target(painter, fonts_,
        { .divisor = view.divisor, .page = {}, .visible = visible, .isScreen = true });
    ReplayOptions options { .divisor = view.divisor, .fillPageCount = !showsPageWindow(view) };
    options.visible = part;
    MemberCalls::endQuietly(
        [&] { PageRenderer(canvas_.document()).replay(page, options, target); });
}

/// A mouse over a page always switches pan mode on.
void CanvasAreas::mouseMoved()
{
    if (!canvas_.view().pan)
        canvas_.mouseMove();
}

void CanvasAreas::mousePressed(Qt::MouseButton button, QPointF at)
{
    if (button == Qt::RightButton)
        rightButton_.pressed();
    if (!hasScale(canvas_.view()))
        return;
    const QSizeF scale = pixelsPerTwip();
    MemberCalls::endQuietly(
        [&] { canvas_.mouseDown(at.x() / scale.width(), at.y() / scale.height()); });
}

void CanvasAreas::mouseReleased(Qt::MouseButton button, QPointF at)
{
    if (button == Qt::RightButton)
        rightButton_.released();
    if (!hasScale(canvas_.view()))
        return;
    const QSizeF scale = pixelsPerTwip();
    MemberCalls::endQuietly(
        [&] { canvas_.mouseUp(at.x() / scale.width(), at.y() / scale.height()); });
}

} // namespace pelloric::qt
