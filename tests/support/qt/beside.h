// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QEvent>
#include <QObject>

#include <algorithm>
#include <atomic>
#include <chrono>
#include <ctime>
#include <functional>
#include <thread>

namespace pelloric::qt {

/// Does something again and again on the thread of the user interface as long as its loop goes
/// round, with timers stopped, too; measures the longest time in which it did not.
class Beside final : public QObject {
public:
    explicit Beside(std::function<void()> look = {})
        : look_(std::move(look))
    {
        since_.start();
        poster_ = std::thread([this] {
            while (!isOver_) {
                if (!isPosted_.exchange(true))
                    QCoreApplication::postEvent(this, new QEvent(QEvent::User));
                std::this_thread::sleep_for(std::chrono::milliseconds(5));
            }
        });
    }

    ~Beside() override
    {
        isOver_ = true;
        poster_.join();
    }

    Beside(const Beside&) = delete;
    Beside& operator=(const Beside&) = delete;

    /// Milliseconds of the clock.
    qint64 longest() const { return std::max(longest_, since_.elapsed()); }

    /// Milliseconds for which a processor worked at most in between: other work on the machine does
    /// not count.
    qint64 longestWork() const { return std::max(longestWork_, worked()); }

protected:
    bool event(QEvent* event) override
    {
        if (event->type() != QEvent::User)
            return QObject::event(event);
        longest_ = std::max(longest_, since_.restart());
        longestWork_ = std::max(longestWork_, worked());
        workedBefore_ = std::clock();
        isPosted_ = false;
        if (look_)
            look_();
        return true;
    }

private:
    qint64 worked() const
    {
        constexpr auto ATick = CLOCKS_PER_SEC / 1000;
        return static_cast<qint64>((std::clock() - workedBefore_) / ATick);
    }

    std::function<void()> look_;
    QElapsedTimer since_;
    qint64 longest_ = 0;
    std::clock_t workedBefore_ = std::clock();
    qint64 longestWork_ = 0;
    std::atomic<bool> isPosted_ = false;
    std::atomic<bool> isOver_ = false;
    std::thread poster_;
};

} // namespace pelloric::qt
