// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/reading_input.h"

#include "controls/canvas.h"
#include "ui/qt/preview_world.h"

#include <pelloric/sorvane.h>

#include <QImage>
#include <QScrollBar>
#include <QWheelEvent>

#include <functional>
#include <iostream>

namespace pelloric::qt {

namespace {

constexpr int TileSize = 250; ///< of a page's coloured tiles: twips
constexpr QRgb FirstColor = 0x400000; ///< of the first tile; no other pixel has such a one
constexpr int Pages = 7;
constexpr int MostSteps = 3000; ///< that reading a document may take

/// A paper, in twips.
struct Paper {
    const char* name;
    Twips width;
    Twips height;
};

constexpr Paper A4 { "A4", 11907, 16840 };
constexpr Paper A4Across { "A4 across", 16840, 11907 };
constexpr Paper A3 { "A3", 16840, 23814 };
constexpr Paper Card { "100x150mm", 5669, 8504 };
constexpr Paper Strip { "80x600mm", 4535, 34016 };

/// How the pages are shown.
struct Mode {
    const char* name;
    std::function<void(PreviewSession&, Canvas&)> show;
};

/// A way to read: moves on by one press, and what stands for the other direction.
struct Road {
    const char* name;
    std::function<void(PreviewWindow&)> step;
    bool isBack = false;
};

void roll(PreviewWindow& window, int angle)
{
    const QPointF at(200, 200);
    QWheelEvent event(at, window.canvas().mapToGlobal(at), {}, { 0, angle }, Qt::NoButton,
        Qt::NoModifier, Qt::NoScrollPhase, false);
    QApplication::sendEvent(&window.canvas(), &event);
}

/// The bars alone, by clicks beside their handles, and the tool that turns pages.
void stepByBars(PreviewWindow& window)
{
    auto* const down = window.canvas().findChild<QScrollBar*>("Vbar");
    auto* const across = window.canvas().findChild<QScrollBar*>("Hbar");
    if (down->value() < down->maximum()) {
        down->triggerAction(QAbstractSlider::SliderPageStepAdd);
    } else if (across->value() < across->maximum()) {
        down->triggerAction(QAbstractSlider::SliderToMinimum);
        across->triggerAction(QAbstractSlider::SliderPageStepAdd);
    } else if (!window.canvas().canvas().view().multiPage
        || window.canvas().canvas().WindowPages() > 0) {
        QTest::keyClick(&window.canvas(), Qt::Key_PageDown, Qt::ControlModifier);
    }
}

void press(PreviewWindow& window, Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
{
    QTest::keyClick(&window.canvas(), key, modifiers);
}

/// Which tiles of a document are seen while it is read.
class Tiles {
public:
    Tiles(Canvas& canvas, const Paper& paper)
        : columns_((paper.width + TileSize - 1) / TileSize)
        , rows_((paper.height + TileSize - 1) / TileSize)
        , seenAt_(static_cast<std::size_t>(Pages * columns_ * rows_), -1)
    {
        canvas.clear();
        canvas.page.myWidth = paper.width;
        canvas.page.myHeight = paper.height;
        for (int page = 0; page < Pages; ++page) {
            if (page > 0)
                canvas.newPage();
            for (int row = 0; row < rows_; ++row) {
                for (int column = 0; column < columns_; ++column)
                    draw(canvas.document(), paper, page, row, column);
            }
        }
        canvas.setCurrentpage(1);
        canvas.showPage();
        canvas.OnDraw();
    }

    /// Notes what a picture of the viewport shows. @return whether anything of a page
    bool look(const QImage& picture, int step)
    {
        bool isPage = false;
        QRgb before = 0;
        for (int y = 0; y < picture.height(); ++y) {
            const auto* const line = reinterpret_cast<const QRgb*>(picture.constScanLine(y));
            for (int x = 0; x < picture.width(); ++x) {
                if (line[x] == before)
                    continue;
                before = line[x];
                const QRgb tile = (before & 0xFFFFFF) - FirstColor;
                if (tile >= seenAt_.size())
                    continue;
                isPage = true;
                if (seenAt_[tile] < 0)
                    seenAt_[tile] = step;
            }
        }
        return isPage;
    }

    /// The tiles never seen, but for the strips at the ends of a page that may stay hidden.
    int unseen(const Paper& paper, Twips hiddenRight, Twips hiddenBelow) const
    {
        int count = 0;
        each([&](int page, int row, int column) {
            const bool isHidden = column * TileSize >= paper.width - hiddenRight
                || row * TileSize >= paper.height - hiddenBelow;
            count += !isHidden && at(page, row, column) < 0 ? 1 : 0;
        });
        return count;
    }

    /// The tiles that were seen before one that stands above or to the left on the same page, or
    /// before any of an earlier group of pages.
    int outOfOrder(int group, bool isBack) const
    {
        int count = 0;
        const int sign = isBack ? -1 : 1;
        each([&](int page, int row, int column) {
            const int here = at(page, row, column);
            const int above = row > 0 ? at(page, row - 1, column) : -1;
            const int left = column > 0 ? at(page, row, column - 1) : -1;
            const int earlier = page >= group ? at(page - group, row, column) : -1;
            for (const int other : { above, left, earlier })
                count += here >= 0 && other >= 0 && sign * here < sign * other ? 1 : 0;
        });
        return count;
    }

private:
    static Twips edge(int tile, Twips paper) { return std::min(tile * TileSize, paper); }

    int indexOf(int page, int row, int column) const
    {
        return (page * rows_ + row) * columns_ + column;
    }

    int at(int page, int row, int column) const
    {
        return seenAt_[static_cast<std::size_t>(indexOf(page, row, column))];
    }

    void draw(PageDocument& document, const Paper& paper, int page, int row, int column) const
    {
        const QRgb rgb = FirstColor + static_cast<QRgb>(indexOf(page, row, column));
        const QRgb color = (rgb & 0xFF) << 16 | (rgb & 0xFF00) | (rgb >> 16 & 0xFF);
        const LinePen pen { .FillStyle = 0, .FillColor = static_cast<Color>(color) };
        document.append(LineRecord { { edge(column, paper.width), edge(row, paper.height) },
            { edge(column + 1, paper.width), edge(row + 1, paper.height) },
            document.penNumber(pen) });
    }

    template <typename Visit> void each(Visit visit) const
    {
        for (int page = 0; page < Pages; ++page) {
            for (int row = 0; row < rows_; ++row) {
                for (int column = 0; column < columns_; ++column)
                    visit(page, row, column);
            }
        }
    }

    int columns_;
    int rows_;
    std::vector<int> seenAt_; ///< the step that showed a tile first; -1: none has yet
};

/// What is in the viewport, to tell whether a step has changed anything.
struct Place {
    Tpoint offset;
    std::int16_t page = 0;
    MuliPageType window;

    bool operator==(const Place&) const = default;
};

Place placeOf(const Canvas& canvas)
{
    return { canvas.view().offset, canvas.Currentpage(), canvas.view().window };
}

class Reading : public PreviewWorld {
protected:
    /// Reads a document of tiles from its first page to its last, or back, and tells of it.
    void readWhole(QSize size, const Paper& paper, const Mode& mode, const Road& road)
    {
        PreviewWindow& window = show();
        window.resize(size);
        Tiles tiles(canvas(), paper);
        auto& session = const_cast<PreviewSession&>(window.session());
        mode.show(session, canvas());
        window.canvas().setFocus();
        QWidget* const pages = window.canvas().findChild<QWidget*>("Backscreen");
        pages->grab(); // a first paint may change the mode
        if (road.isBack) {
            press(window, Qt::Key_End, Qt::ControlModifier);
            barsToEnd(canvas());
        }
        int steps = 0;
        int blanks = 0;
        for (; steps < MostSteps; ++steps) {
            blanks += tiles.look(pages->grab().toImage(), steps) ? 0 : 1;
            const Place before = placeOf(canvas());
            road.step(window);
            if (placeOf(canvas()) == before)
                break;
        }
        const bool isFree = !canvas().view().Vbar.enabled;
        const PageGrid grid = canvas().view().grid;
        const Twips hiddenBelow = isFree ? 100 + 200 * (grid.rows - 1) : 0;
        const Twips hiddenRight
            = !canvas().view().Hbar.enabled ? 100 + 200 * (grid.columns - 1) : 0;
        const int unseen = tiles.unseen(paper, hiddenRight, hiddenBelow);
        const int group = std::max<int>(1, canvas().WindowPages());
        const int disorder = tiles.outOfOrder(group, road.isBack);
        std::cout << "| " << size.width() << "x" << size.height() << " | " << paper.name << " | "
                  << mode.name << " | " << road.name << " | " << steps << " | " << unseen << " | "
                  << disorder << " |\n";
        EXPECT_LT(steps, MostSteps);
        EXPECT_EQ(unseen, 0);
        EXPECT_EQ(disorder, 0);
        if (canvas().WindowPages() == 0) { // the last window may have surfaces without a page
            EXPECT_EQ(blanks, 0);
        }
        EXPECT_GT(steps, 0);
        if (!road.isBack && !canvas().view().multiPage) {
            EXPECT_EQ(canvas().Currentpage(), Pages);
        }
    }

    void readAll(std::initializer_list<QSize> sizes, std::initializer_list<Paper> papers,
        std::initializer_list<Mode> modes, std::initializer_list<Road> roads)
    {
        std::cout << "| window | paper | mode | road | steps | unseen | out of order |\n";
        for (const QSize size : sizes) {
            for (const Paper& paper : papers) {
                for (const Mode& mode : modes) {
                    for (const Road& road : roads)
                        readWhole(size, paper, mode, road);
                }
            }
        }
    }
};

Mode scaleMode(const char* name, TextView scale)
{
    return { name, [scale](PreviewSession& session, Canvas&) {
                session.click(10);
                session.chooseScale(scale);
            } };
}

Mode toolMode(const char* name, int tool)
{
    return { name, [tool](PreviewSession& session, Canvas&) { session.click(tool); } };
}

const Mode Full = scaleMode("100 %", u"100");
const Mode Half = scaleMode("50 %", u"50");
const Mode Large = scaleMode("300 %", u"300");
const Mode Whole = toolMode("whole page", 15);
const Mode Two = toolMode("two pages", 16);
const Mode Four = toolMode("four pages", 18);
const Mode All = toolMode("all pages", 9);
const Mode Width { "page width", [](PreviewSession& session, Canvas&) { session.fitPageWidth(); } };
const Mode Fit { "page in view", [](PreviewSession& session, Canvas&) { session.fitPage(); } };
const Mode Six { "six pages", [](PreviewSession& session, Canvas& canvas) {
                    canvas.SetShowStyle(6, 0, 5);
                    canvas.showMuliPage(6);
                    session.askForCentring(); // a paint meanwhile has centred a page alone
                    canvas.OnDraw();
                } };

const Road Down { "Page Down", [](PreviewWindow& window) { press(window, Qt::Key_PageDown); } };
const Road Space { "Space", [](PreviewWindow& window) { press(window, Qt::Key_Space); } };
const Road Wheel { "wheel", [](PreviewWindow& window) { roll(window, -120); } };
const Road Bars { "bars", stepByBars };
const Road Up { "Page Up", [](PreviewWindow& window) { press(window, Qt::Key_PageUp); }, true };
const Road SpaceUp { "Shift+Space",
    [](PreviewWindow& window) { press(window, Qt::Key_Space, Qt::ShiftModifier); }, true };
const Road WheelUp { "wheel up", [](PreviewWindow& window) { roll(window, 120); }, true };

TEST_F(Reading, ShowsEveryTileOfUprightPagesInOrder)
{
    readAll(
        { { 800, 500 }, { 1180, 860 } }, { A4 }, { Full, Half, Whole, Width, Fit }, { Down, Up });
}

TEST_F(Reading, ShowsEveryTileOfPagesOnTheirSideInOrder)
{
    readAll(
        { { 800, 500 }, { 1180, 860 } }, { A4Across }, { Full, Whole, Width, Fit }, { Down, Up });
}

TEST_F(Reading, ShowsEveryTileOfSmallPagesInOrder)
{
    readAll({ { 800, 500 }, { 1024, 600 } }, { Card }, { Full, Whole, Width, Fit }, { Down, Up });
}

TEST_F(Reading, ShowsEveryTileOfPagesThatAreWiderThanTheWindow)
{
    readAll({ { 800, 500 } }, { A3 }, { Full }, { Down, Up, Wheel, WheelUp });
    readAll({ { 800, 500 } }, { Strip }, { Large }, { Down, WheelUp });
}

TEST_F(Reading, ShowsEveryTileOfWindowsOfUprightPagesInOrder)
{
    readAll({ { 800, 500 }, { 1024, 600 } }, { A4 }, { Two, Four, Six, All }, { Down, Up, Wheel });
}

TEST_F(Reading, ShowsEveryTileOfWindowsOfPagesOnTheirSideInOrder)
{
    readAll({ { 1024, 600 } }, { A4Across }, { Two, Four, Six, All }, { Down, Up });
}

TEST_F(Reading, ShowsEveryTileByEveryRoad)
{
    readAll(
        { { 1024, 600 } }, { A4 }, { Full, Whole, Two }, { Space, SpaceUp, Wheel, WheelUp, Bars });
}

TEST_F(Reading, ShowsEveryTileOnLargeScreens)
{
    readAll({ { 1920, 1080 } }, { A4 }, { Full, Whole, Two, Fit }, { Down, Up });
    readAll({ { 3840, 2160 } }, { A4 }, { Full, Whole, Fit }, { Down });
}

/// The pages were dragged by hand before they are read.
TEST_F(Reading, ShowsEveryTileAfterADrag)
{
    const Mode dragged { "dragged", [](PreviewSession& session, Canvas& canvas) {
                            session.click(10);
                            canvas.Pan();
                            canvas.mouseDown(0, 0);
                            canvas.mouseUp(0, 2500);
                        } };
    readAll({ { 800, 500 } }, { A4 }, { dragged }, { Wheel });
    const Mode scrolled { "dragged, then to the top", [&](PreviewSession& session, Canvas& canvas) {
                             dragged.show(session, canvas);
                             session.read(ReadingWay::On);
                             session.read(ReadingWay::Back);
                             session.read(ReadingWay::Back);
                         } };
    readAll({ { 800, 500 } }, { A4 }, { scrolled }, { Down });
}

} // namespace

} // namespace pelloric::qt
