// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/kestrane.h"

#include "controls/qt/default_platform.h"
#include "controls/qt/published_values.h"
#include "grids/qt/grid_for.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QPainter>

namespace pelloric::qt {

namespace {

PreviewOpener* defaultOpener = nullptr;

using Slot = pelloric::AlignmentType;

static_assert(Kestrane::LocLeft == static_cast<int>(Slot::LocLeft)
    && Kestrane::LocCenter == static_cast<int>(Slot::LocCenter)
    && Kestrane::LocRight == static_cast<int>(Slot::LocRight));

} // namespace

Kestrane::Kestrane(QWidget* parent)
    : Kestrane(defaultPlatform(), parent)
{
}

Kestrane::Kestrane(QtPlatform& platform, QWidget* parent)
    : QWidget(parent)
    , platform_(platform.record())
    , facade_(platform_, opener_)
    , calls_(*this, platform_, [] {})
{
    setObjectName(QStringLiteral("Kestrane"));
    setAccessibleName(tr("Print preview"));
}

Kestrane::~Kestrane() = default;

void Kestrane::setDefaultPreviewOpener(PreviewOpener* opener) { defaultOpener = opener; }

void Kestrane::Opener::openPreview(std::unique_ptr<AutomationObject> grid)
{
    PreviewOpener* const opener = own ? own : defaultOpener;
    if (!opener)
        throw RunTimeError(ErrorNumber::InvalidCall, u"nobody opens the preview window");
    opener->openPreview(std::move(grid));
}

void Kestrane::doPreview(std::unique_ptr<AutomationObject> PrintObj)
{
    calls_.run([&] {
        if (!PrintObj)
            throw RunTimeError(ErrorNumber::ObjectMissing);
        facade_.doPreview(std::move(PrintObj));
    });
}

void Kestrane::doPreview(QObject* PrintObj)
{
    calls_.run([&] {
        if (!PrintObj)
            throw RunTimeError(ErrorNumber::ObjectMissing);
        facade_.doPreview(gridFor(*PrintObj));
    });
}

void Kestrane::AddHeader(const QString& strHeader, pelloric::AlignmentType Location)
{
    calls_.run([&] { facade_.AddHeader(viewOf(strHeader), static_cast<int>(Location)); });
}

void Kestrane::AddFooter(const QString& strFooter, pelloric::AlignmentType Location)
{
    calls_.run([&] { facade_.AddFooter(viewOf(strFooter), static_cast<int>(Location)); });
}

void Kestrane::setShowHeader(bool show)
{
    calls_.run([&] { facade_.setShowHeader(show); });
}

void Kestrane::setMarvenStartRow(std::int32_t row)
{
    calls_.run([&] { facade_.setMarvenStartRow(row); });
}

void Kestrane::setMergeGrid(bool merge)
{
    calls_.run([&] { facade_.setMergeGrid(merge); });
}

void Kestrane::doPreview(const QVariant& PrintObj)
{
    calls_.run([&] { facade_.doPreview(toGrid(PrintObj)); });
}

void Kestrane::AddHeader(const QVariant& strHeader, const QVariant& Location)
{
    calls_.run([&] {
        const QString text = toPlainText(strHeader);
        facade_.AddHeader(viewOf(text), toInt16(Location));
    });
}

void Kestrane::AddFooter(const QVariant& strFooter, const QVariant& Location)
{
    calls_.run([&] {
        const QString text = toPlainText(strFooter);
        facade_.AddFooter(viewOf(text), toInt16(Location));
    });
}

void Kestrane::putShowHeader(const QVariant& value)
{
    calls_.run([&] { facade_.setShowHeader(toTruth(value)); });
}

void Kestrane::putMarvenStartRow(const QVariant& value)
{
    calls_.run([&] { facade_.setMarvenStartRow(toInt32(value)); });
}

void Kestrane::putMergeGrid(const QVariant& value)
{
    calls_.run([&] { facade_.setMergeGrid(toTruth(value)); });
}

QSize Kestrane::sizeHint() const { return { 48, 48 }; }

/// A rectangle that covers the control is all that is shown.
void Kestrane::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setPen(palette().color(QPalette::WindowText));
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
}

} // namespace pelloric::qt
