// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/services.h"

#include <QElapsedTimer>

#include <atomic>
#include <cstdio>
#include <vector>

class QDate;
class QLocale;
class QObject;
class QString;
class QTime;
class QWidget;

namespace pelloric::qt {

/// A day as YYYY-MM-DD, in plain digits whatever the locale.
QString plainDate(QDate date);

/// The time of day with seconds as a locale writes it, without a time zone.
QString timeWithSeconds(QTime time, const QLocale& locale);

/// The system's clock.
class QtClock final : public Clock {
public:
    Text date() const override;
    /// The time as the default locale writes it.
    Text time() const override;
};

/// The application's event loop; does nothing where there is no application.
class QtMessageLoop final : public MessageLoop {
public:
    /// Ends the operation that is under way at its next turn of the loop; may be called from any
    /// thread and from a signal handler.
    void cancel() { isCancelled_ = true; }

    /// Forgets a cancellation that no operation has met.
    void forgetCancel() { isCancelled_ = false; }

    void runOnce() override;
    void keepAlive() override;

    /// As `keepAlive`, but the wish to end stays for the operation to meet at its next step.
    void letLive();

private:
    void endWhenCancelled();
    void livePass();

    std::atomic<bool> isCancelled_ = false;
    bool isInPass_ = false;
    QElapsedTimer sincePass_;
    static_assert(std::atomic<bool>::is_always_lock_free);
};

/// Lets a widget take keys and clicks while a long operation refuses those of all others: a button
/// that ends it.
void keepAnswering(QObject& widget);

/// Says which window the next message box is about, so that the box belongs to it and brings no
/// other window forward.
/// @param window  borrowed; null: nobody knows
void setMessageSubject(QWidget* window);

/// Shows each message in a box over the window that it is about, or over the active one.
class BoxMessages final : public MessageService {
public:
    void show(const Message& message) override;
};

/// Writes each message as one line and remembers that there was one; for programs without windows.
class StreamMessages final : public MessageService {
public:
    /// @param stream  borrowed
    explicit StreamMessages(std::FILE* stream = stderr);

    void show(const Message& message) override;

    /// What the program ends with: 0, or 1 once a message was shown.
    int exitStatus() const { return shown_.empty() ? 0 : 1; }

    /// Every message, in order.
    const std::vector<Message>& shown() const { return shown_; }

private:
    std::FILE* stream_;
    std::vector<Message> shown_;
};

/// The system directory on Windows, elsewhere "pelloric" below the user's configuration folder.
class QtSystemFolders final : public SystemFolders {
public:
    /// Replaces the folder, for a site-wide set-up or a test.
    /// @param folder  empty: the system's own again
    void setSystemDirectory(std::filesystem::path folder);

    std::filesystem::path systemDirectory() const override;

private:
    std::filesystem::path folder_;
};

} // namespace pelloric::qt
