// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_services.h"

#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QApplication>
#include <QLocale>
#include <QMessageBox>
#include <QStandardPaths>

#ifdef Q_OS_WIN
#include <windows.h>
#endif

namespace pelloric::qt {

namespace {

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

QString timeWithSeconds(QTime time, const QLocale& locale)
{
    return locale.toString(time, withoutZone(locale.timeFormat(QLocale::LongFormat)));
}

void QtClock::setNow(std::optional<QDateTime> now) { now_ = std::move(now); }

Text QtClock::date() const
{
    return toText(QLocale::c().toString(now().date(), QStringLiteral("yyyy-MM-dd")));
}

Text QtClock::time() const { return toText(timeWithSeconds(now().time(), QLocale())); }

QDateTime QtClock::now() const { return now_ ? *now_ : QDateTime::currentDateTime(); }

void QtMessageLoop::runOnce()
{
    if (QCoreApplication::instance())
        QCoreApplication::processEvents();
    if (isCancelled_.exchange(false))
        throw RunTimeError(ErrorNumber::Cancelled);
}

void BoxMessages::show(const Message& message)
{
    QMessageBox box(QApplication::activeWindow());
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
