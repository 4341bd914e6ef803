// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/preview_window.h"

#include "controls/canvas.h"
#include "platform/qt/qt_fonts.h"
#include "platform/run_time_error.h"
#include "settings/settings_file.h"
#include "support/test_paths.h"
#include "ui/qt/icon_set.h"
#include "ui/qt/preview_world.h"
#include "ui/tool_table.h"
#include <pelloric/sorvane.h>

#include <QAction>
#include <QApplication>
#include <QComboBox>
#include <QDialog>
#include <QDir>
#include <QFile>
#include <QFileDialog>
#include <QFileInfo>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QMessageBox>
#include <QPointer>
#include <QProcess>
#include <QPushButton>
#include <QSignalSpy>
#include <QTest>
#include <QTimer>
#include <QToolBar>
#include <QToolButton>

#include <gmock/gmock.h>

#include <array>
#include <chrono>
#include <thread>

namespace pelloric::qt {

namespace {

using PreviewWindowTest = PreviewWorld;

/// A button of the toolbar as it must be found.
struct ButtonRow {
    int id;
    const char* name;
    const char* caption;
    bool enabled = true;
};

constexpr auto Buttons = std::to_array<ButtonRow>({
    { 1, "tool1", "Design  Report" },
    { 2, "toolFresh", "ReFresh" },
    { 3, "toolOut", "Zoom In" },
    { 4, "toolIn", "Zoom Out" },
    { 5, "tool5", "The First Page", false },
    { 6, "tool6", "Previous Page", false },
    { 7, "tool7", "Next Page", false },
    { 8, "tool8", "the Last Page", false },
    { 9, "tool9", " Show More Pages" },
    { 10, "tool10", "Show One Page" },
    { 11, "tool11", "Move Smoth" },
    { 12, "tool12", "Print" },
    { 13, "tool13", "Page Setup" },
    { 15, "tool15", " Show Whole Page" },
    { 16, "tool15", "Show Two Page" },
    { 17, "toolExit", "Exit" },
    { 18, "tool15", "Show Four Page" },
    { 19, "toolAbout", "About" },
    { 20, "OpenFile", "Open File" },
    { 21, "SaveFile", "Save File" },
    { 23, "tool23", "Maximum " },
    { 24, "tool24", "Minimum" },
});

TEST_F(PreviewWindowTest, CarriesItsNamesAndItsTitle)
{
    PreviewWindow& window = show();
    EXPECT_EQ(window.objectName(), "frmPrintPreview");
    EXPECT_EQ(window.windowTitle(), "Print Preview ");
    EXPECT_NE(window.findChild<QToolBar*>("ActiveBar1"), nullptr);
    EXPECT_EQ(window.findChildren<QToolBar*>().size(), 1);
    EXPECT_TRUE(window.centralWidget()->isAncestorOf(window.findChild<Sorvane*>("Sorvane1")));
    EXPECT_EQ(canvas().strSCliectRect, u"full");
}

TEST_F(PreviewWindowTest, SaysInAStripWhyThereAreNoPagesAndMendsIt)
{
    folder_.write("OstlConfig.ini", "Top= 4000\r\n");
    EXPECT_THROW(opener_.openPreview(gridOf(3)), RunTimeError);
    PreviewWindow& window = *opener_.window();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&window));
    QWidget& strip = *window.findChild<QWidget*>("Notice");
    EXPECT_TRUE(strip.isVisible());
    EXPECT_TRUE(window.findChild<QLabel*>("labNotice")->text().contains("Top= 4000 in "));
    EXPECT_LE(strip.geometry().bottom(), window.canvas().geometry().top());
    const auto button = [&](const char* name) { return window.findChild<QAbstractButton*>(name); };
    EXPECT_TRUE(button("cmdNoticePageSetup")->isVisible());
    EXPECT_FALSE(button("cmdNoticeGridStyle")->isVisible());
    button("cmdNoticeDefaults")->click();
    EXPECT_FALSE(strip.isVisible());
    EXPECT_EQ(canvas().page.intTop, 907);
    EXPECT_FALSE(canvas().document().texts(0).empty());
    EXPECT_EQ(folder_.read("OstlConfig.ini.bak"), "Top= 4000\r\n");
}

TEST_F(PreviewWindowTest, SaysOnceWhichFaceWasTakenForAFontThatIsNotInstalled)
{
    PreviewWindow& window = preview(3);
    QWidget& strip = *window.findChild<QWidget*>("Notice");
    EXPECT_FALSE(strip.isVisible());
    writeSetting(platform_.record(), u"FontName", u"No Such Face");
    click(2);
    EXPECT_TRUE(strip.isVisible());
    EXPECT_EQ(window.findChild<QLabel*>("labNotice")->text(),
        QStringLiteral("The font No Such Face is not installed; %1 is taken instead.")
            .arg(QtFonts::resolve(QStringLiteral("No Such Face"))));
    window.findChild<QAbstractButton*>("cmdNoticeClose")->click();
    EXPECT_FALSE(strip.isVisible());
    click(2);
    EXPECT_FALSE(strip.isVisible());
}

TEST_F(PreviewWindowTest, OpensPageSetupFromItsStrip)
{
    PreviewWindow& window = preview(3);
    writeSetting(platform_.record(), u"Top", u"4000");
    click(2);
    ASSERT_TRUE(window.findChild<QWidget*>("Notice")->isVisible());
    QTimer::singleShot(0, &window, [] {
        QWidget* const dialog = QApplication::activeModalWidget();
        ASSERT_NE(dialog, nullptr);
        EXPECT_EQ(dialog->windowTitle(), "Page Setup");
        auto* const top = dialog->findChild<QLineEdit*>("txtTop");
        top->setText("12");
        dialog->findChild<QAbstractButton*>("cmdOk")->click();
    });
    window.findChild<QAbstractButton*>("cmdNoticePageSetup")->click();
    EXPECT_FALSE(window.findChild<QWidget*>("Notice")->isVisible());
    EXPECT_EQ(canvas().page.intTop, 1089);
}

TEST_F(PreviewWindowTest, HidesItsStripWhenItWasRead)
{
    PreviewWindow& window = preview(3);
    writeSetting(platform_.record(), u"HeaderFontSize", u"0");
    click(2);
    QWidget& strip = *window.findChild<QWidget*>("Notice");
    EXPECT_TRUE(strip.isVisible());
    window.findChild<QAbstractButton*>("cmdNoticeClose")->click();
    EXPECT_FALSE(strip.isVisible());
    EXPECT_EQ(QApplication::focusWidget(), &window.canvas());
}

TEST_F(PreviewWindowTest, DisablesWhatRebuildsADocumentThatWasOpenedWithoutAGrid)
{
    preview(3);
    canvas().SaveFile(folder_.file("saved.ostl"));
    opener_.window()->close();
    show().openDocument(folder_.file("saved.ostl"));
    for (const int id : { 2, 23, 24 })
        EXPECT_FALSE(button(id)->isEnabled()) << id;
    opener_.openPreview(gridOf(3));
    for (const int id : { 2, 23, 24 })
        EXPECT_TRUE(button(id)->isEnabled()) << id;
}

TEST_F(PreviewWindowTest, KeepsItsPlaceBesideTheSettings)
{
    PreviewWindow& window = show();
    const QSettings beside(QSettings::IniFormat, QSettings::UserScope, QStringLiteral("pelloric"),
        QStringLiteral("PreviewWindow"));
    EXPECT_FALSE(QFile::exists(beside.fileName()));
    window.close();
    EXPECT_TRUE(QFile::exists(beside.fileName()));
    EXPECT_FALSE(QDir(file("Pelloric")).exists());
}

TEST_F(PreviewWindowTest, HasEveryToolWithNumberNameAndCaption)
{
    show();
    for (const ButtonRow& row : Buttons) {
        SCOPED_TRACE(row.caption);
        QToolButton* const found = button(row.id);
        ASSERT_NE(found, nullptr);
        EXPECT_EQ(found->objectName(), row.name);
        EXPECT_EQ(found->text(), row.caption);
        EXPECT_EQ(found->isEnabled(), row.enabled);
        EXPECT_EQ(found->property("category"), "print");
        EXPECT_FALSE(found->icon().isNull());
        EXPECT_FALSE(found->accessibleName().isEmpty());
        EXPECT_NE(found->focusPolicy() & Qt::TabFocus, 0);
    }
}

TEST_F(PreviewWindowTest, HasTheTwoCombosOfItsBand)
{
    PreviewWindow& window = show();
    const QStringList scales { "   500 %", "   200 %", "   150 %", "   100 %", "   75 %", "   50 %",
        "   25 %", "   10 %" };
    QStringList entries;
    for (int entry = 0; entry < box("cmbScala")->count(); ++entry)
        entries.append(box("cmbScala")->itemText(entry));
    EXPECT_EQ(entries, scales);
    EXPECT_EQ(box("cmbScala")->currentText(), "   100 %");
    EXPECT_EQ(box("cmbScala")->property("caption"), "Show Scala");
    EXPECT_EQ(box("cmbScala")->property("toolId"), 16);
    EXPECT_EQ(box("cmbScala")->property("band"), "toolshow");
    EXPECT_EQ(box("Page NO.")->currentText(), "NO. 1");
    EXPECT_EQ(box("Page NO.")->property("caption"), "Page NO.");
    EXPECT_EQ(box("Page NO.")->property("toolId"), 15);
    EXPECT_EQ(box("Page NO.")->property("band"), "toolshow");
    EXPECT_EQ(window.findChild<QLabel*>("PageCount")->text(), QString::fromUtf8(" 【共 1 页】"));
}

TEST_F(PreviewWindowTest, NamesTheKeysOfEveryToolInItsTip)
{
    show();
    for (const PreviewTool& tool : PreviewTools) {
        SCOPED_TRACE(tool.id);
        const auto keys = QKeySequence::fromString(
            QString::fromUtf16(tool.shortcut.data(), static_cast<qsizetype>(tool.shortcut.size())));
        ASSERT_FALSE(keys.isEmpty());
        if (tool.kind == ToolKind::Button) {
            EXPECT_TRUE(
                button(tool.id)->toolTip().contains(keys.toString(QKeySequence::NativeText)));
        }
    }
}

TEST_F(PreviewWindowTest, HasAPictureForEveryTool)
{
    for (const PreviewTool& tool : PreviewTools) {
        if (tool.kind == ToolKind::Combo)
            continue;
        const QString name
            = QString::fromUtf16(tool.icon.data(), static_cast<qsizetype>(tool.icon.size()));
        EXPECT_FALSE(libraryIcon(name, QPalette()).isNull()) << name.toStdString();
    }
    EXPECT_TRUE(libraryIcon("no such picture", QPalette()).isNull());
}

TEST_F(PreviewWindowTest, EnablesTheNavigationByThePositionInTheDocument)
{
    preview(400);
    const int total = canvas().Totalpages();
    ASSERT_GE(total, 5);
    EXPECT_EQ(navigation(), "0011");
    EXPECT_EQ(box("Page NO.")->count(), total);
    EXPECT_EQ(box("Page NO.")->itemText(2), "   NO. 3");
    EXPECT_EQ(opener_.window()->findChild<QLabel*>("PageCount")->text(),
        QString::fromUtf8(" 【共 %1 页】").arg(total));
    click(7);
    EXPECT_EQ(canvas().Currentpage(), 2);
    EXPECT_EQ(navigation(), "1111");
    EXPECT_EQ(box("Page NO.")->currentText(), "NO. 2");
    click(8);
    EXPECT_EQ(canvas().Currentpage(), total);
    EXPECT_EQ(navigation(), "1100");
    click(6);
    EXPECT_EQ(canvas().Currentpage(), total - 1);
    click(5);
    EXPECT_EQ(navigation(), "0011");
}

TEST_F(PreviewWindowTest, EnablesTheNavigationByTheWindowOfPages)
{
    preview(400);
    click(16);
    EXPECT_EQ(canvas().WindowPages(), 2);
    EXPECT_EQ(navigation(), "0011");
    EXPECT_EQ(box("Page NO.")->currentText(), QString::fromUtf8("【1-2】"));
    click(7);
    EXPECT_EQ(box("Page NO.")->currentText(), QString::fromUtf8("【3-4】"));
    EXPECT_EQ(navigation(), "1111");
    click(18);
    EXPECT_EQ(canvas().WindowPages(), 4);
    click(10);
    EXPECT_EQ(canvas().WindowPages(), 0);
    click(15);
    EXPECT_EQ(canvas().WindowOrderStyle(), OrderStyle::Whole);
}

TEST_F(PreviewWindowTest, DisablesAllNavigationOnASinglePage)
{
    preview(3);
    EXPECT_EQ(canvas().Totalpages(), 1);
    EXPECT_EQ(navigation(), "0000");
}

TEST_F(PreviewWindowTest, ZoomsByToolsAndShowsTheScale)
{
    preview(3);
    click(3);
    EXPECT_EQ(canvas().DispScale(), 0.5F);
    EXPECT_EQ(box("cmbScala")->currentText(), "200%");
    click(4);
    click(4);
    EXPECT_EQ(canvas().DispScale(), 2.0F);
    EXPECT_EQ(box("cmbScala")->currentText(), "50%");
}

TEST_F(PreviewWindowTest, TakesAScaleThatIsEnteredOrPicked)
{
    preview(3);
    enter("cmbScala", "25");
    EXPECT_EQ(canvas().DispScale(), 4.0F);
    box("cmbScala")->setFocus();
    QTest::keyClick(box("cmbScala"), Qt::Key_Home, Qt::ControlModifier);
    const QSignalSpy chosen(box("cmbScala"), &ChoiceBox::chosen);
    QTest::keyClick(box("cmbScala"), Qt::Key_Down);
    EXPECT_EQ(chosen.size(), 1);
    EXPECT_EQ(canvas().DispScale(), 10.0F);
}

TEST_F(PreviewWindowTest, TakesATypedTextBackThatWasNotEntered)
{
    preview(3);
    ChoiceBox* const scale = box("cmbScala");
    const QString before = scale->currentText();
    scale->setFocus();
    scale->lineEdit()->selectAll();
    QTest::keyClicks(scale, "25");
    opener_.window()->canvas().setFocus();
    EXPECT_EQ(canvas().DispScale(), 1.0F);
    EXPECT_EQ(scale->currentText(), before);
}

TEST_F(PreviewWindowTest, LeavesTheBoxAndNotTheWindowByEscape)
{
    preview(3);
    ChoiceBox* const scale = box("cmbScala");
    scale->setFocus();
    QTest::keyClicks(scale, "7");
    QTest::keyClick(scale, Qt::Key_Escape);
    ASSERT_NE(opener_.window(), nullptr);
    EXPECT_TRUE(opener_.window()->canvas().hasFocus());
}

TEST_F(PreviewWindowTest, GoesToAPageThatIsEnteredAndIgnoresAWindowText)
{
    preview(400);
    enter("Page NO.", "NO. 3");
    EXPECT_EQ(canvas().Currentpage(), 3);
    enter("Page NO.", "2");
    EXPECT_EQ(canvas().Currentpage(), 2);
    box("Page NO.")->lineEdit()->setText(QString::fromUtf8("【4-5】"));
    QTest::keyClick(box("Page NO."), Qt::Key_Return);
    EXPECT_EQ(canvas().Currentpage(), 2);
}

TEST_F(PreviewWindowTest, RaisesNoChangeByItself)
{
    preview(400);
    const QSignalSpy pages(box("Page NO."), &ChoiceBox::chosen);
    const QSignalSpy scales(box("cmbScala"), &ChoiceBox::chosen);
    for (const int id : { 7, 8, 6, 5, 3, 4, 16, 18, 9, 10, 2 })
        click(id);
    EXPECT_EQ(pages.size(), 0);
    EXPECT_EQ(scales.size(), 0);
}

TEST_F(PreviewWindowTest, OpensTheContextMenuByTheRightButton)
{
    PreviewWindow& window = preview(3);
    emit window.canvas().MouseUp(2);
    auto* const menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
    ASSERT_NE(menu, nullptr);
    QStringList texts;
    for (const QAction* const action : menu->actions())
        texts.append(action->text());
    EXPECT_EQ(texts.mid(0, 3), QStringList({ "Clear  All Pages", "Open File", "Save File" }));
    EXPECT_TRUE(texts.contains(QStringLiteral("Save as PDF")));
    for (const QAction* const action : menu->actions().mid(3))
        EXPECT_TRUE(
            action->isSeparator() || !action->shortcut().isEmpty() || action->text().contains('\t'))
            << action->text().toStdString();
    menu->actions().front()->trigger();
    menu->close();
    EXPECT_EQ(canvas().Totalpages(), 1);
    EXPECT_TRUE(canvas().document().texts(0).empty());
}

TEST_F(PreviewWindowTest, WorksByKeys)
{
    PreviewWindow& window = preview(400);
    window.resize(1200, 800);
    window.canvas().setFocus();
    const auto press = [&](int key, Qt::KeyboardModifiers modifiers = Qt::ControlModifier) {
        QTest::keyClick(&window.canvas(), static_cast<Qt::Key>(key), modifiers);
    };
    press(Qt::Key_PageDown);
    EXPECT_EQ(canvas().Currentpage(), 2);
    press(Qt::Key_End);
    EXPECT_EQ(canvas().Currentpage(), canvas().Totalpages());
    press(Qt::Key_PageUp);
    EXPECT_EQ(canvas().Currentpage(), canvas().Totalpages() - 1);
    press(Qt::Key_Home);
    EXPECT_EQ(canvas().Currentpage(), 1);
    press(Qt::Key_Plus);
    EXPECT_EQ(canvas().DispScale(), 0.5F);
    press(Qt::Key_Minus);
    EXPECT_EQ(canvas().DispScale(), 1.0F);
    press(Qt::Key_2, Qt::AltModifier);
    EXPECT_EQ(canvas().WindowPages(), 2);
    press(Qt::Key_0);
    EXPECT_EQ(canvas().WindowOrderStyle(), OrderStyle::Whole);
    press(Qt::Key_G);
    EXPECT_EQ(QApplication::focusWidget(), box("Page NO."));
}

TEST_F(PreviewWindowTest, TurnsThePageWhereItCannotBeScrolledOn)
{
    PreviewWindow& window = preview(400);
    window.canvas().setFocus();
    enter("cmbScala", "10");
    window.canvas().setFocus();
    QTest::keyClick(&window.canvas(), Qt::Key_PageDown);
    EXPECT_EQ(canvas().Currentpage(), 2);
    QTest::keyClick(&window.canvas(), Qt::Key_PageUp);
    EXPECT_EQ(canvas().Currentpage(), 1);
}

TEST_F(PreviewWindowTest, SavesClearsAndOpensADocument)
{
    answerFiles(file("saved.ostl"));
    preview(400);
    const int total = canvas().Totalpages();
    click(21);
    EXPECT_TRUE(QFile::exists(file("saved.ostl")));
    opener_.window()->findChild<QMenu*>("PopMenu")->actions().front()->trigger();
    EXPECT_EQ(canvas().Totalpages(), 1);
    EXPECT_EQ(navigation(), "0000");
    click(20);
    EXPECT_EQ(canvas().Totalpages(), total);
    EXPECT_EQ(navigation(), "0011");
    ASSERT_EQ(asked_.size(), 2U);
    EXPECT_EQ(asked_[0].title, "Save File");
    EXPECT_TRUE(asked_[0].isSave);
    EXPECT_EQ(asked_[1].title, "Open File");
    EXPECT_EQ(asked_[1].filter, "Ostrel (*.ostl)");
#ifdef Q_OS_WIN
    EXPECT_EQ(asked_[1].folder, "C:\\");
#else
    EXPECT_EQ(asked_[1].folder, "/");
#endif
}

TEST_F(PreviewWindowTest, EndsACancelledFileDialogWithoutAWord)
{
    answerFiles({});
    preview(400);
    const int total = canvas().Totalpages();
    click(20);
    click(21);
    EXPECT_EQ(asked_.size(), 2U);
    EXPECT_EQ(canvas().Totalpages(), total);
}

TEST_F(PreviewWindowTest, ShowsTheAboutBoxThatWasPutIn)
{
    answerFiles({});
    show();
    click(19);
    EXPECT_EQ(aboutBoxes_, 1);
}

TEST_F(PreviewWindowTest, ShowsItsDialogsModally)
{
    preview(3);
    for (const int id : { 1, 12, 13 }) {
        SCOPED_TRACE(id);
        bool wasModal = false;
        QTimer::singleShot(0, opener_.window(), [&] {
            auto* const dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            wasModal = dialog != nullptr && dialog->parentWidget() == opener_.window();
            if (dialog != nullptr)
                dialog->reject();
        });
        click(id);
        EXPECT_TRUE(wasModal);
    }
}

TEST_F(PreviewWindowTest, ShowsTheNextGridInTheSameWindow)
{
    const PreviewWindow* const first = &preview(3);
    const PreviewWindow* const second = &preview(400);
    EXPECT_EQ(first, second);
    EXPECT_GE(canvas().Totalpages(), 5);
    EXPECT_EQ(navigation(), "0011");
}

TEST_F(PreviewWindowTest, ClosesAndIsMadeAnewAfterExit)
{
    const QPointer<PreviewWindow> first = &preview(3);
    click(17);
    EXPECT_EQ(opener_.window(), nullptr);
    preview(400);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_TRUE(first.isNull());
    EXPECT_GE(canvas().Totalpages(), 5);
}

TEST_F(PreviewWindowTest, ExitOfTheLastWindowEndsTheProgram)
{
    preview(3);
    QTimer::singleShot(0, button(17), [&] { click(17); });
    EXPECT_TRUE(programEnds());
}

TEST_F(PreviewWindowTest, TheLastWindowEndsTheProgramThoughItWasClosedDuringABuild)
{
    const QPointer<PreviewWindow> window = &preview(3);
    QTimer::singleShot(0, window, [&] {
        QTimer::singleShot(0, window, [&] { window->close(); });
        opener_.openPreview(gridOf(400));
    });
    EXPECT_TRUE(programEnds());
}

TEST_F(PreviewWindowTest, ClosesByEscapeWhenNothingIsBuilt)
{
    PreviewWindow& window = preview(3);
    QTest::qWait(50);
    QTest::keyClick(&window.canvas(), Qt::Key_Escape);
    EXPECT_EQ(opener_.window(), nullptr);
}

TEST_F(PreviewWindowTest, KeepsTheEarlierPagesWhenEscapeEndsABuild)
{
    PreviewWindow& window = preview(400);
    const int total = canvas().Totalpages();
    bool wasBuilding = false;
    QTimer::singleShot(0, &window, [&] {
        wasBuilding = canvas().isBuilding();
        QTest::keyClick(&window.canvas(), Qt::Key_Escape);
    });
    opener_.openPreview(gridOf(3));
    EXPECT_TRUE(wasBuilding);
    ASSERT_EQ(opener_.window(), &window);
    EXPECT_EQ(canvas().Totalpages(), total);
    click(2);
    EXPECT_EQ(canvas().Totalpages(), 1); // the grid is kept, and the next build is whole
}

TEST_F(PreviewWindowTest, GoesAfterTheBuildDuringWhichItWasClosed)
{
    const QPointer<PreviewWindow> window = &preview(3);
    bool wasBuilding = false;
    QTimer::singleShot(0, window, [&] {
        wasBuilding = canvas().isBuilding();
        window->close();
        EXPECT_FALSE(window->isClosed());
    });
    opener_.openPreview(gridOf(400));
    EXPECT_TRUE(wasBuilding);
    EXPECT_EQ(opener_.window(), nullptr);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_TRUE(window.isNull());
}

TEST_F(PreviewWindowTest, GoesAfterABuildThatAHostHasBegunOnTheCanvas)
{
    const QPointer<PreviewWindow> window = &preview(3);
    const auto grid = gridOf(400);
    QTimer::singleShot(0, window, [&] { window->close(); });
    EXPECT_THROW(canvas().doPreview(*grid), RunTimeError); // ended by the user
    EXPECT_TRUE(QTest::qWaitFor([&] { return window.isNull(); }));
}

/// Posts an event to a window from outside, some time from now.
class LateEvent {
public:
    LateEvent(QObject& receiver, QEvent* event)
        : thread_([&receiver, event] {
            std::this_thread::sleep_for(std::chrono::milliseconds(200));
            QCoreApplication::postEvent(&receiver, event);
        })
    {
    }

    ~LateEvent() { thread_.join(); }
    LateEvent(const LateEvent&) = delete;
    LateEvent& operator=(const LateEvent&) = delete;

private:
    std::thread thread_;
};

TEST_F(PreviewWindowTest, KeepsTheEarlierPagesWhenEscapeIsPressedWhileRowsGoBy)
{
    PreviewWindow& window = preview(400);
    const int total = canvas().Totalpages();
    auto grid = longGrid();
    const LateEvent escape(
        window.canvas(), new QKeyEvent(QEvent::KeyPress, Qt::Key_Escape, Qt::NoModifier));
    opener_.openPreview(std::move(grid));
    ASSERT_EQ(opener_.window(), &window);
    EXPECT_TRUE(window.isVisible());
    EXPECT_EQ(canvas().Totalpages(), total);
    EXPECT_FALSE(canvas().progress().visible);
}

TEST_F(PreviewWindowTest, ClosesWhileRowsGoBy)
{
    PreviewWindow& window = preview(3);
    auto grid = longGrid();
    const LateEvent close(window, new QCloseEvent);
    opener_.openPreview(std::move(grid));
    EXPECT_EQ(opener_.window(), nullptr);
}

TEST_F(PreviewWindowTest, RefusesAGridWithoutAWordWhileItBuilds)
{
    PreviewWindow& window = preview(3);
    QTimer::singleShot(0, &window, [&] { opener_.openPreview(gridOf(3)); });
    opener_.openPreview(gridOf(400));
    EXPECT_GE(canvas().Totalpages(), 5);
}

TEST_F(PreviewWindowTest, LeavesTheErrorOfABuildToItsCaller)
{
    show();
    QFile::remove(file("OstlConfig.ini"));
    EXPECT_THROW(opener_.openPreview(gridOf(3)), RunTimeError);
    EXPECT_TRUE(opener_.window()->isVisible());
    EXPECT_FALSE(opener_.window()->isBusy());
}

TEST_F(PreviewWindowTest, RemembersItsSize)
{
    show().resize(640, 480);
    opener_.window()->close();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_EQ(show().size(), QSize(640, 480));
}

TEST_F(PreviewWindowTest, ShowsEveryToolOfANarrowWindowBehindAnArrow)
{
    PreviewWindow& window = show();
    window.resize(300, 400);
    QTest::qWait(1);
    auto* const arrow = window.findChild<QToolButton*>("qt_toolbar_ext_button");
    ASSERT_NE(arrow, nullptr);
    EXPECT_TRUE(arrow->isVisible());
    EXPECT_FALSE(box("Page NO.")->isVisible());
    QTest::keyClick(&window.canvas(), Qt::Key_G, Qt::ControlModifier);
    EXPECT_TRUE(QTest::qWaitFor([&] { return box("Page NO.")->hasFocus(); }, 2000));
    EXPECT_TRUE(box("Page NO.")->isVisible());
}

TEST_F(PreviewWindowTest, ScalesTheReportByItsTools)
{
    preview(400);
    const int total = canvas().Totalpages();
    click(23);
    click(23);
    EXPECT_GT(canvas().Totalpages(), total);
    EXPECT_EQ(canvas().Currentpage(), 1);
    click(24);
    click(24);
    EXPECT_LE(canvas().Totalpages(), total);
}

TEST(PreviewDemo, WalksThroughWithoutADisplay)
{
    const TempFolder folder;
    const QString out = QString::fromStdString(folder.path().string());
    QProcess program;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.remove(QStringLiteral("DISPLAY"));
    environment.remove(QStringLiteral("WAYLAND_DISPLAY"));
    environment.remove(QStringLiteral("QT_QPA_PLATFORM"));
    program.setProcessEnvironment(environment);
    program.start(PELLORIC_PROGRAM, { "demo", "--walk", out });
    ASSERT_TRUE(program.waitForFinished(60'000));
    EXPECT_EQ(program.readAllStandardError().toStdString(), "");
    EXPECT_EQ(program.exitCode(), 0);
    const QStringList said
        = QString::fromUtf8(program.readAllStandardOutput()).split('\n', Qt::SkipEmptyParts);
    EXPECT_EQ(said.size(), QDir(out).entryList(QDir::Files).size());
    for (const char* const name : { "demo-flex-grid.png", "flex-grid.pdf", "list-view.pdf",
             "data-grid-preview.png", "report.ostl", "reopened.png" })
        EXPECT_TRUE(QFile::exists(out + '/' + name)) << name;
}

} // namespace

TEST_F(PreviewWindowTest, SavesThePagesAsThePathsEndingSays)
{
    std::vector<FileQuestion> questions;
    QString answer;
    PreviewPrompts prompts;
    prompts.chooseFile = [&](QWidget&, const FileQuestion& question) {
        questions.push_back(question);
        return answer;
    };
    opener_.setPrompts(prompts);
    PreviewWindow& window = preview(3);
    canvas().documentName = u"Orders: May/June";
    const QString folder = QString::fromStdString(folder_.path().string());
    const auto begins = [&](const QString& name, const QByteArray& start) {
        QFile file(folder + name);
        return file.open(QIODevice::ReadOnly) && file.readAll().contains(start);
    };
    answer = folder + QStringLiteral("/a.pdf");
    QTest::keyClick(&window, Qt::Key_E, Qt::ControlModifier);
    EXPECT_TRUE(begins(QStringLiteral("/a.pdf"), "%PDF"));
    ASSERT_EQ(questions.size(), 1U);
    EXPECT_TRUE(questions[0].isSave);
    EXPECT_EQ(questions[0].title, "Save as PDF");
    EXPECT_EQ(questions[0].name, "Orders- May-June.pdf");
    EXPECT_EQ(questions[0].suffixes, QStringList({ "pdf", "png", "svg" }));
    EXPECT_TRUE(questions[0].places.isEmpty());
    answer = folder + QStringLiteral("/b.PNG");
    QTest::keyClick(&window, Qt::Key_E, Qt::ControlModifier);
    EXPECT_TRUE(begins(QStringLiteral("/b.PNG"), "PNG"));
    EXPECT_EQ(questions[1].folder, folder);
    EXPECT_EQ(questions[1].places, QStringList(folder));
    answer = folder + QStringLiteral("/c.svg");
    QTest::keyClick(&window, Qt::Key_E, Qt::ControlModifier);
    EXPECT_TRUE(begins(QStringLiteral("/c.svg"), "<svg"));
    EXPECT_TRUE(messages_.take().empty());
    answer.clear();
    QTest::keyClick(&window, Qt::Key_E, Qt::ControlModifier);
    EXPECT_TRUE(messages_.take().empty());
    answer = folder + QStringLiteral("/missing/d.pdf");
    QTest::keyClick(&window, Qt::Key_E, Qt::ControlModifier);
    EXPECT_EQ(messages_.take().size(), 1U);
}

TEST_F(PreviewWindowTest, ReplacesNumberedFilesOnlyWhenThePersonSaysSo)
{
    QString answer = file("page.png");
    std::vector<QStringList> asked;
    bool mayReplace = false;
    PreviewPrompts prompts;
    prompts.chooseFile = [&](QWidget&, const FileQuestion&) { return answer; };
    prompts.mayReplace = [&](QWidget&, const QStringList& files) {
        asked.push_back(files);
        return mayReplace;
    };
    opener_.setPrompts(prompts);
    PreviewWindow& window = preview(60);
    ASSERT_EQ(canvas().Totalpages(), 2);
    folder_.write("page-002.png", "mine");
    folder_.write("page-003.png", "of another report");
    const auto save = [&] { QTest::keyClick(&window, Qt::Key_E, Qt::ControlModifier); };
    save();
    EXPECT_THAT(asked, testing::ElementsAre(QStringList(file("page-002.png"))));
    EXPECT_EQ(folder_.read("page-002.png"), "mine");
    EXPECT_FALSE(QFile::exists(file("page-001.png")));
    mayReplace = true;
    save();
    EXPECT_EQ(asked.size(), 2U);
    EXPECT_TRUE(QFile::exists(file("page-001.png")));
    EXPECT_NE(folder_.read("page-002.png"), "mine");
    EXPECT_EQ(folder_.read("page-003.png"), "of another report");
    answer = file("page.svg");
    save();
    answer = file("page.pdf");
    save();
    save();
    EXPECT_EQ(asked.size(), 2U); // new files, and one that the file dialog has asked about
}

TEST_F(PreviewWindowTest, AsksInABoxBeforeNumberedFilesAreReplaced)
{
    QWidget window;
    const auto answer = [&](const char* button) {
        QTimer::singleShot(0, [button] {
            auto* const box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
            ASSERT_NE(box, nullptr);
            EXPECT_EQ(box->text(), "3 files already exist, such as page-001.png.");
            EXPECT_EQ(box->defaultButton()->text().remove(u'&'), "Cancel");
            for (QAbstractButton* const found : box->buttons()) {
                if (found->text().remove(u'&') == QLatin1String(button))
                    found->click();
            }
        });
        return standardPrompts().mayReplace(window,
            { QStringLiteral("/a/page-001.png"), QStringLiteral("/a/page-002.png"),
                QStringLiteral("/a/page-003.png") });
    };
    EXPECT_FALSE(answer("Cancel"));
    EXPECT_TRUE(answer("Replace"));
}

TEST_F(PreviewWindowTest, OpenAndSaveKeepTheirFolderAndOfferThoseOfTheSession)
{
    std::vector<FileQuestion> questions;
    const QString path = QString::fromStdString((folder_.path() / "a.ostl").string());
    PreviewPrompts prompts;
    prompts.chooseFile = [&](QWidget&, const FileQuestion& question) {
        questions.push_back(question);
        return path;
    };
    opener_.setPrompts(prompts);
    PreviewWindow& window = preview(3);
    QTest::keyClick(&window, Qt::Key_S, Qt::ControlModifier);
    QTest::keyClick(&window, Qt::Key_O, Qt::ControlModifier);
    ASSERT_EQ(questions.size(), 2U);
    for (const FileQuestion& question : questions) {
        EXPECT_EQ(question.folder, QStringLiteral("/"));
        EXPECT_EQ(question.filter, "Ostrel (*.ostl)");
        EXPECT_TRUE(question.suffixes.isEmpty());
        EXPECT_TRUE(question.name.isEmpty());
    }
    EXPECT_EQ(questions[1].places, QStringList(QFileInfo(path).absolutePath()));
}

TEST_F(PreviewWindowTest, TheFileDialogHasTheSessionsFoldersAndAddsTheEnding)
{
    const QString folder = QString::fromStdString(folder_.path().string());
    const auto answer = [&](const QString& typed, const QString& filter) {
        FileQuestion question { .title = QStringLiteral("Save as PDF"),
            .folder = folder,
            .filter = QStringLiteral("PDF document (*.pdf);;PNG pictures (*.png)"),
            .isSave = true };
        question.suffixes = { QStringLiteral("pdf"), QStringLiteral("png") };
        question.name = QStringLiteral("report.pdf");
        question.places = { folder };
        QTimer::singleShot(0, [&] {
            auto* const dialog = qobject_cast<QFileDialog*>(QApplication::activeModalWidget());
            ASSERT_NE(dialog, nullptr);
            EXPECT_TRUE(dialog->sidebarUrls().contains(QUrl::fromLocalFile(folder)));
            auto* const name = dialog->findChild<QLineEdit*>(QStringLiteral("fileNameEdit"));
            EXPECT_EQ(name->text(), "report.pdf");
            if (!filter.isEmpty()) {
                dialog->selectNameFilter(filter);
                emit dialog->filterSelected(filter);
            }
            name->setText(typed);
            // A foreign ending is completed and shown again.
            QTimer::singleShot(100, dialog, [dialog] { QTest::keyClick(dialog, Qt::Key_Return); });
            QTest::keyClick(dialog, Qt::Key_Return);
        });
        QWidget window;
        return standardPrompts().chooseFile(window, question).mid(folder.size());
    };
    EXPECT_EQ(answer(QStringLiteral("x"), {}), "/x.pdf");
    EXPECT_EQ(answer(QStringLiteral("x.png"), {}), "/x.png");
    EXPECT_EQ(answer(QStringLiteral("x"), QStringLiteral("PNG pictures (*.png)")), "/x.png");
    EXPECT_EQ(answer(QStringLiteral("x.doc"), {}), "/x.doc.pdf");
}

} // namespace pelloric::qt
