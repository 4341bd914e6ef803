// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/sorvane.h>

#include "controls/canvas.h"
#include "controls/qt/canvas_areas.h"
#include "controls/qt/default_platform.h"
#include "controls/qt/member_calls.h"
#include "controls/qt/page_accessible.h"
#include "controls/qt/plain_calls.h"
#include "controls/qt/published_values.h"
#include "grids/qt/grid_for.h"
#include "platform/phrase.h"
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
        throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"no grid was given"));
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

struct Sorvane::Parts {
    /// What works without the window.
    struct Core {
        explicit Core(QtPlatform& services)
            : platform(services.record())
            , canvas(platform)
        {
        }

        Platform platform;
        Canvas canvas;
        std::unique_ptr<AutomationObject> grid {}; ///< of the last build, alive while it runs
    };

    Parts(Sorvane& control, QtPlatform& services)
        : core(std::make_shared<Core>(services))
        , calls(control, core, core->platform, [this] { areas.viewChanged(); })
        , areas(control, core->canvas, services.fonts(),
              { [&control] { emit control.Click(RightButtonNumber); },
                  [&control] { emit control.MouseUp(RightButtonNumber); } })
    {
    }

    std::shared_ptr<Core> core; ///< shared with the members that run
    MemberCalls calls;
    CanvasAreas areas;
};

Sorvane::Sorvane(QWidget* parent)
    : Sorvane(defaultPlatform(), parent)
{
}

Sorvane::Sorvane(QtPlatform& platform, QWidget* parent)
    : SorvaneCalls(madeReadable(parent))
    , parts_(std::make_unique<Parts>(*this, platform))
{
    registerRecords();
    canvas().documentName = toText(QGuiApplication::applicationDisplayName());
    setObjectName(QStringLiteral("Sorvane"));
    setAccessibleName(tr("Page preview"));
    setFocusPolicy(Qt::StrongFocus);
    parts_->areas.fill(FocusEdge);
}

Sorvane::~Sorvane() = default;

Canvas& Sorvane::canvas() { return parts_->core->canvas; }

const Canvas& Sorvane::canvas() const { return parts_->core->canvas; }

void Sorvane::setPageGuest(PageGuest* guest) { parts_->areas.setGuest(guest); }

void Sorvane::repaintPages() { parts_->areas.repaintPages(); }

QString Sorvane::shownText() const { return parts_->areas.shownText(); }

void Sorvane::run(const std::function<void()>& member) { parts_->calls.run(member); }

std::int16_t Sorvane::Currentpage()
{
    std::int16_t page = 0;
    run([&] { page = canvas().Currentpage(); });
    return page;
}

void Sorvane::setCurrentpage(std::int16_t page)
{
    run([&] { canvas().setCurrentpage(page); });
}

void Sorvane::setDispScale(float scale)
{
    run([&] { canvas().setDispScale(scale); });
}

void Sorvane::setVerticalDir(bool portrait)
{
    run([&] { canvas().setVerticalDir(portrait); });
}

void Sorvane::showMuliPage(std::int16_t nPages)
{
    run([&] { canvas().showMuliPage(nPages); });
}

void Sorvane::SetShowStyle(std::int16_t nPages, std::int16_t nStartPage, std::int16_t nEndPage)
{
    run([&] { canvas().SetShowStyle(nPages, nStartPage, nEndPage); });
}

void Sorvane::doPrint(bool bAllPrint, const QString& strPrintRange, std::int16_t nPrintPageNum)
{
    run([&] { canvas().doPrint(bAllPrint, viewOf(strPrintRange), nPrintPageNum); });
}

void Sorvane::SaveFile(const QString& FilePath)
{
    run([&] { canvas().SaveFile(pathOf(FilePath)); });
}

void Sorvane::OpenFile(const QString& FilePath)
{
    run([&] { canvas().OpenFile(pathOf(FilePath)); });
}

void Sorvane::doPreview(AutomationObject& PrintObj)
{
    run([&] { canvas().doPreview(PrintObj); });
}

void Sorvane::doPreview(QObject* PrintObj)
{
    run([&] { preview(gridFor(objectOf(PrintObj))); });
}

void Sorvane::ReDrawZoom(AutomationObject& PrintObj)
{
    run([&] { canvas().ReDrawZoom(PrintObj); });
}

void Sorvane::ReDrawZoom(QObject* PrintObj)
{
    run([&] { redraw(gridFor(objectOf(PrintObj))); });
}

/// A build that is asked for while another runs is refused, and must not touch the other's grid.
void Sorvane::preview(std::unique_ptr<AutomationObject> grid)
{
    if (canvas().isBusy())
        return;
    parts_->core->grid = std::move(grid);
    canvas().doPreview(*parts_->core->grid);
}

void Sorvane::redraw(std::unique_ptr<AutomationObject> grid)
{
    if (canvas().isBusy())
        return;
    parts_->core->grid = std::move(grid);
    canvas().ReDrawZoom(*parts_->core->grid);
}

void Sorvane::showWholePage()
{
    run([&] { canvas().showWholePage(); });
}

void Sorvane::showPage()
{
    run([&] { canvas().showPage(); });
}

void Sorvane::showAllPage()
{
    run([&] { canvas().showAllPage(); });
}

void Sorvane::clear()
{
    run([&] { canvas().clear(); });
}

void Sorvane::zoomIn()
{
    run([&] { canvas().zoomIn(); });
}

void Sorvane::zoomOut()
{
    run([&] { canvas().zoomOut(); });
}

void Sorvane::Minimum()
{
    run([&] { canvas().Minimum(); });
}

void Sorvane::Maximum()
{
    run([&] { canvas().Maximum(); });
}

void Sorvane::setMouse()
{
    run([&] { canvas().setMouse(); });
}

void Sorvane::Pan()
{
    run([&] { canvas().Pan(); });
}

std::int16_t Sorvane::WindowMinPage() const { return canvas().WindowMinPage(); }

std::int16_t Sorvane::WindowMaxPage() const { return canvas().WindowMaxPage(); }

std::int16_t Sorvane::WindowPages() const { return canvas().WindowPages(); }

Sorvane::OrderStyle Sorvane::WindowOrderStyle() const
{
    return static_cast<OrderStyle>(canvas().WindowOrderStyle());
}

void Sorvane::OnDraw()
{
    run([&] { canvas().OnDraw(); });
}

QVariant Sorvane::getVerticalDir()
{
    parts_->calls.refuseRead("VerticalDir");
    return {};
}

std::int16_t Sorvane::intTop() const { return canvas().page.intTop; }

void Sorvane::setintTop(std::int16_t twips) { canvas().page.intTop = twips; }

std::int16_t Sorvane::intButtom() const { return canvas().page.intButtom; }

void Sorvane::setintButtom(std::int16_t twips) { canvas().page.intButtom = twips; }

std::int16_t Sorvane::intLeft() const { return canvas().page.intLeft; }

void Sorvane::setintLeft(std::int16_t twips) { canvas().page.intLeft = twips; }

std::int16_t Sorvane::intRight() const { return canvas().page.intRight; }

void Sorvane::setintRight(std::int16_t twips) { canvas().page.intRight = twips; }

std::int32_t Sorvane::myHeight() const { return canvas().page.myHeight; }

void Sorvane::setmyHeight(std::int32_t twips) { canvas().page.myHeight = twips; }

std::int32_t Sorvane::myWidth() const { return canvas().page.myWidth; }

void Sorvane::setmyWidth(std::int32_t twips) { canvas().page.myWidth = twips; }

std::int16_t Sorvane::Totalpages() const { return canvas().Totalpages(); }

void Sorvane::setTotalpages(std::int16_t pages)
{
    run([&] { canvas().setTotalpages(pages); });
}

bool Sorvane::bGetText() const { return canvas().bGetText; }

void Sorvane::setbGetText(bool getText) { canvas().bGetText = getText; }

Sorvane::PrintObjKind Sorvane::m_PrintObj() const
{
    return static_cast<PrintObjKind>(canvas().m_PrintObj);
}

void Sorvane::setm_PrintObj(PrintObjKind kind)
{
    canvas().m_PrintObj = static_cast<CoreKind>(kind);
}

QString Sorvane::strSCliectRect() const { return toQString(canvas().strSCliectRect); }

void Sorvane::setstrSCliectRect(const QString& size) { canvas().strSCliectRect = toText(size); }

std::int32_t Sorvane::CurrentX() const { return canvas().CurrentX(); }

void Sorvane::setCurrentX(std::int32_t x) { canvas().setCurrentX(x); }

std::int32_t Sorvane::CurrentY() const { return canvas().CurrentY(); }

void Sorvane::setCurrentY(std::int32_t y) { canvas().setCurrentY(y); }

float Sorvane::DispScale() const { return canvas().DispScale(); }

QString Sorvane::PageHeader() const { return toQString(canvas().PageHeader); }

void Sorvane::setPageHeader(const QString& text) { canvas().PageHeader = toText(text); }

bool Sorvane::ReSetLeftTop() const { return canvas().ReSetLeftTop(); }

void Sorvane::setReSetLeftTop(bool centre) { canvas().setReSetLeftTop(centre); }

void Sorvane::useSettings(std::optional<ReportSettings> settings)
{
    canvas().useSettings(std::move(settings));
}

void Sorvane::setReportOptions(const ReportOptions& options) { canvas().options = options; }

const ReportOptions& Sorvane::reportOptions() const { return canvas().options; }

FitResult Sorvane::fitResult() const { return canvas().fit(); }

std::vector<LeftOut> Sorvane::leftOutOfTotals() const { return canvas().leftOut(); }

QSize Sorvane::sizeHint() const { return { 640, 480 }; }

QSize Sorvane::minimumSizeHint() const { return { 120, 90 }; }

bool Sorvane::event(QEvent* event)
{
    if (event->type() == QEvent::NativeGesture
        && parts_->areas.scrolling().gesture(static_cast<QNativeGestureEvent&>(*event)))
        return true;
    return QWidget::event(event);
}

void Sorvane::resizeEvent(QResizeEvent*) { parts_->areas.fill(FocusEdge); }

void Sorvane::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::StyleChange && parts_)
        parts_->areas.fill(FocusEdge);
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

void Sorvane::wheelEvent(QWheelEvent* event) { parts_->areas.scrolling().wheel(*event); }

void Sorvane::keyPressEvent(QKeyEvent* event)
{
    if (!parts_->areas.scrolling().key(event->key()))
        QWidget::keyPressEvent(event);
}

void Sorvane::focusInEvent(QFocusEvent*) { update(); }

void Sorvane::focusOutEvent(QFocusEvent*) { update(); }

} // namespace pelloric::qt
