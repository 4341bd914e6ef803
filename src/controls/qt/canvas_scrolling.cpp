// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/canvas_scrolling.h"

#include "controls/canvas.h"
#include "controls/qt/member_calls.h"
#include "platform/units.h"

#include <QCoreApplication>
#include <QScrollBar>
#include <QSignalBlocker>
#include <QStyle>
#include <QWheelEvent>

#include <algorithm>
#include <array>
#include <cmath>

namespace pelloric::qt {

namespace {

constexpr double ZoomStep = 1.25; ///< of a wheel click

constexpr double SmallestScale = 0.01; ///< wheel and pinch zoom no further out
constexpr double LargestScale = 64; ///< wheel and pinch zoom no further in

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

CanvasScrolling::CanvasScrolling(QWidget& control, const QWidget& viewport, Canvas& canvas)
    : control_(control)
    , viewport_(viewport)
    , canvas_(canvas)
    , Hbar_(makeBar(Qt::Horizontal, "Hbar",
          QCoreApplication::translate("pelloric::qt::CanvasAreas", "Horizontal scroll bar")))
    , Vbar_(makeBar(Qt::Vertical, "Vbar",
          QCoreApplication::translate("pelloric::qt::CanvasAreas", "Vertical scroll bar")))
{
    QObject::connect(Hbar_, &QScrollBar::valueChanged, &control_,
        [this](int value) { MemberCalls::endQuietly([&] { canvas_.setHbar(value); }); });
    QObject::connect(Vbar_, &QScrollBar::valueChanged, &control_,
        [this](int value) { MemberCalls::endQuietly([&] { canvas_.setVbar(value); }); });
}

QScrollBar* CanvasScrolling::makeBar(
    Qt::Orientation orientation, const char* name, const QString& meaning)
{
    auto* const bar = new QScrollBar(orientation, &control_);
    bar->setObjectName(QString::fromLatin1(name));
    bar->setAccessibleName(meaning);
    bar->setLayoutDirection(Qt::LeftToRight);
    bar->setRange(0, 0);
    bar->setEnabled(false);
    return bar;
}

int CanvasScrolling::extent() const
{
    return control_.style()->pixelMetric(QStyle::PM_ScrollBarExtent, nullptr, Hbar_);
}

void CanvasScrolling::placeAround(const QRect& viewport)
{
    const int bar = extent();
    Hbar_->setGeometry(viewport.left(), viewport.bottom() + 1, viewport.width(), bar);
    Vbar_->setGeometry(viewport.right() + 1, viewport.top(), bar, viewport.height());
}

void CanvasScrolling::show(const ViewState& view)
{
    showBar(*Hbar_, view.Hbar);
    showBar(*Vbar_, view.Vbar);
}

void CanvasScrolling::showNothing()
{
    showBar(*Hbar_, {});
    showBar(*Vbar_, {});
}

void CanvasScrolling::wheel(QWheelEvent& event)
{
    const QPoint angle = event.angleDelta();
    event.accept();
    if (event.modifiers() & Qt::ControlModifier) {
        wheelRest_ += angle.y();
        const int clicks = wheelRest_ / QWheelEvent::DefaultDeltasPerStep;
        wheelRest_ -= clicks * QWheelEvent::DefaultDeltasPerStep;
        if (clicks != 0)
            zoomAbout(std::pow(ZoomStep, clicks), inViewport(event.position()));
        return;
    }
    const bool isAcross
        = std::abs(angle.x()) > std::abs(angle.y()) || (event.modifiers() & Qt::ShiftModifier);
    QScrollBar* const bar = isAcross ? Hbar_ : Vbar_;
    QWheelEvent passed(event.position(), event.globalPosition(), event.pixelDelta(), angle,
        event.buttons(), event.modifiers() & ~Qt::ShiftModifier, event.phase(), event.inverted());
    if (!bar->isEnabled())
        return;
    const ViewState& view = canvas_.view();
    bar->setPageStep(
        isAcross ? seenStep(view.Hbar, view.innerWidth) : seenStep(view.Vbar, view.innerHeight));
    bar->event(&passed);
}

QPointF CanvasScrolling::inViewport(QPointF position) const
{
    return viewport_.mapFrom(&control_, position);
}

/// @param at  pixels of the viewport
void CanvasScrolling::zoomAbout(double factor, QPointF at)
{
    const ViewState& view = canvas_.view();
    if (!hasScale(view) || !view.baseVisible)
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

bool CanvasScrolling::gesture(QNativeGestureEvent& event)
{
    if (event.gestureType() != Qt::ZoomNativeGesture)
        return false;
    const double factor = 1 + event.value();
    if (factor > 0 && factor != 1)
        zoomAbout(factor, inViewport(event.position()));
    return true;
}

bool CanvasScrolling::key(int key)
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
