// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/kestrane.h>

#include "controls/facade.h"
#include "controls/qt/default_platform.h"
#include "controls/qt/member_calls.h"
#include "controls/qt/plain_calls.h"
#include "controls/qt/published_values.h"
#include "grids/qt/grid_for.h"
#include "platform/phrase.h"
#include "platform/platform.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include <pelloric/options.h>

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
            throw RunTimeError(
                ErrorNumber::InvalidCall, phrase(u"nobody opens the preview window"));
        opener->setReportOptions(options);
        opener->openPreview(std::move(grid));
    }

    PreviewOpener* own = nullptr; ///< null: the default one
    ReportOptions options;
};

} // namespace

struct Kestrane::Parts {
    /// What works without the window.
    struct Core {
        explicit Core(QtPlatform& services)
            : platform(services.record())
            , facade(platform, opener)
        {
        }

        Platform platform;
        CurrentOpener opener;
        Facade facade;
    };

    Parts(Kestrane& control, QtPlatform& services)
        : core(std::make_shared<Core>(services))
        , calls(control, core, core->platform, [] {})
    {
    }

    std::shared_ptr<Core> core; ///< shared with the members that run
    MemberCalls calls;
};

Kestrane::Kestrane(QWidget* parent)
    : Kestrane(defaultPlatform(), parent)
{
}

Kestrane::Kestrane(QtPlatform& platform, QWidget* parent)
    : KestraneCalls(parent)
    , parts_(std::make_unique<Parts>(*this, platform))
{
    registerRecords();
    setObjectName(QStringLiteral("Kestrane"));
    setAccessibleName(tr("Print preview"));
}

Kestrane::~Kestrane() = default;

void Kestrane::setDefaultPreviewOpener(PreviewOpener* opener) { defaultOpener = opener; }

void Kestrane::setPreviewOpener(PreviewOpener* opener) { parts_->core->opener.own = opener; }

bool Kestrane::ShowHeader() const { return parts_->core->facade.ShowHeader(); }

std::int32_t Kestrane::MarvenStartRow() const { return parts_->core->facade.MarvenStartRow(); }

bool Kestrane::MergeGrid() const { return parts_->core->facade.MergeGrid(); }

void Kestrane::setReportOptions(const ReportOptions& options)
{
    parts_->core->opener.options = options;
}

const ReportOptions& Kestrane::reportOptions() const { return parts_->core->opener.options; }

void Kestrane::doPreview(std::unique_ptr<AutomationObject> PrintObj)
{
    parts_->calls.run([&] {
        if (!PrintObj)
            throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"doPreview was given no grid"));
        parts_->core->facade.doPreview(std::move(PrintObj));
    });
}

void Kestrane::doPreview(QObject* PrintObj)
{
    parts_->calls.run([&] {
        if (!PrintObj)
            throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"doPreview was given no grid"));
        parts_->core->facade.doPreview(gridFor(*PrintObj));
    });
}

void Kestrane::AddHeader(const QString& strHeader, pelloric::AlignmentType Location)
{
    parts_->calls.run(
        [&] { parts_->core->facade.AddHeader(viewOf(strHeader), static_cast<int>(Location)); });
}

void Kestrane::AddFooter(const QString& strFooter, pelloric::AlignmentType Location)
{
    parts_->calls.run(
        [&] { parts_->core->facade.AddFooter(viewOf(strFooter), static_cast<int>(Location)); });
}

void Kestrane::setShowHeader(bool show)
{
    parts_->calls.run([&] { parts_->core->facade.setShowHeader(show); });
}

void Kestrane::setMarvenStartRow(std::int32_t row)
{
    parts_->calls.run([&] { parts_->core->facade.setMarvenStartRow(row); });
}

void Kestrane::setMergeGrid(bool merge)
{
    parts_->calls.run([&] { parts_->core->facade.setMergeGrid(merge); });
}

void Kestrane::doPreview(const QVariant& PrintObj)
{
    parts_->calls.run([&] { parts_->core->facade.doPreview(toGrid(PrintObj, *this)); });
}

void Kestrane::AddHeader(const QVariant& strHeader, const QVariant& Location)
{
    parts_->calls.run([&] {
        const QString text = toPlainText(strHeader);
        parts_->core->facade.AddHeader(viewOf(text), toInt16(Location));
    });
}

void Kestrane::AddFooter(const QVariant& strFooter, const QVariant& Location)
{
    parts_->calls.run([&] {
        const QString text = toPlainText(strFooter);
        parts_->core->facade.AddFooter(viewOf(text), toInt16(Location));
    });
}

void Kestrane::putShowHeader(const QVariant& value)
{
    parts_->calls.run([&] { parts_->core->facade.setShowHeader(toTruth(value)); });
}

void Kestrane::putMarvenStartRow(const QVariant& value)
{
    parts_->calls.run([&] { parts_->core->facade.setMarvenStartRow(toInt32(value)); });
}

void Kestrane::putMergeGrid(const QVariant& value)
{
    parts_->calls.run([&] { parts_->core->facade.setMergeGrid(toTruth(value)); });
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
