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

    /// Milliseconds.
    qint64 longest() const { return std::max(longest_, since_.elapsed()); }

protected:
    bool event(QEvent* event) override
    {
        if (event->type() != QEvent::User)
            return QObject::event(event);
        longest_ = std::max(longest_, since_.restart());
        isPosted_ = false;
        if (look_)
            look_();
        return true;
    }

private:
    std::function<void()> look_;
    QElapsedTimer since_;
    qint64 longest_ = 0;
    std::atomic<bool> isPosted_ = false;
    std::atomic<bool> isOver_ = false;
    std::thread poster_;
};

} // namespace pelloric::qt
