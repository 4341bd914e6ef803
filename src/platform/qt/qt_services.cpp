// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_services.h"

#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QApplication>
#include <QDateTime>
#include <QKeyEvent>
#include <QLocale>
#include <QMessageBox>
#include <QPointer>
#include <QStandardPaths>

#ifdef Q_OS_WIN
#include <windows.h>
#endif

namespace pelloric::qt {

namespace {

constexpr qint64 PassMs = 150; ///< between two passes of a long operation: milliseconds

constexpr char AnsweringProperty[] = "answersWhileBusy";

/// Takes the user's input while a long operation runs: Escape ends the operation, the rest is
/// refused.
class BusyInput final : public QObject {
public:
    explicit BusyInput(QtMessageLoop& loop)
        : loop_(loop)
    {
        QCoreApplication::instance()->installEventFilter(this);
    }

    bool eventFilter(QObject* watched, QEvent* event) override
    {
        // A window hands on to the widgets in it, which are met again here.
        if (isOnTheWay(*watched, *event))
            return false;
        switch (event->type()) {
        case QEvent::ShortcutOverride: // taken, so that no shortcut is looked for
            event->accept();
            return true;
        case QEvent::KeyPress:
            if (static_cast<QKeyEvent*>(event)->key() == Qt::Key_Escape)
                loop_.cancel();
            return true;
        case QEvent::KeyRelease:
        case QEvent::Shortcut:
        case QEvent::InputMethod:
        case QEvent::MouseButtonPress:
        case QEvent::MouseButtonRelease:
        case QEvent::MouseButtonDblClick:
        case QEvent::MouseMove:
        case QEvent::Wheel:
        case QEvent::ContextMenu:
        case QEvent::TouchBegin:
        case QEvent::TouchUpdate:
        case QEvent::TouchEnd:
        case QEvent::TabletPress:
        case QEvent::TabletMove:
        case QEvent::TabletRelease:
        case QEvent::DragEnter:
        case QEvent::DragMove:
        case QEvent::Drop:
        case QEvent::Timer:
            return true;
        default:
            return false;
        }
    }

private:
    static bool isOnTheWay(const QObject& watched, const QEvent& event)
    {
        switch (event.type()) {
        case QEvent::MouseButtonPress:
        case QEvent::MouseButtonRelease:
        case QEvent::MouseButtonDblClick:
        case QEvent::MouseMove:
            return watched.isWindowType() || watched.property(AnsweringProperty).toBool();
        case QEvent::KeyPress:
        case QEvent::KeyRelease:
            return static_cast<const QKeyEvent&>(event).key() == Qt::Key_Space
                && (watched.isWindowType() || watched.property(AnsweringProperty).toBool());
        default:
            return false;
        }
    }

    QtMessageLoop& loop_;
};

QPointer<QWidget>& messageSubject()
{
    static QPointer<QWidget> subject;
    return subject;
}

/// A modal dialog lets no other window's box be answered.
QWidget* boxOwner()
{
    if (QWidget* const dialog = QApplication::activeModalWidget())
        return dialog;
    QWidget* const subject = messageSubject();
    return subject != nullptr && subject->isVisible() ? subject : QApplication::activeWindow();
}

QMessageBox::Icon boxIcon(MessageIcon icon)
{
    switch (icon) {
    case MessageIcon::None:
        return QMessageBox::NoIcon;
    case MessageIcon::Information:
        return QMessageBox::Information;
    case MessageIcon::Critical:
        return QMessageBox::Critical;
    }
    return QMessageBox::NoIcon;
}

/// A time format without its time zone; what stands in quotes is left alone.
QString withoutZone(const QString& format)
{
    QString result;
    bool isQuoted = false;
    for (const QChar character : format) {
        isQuoted = isQuoted != (character == QLatin1Char('\''));
        if (isQuoted || character != QLatin1Char('t'))
            result.append(character);
    }
    return result.trimmed();
}

#ifdef Q_OS_WIN
std::filesystem::path systemFolder()
{
    wchar_t folder[MAX_PATH + 1];
    const UINT length = GetSystemDirectoryW(folder, MAX_PATH + 1);
    return std::wstring(folder, length <= MAX_PATH ? length : 0);
}
#else
std::filesystem::path systemFolder()
{
    const QString folder = QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation);
    return std::filesystem::path(toText(folder)) / "pelloric";
}
#endif

} // namespace

QString plainDate(QDate date) { return QLocale::c().toString(date, QStringLiteral("yyyy-MM-dd")); }

QString timeWithSeconds(QTime time, const QLocale& locale)
{
    return locale.toString(time, withoutZone(locale.timeFormat(QLocale::LongFormat)));
}

Text QtClock::date() const { return toText(plainDate(QDate::currentDate())); }

Text QtClock::time() const { return toText(timeWithSeconds(QTime::currentTime(), QLocale())); }

void QtMessageLoop::runOnce()
{
    if (QCoreApplication::instance())
        QCoreApplication::processEvents();
    sincePass_.start();
    endWhenCancelled();
}

void QtMessageLoop::keepAlive()
{
    letLive();
    endWhenCancelled();
}

void QtMessageLoop::letLive()
{
    if (!sincePass_.isValid())
        sincePass_.start();
    if (!isInPass_ && sincePass_.elapsed() >= PassMs)
        livePass();
}

/// What waits for the sockets and timers of the host stays waiting; what was posted cannot.
void QtMessageLoop::livePass()
{
    if (QCoreApplication::instance()) {
        isInPass_ = true;
        const BusyInput refused(*this);
        QCoreApplication::processEvents(
            QEventLoop::ExcludeSocketNotifiers | QEventLoop::X11ExcludeTimers);
        isInPass_ = false;
    }
    sincePass_.start();
}

void QtMessageLoop::endWhenCancelled()
{
    if (isCancelled_.load(std::memory_order_relaxed) && isCancelled_.exchange(false))
        throw RunTimeError(ErrorNumber::Cancelled);
}

void keepAnswering(QObject& widget) { widget.setProperty(AnsweringProperty, true); }

void setMessageSubject(QWidget* window) { messageSubject() = window; }

void BoxMessages::show(const Message& message)
{
    QMessageBox box(boxOwner());
    box.setIcon(boxIcon(message.icon));
    box.setWindowTitle(
        message.title ? toQString(*message.title) : QGuiApplication::applicationDisplayName());
    box.setTextFormat(Qt::PlainText);
    box.setText(toQString(message.text));
    box.setStandardButtons(QMessageBox::Ok);
    box.exec();
}

StreamMessages::StreamMessages(std::FILE* stream)
    : stream_(stream)
{
}

void StreamMessages::show(const Message& message)
{
    shown_.push_back(message);
    std::string line;
    if (message.title && !message.title->empty())
        line = toUtf8(*message.title) + ": ";
    line += toUtf8(replaceAll(message.text, u"\n", u" ")) + "\n";
    std::fputs(line.c_str(), stream_);
}

void QtSystemFolders::setSystemDirectory(std::filesystem::path folder)
{
    folder_ = folder.has_filename() ? std::move(folder) : folder.parent_path();
}

std::filesystem::path QtSystemFolders::systemDirectory() const
{
    return folder_.empty() ? systemFolder() : folder_;
}

} // namespace pelloric::qt
