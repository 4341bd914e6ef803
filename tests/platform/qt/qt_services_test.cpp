// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_services.h"

#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "support/errors.h"

#include <QApplication>
#include <QDateTime>
#include <QKeyEvent>
#include <QLineEdit>
#include <QLocale>
#include <QMessageBox>
#include <QTemporaryDir>
#include <QTest>
#include <QTimer>
#include <QWindow>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

/// Has a long operation go on for some time.
std::optional<ErrorNumber> workFor(QtMessageLoop& loop, int milliseconds)
{
    QElapsedTimer timer;
    timer.start();
    std::optional<ErrorNumber> error;
    while (!error && timer.elapsed() < milliseconds)
        error = errorOf([&] { loop.keepAlive(); });
    return error;
}

void postKey(QWidget& widget, int key, const QString& text = {})
{
    QCoreApplication::postEvent(&widget, new QKeyEvent(QEvent::KeyPress, key, {}, text));
}

/// Counts the passes in which it is told to go on.
class PassCounter : public QObject {
public:
    PassCounter() { post(); }

    bool event(QEvent* event) override
    {
        if (event->type() != QEvent::User)
            return QObject::event(event);
        ++passes;
        post();
        return true;
    }

    int passes = 0;

private:
    void post() { QCoreApplication::postEvent(this, new QEvent(QEvent::User)); }
};

} // namespace

TEST(QtClock, TellsTheDateOneWayAndTheTimeAsTheLocaleDoes)
{
    EXPECT_EQ(plainDate(QDate(2004, 10, 3)), QStringLiteral("2004-10-03"));
    EXPECT_EQ(timeWithSeconds(QTime(7, 5, 9), QLocale::c()), QStringLiteral("07:05:09"));
    const QLocale german(QLocale::German, QLocale::Germany);
    EXPECT_EQ(timeWithSeconds(QTime(7, 5, 9), german), QStringLiteral("07:05:09"));
}

TEST(QtClock, TellsTheYearInPlainDigitsInEveryLocale)
{
    const QLocale before;
    QLocale::setDefault(QLocale(QLocale::Arabic, QLocale::Egypt));
    EXPECT_EQ(plainDate(QDate(2004, 10, 3)), QStringLiteral("2004-10-03"));
    QLocale::setDefault(before);
}

TEST(QtClock, IsTheSystems)
{
    const auto now = [] { return QDateTime::currentDateTime(); };
    const QtClock clock;
    const QDateTime before = now();
    const QString told = toQString(clock.date()) + QLatin1Char(' ') + toQString(clock.time());
    std::vector<QString> moments;
    for (QDateTime moment = before; moment <= now().addSecs(1); moment = moment.addSecs(1))
        moments.push_back(plainDate(moment.date()) + QLatin1Char(' ')
            + timeWithSeconds(moment.time(), QLocale()));
    EXPECT_THAT(moments, testing::Contains(told));
}

TEST(QtMessageLoop, RunsWhatIsPendingOnce)
{
    int runs = 0;
    QTimer::singleShot(0, [&] { ++runs; });
    QtMessageLoop loop;
    loop.runOnce();
    EXPECT_EQ(runs, 1);
}

TEST(QtMessageLoop, EndsACancelledOperationOnce)
{
    QtMessageLoop loop;
    loop.cancel();
    EXPECT_EQ(errorOf([&] { loop.runOnce(); }), ErrorNumber::Cancelled);
    EXPECT_EQ(errorOf([&] { loop.runOnce(); }), std::nullopt);
    loop.cancel();
    loop.forgetCancel();
    EXPECT_EQ(errorOf([&] { loop.runOnce(); }), std::nullopt);
}

TEST(QtMessageLoop, LivesAFewTimesASecondHoweverOftenItIsAsked)
{
    QtMessageLoop loop;
    loop.runOnce();
    const PassCounter counter;
    QElapsedTimer timer;
    timer.start();
    EXPECT_EQ(workFor(loop, 1000), std::nullopt);
    EXPECT_GE(counter.passes, 2);
    EXPECT_LE(counter.passes, timer.elapsed() / 100);
}

TEST(QtMessageLoop, TakesEscapeAndRefusesOtherInputWhileAnOperationRuns)
{
    QtMessageLoop loop;
    QLineEdit edit;
    edit.show();
    QCoreApplication::processEvents();
    postKey(edit, Qt::Key_A, QStringLiteral("a"));
    EXPECT_EQ(workFor(loop, 400), std::nullopt);
    EXPECT_EQ(edit.text(), QString());
    postKey(edit, Qt::Key_Escape);
    EXPECT_EQ(workFor(loop, 5000), ErrorNumber::Cancelled);
    EXPECT_EQ(workFor(loop, 400), std::nullopt);
    QTest::keyClicks(&edit, QStringLiteral("b"));
    EXPECT_EQ(edit.text(), QStringLiteral("b"));
}

TEST(QtMessageLoop, PaintsAndClosesWindowsWhileAnOperationRuns)
{
    class Painted : public QWidget {
    public:
        void paintEvent(QPaintEvent*) override { ++paints; }
        int paints = 0;
    };
    QtMessageLoop loop;
    Painted window;
    window.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&window));
    const int paints = window.paints;
    window.update();
    EXPECT_EQ(workFor(loop, 400), std::nullopt);
    EXPECT_GT(window.paints, paints);
    QCoreApplication::postEvent(window.windowHandle(), new QCloseEvent);
    EXPECT_EQ(workFor(loop, 400), std::nullopt);
    EXPECT_FALSE(window.isVisible());
}

TEST(QtMessageLoop, LetsTimersWaitWhileAnOperationRuns)
{
    QtMessageLoop loop;
    int fired = 0;
    QTimer timer;
    QObject::connect(&timer, &QTimer::timeout, [&] { ++fired; });
    timer.setSingleShot(true);
    timer.start(1);
    EXPECT_EQ(workFor(loop, 400), std::nullopt);
    EXPECT_EQ(fired, 0);
    loop.runOnce();
    EXPECT_EQ(fired, 1);
}

TEST(QtMessageLoop, EndsACancelledOperationAtItsNextStep)
{
    QtMessageLoop loop;
    loop.runOnce();
    loop.cancel();
    EXPECT_EQ(errorOf([&] { loop.keepAlive(); }), ErrorNumber::Cancelled);
    EXPECT_EQ(errorOf([&] { loop.keepAlive(); }), std::nullopt);
}

TEST(BoxMessages, ShowsTextTitleAndIcon)
{
    QString text;
    QString title;
    auto icon = QMessageBox::NoIcon;
    QTimer::singleShot(0, [&] {
        auto* const box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
        ASSERT_TRUE(box);
        text = box->text();
        title = box->windowTitle();
        icon = box->icon();
        box->accept();
    });
    BoxMessages().show({ u"<b>无", u"提示", MessageIcon::Critical });
    EXPECT_EQ(text, QStringLiteral("<b>无"));
    EXPECT_EQ(title, QStringLiteral("提示"));
    EXPECT_EQ(icon, QMessageBox::Critical);
}

TEST(StreamMessages, WritesALineAndSetsTheExitStatus)
{
    std::FILE* const file = std::tmpfile();
    ASSERT_TRUE(file);
    StreamMessages messages(file);
    EXPECT_EQ(messages.exitStatus(), 0);
    messages.show({ u"two\nlines", u"提示", MessageIcon::Critical });
    EXPECT_EQ(messages.exitStatus(), 1);
    ASSERT_EQ(messages.shown().size(), 1U);
    std::rewind(file);
    char line[64] = {};
    EXPECT_TRUE(std::fgets(line, sizeof line, file));
    EXPECT_STREQ(line, "提示: two lines\n");
    std::fclose(file);
}

TEST(QtSystemFolders, TheFolderCanBeReplaced)
{
    QtSystemFolders folders;
    EXPECT_EQ(folders.systemDirectory().filename(), "pelloric");
    folders.setSystemDirectory("/srv/set-up/");
    EXPECT_EQ(folders.systemDirectory(), "/srv/set-up");
    folders.setSystemDirectory({});
    EXPECT_EQ(folders.systemDirectory().filename(), "pelloric");
}

TEST(QtPlatform, HasNoPrinterUntilOneIsPutIn)
{
    QtPlatform platform;
    const Platform services = platform.record();
    EXPECT_EQ(services.printers.currentPrinter(), u"");
    EXPECT_FALSE(services.printers.opens(u"T1"));
    EXPECT_EQ(errorOf([&] { services.printer.endDoc(); }), std::nullopt);
    services.printer.print(u"text");
    EXPECT_EQ(errorOf([&] { services.printer.endDoc(); }), ErrorNumber::InvalidCall);
}

TEST(QtPlatform, HandsOutWhatWasPutIn)
{
    QtPlatform platform;
    StreamMessages messages;
    platform.useMessages(messages);
    EXPECT_EQ(&platform.record().messages, &messages);
    platform.library().MarvenStartRow = 3;
    EXPECT_EQ(platform.record().library.MarvenStartRow, 3);
}

TEST(QtText, ConvertsBothWays)
{
    const Text text = u"宋体 \U0001F600";
    EXPECT_EQ(toText(toQString(text)), text);
    EXPECT_EQ(viewOf(borrowedString(text)).data(), text.data());
    EXPECT_EQ(viewOf(borrowed(text)).data(), text.data());
}

} // namespace pelloric::qt
