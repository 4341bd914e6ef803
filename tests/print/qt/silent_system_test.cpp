// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "print/paper_names.h"
#include "print/print_job.h"
#include "print/qt/print_calls.h"
#include "print/qt/private_cups.h"
#include "print/qt/qt_printing.h"
#include "print/qt/silent_server.h"
#include "settings/default_settings.h"
#include "support/qt/beside.h"
#include "support/recorded_pages.h"
#include "support/test_paths.h"
#include "ui/qt/page_setup_dialog.h"
#include "ui/qt/print_options_dialog.h"

#include <QElapsedTimer>
#include <QLabel>
#include <QTest>
#include <QTreeWidget>

#include <gtest/gtest.h>

#include <atomic>
#include <thread>

namespace pelloric::qt {

namespace {

using std::chrono::milliseconds;

constexpr qint64 Deadline = 3000;
constexpr qint64 Slack = 7000; ///< for a loaded machine
constexpr qint64 LongestPause = 1500; ///< 300 on a machine that does nothing else: milliseconds

class SilentSystemTest : public testing::Test {
protected:
    SilentSystemTest()
    {
        platform.folders().setSystemDirectory(folder.path());
        deployDefaultSettings(platform.record());
    }

    void SetUp() override { ASSERT_TRUE(server.isListening()); }

    TempFolder folder;
    SilentServer server;
    QtPlatform platform;
    QtPrinting printing { platform };
};

QString hintOf(const QDialog& dialog, const char* name)
{
    return dialog.findChild<QLabel*>(QLatin1String(name))->text();
}

} // namespace

TEST_F(SilentSystemTest, EveryQuestionEndsInWordsWithinItsDeadline)
{
    QElapsedTimer timer;
    timer.start();
    QtPrinterSystem& system = printing.system();
    EXPECT_TRUE(system.printerNames().empty());
    EXPECT_TRUE(system.currentPrinter().empty());
    EXPECT_EQ(system.forms(), standardPaperForms());
    EXPECT_FALSE(system.opens(u"T1"));
    EXPECT_EQ(system.sheetFor({}), std::nullopt);
    EXPECT_EQ(printing.printer().paperSize(), 0);
    const QString refusal = system.refusal(u"T1");
    EXPECT_TRUE(refusal.startsWith(QStringLiteral("the print system does not answer (")))
        << refusal.toStdString();
    // Questions that follow each other do not wait one after the other.
    EXPECT_LT(timer.elapsed(), 3 * Deadline);
}

TEST_F(SilentSystemTest, PrintingEndsInWordsAndTheLoopGoesRoundMeanwhile)
{
    PageDocument document;
    addText(document, { 100, 100 }, u"one");
    const Beside watch;
    QElapsedTimer timer;
    timer.start();
    try {
        doPrint(document, {}, {}, printing.printer());
        FAIL() << "nothing takes pages";
    } catch (const RunTimeError& error) {
        const std::string text = error.what();
        EXPECT_NE(text.find("the print system does not answer ("), std::string::npos) << text;
        EXPECT_TRUE(text.ends_with("after 0 of 1 pages")) << text;
    }
    EXPECT_LT(timer.elapsed(), 3 * Deadline);
    EXPECT_LT(watch.longest(), LongestPause);
}

TEST_F(SilentSystemTest, PageSetupOpensAtOnceWithTheStandardPapersAndThenSaysWhy)
{
    const Platform record = platform.record();
    QElapsedTimer timer;
    timer.start();
    PageSetupDialog dialog(record);
    dialog.show();
    EXPECT_LT(timer.elapsed(), 1000);
    auto* const list = dialog.findChild<QTreeWidget*>(QStringLiteral("ListView1"));
    EXPECT_EQ(list->topLevelItemCount(), static_cast<int>(standardPaperForms().size()));
    EXPECT_EQ(hintOf(dialog, "labPapersHint"), "");
    const Beside watch;
    ASSERT_TRUE(QTest::qWaitFor(
        [&] { return !hintOf(dialog, "labPapersHint").isEmpty(); }, Deadline + Slack));
    EXPECT_TRUE(hintOf(dialog, "labPapersHint").contains(QStringLiteral("does not answer")));
    EXPECT_LT(watch.longest(), LongestPause);
}

TEST_F(SilentSystemTest, PrintOpensAtOnceAndThenSaysWhyThereAreNoPrinters)
{
    const Platform record = platform.record();
    QElapsedTimer timer;
    timer.start();
    PrintOptionsDialog dialog(record, {});
    dialog.show();
    EXPECT_LT(timer.elapsed(), 1000);
    ASSERT_TRUE(QTest::qWaitFor(
        [&] { return !hintOf(dialog, "labPrinterHint").isEmpty(); }, Deadline + Slack));
    EXPECT_TRUE(hintOf(dialog, "labPrinterHint").contains(QStringLiteral("does not answer")));
}

TEST_F(SilentSystemTest, TheProgramSaysItAndEnds)
{
    const QString wine = QStringLiteral(PELLORIC_TESTS_DIR "/../samples/wine.csv");
    for (const QStringList& arguments :
        { QStringList { QStringLiteral("printers") }, { QStringLiteral("print"), wine } }) {
        QElapsedTimer timer;
        timer.start();
        const ProgramResult result = runProgram(QStringLiteral(PELLORIC_PROGRAM), arguments);
        EXPECT_EQ(result.status, 1);
        EXPECT_TRUE(result.errors.startsWith(
            QStringLiteral("pelloric: the print system does not answer (")))
            << result.errors.toStdString();
        EXPECT_LT(timer.elapsed(), 2 * Deadline + Slack);
    }
}

TEST(PrintCalls, GoOnWithoutACallThatMissesItsDeadline)
{
    PrivateCups cups;
    ASSERT_EQ(cups.failure(), "");
    PrintCalls calls;
    int turns = 0;
    calls.whileWaiting([&] { ++turns; });
    EXPECT_EQ(calls.ask<int>([] { return 7; }), 7);
    const auto isLetGo = std::make_shared<std::atomic<bool>>(false);
    const auto hang = [isLetGo] {
        while (!*isLetGo)
            std::this_thread::sleep_for(milliseconds(5));
        return 1;
    };
    EXPECT_EQ(calls.ask<int>(hang, milliseconds(200)), std::nullopt);
    EXPECT_GT(turns, 2);
    EXPECT_TRUE(calls.trouble().contains(QStringLiteral("0.2 seconds")));
    EXPECT_EQ(calls.ask<int>([] { return 8; }), std::nullopt) << "asked too soon again";
    std::this_thread::sleep_for(milliseconds(2100));
    EXPECT_EQ(calls.ask<int>([] { return 9; }), 9) << "the lost call is still under way";
    EXPECT_EQ(calls.trouble(), QString());
    *isLetGo = true;
}

TEST(PrintCalls, HandOnWhatACallThrows)
{
    PrivateCups cups;
    ASSERT_EQ(cups.failure(), "");
    PrintCalls calls;
    EXPECT_THROW(
        calls.ask<int>([]() -> int { throw RunTimeError(ErrorNumber::Overflow); }), RunTimeError);
    EXPECT_EQ(calls.ask<int>([] { return 1; }), 1);
}

} // namespace pelloric::qt
