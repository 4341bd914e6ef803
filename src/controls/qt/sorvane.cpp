// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/qt/sorvane.h"

#include "controls/qt/canvas_areas.h"
#include "controls/qt/default_platform.h"
#include "controls/qt/page_accessible.h"
#include "controls/qt/published_values.h"
#include "grids/qt/grid_for.h"
#include "platform/platform.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QGuiApplication>
#include <QKeyEvent>
#include <QPainter>
#include <QWheelEvent>

#include <filesystem>

namespace pelloric::qt {

namespace {

using CoreOrder = pelloric::OrderStyle;
using CoreKind = pelloric::PrintObjKind;

static_assert(Sorvane::Whole == static_cast<int>(CoreOrder::Whole)
    && Sorvane::One == static_cast<int>(CoreOrder::One)
    && Sorvane::Two == static_cast<int>(CoreOrder::Two)
    && Sorvane::Four == static_cast<int>(CoreOrder::Four)
    && Sorvane::Multiple == static_cast<int>(CoreOrder::Multiple)
    && Sorvane::UserCustom == static_cast<int>(CoreOrder::UserCustom)
    && Sorvane::Six == static_cast<int>(CoreOrder::Six));
static_assert(Sorvane::MSHFlexGrid == static_cast<int>(CoreKind::MSHFlexGrid)
    && Sorvane::MSFlexGrid == static_cast<int>(CoreKind::MSFlexGrid)
    && Sorvane::ListView == static_cast<int>(CoreKind::ListView)
    && Sorvane::datagrid == static_cast<int>(CoreKind::datagrid));

constexpr short RightButtonNumber = 2;

constexpr int FocusEdge = 2; ///< shows whether the control has the focus: pixels

QObject& objectOf(QObject* object)
{
    if (!object)
        throw RunTimeError(ErrorNumber::ObjectMissing, u"no grid was given");
    return *object;
}

/// Has screen readers know the canvas and its pages before the first of them is made: what is asked
/// for once is kept for good.
QWidget* madeReadable(QWidget* parent)
{
    [[maybe_unused]] static const bool isReadable = (installPageAccessibility(), true);
    return parent;
}

} // namespace

/// What works without the window.
struct Sorvane::Parts {
    explicit Parts(QtPlatform& services)
        : platform(services.record())
        , canvas(platform)
    {
    }

    Platform platform;
    Canvas canvas;
    std::unique_ptr<AutomationObject> grid; ///< of the last build, alive while it runs
};

Sorvane::Sorvane(QWidget* parent)
    : Sorvane(defaultPlatform(), parent)
{
}

Sorvane::Sorvane(QtPlatform& platform, QWidget* parent)
    : SorvaneCalls(madeReadable(parent))
    , parts_(std::make_shared<Parts>(platform))
    , canvas_(parts_->canvas)
    , calls_(*this, parts_, parts_->platform, [this] { areas_->viewChanged(); })
    , areas_(std::make_unique<CanvasAreas>(*this, canvas_, platform.fonts(),
          CanvasAreas::RightButton { [this] { emit Click(RightButtonNumber); },
              [this] { emit MouseUp(RightButtonNumber); } }))
{
    registerRecords();
    canvas_.documentName = toText(QGuiApplication::applicationDisplayName());
    setObjectName(QStringLiteral("Sorvane"));
    setAccessibleName(tr("Page preview"));
    setFocusPolicy(Qt::StrongFocus);
    areas_->fill(FocusEdge);
}

Sorvane::~Sorvane() = default;

void Sorvane::setPageGuest(PageGuest* guest) { areas_->setGuest(guest); }

void Sorvane::repaintPages() { areas_->repaintPages(); }

QString Sorvane::shownText() const { return areas_->shownText(); }

std::int16_t Sorvane::Currentpage()
{
    std::int16_t page = 0;
    run([&] { page = canvas_.Currentpage(); });
    return page;
}

void Sorvane::setCurrentpage(std::int16_t page)
{
    run([&] { canvas_.setCurrentpage(page); });
}

void Sorvane::setDispScale(float scale)
{
    run([&] { canvas_.setDispScale(scale); });
}

void Sorvane::setVerticalDir(bool portrait)
{
    run([&] { canvas_.setVerticalDir(portrait); });
}

void Sorvane::showMuliPage(std::int16_t nPages)
{
    run([&] { canvas_.showMuliPage(nPages); });
}

void Sorvane::SetShowStyle(std::int16_t nPages, std::int16_t nStartPage, std::int16_t nEndPage)
{
    run([&] { canvas_.SetShowStyle(nPages, nStartPage, nEndPage); });
}

void Sorvane::doPrint(bool bAllPrint, const QString& strPrintRange, std::int16_t nPrintPageNum)
{
    run([&] { canvas_.doPrint(bAllPrint, viewOf(strPrintRange), nPrintPageNum); });
}

void Sorvane::SaveFile(const QString& FilePath)
{
    run([&] { canvas_.SaveFile(pathOf(FilePath)); });
}

void Sorvane::OpenFile(const QString& FilePath)
{
    run([&] { canvas_.OpenFile(pathOf(FilePath)); });
}

void Sorvane::doPreview(AutomationObject& PrintObj)
{
    run([&] { canvas_.doPreview(PrintObj); });
}

void Sorvane::doPreview(QObject* PrintObj)
{
    run([&] { preview(gridFor(objectOf(PrintObj))); });
}

void Sorvane::ReDrawZoom(AutomationObject& PrintObj)
{
    run([&] { canvas_.ReDrawZoom(PrintObj); });
}

void Sorvane::ReDrawZoom(QObject* PrintObj)
{
    run([&] { redraw(gridFor(objectOf(PrintObj))); });
}

/// A build that is asked for while another runs is refused, and must not touch the other's grid.
void Sorvane::preview(std::unique_ptr<AutomationObject> grid)
{
    if (canvas_.isBusy())
        return;
    parts_->grid = std::move(grid);
    canvas_.doPreview(*parts_->grid);
}

void Sorvane::redraw(std::unique_ptr<AutomationObject> grid)
{
    if (canvas_.isBusy())
        return;
    parts_->grid = std::move(grid);
    canvas_.ReDrawZoom(*parts_->grid);
}

void Sorvane::showWholePage()
{
    run([&] { canvas_.showWholePage(); });
}

void Sorvane::showPage()
{
    run([&] { canvas_.showPage(); });
}

void Sorvane::showAllPage()
{
    run([&] { canvas_.showAllPage(); });
}

void Sorvane::showMuliPage(const QVariant& nPages)
{
    run([&] { canvas_.showMuliPage(toInt16(nPages)); });
}

void Sorvane::clear()
{
    run([&] { canvas_.clear(); });
}

void Sorvane::zoomIn()
{
    run([&] { canvas_.zoomIn(); });
}

void Sorvane::zoomOut()
{
    run([&] { canvas_.zoomOut(); });
}

void Sorvane::Minimum()
{
    run([&] { canvas_.Minimum(); });
}

void Sorvane::Maximum()
{
    run([&] { canvas_.Maximum(); });
}

void Sorvane::setMouse()
{
    run([&] { canvas_.setMouse(); });
}

void Sorvane::Pan()
{
    run([&] { canvas_.Pan(); });
}

void Sorvane::doPrint(
    const QVariant& bAllPrint, const QVariant& strPrintRange, const QVariant& nPrintPageNum)
{
    run([&] {
        const QString range = toPlainText(strPrintRange);
        canvas_.doPrint(toTruth(bAllPrint), viewOf(range), toInt16(nPrintPageNum));
    });
}

void Sorvane::doPreview(const QVariant& PrintObj)
{
    run([&] { preview(toGrid(PrintObj, *this)); });
}

void Sorvane::SetShowStyle(
    const QVariant& nPages, const QVariant& nStartPage, const QVariant& nEndPage)
{
    run([&] { canvas_.SetShowStyle(toInt16(nPages), toInt16(nStartPage), toInt16(nEndPage)); });
}

QVariant Sorvane::WindowMinPage() const { return QVariant::fromValue(canvas_.WindowMinPage()); }

QVariant Sorvane::WindowMaxPage() const { return QVariant::fromValue(canvas_.WindowMaxPage()); }

QVariant Sorvane::WindowPages() const { return QVariant::fromValue(canvas_.WindowPages()); }

QVariant Sorvane::WindowOrderStyle() const { return static_cast<int>(canvas_.WindowOrderStyle()); }

void Sorvane::OnDraw()
{
    run([&] { canvas_.OnDraw(); });
}

void Sorvane::SaveFile(const QVariant& FilePath)
{
    run([&] { canvas_.SaveFile(pathOf(toPlainText(FilePath))); });
}

void Sorvane::OpenFile(const QVariant& FilePath)
{
    run([&] { canvas_.OpenFile(pathOf(toPlainText(FilePath))); });
}

void Sorvane::ReDrawZoom(const QVariant& PrintObj)
{
    run([&] { redraw(toGrid(PrintObj, *this)); });
}

QVariant Sorvane::getPrintObj() const { return static_cast<int>(canvas_.m_PrintObj); }

QVariant Sorvane::getStrSCliectRect() const { return toQString(canvas_.strSCliectRect); }

QVariant Sorvane::getCurrentpage() { return QVariant::fromValue(Currentpage()); }

QVariant Sorvane::getVerticalDir()
{
    calls_.refuseRead("VerticalDir");
    return {};
}

QVariant Sorvane::getPageHeader() const { return toQString(canvas_.PageHeader); }

void Sorvane::putIntTop(const QVariant& value)
{
    run([&] { canvas_.page.intTop = toInt16(value); });
}

void Sorvane::putIntButtom(const QVariant& value)
{
    run([&] { canvas_.page.intButtom = toInt16(value); });
}

void Sorvane::putIntLeft(const QVariant& value)
{
    run([&] { canvas_.page.intLeft = toInt16(value); });
}

void Sorvane::putIntRight(const QVariant& value)
{
    run([&] { canvas_.page.intRight = toInt16(value); });
}

void Sorvane::putMyHeight(const QVariant& value)
{
    run([&] { canvas_.page.myHeight = toInt32(value); });
}

void Sorvane::putMyWidth(const QVariant& value)
{
    run([&] { canvas_.page.myWidth = toInt32(value); });
}

void Sorvane::putTotalpages(const QVariant& value)
{
    run([&] { canvas_.setTotalpages(toInt16(value)); });
}

void Sorvane::putBGetText(const QVariant& value)
{
    run([&] { canvas_.bGetText = toTruth(value); });
}

void Sorvane::putPrintObj(const QVariant& value)
{
    run([&] { canvas_.m_PrintObj = static_cast<CoreKind>(toInt16(value)); });
}

void Sorvane::putStrSCliectRect(const QVariant& value)
{
    run([&] { canvas_.strSCliectRect = toText(toPlainText(value)); });
}

void Sorvane::putCurrentpage(const QVariant& value)
{
    run([&] { canvas_.setCurrentpage(toInt16(value)); });
}

void Sorvane::putCurrentX(const QVariant& value)
{
    run([&] { canvas_.setCurrentX(toInt32(value)); });
}

void Sorvane::putCurrentY(const QVariant& value)
{
    run([&] { canvas_.setCurrentY(toInt32(value)); });
}

void Sorvane::putDispScale(const QVariant& value)
{
    run([&] { canvas_.setDispScale(toSingle(value)); });
}

void Sorvane::putVerticalDir(const QVariant& value)
{
    run([&] { canvas_.setVerticalDir(toTruth(value)); });
}

void Sorvane::putPageHeader(const QVariant& value)
{
    run([&] { canvas_.PageHeader = toText(toPlainText(value)); });
}

void Sorvane::putReSetLeftTop(const QVariant& value)
{
    run([&] { canvas_.setReSetLeftTop(toTruth(value)); });
}

QSize Sorvane::sizeHint() const { return { 640, 480 }; }

QSize Sorvane::minimumSizeHint() const { return { 120, 90 }; }

bool Sorvane::event(QEvent* event)
{
    if (event->type() == QEvent::NativeGesture
        && areas_->gesture(static_cast<QNativeGestureEvent&>(*event)))
        return true;
    return QWidget::event(event);
}

void Sorvane::resizeEvent(QResizeEvent*) { areas_->fill(FocusEdge); }

void Sorvane::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::StyleChange && areas_)
        areas_->fill(FocusEdge);
}

/// The edge around the areas, and the corner between the bars, are all that is seen of it.
void Sorvane::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.fillRect(rect(), palette().color(QPalette::Window));
    const auto role = hasFocus() ? QPalette::Highlight : QPalette::Mid;
    painter.setPen(palette().color(role));
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
    if (hasFocus())
        painter.drawRect(rect().adjusted(1, 1, -2, -2));
}

void Sorvane::wheelEvent(QWheelEvent* event) { areas_->wheel(*event); }

void Sorvane::keyPressEvent(QKeyEvent* event)
{
    if (!areas_->key(event->key()))
        QWidget::keyPressEvent(event);
}

void Sorvane::focusInEvent(QFocusEvent*) { update(); }

void Sorvane::focusOutEvent(QFocusEvent*) { update(); }

} // namespace pelloric::qt
