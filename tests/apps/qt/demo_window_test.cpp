// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_window.h"

#include "fakes/temp_folder.h"
#include "own_table.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"
#include "support/qt/accessible_walk.h"
#include "support/test_paths.h"

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QApplication>
#include <QHeaderView>
#include <QInputDialog>
#include <QLabel>
#include <QTabWidget>
#include <QTest>
#include <QTimer>

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <optional>

namespace pelloric::app {

namespace {

class DemoWindowTest : public testing::Test {
protected:
    DemoWindowTest()
    {
        platform_.folders().setSystemDirectory(folder_.path());
        deployDefaultSettings(platform_.record());
        demo_.emplace(platform_, QStringLiteral(PELLORIC_TESTS_DIR "/../samples"));
    }

    void show()
    {
        demo_->show();
        ASSERT_TRUE(QTest::qWaitForWindowActive(&*demo_));
    }

    /// Calls back with each page of the form in front.
    void onEachPage(const std::function<void()>& look)
    {
        for (int page = 0; page < demo_->pages().count(); ++page) {
            demo_->pages().setCurrentIndex(page);
            QApplication::processEvents();
            look();
        }
    }

    TempFolder folder_;
    qt::QtPlatform platform_;
    std::optional<DemoWindow> demo_;
};

/// The letters that go to a control with Alt, of those that are seen.
QString altKeysOf(QWidget& window)
{
    QString keys;
    const auto add = [&keys](const QString& caption) {
        const QString key = QKeySequence::mnemonic(caption).toString();
        if (!key.isEmpty())
            keys += key.back();
    };
    for (const QWidget* const widget : window.findChildren<QWidget*>()) {
        if (!widget->isVisible())
            continue;
        if (const auto* const button = qobject_cast<const QAbstractButton*>(widget))
            add(button->text());
        else if (const auto* const label = qobject_cast<const QLabel*>(widget))
            add(label->buddy() ? label->text() : QString());
    }
    const auto* const pages = window.findChild<QTabWidget*>();
    for (int page = 0; page < pages->count(); ++page)
        add(pages->tabText(page));
    return keys;
}

} // namespace

TEST_F(DemoWindowTest, HasANameForEveryControlThatTakesTheFocus) { qt::expectNames(*demo_); }

TEST_F(DemoWindowTest, LetsTheTabKeyWalkFromTheGridToItsButton)
{
    show();
    onEachPage([this] {
        const std::vector<QWidget*> stops = qt::tabStops(*demo_);
        QWidget* const page = demo_->pages().currentWidget();
        auto* const view = page->findChild<QAbstractItemView*>();
        const auto grid = std::ranges::find(stops, static_cast<QWidget*>(view));
        ASSERT_NE(grid, stops.end());
        ASSERT_NE(grid + 1, stops.end());
        EXPECT_EQ((*(grid + 1))->objectName(), QStringLiteral("preview") + view->objectName());
    });
}

TEST_F(DemoWindowTest, ShowsTheRowsOfEveryGrid)
{
    show();
    int grids = 0;
    onEachPage([&] {
        for (const QAbstractItemView* const view : demo_->findChildren<QAbstractItemView*>()) {
            if (!view->isVisible() || qobject_cast<const QHeaderView*>(view))
                continue;
            ++grids;
            const QModelIndex middle = view->indexAt(
                QPoint(view->viewport()->width() / 2, view->viewport()->height() / 2));
            EXPECT_TRUE(middle.isValid()) << demo_->pages().currentIndex();
        }
    });
    EXPECT_EQ(grids, demo_->pages().count());
}

TEST_F(DemoWindowTest, HasNoAltKeyTwice)
{
    show();
    onEachPage([this] {
        QString keys = altKeysOf(*demo_);
        EXPECT_GT(keys.size(), 6);
        std::ranges::sort(keys);
        EXPECT_EQ(std::ranges::adjacent_find(keys), keys.end()) << keys.toStdString();
    });
}

TEST_F(DemoWindowTest, GetsAsSmallAsASmallScreen)
{
    show();
    demo_->resize(800, 500);
    QApplication::processEvents();
    EXPECT_EQ(demo_->size(), QSize(800, 500));
}

TEST_F(DemoWindowTest, AsksByNameForTheTableOfADatabase)
{
    QTimer::singleShot(0, &*demo_, [] {
        auto* const dialog = qobject_cast<QInputDialog*>(QApplication::activeModalWidget());
        ASSERT_NE(dialog, nullptr);
        qt::expectNames(*dialog);
        dialog->reject();
    });
    EXPECT_FALSE(
        openOwnTable(*demo_, QStringLiteral(PELLORIC_TESTS_DIR "/../samples/samples.sqlite")));
}

} // namespace pelloric::app
