// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/kestrane.h"

#include "controls/qt/default_platform.h"
#include "controls/qt/published_values.h"
#include "grids/qt/grid_for.h"
#include "platform/platform.h"
#include "platform/qt/qt_platform.h"
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

/// Hands on to whoever opens the window at the moment.
struct CurrentOpener final : PreviewOpener {
    void openPreview(std::unique_ptr<AutomationObject> grid) override
    {
        PreviewOpener* const opener = own ? own : defaultOpener;
        if (!opener)
            throw RunTimeError(ErrorNumber::InvalidCall, u"nobody opens the preview window");
        opener->openPreview(std::move(grid));
    }

    PreviewOpener* own = nullptr; ///< null: the default one
};

} // namespace

/// What works without the window.
struct Kestrane::Parts {
    explicit Parts(QtPlatform& services)
        : platform(services.record())
        , facade(platform, opener)
    {
    }

    Platform platform;
    CurrentOpener opener;
    Facade facade;
};

Kestrane::Kestrane(QWidget* parent)
    : Kestrane(defaultPlatform(), parent)
{
}

Kestrane::Kestrane(QtPlatform& platform, QWidget* parent)
    : KestraneCalls(parent)
    , parts_(std::make_shared<Parts>(platform))
    , facade_(parts_->facade)
    , calls_(*this, parts_, parts_->platform, [] {})
{
    registerRecords();
    setObjectName(QStringLiteral("Kestrane"));
    setAccessibleName(tr("Print preview"));
}

Kestrane::~Kestrane() = default;

void Kestrane::setDefaultPreviewOpener(PreviewOpener* opener) { defaultOpener = opener; }

void Kestrane::setPreviewOpener(PreviewOpener* opener) { parts_->opener.own = opener; }

bool Kestrane::ShowHeader() const { return facade_.ShowHeader(); }

std::int32_t Kestrane::MarvenStartRow() const { return facade_.MarvenStartRow(); }

bool Kestrane::MergeGrid() const { return facade_.MergeGrid(); }

void Kestrane::doPreview(std::unique_ptr<AutomationObject> PrintObj)
{
    calls_.run([&] {
        if (!PrintObj)
            throw RunTimeError(ErrorNumber::ObjectMissing, u"doPreview was given no grid");
        facade_.doPreview(std::move(PrintObj));
    });
}

void Kestrane::doPreview(QObject* PrintObj)
{
    calls_.run([&] {
        if (!PrintObj)
            throw RunTimeError(ErrorNumber::ObjectMissing, u"doPreview was given no grid");
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
    calls_.run([&] { facade_.doPreview(toGrid(PrintObj, *this)); });
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
