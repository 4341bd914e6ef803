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
#include <QScrollBar>
#include <QSignalBlocker>
#include <QStyle>
#include <QWheelEvent>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>

namespace pelloric::qt {

namespace {

constexpr double ScrollStep = 100; ///< what one step of a bar moves: page twips

/// So many page surfaces are widgets; the toolkit takes long to move thousands of them.
constexpr std::size_t MostSurfaces = 64;

constexpr double ZoomStep = 1.25; ///< of a wheel click

constexpr double SmallestScale = 0.01; ///< wheel and pinch zoom no further out
constexpr double LargestScale = 64; ///< wheel and pinch zoom no further in

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

/// What a key does to a scroll bar.
struct KeyRow {
    int key;
    Qt::Orientation bar;
    QAbstractSlider::SliderAction action;
};

constexpr auto Keys = std::to_array<KeyRow>({
    { Qt::Key_Left, Qt::Horizontal, QAbstractSlider::SliderSingleStepSub },
    { Qt::Key_Right, Qt::Horizontal, QAbstractSlider::SliderSingleStepAdd },
    { Qt::Key_Up, Qt::Vertical, QAbstractSlider::SliderSingleStepSub },
    { Qt::Key_Down, Qt::Vertical, QAbstractSlider::SliderSingleStepAdd },
    { Qt::Key_PageUp, Qt::Vertical, QAbstractSlider::SliderPageStepSub },
    { Qt::Key_PageDown, Qt::Vertical, QAbstractSlider::SliderPageStepAdd },
    { Qt::Key_Home, Qt::Vertical, QAbstractSlider::SliderToMinimum },
    { Qt::Key_End, Qt::Vertical, QAbstractSlider::SliderToMaximum },
});

QLabel* makeHolder(QWidget& control, const char* name, const QString& accessibleName)
{
    auto* const holder = new QLabel(&control);
    holder->setObjectName(QString::fromLatin1(name));
    holder->setAccessibleName(accessibleName);
    holder->hide();
    return holder;
}

/// Shows a bar of the canvas without running its change handler.
void showBar(QScrollBar& bar, const ScrollBar& state)
{
    const QSignalBlocker blocker(bar);
    bar.setEnabled(state.enabled);
    bar.setRange(0, state.enabled ? state.maximum : 0);
    bar.setPageStep(state.largeChange);
    bar.setSingleStep(state.smallChange);
    bar.setValue(state.value);
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
    , Hbar_(makeBar(Qt::Horizontal, "Hbar"))
    , Vbar_(makeBar(Qt::Vertical, "Vbar"))
{
    makeHolder(
        control, "PicHouse", QCoreApplication::translate("pelloric::qt::CanvasAreas", "Picture"));
    makeHolder(
        control, "PicIcon", QCoreApplication::translate("pelloric::qt::CanvasAreas", "Picture"));
    hand_->setPixmap(handPicture(control.devicePixelRatioF()));
    Hbar_->setAccessibleName(
        QCoreApplication::translate("pelloric::qt::CanvasAreas", "Horizontal scroll bar"));
    Vbar_->setAccessibleName(
        QCoreApplication::translate("pelloric::qt::CanvasAreas", "Vertical scroll bar"));
    auto* const base = new PageSurface(*this, backScreen_);
    base->hide();
    surfaces_[0] = base;
    QObject::connect(Hbar_, &QScrollBar::valueChanged, &control_,
        [this](int value) { MemberCalls::endQuietly([&] { canvas_.setHbar(value); }); });
    QObject::connect(Vbar_, &QScrollBar::valueChanged, &control_,
        [this](int value) { MemberCalls::endQuietly([&] { canvas_.setVbar(value); }); });
    canvas_.observe(*this);
}

CanvasAreas::~CanvasAreas() { canvas_.forget(*this); }

QScrollBar* CanvasAreas::makeBar(Qt::Orientation orientation, const char* name)
{
    auto* const bar = new QScrollBar(orientation, &control_);
    bar->setObjectName(QString::fromLatin1(name));
    bar->setLayoutDirection(Qt::LeftToRight);
    bar->setRange(0, 0);
    bar->setEnabled(false);
    return bar;
}

void CanvasAreas::fill(int edge)
{
    const int bar = control_.style()->pixelMetric(QStyle::PM_ScrollBarExtent, nullptr, Hbar_);
    const QRect all = control_.rect().adjusted(edge, edge, -edge, -edge);
    const QSize view(std::max(0, all.width() - bar), std::max(0, all.height() - bar));
    const QRect viewport(all.topLeft(), view);
    backScreen_->setGeometry(viewport);
    startIcon_->setGeometry(viewport);
    Hbar_->setGeometry(all.left(), all.top() + view.height(), view.width(), bar);
    Vbar_->setGeometry(all.left() + view.width(), all.top(), bar, view.height());
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
    showBar(*Hbar_, isAtStart() ? ScrollBar() : canvas_.view().Hbar);
    showBar(*Vbar_, isAtStart() ? ScrollBar() : canvas_.view().Vbar);
}

void CanvasAreas::showCursor()
{
    if (showsHand_ == canvas_.view().pan)
        return;
    showsHand_ = canvas_.view().pan;
    backScreen_->setCursor(showsHand_ ? QCursor(hand_->pixmap()) : QCursor(Qt::ArrowCursor));
}

bool CanvasAreas::hasScale() const
{
    const double divisor = canvas_.view().divisor;
    return divisor > 0 && std::isfinite(1 / divisor);
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
    if (!hasScale())
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
    if (!canvas_.view().baseVisible || !hasScale())
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
    if (canvas_.strSCliectRect == u"small" || !hasScale())
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
    if (!guest_ || !hasScale())
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
    if (!hasScale())
        return;
    const QSizeF scale = pixelsPerTwip();
    MemberCalls::endQuietly(
        [&] { canvas_.mouseDown(at.x() / scale.width(), at.y() / scale.height()); });
}

void CanvasAreas::mouseReleased(Qt::MouseButton button, QPointF at)
{
    if (button == Qt::RightButton)
        rightButton_.released();
    if (!hasScale())
        return;
    const QSizeF scale = pixelsPerTwip();
    MemberCalls::endQuietly(
        [&] { canvas_.mouseUp(at.x() / scale.width(), at.y() / scale.height()); });
}

void CanvasAreas::wheel(QWheelEvent& event)
{
    const QPoint angle = event.angleDelta();
    event.accept();
    if (event.modifiers() & Qt::ControlModifier) {
        wheelRest_ += angle.y();
        const int clicks = wheelRest_ / QWheelEvent::DefaultDeltasPerStep;
        wheelRest_ -= clicks * QWheelEvent::DefaultDeltasPerStep;
        if (clicks != 0)
            zoomAbout(
                std::pow(ZoomStep, clicks), backScreen_->mapFrom(&control_, event.position()));
        return;
    }
    const bool isAcross
        = std::abs(angle.x()) > std::abs(angle.y()) || (event.modifiers() & Qt::ShiftModifier);
    QScrollBar* const bar = isAcross ? Hbar_ : Vbar_;
    QWheelEvent passed(event.position(), event.globalPosition(), event.pixelDelta(), angle,
        event.buttons(), event.modifiers() & ~Qt::ShiftModifier, event.phase(), event.inverted());
    if (!bar->isEnabled())
        return;
    // Never further than what is seen at once: a large step is a rounded number.
    const ViewState& view = canvas_.view();
    const double seen = (isAcross ? view.innerWidth : view.innerHeight) / ScrollStep;
    bar->setPageStep(std::clamp(static_cast<int>(std::min(seen, 32767.0)), 1, bar->pageStep()));
    bar->event(&passed);
}

void CanvasAreas::zoomAbout(double factor, QPointF at)
{
    const ViewState& view = canvas_.view();
    if (!hasScale() || !view.baseVisible)
        return;
    const double present = 1 / static_cast<double>(view.divisor);
    const double scale = std::clamp(present * factor, SmallestScale, LargestScale);
    if ((factor > 1) != (scale > present))
        return;
    MemberCalls::endQuietly([&] {
        canvas_.zoomAbout(static_cast<float>(scale), at.x() * TwipsPerInch / control_.logicalDpiX(),
            at.y() * TwipsPerInch / control_.logicalDpiY());
    });
}

/// A pinch on a touch pad.
bool CanvasAreas::gesture(QNativeGestureEvent& event)
{
    if (event.gestureType() != Qt::ZoomNativeGesture)
        return false;
    const double factor = 1 + event.value();
    if (factor > 0 && factor != 1)
        zoomAbout(factor, backScreen_->mapFrom(&control_, event.position()));
    return true;
}

bool CanvasAreas::key(int key)
{
    for (const KeyRow& row : Keys) {
        if (row.key != key)
            continue;
        QScrollBar* const bar = row.bar == Qt::Horizontal ? Hbar_ : Vbar_;
        if (bar->isEnabled())
            bar->triggerAction(row.action);
        return true;
    }
    return false;
}

} // namespace pelloric::qt
