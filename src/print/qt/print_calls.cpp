// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/print_calls.h"

#include "platform/qt/qt_phrase.h"
#include "print/qt/spooler.h"

#include <algorithm>
#include <atomic>
#include <condition_variable>
#include <deque>
#include <exception>
#include <mutex>
#include <thread>

namespace pelloric::qt {

namespace {

using Clock = std::chrono::steady_clock;
using std::chrono::milliseconds;

constexpr milliseconds BetweenTurns { 15 };

/// After a call that got no answer, so that a dialog's next questions do not wait as well.
constexpr milliseconds SilentFor { 2000 };

/// A silence that is known sooner lets nobody wait.
constexpr milliseconds SlowSilence { 500 };

/// Threads that wait for an answer for good; more are not begun.
constexpr int MostLost = 8;
std::atomic<int> lostLines = 0;

class Call final : public PrintCall {
public:
    explicit Call(std::function<void()> work)
        : work_(std::move(work))
    {
    }

    void run()
    {
        QString silence = silenceOfSystem();
        std::exception_ptr error;
        if (silence.isEmpty()) {
            try {
                work_();
            } catch (...) {
                error = std::current_exception();
            }
        }
        work_ = {};
        const std::lock_guard lock(mutex_);
        silence_ = std::move(silence);
        error_ = error;
        hasEnded_ = true;
        ended_.notify_all();
    }

    bool wait(milliseconds patience, const std::function<void()>& turn) override
    {
        std::unique_lock lock(mutex_);
        Clock::time_point deadline = Clock::now() + patience;
        while (!hasEnded_ && Clock::now() < deadline) {
            ended_.wait_until(lock, std::min(deadline, Clock::now() + BetweenTurns));
            if (hasEnded_ || !turn)
                continue;
            lock.unlock();
            const Clock::time_point before = Clock::now();
            turn();
            deadline += Clock::now() - before;
            lock.lock();
        }
        if (error_)
            std::rethrow_exception(std::exchange(error_, nullptr));
        return hasEnded_;
    }

    QString silence() const override
    {
        const std::lock_guard lock(mutex_);
        return silence_;
    }

private:
    std::function<void()> work_;
    mutable std::mutex mutex_;
    std::condition_variable ended_;
    QString silence_;
    std::exception_ptr error_;
    bool hasEnded_ = false;
};

} // namespace

/// A thread and the calls that wait for it; they outlive whoever asked.
class PrintCalls::Line : public std::enable_shared_from_this<Line> {
public:
    void start()
    {
        std::thread([line = shared_from_this()] { line->work(); }).detach();
    }

    void add(std::shared_ptr<Call> call)
    {
        const std::lock_guard lock(mutex_);
        calls_.push_back(std::move(call));
        changed_.notify_all();
    }

    /// The thread ends as soon as it can.
    void leave()
    {
        const std::lock_guard lock(mutex_);
        isLeft_ = true;
        calls_.clear();
        if (isWorking_) {
            isLost_ = true;
            ++lostLines;
        }
        changed_.notify_all();
    }

private:
    void work()
    {
        std::unique_lock lock(mutex_);
        while (!isLeft_) {
            if (calls_.empty()) {
                changed_.wait(lock);
                continue;
            }
            const std::shared_ptr<Call> call = std::move(calls_.front());
            calls_.pop_front();
            isWorking_ = true;
            lock.unlock();
            prepareCallingThread();
            call->run();
            lock.lock();
            isWorking_ = false;
        }
        if (isLost_)
            --lostLines;
    }

    std::mutex mutex_;
    std::condition_variable changed_;
    std::deque<std::shared_ptr<Call>> calls_;
    bool isWorking_ = false;
    bool isLeft_ = false;
    bool isLost_ = false;
};

PrintCalls::PrintCalls() = default;

PrintCalls::~PrintCalls()
{
    if (line_)
        line_->leave();
}

std::shared_ptr<PrintCall> PrintCalls::begin(std::function<void()> work)
{
    auto call = std::make_shared<Call>(std::move(work));
    if (!line_ && lostLines < MostLost) {
        line_ = std::make_shared<Line>();
        line_->start();
    }
    if (line_)
        line_->add(call);
    return call;
}

bool PrintCalls::run(std::function<void()> work, milliseconds patience)
{
    if (Clock::now() < silentUntil_)
        return false;
    trouble_.clear();
    const Clock::time_point before = Clock::now();
    const std::shared_ptr<PrintCall> call = begin(std::move(work));
    if (!line_ || !call->wait(patience, turn_)) {
        if (line_)
            line_->leave();
        line_.reset();
        silentUntil_ = Clock::now() + SilentFor;
        trouble_ = silenceAfter(patience);
        return false;
    }
    trouble_ = call->silence();
    if (!trouble_.isEmpty() && Clock::now() - before > SlowSilence)
        silentUntil_ = Clock::now() + SilentFor;
    return trouble_.isEmpty();
}

QString silenceAfter(milliseconds time)
{
    return phrased(u"the print system does not answer (nothing came within %1 seconds)",
        { QString::number(static_cast<double>(time.count()) / 1000) });
}

} // namespace pelloric::qt
