// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/sorvane.h>

#include "controls/qt/sorvane_world.h"
#include "platform/qt/uming.h"

#include <QApplication>
#include <QPaintEvent>
#include <QPainter>
#include <QPointer>
#include <QProgressBar>
#include <QScreen>
#include <QSignalSpy>
#include <QTest>
#include <QTimer>
#include <QWheelEvent>

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <string>

namespace pelloric::qt {

namespace {

/// Counts the paints of page surfaces.
class PaintCounter : public QObject {
public:
    PaintCounter() { qApp->installEventFilter(this); }

    bool eventFilter(QObject* object, QEvent* event) override
    {
        if (event->type() == QEvent::Paint && object->objectName().startsWith("paper("))
            ++count;
        return false;
    }

    int count = 0;
};

QImage grabbed(QWidget& widget, qreal devicePixelRatio = 1)
{
    QImage image(widget.size() * devicePixelRatio, QImage::Format_RGB32);
    image.setDevicePixelRatio(devicePixelRatio);
    image.fill(Qt::magenta);
    widget.render(&image);
    return image;
}

bool isDark(QRgb pixel) { return qGray(pixel) < 128; }

/// The dark pixels within a rectangle: device pixels.
int inkIn(const QImage& image, const QRect& area)
{
    int ink = 0;
    for (int y = area.top(); y <= area.bottom(); ++y) {
        for (int x = area.left(); x <= area.right(); ++x)
            ink += isDark(image.pixel(x, y)) ? 1 : 0;
    }
    return ink;
}

void turnWheel(QWidget& widget, QPointF at, int clicks, Qt::KeyboardModifiers modifiers = {})
{
    QWheelEvent event(at, widget.mapToGlobal(at), {}, { 0, clicks * 120 }, {}, modifiers,
        Qt::NoScrollPhase, false);
    QApplication::sendEvent(&widget, &event);
}

std::vector<QWidget*> shownPapers(const Sorvane& sorvane)
{
    std::vector<QWidget*> shown;
    for (QWidget* widget : sorvane.findChildren<QWidget*>()) {
        if (widget->objectName().startsWith("paper(") && widget->isVisible())
            shown.push_back(widget);
    }
    return shown;
}

} // namespace

TEST(Sorvane, HasItsAreasWithTheVisibilityOfTheStart)
{
    struct Row {
        const char* name;
        bool visible;
    };
    constexpr auto Rows
        = std::to_array<Row>({ { "Backscreen", true }, { "paper(0)", false }, { "Hbar", true },
            { "Vbar", true }, { "imgPan", false }, { "frmIcon", true }, { "PicHouse", false },
            { "PicIcon", false }, { "PicProgress", false }, { "ProgressBar1", false } });
    const SorvaneWorld world;
    for (const Row& row : Rows) {
        QWidget* const area = world.child(row.name);
        ASSERT_NE(area, nullptr) << row.name;
        EXPECT_EQ(area->isVisible(), row.visible) << row.name;
        EXPECT_FALSE(area->accessibleName().isEmpty()) << row.name;
    }
    EXPECT_EQ(world.child<QProgressBar>("ProgressBar1")->value(), 0);
    for (const char* name : { "Hbar", "Vbar" }) {
        const auto* const bar = world.child<QScrollBar>(name);
        EXPECT_EQ(bar->minimum(), 0);
        EXPECT_EQ(bar->value(), 0);
        EXPECT_FALSE(bar->isEnabled());
    }
    EXPECT_TRUE(world.paper(0)->hasMouseTracking());
}

TEST(Sorvane, FillsItselfWithItsAreasWheneverItIsResized)
{
    SorvaneWorld world;
    for (const QSize size : { QSize(1000, 300), QSize(200, 700), QSize(5, 3), QSize(640, 480) }) {
        world.sorvane.resize(size);
        QCoreApplication::processEvents();
        const QRect viewport = world.child("Backscreen")->geometry();
        EXPECT_EQ(world.child("Hbar")->width(), viewport.width());
        EXPECT_EQ(world.child("Vbar")->height(), viewport.height());
        EXPECT_EQ(world.child("frmIcon")->geometry(), viewport);
        EXPECT_EQ(world.canvas.view().viewportWidth, viewport.width() * 15);
        EXPECT_EQ(world.canvas.view().viewportHeight, viewport.height() * 15);
    }
}

TEST(Sorvane, PutsSurfacesWhereTheCanvasSaysInEveryMode)
{
    struct Row {
        const char* mode;
        std::function<void(Canvas&)> show;
    };
    const std::vector<Row> rows {
        { "one", [](Canvas& canvas) { canvas.showPage(); } },
        { "whole", [](Canvas& canvas) { canvas.showWholePage(); } },
        { "two", [](Canvas& canvas) { canvas.SetShowStyle(2, 0, 1), canvas.showMuliPage(2); } },
        { "four", [](Canvas& canvas) { canvas.SetShowStyle(4, 0, 3), canvas.showMuliPage(4); } },
        { "six", [](Canvas& canvas) { canvas.SetShowStyle(6, 0, 5), canvas.showMuliPage(6); } },
        { "all", [](Canvas& canvas) { canvas.setDispScale(0.2F), canvas.showAllPage(); } },
        { "half", [](Canvas& canvas) { canvas.zoomIn(); } },
        { "double", [](Canvas& canvas) { canvas.zoomOut(); } },
        { "centred", [](Canvas& canvas) { canvas.setReSetLeftTop(true), canvas.showWholePage(); } },
        { "landscape", [](Canvas& canvas) { canvas.setVerticalDir(false); } },
    };
    for (const Row& row : rows) {
        SorvaneWorld world;
        world.makePages(12);
        row.show(world.canvas);
        EXPECT_FALSE(world.child("frmIcon")->isVisible()) << row.mode;
        const auto shown = surfacesInView(world.canvas.view(), world.canvas.facts());
        EXPECT_EQ(shownPapers(world.sorvane).size(), shown.size()) << row.mode;
        for (const int index : shown) {
            ASSERT_NE(world.paper(index), nullptr) << row.mode << index;
            const QRect area = world.paper(index)->geometry();
            const QRectF expected = world.expectedArea(index);
            const double rounding = index == 0 ? 0.51 : 1.01; // its own and that of surface 0
            EXPECT_NEAR(area.left(), expected.left(), rounding) << row.mode << index;
            EXPECT_NEAR(area.top(), expected.top(), rounding) << row.mode << index;
            EXPECT_NEAR(area.width(), expected.width(), 1.01) << row.mode << index;
            EXPECT_NEAR(area.height(), expected.height(), 1.01) << row.mode << index;
        }
    }
}

TEST(Sorvane, PaintsInkWhereItIsRecordedOnWhitePagesBeforeGrey)
{
    ASSERT_TRUE(loadUming());
    for (const qreal ratio : { 1.0, 1.25, 1.5, 2.0, 3.0 }) {
        SorvaneWorld world;
        world.makePages(1);
        world.canvas.zoomIn();
        const LinePen black { .FillStyle = SolidFill, .FillColor = 0 };
        addLine(world.canvas.document(), { 3000, 3000 }, { 4500, 4500 }, black);
        addText(world.canvas.document(), { 6000, 3000 }, u"国国国",
            { { .name = Text(Uming), .size = 20 }, 0 });
        const QImage image = grabbed(world.sorvane, ratio);
        const auto device
            = [&](Tpoint at) { return (QPointF(world.onControl(0, at)) * ratio).toPoint(); };
        EXPECT_EQ(image.pixel(device({ 3750, 3750 })), qRgb(0, 0, 0)) << ratio;
        EXPECT_EQ(image.pixel(device({ 2900, 2900 })), qRgb(255, 255, 255)) << ratio;
        EXPECT_EQ(image.pixel(device({ 4700, 4700 })), qRgb(255, 255, 255)) << ratio;
        EXPECT_GT(inkIn(image, QRect(device({ 6000, 3000 }), device({ 7200, 3400 }))), 10 * ratio)
            << ratio;
        EXPECT_EQ(inkIn(image, QRect(device({ 7300, 3000 }), device({ 9000, 3400 }))), 0) << ratio;
        EXPECT_EQ(inkIn(image, QRect(device({ 6000, 2500 }), device({ 7200, 2980 }))), 0) << ratio;
        const QRgb beside = image.pixel((QPointF(700, 300) * ratio).toPoint());
        EXPECT_EQ(qRed(beside) == 255, false) << ratio;
        EXPECT_NEAR(qRed(beside), qBlue(beside), 16) << ratio;
    }
}

TEST(Sorvane, ShowsThePageCountTokenOnlyInAPageWindow)
{
    SorvaneWorld world;
    world.makePages(2);
    world.canvas.document().currentPage = 0;
    world.canvas.setDispScale(0.5F);
    // The digit is much shorter than the token, which reaches past here.
    const Tpoint from { 1500, 1000 };
    const Tpoint to { 2900, 1600 };
    addText(world.canvas.document(), { 1000, 1000 }, u"[Pages]", { { .size = 28 }, 0 });
    world.canvas.showPage();
    const auto ink = [&] {
        const QImage image = grabbed(world.sorvane);
        return inkIn(image, QRect(world.onControl(0, from), world.onControl(0, to)));
    };
    EXPECT_EQ(ink(), 0);
    world.canvas.SetShowStyle(2, 0, 1);
    world.canvas.showMuliPage(2);
    EXPECT_GT(ink(), 0);
}

TEST(Sorvane, PaintsNoPageWhileItIsSmall)
{
    SorvaneWorld world;
    world.canvas.strSCliectRect = u"small";
    world.makePages(1);
    addLine(world.canvas.document(), { 0, 0 }, { 9000, 9000 },
        { .FillStyle = SolidFill, .FillColor = 0 });
    const QImage image = grabbed(world.sorvane);
    EXPECT_EQ(image.pixel(world.onControl(0, { 3000, 3000 })), qRgb(255, 255, 255));
    EXPECT_EQ(world.canvas.WindowOrderStyle(), pelloric::OrderStyle::One);
}

TEST(Sorvane, NeverAsksForAPaintWhileItPaints)
{
    SorvaneWorld world;
    world.makePages(7);
    for (const int pages : { 1, 4 }) {
        world.canvas.SetShowStyle(static_cast<std::int16_t>(pages), 0, 3);
        if (pages > 1)
            world.canvas.showMuliPage(4);
        world.sorvane.grab();
        QTest::qWait(20);
        PaintCounter counter;
        world.sorvane.grab();
        const int ofGrab = counter.count;
        EXPECT_GT(ofGrab, 0);
        QTest::qWait(50);
        EXPECT_EQ(counter.count, ofGrab);
    }
}

TEST(Sorvane, PassesEveryPaintOfASinglePageThroughShowPage)
{
    SorvaneWorld world;
    world.makePages(1);
    world.canvas.zoomIn();
    world.canvas.zoomIn();
    world.canvas.showWholePage();
    world.canvas.zoomIn();
    world.canvas.zoomIn();
    world.canvas.setReSetLeftTop(true);
    EXPECT_EQ(world.canvas.WindowOrderStyle(), pelloric::OrderStyle::Whole);
    world.sorvane.grab();
    QTest::qWait(20);
    EXPECT_EQ(world.canvas.WindowOrderStyle(), pelloric::OrderStyle::One);
    EXPECT_FALSE(world.canvas.ReSetLeftTop());
    EXPECT_GT(world.canvas.view().offset.x, 100);
    EXPECT_NEAR(world.paper(0)->x(), world.expectedArea(0).left(), 0.51);
}

TEST(Sorvane, TellsTheHostOfTheRightButtonOnly)
{
    SorvaneWorld world;
    world.makePages(1);
    QSignalSpy clicks(&world.sorvane, &Sorvane::Click);
    QSignalSpy releases(&world.sorvane, &Sorvane::MouseUp);
    QWidget* const paper = world.paper(0);
    QTest::mousePress(paper, Qt::LeftButton, {}, { 50, 50 });
    QTest::mouseRelease(paper, Qt::LeftButton, {}, { 50, 50 });
    QTest::mouseClick(paper, Qt::MiddleButton, {}, { 50, 50 });
    EXPECT_EQ(clicks.count() + releases.count(), 0);
    QTest::mousePress(paper, Qt::RightButton, {}, { 50, 50 });
    ASSERT_EQ(clicks.count(), 1);
    EXPECT_EQ(releases.count(), 0);
    QTest::mouseRelease(paper, Qt::RightButton, {}, { 50, 50 });
    ASSERT_EQ(releases.count(), 1);
    EXPECT_EQ(clicks[0][0].value<short>(), 2);
    EXPECT_EQ(releases[0][0].value<short>(), 2);
    QTest::mouseClick(world.child("Backscreen"), Qt::RightButton, {}, { 785, 5 });
    EXPECT_EQ(clicks.count(), 1);
}

TEST(Sorvane, SurvivesAHostThatClearsItOnTheRightButton)
{
    SorvaneWorld world;
    world.makePages(4);
    world.canvas.SetShowStyle(4, 0, 3);
    world.canvas.showMuliPage(4);
    QObject::connect(&world.sorvane, &Sorvane::MouseUp, [&] { world.sorvane.clear(); });
    QTest::mouseClick(world.paper(1), Qt::RightButton, {}, { 5, 5 });
    EXPECT_EQ(world.paper(1), nullptr);
    EXPECT_EQ(world.canvas.Totalpages(), 1);
}

TEST(Sorvane, MovesThePagesOnceWhenADragEnds)
{
    SorvaneWorld world;
    world.makePages(1);
    for (const double scale : { 1.0, 0.5 }) {
        world.canvas.setDispScale(static_cast<float>(scale));
        world.canvas.setMouse();
        QWidget* const paper = world.paper(0);
        const QPoint start = paper->pos();
        const Tpoint before = world.canvas.view().offset;
        EXPECT_EQ(world.child("Backscreen")->cursor().shape(), Qt::ArrowCursor);
        QTest::mouseMove(paper, { 99, 99 });
        QTest::mouseMove(paper, { 100, 100 });
        EXPECT_TRUE(world.canvas.view().pan);
        EXPECT_EQ(world.child("Backscreen")->cursor().shape(), Qt::BitmapCursor);
        QTest::mousePress(paper, Qt::LeftButton, {}, { 100, 100 });
        QTest::mouseMove(paper, { 140, 120 });
        EXPECT_EQ(paper->pos(), start);
        QTest::mouseRelease(paper, Qt::LeftButton, {}, { 140, 120 });
        EXPECT_NEAR(paper->x(), start.x() + 40, 1);
        EXPECT_NEAR(paper->y(), start.y() + 20, 1);
        EXPECT_NEAR(world.canvas.view().offset.x, before.x + 600 / scale, 1);
        EXPECT_NEAR(world.canvas.view().offset.y, before.y + 300 / scale, 1);
    }
}

TEST(Sorvane, MovesThePagesByAHundredTwipsForAStepOfABar)
{
    SorvaneWorld world;
    world.makePages(1);
    world.canvas.zoomOut();
    auto* const across = world.child<QScrollBar>("Hbar");
    auto* const down = world.child<QScrollBar>("Vbar");
    ASSERT_TRUE(across->isEnabled());
    EXPECT_EQ(across->maximum(), world.canvas.view().Hbar.maximum);
    EXPECT_EQ(down->maximum(), world.canvas.view().Vbar.maximum);
    EXPECT_EQ(down->pageStep(), world.canvas.view().Vbar.largeChange);
    EXPECT_EQ(down->singleStep(), world.canvas.view().Vbar.smallChange);
    across->setValue(3);
    down->setValue(5);
    EXPECT_EQ(world.canvas.view().offset, (Tpoint { 100 - 300, 100 - 500 }));
    EXPECT_NEAR(world.paper(0)->y(), world.expectedArea(0).top(), 0.51);
}

TEST(Sorvane, ChangesItsBarsWithoutRunningTheirHandlers)
{
    SorvaneWorld world;
    world.makePages(1);
    world.canvas.zoomOut();
    auto* const down = world.child<QScrollBar>("Vbar");
    const int lowest = down->maximum();
    down->setValue(lowest);
    const Tpoint scrolled = world.canvas.view().offset;
    world.canvas.zoomIn();
    EXPECT_LT(down->value(), lowest);
    EXPECT_EQ(world.canvas.view().offset.y, scrolled.y);
    EXPECT_EQ(world.canvas.view().previousVbar, lowest);
}

TEST(Sorvane, ScrollsByTheWheelAndZoomsAboutThePointerWithControl)
{
    SorvaneWorld world;
    world.makePages(1);
    auto* const down = world.child<QScrollBar>("Vbar");
    auto* const across = world.child<QScrollBar>("Hbar");
    turnWheel(world.sorvane, { 300, 300 }, -1);
    EXPECT_GT(down->value(), 0);
    turnWheel(world.sorvane, { 300, 300 }, 20);
    EXPECT_EQ(down->value(), 0);
    world.canvas.zoomOut();
    turnWheel(world.sorvane, { 300, 300 }, -1, Qt::ShiftModifier);
    EXPECT_GT(across->value(), 0);

    const QPoint pointer(400, 300);
    const auto pageUnderPointer = [&] {
        const QPointF at = world.paper(0)->mapFrom(&world.sorvane, QPointF(pointer));
        return at * static_cast<double>(world.canvas.view().divisor);
    };
    const float divisor = world.canvas.DispScale();
    const QPointF before = pageUnderPointer();
    turnWheel(world.sorvane, pointer, 2, Qt::ControlModifier);
    EXPECT_NEAR(world.canvas.DispScale(), divisor / 1.25F / 1.25F, 1e-4F);
    EXPECT_NEAR(pageUnderPointer().x(), before.x(), 5);
    EXPECT_NEAR(pageUnderPointer().y(), before.y(), 5);
    EXPECT_EQ(down->value(), world.canvas.view().previousVbar);
    turnWheel(world.sorvane, pointer, -200, Qt::ControlModifier);
    EXPECT_GT(1 / world.canvas.DispScale(), 0.0009F);
}

TEST(Sorvane, ScrollsByKeys)
{
    SorvaneWorld world;
    world.makePages(1);
    world.canvas.zoomOut();
    auto* const down = world.child<QScrollBar>("Vbar");
    auto* const across = world.child<QScrollBar>("Hbar");
    const auto press = [&](Qt::Key key) { QTest::keyClick(&world.sorvane, key); };
    press(Qt::Key_Down);
    EXPECT_EQ(down->value(), down->singleStep());
    press(Qt::Key_Up);
    EXPECT_EQ(down->value(), 0);
    press(Qt::Key_PageDown);
    EXPECT_EQ(down->value(), down->pageStep());
    press(Qt::Key_PageUp);
    EXPECT_EQ(down->value(), 0);
    press(Qt::Key_End);
    EXPECT_EQ(down->value(), down->maximum());
    press(Qt::Key_Home);
    EXPECT_EQ(down->value(), 0);
    press(Qt::Key_Right);
    EXPECT_EQ(across->value(), across->singleStep());
    press(Qt::Key_Left);
    EXPECT_EQ(across->value(), 0);
    EXPECT_EQ(world.canvas.view().offset, (Tpoint { 100, 100 }));
}

TEST(Sorvane, ShowsThatItHasTheFocus)
{
    SorvaneWorld world;
    world.sorvane.clearFocus();
    const QRgb without = grabbed(world.sorvane).pixel(0, 100);
    world.sorvane.activateWindow();
    world.sorvane.setFocus();
    QTest::qWait(20);
    ASSERT_TRUE(world.sorvane.hasFocus());
    EXPECT_NE(grabbed(world.sorvane).pixel(0, 100), without);
}

TEST(Sorvane, HasSurfacesOnlyForPagesThatAreSeen)
{
    SorvaneWorld world;
    world.makePages(10'000);
    world.canvas.setDispScale(1.0F / 64);
    world.canvas.showAllPage();
    ASSERT_EQ(world.canvas.view().surfaces.size(), 10'000U);
    const auto shown = surfacesInView(world.canvas.view(), world.canvas.facts()).size();
    ASSERT_LT(shown, 4'000U);
    ASSERT_GT(shown, 64U);
    EXPECT_EQ(shownPapers(world.sorvane).size(), 64U);
    PaintCounter counter;
    world.sorvane.grab();
    EXPECT_GT(counter.count, 0);
    EXPECT_LE(counter.count, 64);
    auto* const down = world.child<QScrollBar>("Vbar");
    down->setValue(down->maximum());
    EXPECT_NE(world.paper(0), nullptr);
    EXPECT_LE(shownPapers(world.sorvane).size(), 64U);
}

TEST(Sorvane, StandsInForThePagesThatAreNoWidgets)
{
    SorvaneWorld world;
    world.makePages(3'000);
    PageDocument& document = world.canvas.document();
    const LinePen black { .FillStyle = SolidFill, .FillColor = 0 };
    constexpr int Far = 500; // beyond the first surfaces, and in view
    document.currentPage = Far;
    addLine(document, { 0, 0 }, { 11907, 8000 }, black);
    document.currentPage = 0;
    world.canvas.setDispScale(1.0F / 48);
    world.canvas.showAllPage();
    const auto seen = surfacesInView(world.canvas.view(), world.canvas.facts());
    ASSERT_TRUE(std::ranges::binary_search(seen, Far));
    ASSERT_EQ(world.paper(Far), nullptr);
    QWidget* const screen = world.child("Backscreen");
    const QRect area = world.expectedArea(Far).toRect();
    const QPoint upper(area.center().x(), area.top() + area.height() / 4);
    const QPoint lower(area.center().x(), area.bottom() - area.height() / 4);
    const QImage image = grabbed(world.sorvane);
    EXPECT_EQ(image.pixel(screen->mapTo(&world.sorvane, upper)), qRgb(0, 0, 0));
    EXPECT_EQ(image.pixel(screen->mapTo(&world.sorvane, lower)), qRgb(255, 255, 255));

    QSignalSpy clicks(&world.sorvane, &Sorvane::Click);
    QSignalSpy releases(&world.sorvane, &Sorvane::MouseUp);
    QTest::mouseClick(screen, Qt::RightButton, {}, upper);
    EXPECT_EQ(clicks.count(), 1);
    EXPECT_EQ(releases.count(), 1);
    QTest::mouseClick(screen, Qt::RightButton, {}, { screen->width() - 1, area.top() });
    EXPECT_EQ(clicks.count(), 1);
    EXPECT_EQ(releases.count(), 1);

    QTest::mouseMove(screen, upper);
    EXPECT_TRUE(world.canvas.view().pan);
    const Tpoint before = world.canvas.view().offset;
    QTest::mousePress(screen, Qt::LeftButton, {}, upper);
    QTest::mouseRelease(screen, Qt::LeftButton, {}, upper + QPoint(10, -20));
    const double pixel = 15.0 * static_cast<double>(world.canvas.view().divisor);
    EXPECT_NEAR(world.canvas.view().offset.x, before.x + 10 * pixel, 1);
    EXPECT_NEAR(world.canvas.view().offset.y, before.y - 20 * pixel, 1);
}

TEST(Sorvane, LooksScrolledAsItLooksPaintedAnew)
{
    SorvaneWorld world;
    world.makePages(3'000);
    PageDocument& document = world.canvas.document();
    const LinePen black { .FillStyle = SolidFill, .FillColor = 0 };
    for (std::int16_t page = 0; page < 3'000; ++page) {
        document.currentPage = page;
        addLine(document, { 0, 0 }, { page * 3, 16840 - page * 5 }, black);
        addText(document, { 1000, 9000 }, u"small", { { .size = 11 }, 0xFF0000 });
    }
    document.currentPage = 0;
    struct Row {
        float scale;
        void (Canvas::*show)();
    };
    for (const Row& row : { Row { 1.0F / 48, &Canvas::showAllPage }, { 2, &Canvas::showPage } }) {
        world.canvas.showPage();
        world.canvas.setDispScale(row.scale);
        (world.canvas.*row.show)();
        QTest::qWait(20);
        for (const int step : { 1, 7, 50, 3, 400, 20 }) {
            auto* const down = world.child<QScrollBar>("Vbar");
            auto* const across = world.child<QScrollBar>("Hbar");
            down->setValue(step);
            across->setValue(step / 2);
            QTest::qWait(20);
            const QImage moved = world.sorvane.screen()
                                     ->grabWindow(world.sorvane.winId())
                                     .toImage()
                                     .convertToFormat(QImage::Format_RGB32);
            world.canvas.OnDraw();
            QTest::qWait(20);
            const QImage anew = world.sorvane.screen()
                                    ->grabWindow(world.sorvane.winId())
                                    .toImage()
                                    .convertToFormat(QImage::Format_RGB32);
            ASSERT_FALSE(moved.isNull());
            EXPECT_EQ(moved, anew) << row.scale << ' ' << step;
        }
    }
}

TEST(Sorvane, PaintsOnlyWhatComesIntoSightWhenItScrolls)
{
    class Watch : public QObject {
    public:
        bool eventFilter(QObject*, QEvent* event) override
        {
            if (event->type() == QEvent::Paint)
                painted = static_cast<QPaintEvent*>(event)->region().boundingRect();
            return false;
        }
        QRect painted;
    } watch;
    SorvaneWorld world;
    world.makePages(3'000);
    world.canvas.setDispScale(1.0F / 48);
    world.canvas.showAllPage();
    QTest::qWait(20);
    QWidget* const screen = world.child("Backscreen");
    screen->installEventFilter(&watch);
    world.child<QScrollBar>("Vbar")->setValue(72); // ten pixels
    QTest::qWait(20);
    EXPECT_EQ(watch.painted.height(), 10);
    EXPECT_EQ(watch.painted.bottom(), screen->rect().bottom());
}

TEST(Sorvane, ShowsAllPagesThoughTheirScrollRangeOverflows)
{
    SorvaneWorld world;
    world.makePages(10'000);
    world.sorvane.showAllPage();
    ASSERT_EQ(world.platform.messages.take().size(), 1U);
    EXPECT_EQ(world.canvas.view().surfaces.size(), 10'000U);
    EXPECT_LT(shownPapers(world.sorvane).size(), 4U);
    EXPECT_LE(world.sorvane.findChildren<QWidget*>().size(), 12);
}

TEST(Sorvane, StandsAnyScale)
{
    SorvaneWorld world;
    world.makePages(1);
    addText(world.canvas.document(), { 1000, 1000 }, u"text", { { .size = 11 }, 0 });
    addLine(world.canvas.document(), { 0, 0 }, { 9000, 9000 }, {});
    for (const bool out : { true, false }) {
        for (int step = 0; step < 200; ++step) {
            out ? world.sorvane.zoomOut() : world.sorvane.zoomIn();
            if (step % 20 == 0)
                world.sorvane.grab();
        }
        world.platform.messages.take();
    }
    world.sorvane.setDispScale(-1);
    world.sorvane.grab();
    world.sorvane.setDispScale(1);
    EXPECT_EQ(world.paper(0)->width(), 794); // 11907 twips are 793.8 pixels
    world.platform.messages.take();
}

TEST(Sorvane, ShowsTheProgressOfABuildOnly)
{
    SorvaneWorld world;
    TableGrid grid({ { u"Name", 2000 }, { u"Number", 2000 } });
    for (int row = 0; row < 2000; ++row)
        grid.addRow(std::array<TextView, 2> { u"name", u"1" });
    int paints = 0;
    QWidget* const area = world.child("PicProgress");
    class Watch : public QObject {
    public:
        explicit Watch(int& seen)
            : seen_(seen)
        {
        }
        bool eventFilter(QObject*, QEvent* event) override
        {
            seen_ += event->type() == QEvent::Show ? 1 : 0;
            return false;
        }

    private:
        int& seen_;
    } watch(paints);
    area->installEventFilter(&watch);
    world.sorvane.doPreview(static_cast<AutomationObject&>(grid));
    EXPECT_EQ(paints, 1);
    EXPECT_FALSE(area->isVisible());
    EXPECT_TRUE(world.paper(0)->isVisible());
    EXPECT_FALSE(world.child("frmIcon")->isVisible());
    EXPECT_GT(world.canvas.Totalpages(), 10);
}

TEST(Sorvane, MayBeDeletedWhileItBuilds)
{
    QuietPlatform platform;
    TableGrid grid({ { u"Name", 2000 } });
    grid.addRow(std::array<TextView, 1> { u"name" });
    for (const bool isShownAll : { false, true }) {
        QPointer<Sorvane> sorvane(new Sorvane(platform));
        sorvane->show();
        QCoreApplication::processEvents();
        QTimer::singleShot(0, [&] { delete sorvane.data(); });
        if (isShownAll)
            sorvane->showAllPage();
        else
            sorvane->doPreview(static_cast<AutomationObject&>(grid));
        EXPECT_TRUE(sorvane.isNull());
    }
    EXPECT_TRUE(platform.messages.take().empty());
}

TEST(Sorvane, TellsOfAFailedBuildOnceAndShowsWhatItShowed)
{
    SorvaneWorld world;
    world.makePages(2);
    QObject noGrid;
    world.sorvane.doPreview(&noGrid);
    const auto shown = world.platform.messages.take();
    ASSERT_EQ(shown.size(), 1U);
    EXPECT_EQ(shown[0].title, u"提示");
    EXPECT_EQ(shown[0].icon, MessageIcon::Critical);
    EXPECT_TRUE(world.paper(0)->isVisible());
    EXPECT_FALSE(world.child("PicProgress")->isVisible());
    EXPECT_EQ(world.canvas.Totalpages(), 2);
}

} // namespace pelloric::qt
