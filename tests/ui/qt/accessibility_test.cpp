// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"
#include "fakes/fake_platform.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "print/paper_names.h"
#include "settings/default_settings.h"
#include "support/qt/accessible_walk.h"
#include "ui/qt/font_chooser.h"
#include "ui/qt/grid_style_dialog.h"
#include "ui/qt/page_setup_dialog.h"
#include "ui/qt/preview_prompts.h"
#include "ui/qt/preview_window.h"
#include "ui/qt/print_options_dialog.h"

#include <pelloric/sorvane.h>

#include <QAccessible>
#include <QApplication>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QTabBar>
#include <QTabWidget>
#include <QTest>
#include <QTimer>

#include <gtest/gtest.h>

#include <functional>
#include <memory>

namespace pelloric::qt {

namespace {

/// The Alt keys that are shown now, in capitals.
QString shownKeys(const QWidget& window)
{
    QString keys;
    for (const QWidget* const widget : window.findChildren<QWidget*>()) {
        if (widget->isVisible())
            keys += widget->property("altKey").toString().toUpper();
    }
    return keys;
}

bool hasKey(const QWidget& window, const QWidget& control)
{
    if (!control.property("altKey").toString().isEmpty())
        return true;
    for (const QLabel* const label : window.findChildren<QLabel*>()) {
        if (label->buddy() == &control && !label->property("altKey").toString().isEmpty())
            return true;
    }
    return false;
}

/// Calls back with each tab of a window in front, or once where it has none.
void withEachTab(QWidget& window, const std::function<void()>& look)
{
    auto* const tabs = window.findChild<QTabWidget*>();
    for (int tab = 0; tab < (tabs ? tabs->count() : 1); ++tab) {
        if (tabs)
            tabs->setCurrentIndex(tab);
        QApplication::processEvents();
        look();
    }
}

class WindowsTest : public testing::Test, public FakePlatform {
protected:
    WindowsTest()
    {
        deployDefaultSettings(services());
        printers.paperForms = standardPaperForms();
        printers.names = { u"First", u"第二台" };
        printers.current = u"First";
        dialogs.push_back(std::make_unique<PageSetupDialog>(services()));
        dialogs.push_back(std::make_unique<GridStyleDialog>(services()));
        dialogs.push_back(
            std::make_unique<PrintOptionsDialog>(services(), PrintOptionsDialog::Print()));
        dialogs.push_back(std::make_unique<FontChooser>(ColoredFont {}));
    }

    void show(QWidget& window)
    {
        window.show();
        ASSERT_TRUE(QTest::qWaitForWindowActive(&window));
    }

    std::vector<std::unique_ptr<QDialog>> dialogs;
};

} // namespace

TEST_F(WindowsTest, HaveANameForEveryControlThatTakesTheFocus)
{
    for (const auto& dialog : dialogs)
        expectNames(*dialog);
    QtPlatform platform;
    PreviewWindow preview(platform);
    expectNames(preview);
}

TEST_F(WindowsTest, HaveANameForEveryControlOfTheBoxesThatThePreviewShows)
{
    QtPlatform platform;
    PreviewWindow preview(platform);
    show(preview);
    QTest::keyClick(&preview.canvas(), Qt::Key_F1);
    auto* const keys = preview.findChild<QDialog*>(QStringLiteral("frmKeys"));
    ASSERT_NE(keys, nullptr);
    expectNames(*keys);
    const PreviewPrompts prompts = standardPrompts();
    const std::function<void()> boxes[] = {
        [&] { prompts.showAbout(preview); },
        [&] { prompts.mayReplace(preview, { QStringLiteral("/page-001.png") }); },
        [&] { prompts.chooseFile(preview, openFileQuestion()); },
        [&] { prompts.chooseFile(preview, saveFileQuestion()); },
    };
    for (const auto& show : boxes) {
        int seen = 0;
        QTimer::singleShot(0, &preview, [&seen] {
            QWidget* const box = QApplication::activeModalWidget();
            ASSERT_NE(box, nullptr);
            expectNames(*box);
            ++seen;
            box->close();
        });
        show();
        EXPECT_EQ(seen, 1);
    }
}

TEST_F(WindowsTest, TellComboBoxesByNameAndValue)
{
    auto* const box = dialogs.at(2)->findChild<QComboBox*>(QStringLiteral("cboPrinter"));
    QAccessibleInterface* const told = QAccessible::queryAccessibleInterface(box);
    ASSERT_NE(told, nullptr);
    EXPECT_EQ(told->role(), QAccessible::ComboBox);
    EXPECT_EQ(told->text(QAccessible::Name), "Name");
    EXPECT_EQ(told->text(QAccessible::Value), "First");
    EXPECT_EQ(told->childCount(), 1);
    EXPECT_EQ(told->indexOfChild(told->child(0)), 0);
    auto* const size = dialogs.at(3)->findChild<QComboBox*>(QStringLiteral("cboSize"));
    QAccessibleInterface* const editable = QAccessible::queryAccessibleInterface(size);
    EXPECT_EQ(editable->text(QAccessible::Name), "Size");
    ASSERT_EQ(editable->childCount(), 2);
    EXPECT_EQ(editable->child(1)->text(QAccessible::Name), "Size");
    EXPECT_TRUE(editable->state().editable);
}

TEST_F(WindowsTest, TabWalksTheControlsAsTheEyeReads)
{
    for (const auto& dialog : dialogs) {
        show(*dialog);
        withEachTab(*dialog, [&] { expectTabOrder(*dialog); });
        dialog->hide();
    }
}

TEST_F(WindowsTest, EveryControlOfADialogHasAnAltKeyOfItsOwn)
{
    for (const auto& dialog : dialogs) {
        show(*dialog);
        withEachTab(*dialog, [&] {
            for (const QWidget* const stop : tabStops(*dialog))
                EXPECT_TRUE(hasKey(*dialog, *stop)) << labelOf(*dialog) << ": " << labelOf(*stop);
            QString keys = shownKeys(*dialog);
            std::sort(keys.begin(), keys.end());
            EXPECT_EQ(std::adjacent_find(keys.begin(), keys.end()), keys.end())
                << labelOf(*dialog) << ": " << keys.toStdString();
        });
        dialog->hide();
    }
}

TEST_F(WindowsTest, CaptionsHoldTheLettersOfTheirAltKeys)
{
    const auto expectHeld = [](const QString& caption, const QString& key) {
        EXPECT_TRUE(caption.contains(key, Qt::CaseInsensitive))
            << caption.toStdString() << " " << key.toStdString();
        EXPECT_FALSE(caption.contains(QLatin1Char('&'))) << caption.toStdString();
    };
    for (const auto& dialog : dialogs) {
        for (const QWidget* const widget : dialog->findChildren<QWidget*>()) {
            const QString keys = widget->property("altKey").toString();
            if (const auto* const label = qobject_cast<const QLabel*>(widget))
                expectHeld(label->text(), keys);
            else if (const auto* const button = qobject_cast<const QAbstractButton*>(widget))
                expectHeld(button->text(), keys);
            else if (const auto* const bar = qobject_cast<const QTabBar*>(widget)) {
                for (int tab = 0; tab < keys.size(); ++tab)
                    expectHeld(bar->tabText(tab), keys.mid(tab, 1));
            }
        }
    }
}

TEST_F(WindowsTest, AltAndALetterGoToTheControl)
{
    QDialog& dialog = *dialogs.front();
    show(dialog);
    const auto expectFocus = [&](Qt::Key key, const char* control) {
        QTest::keyClick(&dialog, key, Qt::AltModifier);
        const QWidget* const wanted = dialog.findChild<QWidget*>(QLatin1String(control));
        EXPECT_EQ(dialog.focusWidget(), wanted) << control;
    };
    expectFocus(Qt::Key_W, "txtWidth");
    expectFocus(Qt::Key_1, "ListView1");
    QTest::keyClick(&dialog, Qt::Key_M, Qt::AltModifier);
    EXPECT_EQ(dialog.findChild<QTabWidget*>()->currentIndex(), 1);
    expectFocus(Qt::Key_B, "cmdButtom");
    QTest::keyClick(&dialog, Qt::Key_D, Qt::AltModifier);
    EXPECT_EQ(dialog.findChild<QTabWidget*>()->currentIndex(), 2);
    expectFocus(Qt::Key_5, "txtFormat(5)");
    QTest::keyClick(&dialog, Qt::Key_K, Qt::AltModifier);
    EXPECT_TRUE(QTest::qWaitFor([&] { return dialog.result() == QDialog::Accepted; }));
}

TEST_F(WindowsTest, AltKeysAreShownBelowTheirLetters)
{
    QDialog& dialog = *dialogs.at(2);
    show(dialog);
    const QImage plain = dialog.grab().toImage();
    auto* const marks = dialog.findChild<QWidget*>(QStringLiteral("AltKeyMarks"));
    ASSERT_NE(marks, nullptr);
    marks->hide();
    EXPECT_NE(dialog.grab().toImage(), plain);
    marks->show();
    EXPECT_EQ(dialog.grab().toImage(), plain);
}

TEST_F(WindowsTest, AHeldAltKeyShowsTheKeysOfControlsWithoutACaption)
{
    QDialog& dialog = *dialogs.front();
    dialog.findChild<QTabWidget*>()->setCurrentIndex(2);
    show(dialog);
    dialog.findChild<QPushButton*>(QStringLiteral("cmdOk"))->setFocus();
    const auto picture = [&] {
        auto* const box = dialog.findChild<QWidget*>(QStringLiteral("txtFormat(2)"));
        return dialog.grab(placeOf(*box)).toImage();
    };
    const QImage plain = picture();
    QTest::keyPress(&dialog, Qt::Key_Alt);
    EXPECT_NE(picture(), plain);
    QTest::keyRelease(&dialog, Qt::Key_Alt);
    EXPECT_EQ(picture(), plain);
}

TEST_F(WindowsTest, TheMenuKeyAndAltDownOpenTheFieldsOfABox)
{
    QDialog& dialog = *dialogs.front();
    dialog.findChild<QTabWidget*>()->setCurrentIndex(2);
    show(dialog);
    auto* const box = dialog.findChild<QLineEdit*>(QStringLiteral("txtFormat(2)"));
    auto* const fields = dialog.findChild<QMenu*>(QStringLiteral("ActiveBar1"));
    box->setFocus();
    QTest::keyClick(box, Qt::Key_Down, Qt::AltModifier);
    ASSERT_TRUE(fields->isVisible());
    QTest::keyClick(fields, Qt::Key_Up);
    QTest::keyClick(fields, Qt::Key_Return);
    EXPECT_EQ(box->text(), "[Page #]");
    QContextMenuEvent menuKey(
        QContextMenuEvent::Keyboard, QPoint(1, 1), box->mapToGlobal(QPoint()));
    QApplication::sendEvent(box, &menuKey);
    EXPECT_TRUE(fields->isVisible());
    fields->hide();
}

TEST_F(WindowsTest, TheMenuKeyOpensThePreviewsMenuFromItsToolbarToo)
{
    QtPlatform platform;
    PreviewWindow window(platform);
    show(window);
    auto* const button = window.findChild<QWidget*>(QStringLiteral("tool12"));
    auto* const menu = window.findChild<QMenu*>(QStringLiteral("PopMenu"));
    QContextMenuEvent menuKey(
        QContextMenuEvent::Keyboard, QPoint(1, 1), button->mapToGlobal(QPoint()));
    QApplication::sendEvent(button, &menuKey);
    EXPECT_TRUE(menu->isVisible());
    menu->hide();
}

} // namespace pelloric::qt
