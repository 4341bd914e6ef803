// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"
#include "fakes/fake_services.h"
#include "fakes/temp_folder.h"
#include "grids/table_grid.h"
#include "platform/run_time_error.h"
#include "print/qt/print_test.h"
#include "settings/default_settings.h"
#include "support/qt/beside.h"
#include "ui/qt/preview_window.h"
#include "ui/qt/print_options_dialog.h"

#include <pelloric/sorvane.h>

#include <QAction>
#include <QApplication>
#include <QLabel>
#include <QPushButton>
#include <QSettings>
#include <QTest>
#include <QTimer>

#include <array>

namespace pelloric::qt {

namespace {

constexpr qint64 LongestPause = 1500; ///< 300 on a machine that does nothing else: milliseconds

/// A preview of many pages that are printed on a scheduler of its own.
class PrintWindowTest : public PrintTest {
protected:
    PrintWindowTest()
    {
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope,
            QString::fromStdString(folder.path().string()));
        platform.folders().setSystemDirectory(folder.path());
        platform.useMessages(messages);
        deployDefaultSettings(platform.record());
    }

    void SetUp() override
    {
        PrintTest::SetUp();
        auto grid = std::make_unique<TableGrid>(std::vector<TableColumn> { { u"Number", 3000 } });
        for (int row = 1; row <= 4000; ++row) {
            const Text number = decimal(row);
            grid->addRow(std::array<TextView, 1> { number });
        }
        window = new PreviewWindow(platform);
        window->show();
        window->preview(std::move(grid));
        ASSERT_TRUE(QTest::qWaitForWindowActive(window));
        ASSERT_GT(window->canvas().canvas().Totalpages(), 20);
    }

    void TearDown() override { delete window; }

    static PrintOptionsDialog* dialog()
    {
        return qobject_cast<PrintOptionsDialog*>(QApplication::activeModalWidget());
    }

    /// Opens the print dialog and presses "Print"; calls back all the while.
    /// @return  the longest time without a look: milliseconds
    qint64 printMeanwhile(const std::function<void(PrintOptionsDialog&)>& look)
    {
        qint64 longest = 0;
        QTimer::singleShot(0, window, [&] {
            ASSERT_NE(dialog(), nullptr);
            const Beside watch([&] {
                if (PrintOptionsDialog* const open = dialog())
                    look(*open);
            });
            dialog()->findChild<QPushButton*>(QStringLiteral("cmdOk"))->click();
            longest = watch.longest();
            if (PrintOptionsDialog* const open = dialog())
                look(*open);
        });
        for (QAction* const action : window->findChildren<QAction*>()) {
            if (action->property("toolId").toInt() == 12)
                action->trigger();
        }
        return longest;
    }

    TempFolder folder;
    FakeMessages messages;
    PreviewWindow* window = nullptr;
};

QString textOf(const PrintOptionsDialog& dialog, const char* label)
{
    return dialog.findChild<QLabel*>(QLatin1String(label))->text();
}

} // namespace

TEST_F(PrintWindowTest, ShowsThePagesThatAreSentAndAnswersAllTheTime)
{
    QStringList shown;
    const qint64 longest
        = printMeanwhile([&](PrintOptionsDialog& open) { shown.append(textOf(open, "labSent")); });
    shown.removeAll(QString());
    shown.removeDuplicates();
    EXPECT_GT(shown.size(), 2);
    const int pages = window->canvas().canvas().Totalpages();
    EXPECT_TRUE(
        !shown.isEmpty() && shown.back().endsWith(QStringLiteral(" of %1 pages sent").arg(pages)));
    RecordProperty("longest_pause_ms", static_cast<int>(longest));
    EXPECT_LT(longest, LongestPause);
    EXPECT_EQ(cups.jobs().size(), static_cast<std::size_t>(pages));
}

TEST_F(PrintWindowTest, EscapeEndsAfterThePageInWorkAndSaysHowManyWentOut)
{
    QString said;
    bool isPressed = false;
    printMeanwhile([&](PrintOptionsDialog& open) {
        if (!isPressed && !textOf(open, "labSent").isEmpty()) {
            isPressed = true;
            QTest::keyClick(&open, Qt::Key_Escape);
        }
        said = textOf(open, "labEnd");
        if (!said.isEmpty())
            open.reject();
    });
    ASSERT_TRUE(isPressed);
    const std::size_t sent = cups.jobs().size();
    const int pages = window->canvas().canvas().Totalpages();
    EXPECT_GT(sent, 0U);
    EXPECT_LT(sent, static_cast<std::size_t>(pages));
    EXPECT_EQ(
        said, QStringLiteral("Printing was ended: %1 of %2 pages were sent.").arg(sent).arg(pages));
}

TEST_F(PrintWindowTest, CancelIsClickedWhileItPrints)
{
    bool isPressed = false;
    printMeanwhile([&](PrintOptionsDialog& open) {
        auto* const cancel = open.findChild<QPushButton*>(QStringLiteral("cmdStop"));
        if (!isPressed && cancel->isVisible() && !textOf(open, "labSent").isEmpty()) {
            isPressed = true;
            QTest::mouseClick(cancel, Qt::LeftButton);
        } else if (!textOf(open, "labEnd").isEmpty()) {
            open.reject();
        }
    });
    EXPECT_TRUE(isPressed);
    EXPECT_LT(cups.jobs().size(), static_cast<std::size_t>(window->canvas().canvas().Totalpages()));
}

TEST_F(PrintWindowTest, APrintThatAHostBeginsEndsWithEscapeAndRefusesOthers)
{
    bool isPressed = false;
    window->canvas().canvas().pageSent = [&](std::int64_t sent, std::int64_t) {
        if (sent != 2)
            return true;
        isPressed = true;
        window->canvas().doPrint(true, {}, 1); // refused while one runs
        QTest::keyClick(window, Qt::Key_Escape);
        return true;
    };
    window->print(true, {}, 1);
    EXPECT_TRUE(isPressed);
    EXPECT_TRUE(window->isVisible());
    const std::size_t sent = cups.jobs().size();
    EXPECT_GE(sent, 2U);
    EXPECT_LT(sent, static_cast<std::size_t>(window->canvas().canvas().Totalpages()));
}

} // namespace pelloric::qt
