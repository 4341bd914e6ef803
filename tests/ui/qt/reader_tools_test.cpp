// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/reader_tools.h"

#include "platform/platform.h"
#include "platform/qt/qt_text.h"
#include "ui/qt/page_strip.h"
#include "ui/qt/preview_toolbar.h"
#include "ui/qt/preview_world.h"
#include "ui/tool_table.h"
#include "view/page_texts.h"

#include <QAccessible>
#include <QAction>
#include <QClipboard>
#include <QComboBox>
#include <QDialog>
#include <QLabel>
#include <QMenu>
#include <QNativeGestureEvent>
#include <QPointingDevice>
#include <QScrollBar>
#include <QTreeWidget>

namespace pelloric::qt {

namespace {

class ReaderToolsTest : public PreviewWorld {
protected:
    void press(int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QTest::keyClick(&opener_.window()->canvas(), static_cast<Qt::Key>(key), modifiers);
    }

    QLineEdit* findText() { return opener_.window()->findChild<QLineEdit*>("txtFind"); }

    QString found() { return opener_.window()->findChild<QLabel*>("FindCount")->text(); }

    /// Opens the bar, types, and waits for the search to end.
    void find(const QString& text, const QString& count)
    {
        press(Qt::Key_F, Qt::ControlModifier);
        QTest::keyClicks(findText(), text);
        EXPECT_TRUE(QTest::qWaitFor([&] { return found() == count; }, 5000))
            << found().toStdString();
    }

    QWidget* backScreen() { return opener_.window()->canvas().findChild<QWidget*>("Backscreen"); }

    QWidget* paper() { return opener_.window()->canvas().findChild<QWidget*>("paper(0)"); }

    /// Where a page's point lies on its surface, at the scale in force: pixels.
    QPoint pixels(double x, double y)
    {
        const double scale = 1 / (15 * static_cast<double>(canvas().DispScale()));
        return { static_cast<int>(x * scale), static_cast<int>(y * scale) };
    }

    /// How many pixels of the viewport are nearly of a colour.
    int pixelsOf(QColor color)
    {
        const QImage picture = backScreen()->grab().toImage();
        int count = 0;
        for (int y = 0; y < picture.height(); ++y) {
            for (int x = 0; x < picture.width(); ++x)
                count += picture.pixelColor(x, y) == color ? 1 : 0;
        }
        return count;
    }
};

constexpr QColor Match(0xFF, 0xE0, 0x66);
constexpr QColor Current(0xFF, 0x9A, 0x1F);
constexpr QColor Selected(0x8F, 0xC1, 0xFF);

TEST_F(ReaderToolsTest, FindsCountsMarksAndWalksThroughPlaces)
{
    preview(400); // "39" stands in 39, 139, 239, 339, 390 to 399 and in many squares
    find("Square", QStringLiteral("1 of %1").arg(canvas().Totalpages()));
    EXPECT_GT(pixelsOf(Current), 20);
    press(Qt::Key_F3);
    EXPECT_EQ(canvas().Currentpage(), 2);
    EXPECT_EQ(box("Page NO.")->currentText(), "NO. 2");
    EXPECT_GT(pixelsOf(Current), 20);
    press(Qt::Key_F3, Qt::ShiftModifier);
    EXPECT_EQ(canvas().Currentpage(), 1);
    press(Qt::Key_F3, Qt::ShiftModifier);
    EXPECT_EQ(canvas().Currentpage(), canvas().Totalpages());
    QTest::keyClick(findText(), Qt::Key_Return);
    EXPECT_EQ(canvas().Currentpage(), 1);
    QTest::keyClick(findText(), Qt::Key_Return, Qt::ShiftModifier);
    EXPECT_EQ(canvas().Currentpage(), canvas().Totalpages());
}

TEST_F(ReaderToolsTest, BringsAPlaceIntoSight)
{
    PreviewWindow& window = preview(400);
    window.resize(800, 500);
    enter("cmbScala", "200");
    find("1600", QStringLiteral("1 of 2")); // 40 times 40, low on the first page
    const double top = canvas().view().offset.y;
    EXPECT_LT(top, -2000);
    EXPECT_GT(pixelsOf(Current), 20);
    EXPECT_EQ(canvas().view().Vbar.value, std::lround((100 - top) / 100));
}

TEST_F(ReaderToolsTest, MarksOnTheScreenOnly)
{
    preview(40);
    const QByteArray before = [&] {
        canvas().SaveFile(folder_.file("before.ostl"));
        QFile saved(file("before.ostl"));
        EXPECT_TRUE(saved.open(QIODevice::ReadOnly));
        return saved.readAll();
    }();
    find("1", QStringLiteral("1 of 40"));
    EXPECT_GT(pixelsOf(Match), 20);
    canvas().SaveFile(folder_.file("after.ostl"));
    QFile saved(file("after.ostl"));
    ASSERT_TRUE(saved.open(QIODevice::ReadOnly));
    EXPECT_EQ(saved.readAll(), before);
}

TEST_F(ReaderToolsTest, SaysWhenNothingIsFoundAndClosesByEscape)
{
    preview(40);
    find("nowhere", QStringLiteral("Not found"));
    EXPECT_FALSE(opener_.window()->findChild<QToolButton*>("FindNext")->isEnabled());
    QTest::keyClick(findText(), Qt::Key_Escape);
    EXPECT_FALSE(findText()->isVisible());
    ASSERT_NE(opener_.window(), nullptr);
    EXPECT_TRUE(opener_.window()->canvas().hasFocus());
    press(Qt::Key_F3);
    EXPECT_TRUE(findText()->isVisible());
    opener_.window()->canvas().setFocus();
    press(Qt::Key_Escape);
    EXPECT_FALSE(findText()->isVisible());
    ASSERT_NE(opener_.window(), nullptr);
}

TEST_F(ReaderToolsTest, SearchesOtherPagesAnew)
{
    preview(40);
    find("Square", QStringLiteral("1 of 1"));
    opener_.openPreview(gridOf(400));
    const QString all = QStringLiteral("1 of %1").arg(canvas().Totalpages());
    EXPECT_TRUE(QTest::qWaitFor([&] { return found() == all; }, 5000)) << found().toStdString();
}

TEST_F(ReaderToolsTest, SelectsTextsWithShiftAndTheMouse)
{
    preview(10);
    const Tpoint dragged = canvas().view().offset;
    const auto texts = placedTexts(canvas().document(), 0, canvas().platform().metrics);
    const auto place = [&](TextView wanted) {
        for (const PlacedText& text : texts) {
            if (text.text == wanted)
                return text.area;
        }
        return PageRect {};
    };
    const PageRect first = place(u"5");
    const PageRect last = place(u"36"); // the square of the next row
    backScreen()->grab();
    QTest::mousePress(
        paper(), Qt::LeftButton, Qt::ShiftModifier, pixels(first.left - 30, first.top + 30));
    QTest::mouseMove(paper(), pixels(last.right + 30, last.bottom - 30));
    QTest::mouseRelease(
        paper(), Qt::LeftButton, Qt::ShiftModifier, pixels(last.right + 30, last.bottom - 30));
    EXPECT_GT(pixelsOf(Selected), 20);
    press(Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(QApplication::clipboard()->text(), "5\t25\n6\t36");
    EXPECT_EQ(canvas().view().offset, dragged);
    press(Qt::Key_Escape);
    ASSERT_NE(opener_.window(), nullptr);
    EXPECT_EQ(pixelsOf(Selected), 0);
}

TEST_F(ReaderToolsTest, CopiesAWholePageAsATable)
{
    preview(3);
    press(Qt::Key_A, Qt::ControlModifier);
    press(Qt::Key_C, Qt::ControlModifier);
    EXPECT_TRUE(QApplication::clipboard()->text().contains("Number\tSquare\n1\t1\n2\t4\n3\t9"))
        << QApplication::clipboard()->text().toStdString();
    QTest::mouseClick(paper(), Qt::LeftButton); // a plain click lets go
    QApplication::clipboard()->setText("kept");
    press(Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(QApplication::clipboard()->text(), "kept");
}

TEST_F(ReaderToolsTest, ShowsPicturesOfThePagesAndGoesThere)
{
    PreviewWindow& window = preview(400);
    press(Qt::Key_F9);
    auto* const strip = window.findChild<PageStrip*>();
    ASSERT_TRUE(strip->isVisible());
    EXPECT_EQ(strip->model()->rowCount(), canvas().Totalpages());
    const QModelIndex third = strip->model()->index(2, 0);
    strip->scrollTo(third);
    QTest::mouseClick(
        strip->viewport(), Qt::LeftButton, Qt::NoModifier, strip->visualRect(third).center());
    EXPECT_EQ(canvas().Currentpage(), 3);
    EXPECT_EQ(box("Page NO.")->currentText(), "NO. 3");
    click(7);
    EXPECT_EQ(strip->currentIndex().row(), 3);
    click(16);
    EXPECT_EQ(strip->currentIndex().row(), 3);
    QTest::keyClick(strip, Qt::Key_Down);
    QTest::keyClick(strip, Qt::Key_Down);
    EXPECT_EQ(box("Page NO.")->currentText(), QString::fromUtf8("【5-6】"));
    press(Qt::Key_F9);
    EXPECT_FALSE(strip->isVisible());
}

TEST_F(ReaderToolsTest, PaintsTheSamePictureAsThePageInSmall)
{
    PreviewWindow& window = preview(40);
    press(Qt::Key_F9);
    QTest::qWait(1);
    const QImage picture = window.findChild<PageStrip*>()->viewport()->grab().toImage();
    int ink = 0;
    for (int y = 0; y < picture.height() / 3; ++y) {
        for (int x = 0; x < picture.width(); ++x)
            ink += picture.pixelColor(x, y).lightness() < 200 ? 1 : 0;
    }
    EXPECT_GT(ink, 300); // the rows of the table
}

TEST_F(ReaderToolsTest, FitsByKeys)
{
    PreviewWindow& window = preview(40);
    window.resize(1100, 700);
    press(Qt::Key_1, Qt::ControlModifier);
    EXPECT_FALSE(canvas().view().Hbar.enabled);
    EXPECT_TRUE(canvas().view().Vbar.enabled);
    const float scale = canvas().DispScale();
    window.resize(1300, 700);
    EXPECT_LT(canvas().DispScale(), scale);
    EXPECT_FALSE(canvas().view().Hbar.enabled);
    press(Qt::Key_2, Qt::ControlModifier);
    EXPECT_FALSE(canvas().view().Vbar.enabled);
    EXPECT_EQ(surfacesInView(canvas().view(), canvas().facts()), std::vector<int> { 0 });
    EXPECT_EQ(box("cmbScala")->currentText(), toQString(scaleText(canvas().DispScale())));
}

TEST_F(ReaderToolsTest, ZoomsByAPinchAboutItsMiddle)
{
    PreviewWindow& window = preview(40);
    const float before = canvas().DispScale();
    const QPointF middle(200, 200);
    const auto* const pad = QPointingDevice::primaryPointingDevice();
    QNativeGestureEvent pinch(Qt::ZoomNativeGesture, pad, 2, middle, middle,
        window.canvas().mapToGlobal(middle), 0.25, {});
    QApplication::sendEvent(&window.canvas(), &pinch);
    EXPECT_FLOAT_EQ(canvas().DispScale(), before / 1.25F);
    EXPECT_EQ(box("cmbScala")->currentText(), "125%");
}

TEST_F(ReaderToolsTest, ListsAllKeys)
{
    PreviewWindow& window = preview(3);
    press(Qt::Key_F1);
    auto* const list = window.findChild<QTreeWidget*>("Keys");
    ASSERT_NE(list, nullptr);
    QStringList keys;
    for (int row = 0; row < list->topLevelItemCount(); ++row) {
        EXPECT_FALSE(list->topLevelItem(row)->text(0).isEmpty());
        EXPECT_FALSE(list->topLevelItem(row)->text(1).isEmpty());
        keys.append(list->topLevelItem(row)->text(0).split(", "));
    }
    for (const PreviewTool& tool : PreviewTools)
        EXPECT_TRUE(keys.contains(toQString(tool.shortcut))) << toUtf8(tool.shortcut);
    for (const char* const key : { "F1", "F9", "Ctrl+F", "F3", "Shift+F3", "Ctrl+1", "Ctrl+2",
             "Ctrl+C", "Ctrl+A", "PgDown", "Space", "Esc" })
        EXPECT_TRUE(keys.contains(key)) << key;
    for (const QAction* const action : window.findChildren<QAction*>()) {
        for (const QKeySequence& shortcut : action->shortcuts())
            EXPECT_TRUE(keys.contains(shortcut.toString(QKeySequence::NativeText)))
                << shortcut.toString().toStdString();
    }
    EXPECT_EQ(keys.removeDuplicates(), 0);
    QTest::keyClick(list, Qt::Key_Escape);
    EXPECT_FALSE(list->isVisible());
    ASSERT_NE(opener_.window(), nullptr);
}

TEST_F(ReaderToolsTest, SaysInPlainWordsWhatAToolDoes)
{
    show();
    EXPECT_EQ(button(23)->toolTip(), "Larger text and columns (Ctrl+Up)");
    EXPECT_EQ(button(23)->text(), "Maximum ");
    for (const PreviewTool& tool : PreviewTools) {
        if (tool.kind == ToolKind::Button) {
            EXPECT_GT(button(tool.id)->toolTip().size(), 12);
        }
    }
}

TEST_F(ReaderToolsTest, EscapeDoesTheSmallestThingFirst)
{
    PreviewWindow& window = preview(40);
    window.resize(500, 400);
    QTest::qWait(50);
    press(Qt::Key_L, Qt::ControlModifier); // opens the row of what does not fit
    auto* const arrow = window.findChild<QToolButton*>("qt_toolbar_ext_button");
    EXPECT_TRUE(arrow->isChecked());
    box("cmbScala")->showPopup();
    QWidget* const list = QApplication::activePopupWidget();
    ASSERT_NE(list, nullptr);
    QTest::keyClick(list, Qt::Key_Escape);
    EXPECT_FALSE(list->isVisible());
    ASSERT_NE(opener_.window(), nullptr);
    window.canvas().setFocus();
    if (!arrow->isChecked()) // the toolkit closes the row when a list has closed over it
        arrow->click();
    ASSERT_TRUE(arrow->isChecked());
    press(Qt::Key_Escape);
    EXPECT_FALSE(arrow->isChecked());
    ASSERT_NE(opener_.window(), nullptr);
    QTest::qWait(50); // a key that waited for a command would not leave
    press(Qt::Key_Escape);
    EXPECT_EQ(opener_.window(), nullptr);
}

TEST_F(ReaderToolsTest, AnEscapeThatArrivesAfterTheBuildDoesNotLeave)
{
    PreviewWindow& window = preview(40);
    QTest::qWait(50);
    opener_.openPreview(gridOf(400));
    QCoreApplication::postEvent(
        &window.canvas(), new QKeyEvent(QEvent::KeyPress, Qt::Key_Escape, Qt::NoModifier));
    QCoreApplication::processEvents();
    ASSERT_EQ(opener_.window(), &window);
    QTest::qWait(50);
    press(Qt::Key_Escape);
    EXPECT_EQ(opener_.window(), nullptr);
}

TEST_F(ReaderToolsTest, ReturnsToThePagesAfterABoxWasUsed)
{
    PreviewWindow& window = preview(400);
    enter("cmbScala", "200");
    EXPECT_TRUE(window.canvas().hasFocus());
    press(Qt::Key_PageDown);
    EXPECT_GT(canvas().view().Vbar.value, 0);
    enter("Page NO.", "3");
    EXPECT_TRUE(window.canvas().hasFocus());
    EXPECT_EQ(canvas().view().Vbar.value, 0);
}

TEST_F(ReaderToolsTest, ShowsTheScaleInForceAfterTheWheel)
{
    PreviewWindow& window = preview(40);
    QWheelEvent event({ 200, 200 }, window.canvas().mapToGlobal(QPointF(200, 200)), {}, { 0, 120 },
        Qt::NoButton, Qt::ControlModifier, Qt::NoScrollPhase, false);
    QApplication::sendEvent(&window.canvas(), &event);
    EXPECT_EQ(box("cmbScala")->currentText(), "125%");
}

TEST_F(ReaderToolsTest, ShowsANewPreviewInTheMiddle)
{
    PreviewWindow& window = show();
    window.resize(1600, 1500);
    preview(40);
    const ViewState& view = canvas().view();
    EXPECT_NEAR(view.offset.x, (view.innerWidth - canvas().page.myWidth - 200) / 2, 1);
    backScreen()->grab();
    EXPECT_NEAR(view.offset.x, (view.innerWidth - canvas().page.myWidth - 200) / 2, 1);
    click(10);
    backScreen()->grab();
    window.resize(1900, 1500);
    EXPECT_NEAR(view.offset.x, (view.innerWidth - canvas().page.myWidth - 200) / 2, 1);
    EXPECT_NEAR(
        view.offset.y, std::max(100.0, (view.innerHeight - canvas().page.myHeight - 200) / 2), 1);
}

TEST_F(ReaderToolsTest, PutsCaptionsUnderThePicturesAsSoonAsTheyFit)
{
    PreviewWindow& window = preview(40);
    auto* const toolbar = window.findChild<PreviewToolbar*>();
    window.resize(3600, 800);
    QTest::qWait(1);
    EXPECT_EQ(toolbar->toolButtonStyle(), Qt::ToolButtonTextUnderIcon);
    const int needed = toolbar->sizeHint().width();
    window.resize(needed + 2, 800);
    QTest::qWait(1);
    EXPECT_EQ(toolbar->toolButtonStyle(), Qt::ToolButtonTextUnderIcon);
    EXPECT_TRUE(button(19)->isVisible());
    window.resize(needed - 40, 800);
    QTest::qWait(1);
    EXPECT_EQ(toolbar->toolButtonStyle(), Qt::ToolButtonIconOnly);
}

TEST_F(ReaderToolsTest, ReadsThePagesToAScreenReader)
{
    PreviewWindow& window = preview(3);
    for (QWidget* const widget : { paper(), static_cast<QWidget*>(&window.canvas()) }) {
        QAccessibleInterface* const reader = QAccessible::queryAccessibleInterface(widget);
        ASSERT_NE(reader, nullptr);
        EXPECT_EQ(reader->role(), QAccessible::Document);
        EXPECT_TRUE(reader->state().readOnly);
        EXPECT_FALSE(reader->text(QAccessible::Name).isEmpty());
        const QAccessibleTextInterface* const text = reader->textInterface();
        ASSERT_NE(text, nullptr);
        const QString all = text->text(0, text->characterCount());
        EXPECT_TRUE(all.contains("Number\tSquare\n1\t1\n2\t4\n3\t9")) << all.toStdString();
        EXPECT_EQ(text->text(0, 3), all.left(3));
        EXPECT_EQ(text->text(-5, 99999), all);
        int begin = 0;
        int end = 0;
        EXPECT_TRUE(text->textAtOffset(static_cast<int>(all.indexOf("Square")),
                            QAccessible::LineBoundary, &begin, &end)
                        .startsWith("Number\tSquare"));
    }
}

} // namespace

} // namespace pelloric::qt
