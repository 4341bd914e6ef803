// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/page_workers.h"

#include <algorithm>
#include <utility>

namespace pelloric::qt {

namespace {

constexpr std::size_t PagesAhead = 2; ///< of each thread

} // namespace

int defaultJobs() { return std::max(1, static_cast<int>(std::thread::hardware_concurrency())); }

PageWorkers::PageWorkers(std::vector<int> pages, int jobs, std::function<Maker()> makeMaker)
    : pages_(std::move(pages))
    , makeMaker_(std::move(makeMaker))
    , mostAhead_(PagesAhead * static_cast<std::size_t>(std::max(1, jobs)))
{
    const auto threads = std::min(pages_.size(), static_cast<std::size_t>(std::max(1, jobs)));
    threads_.reserve(threads);
    for (std::size_t thread = 0; thread < threads; ++thread)
        threads_.emplace_back([this] { work(); });
}

PageWorkers::~PageWorkers()
{
    {
        const std::lock_guard lock(mutex_);
        isEnding_ = true;
    }
    changed_.notify_all();
    for (std::thread& thread : threads_)
        thread.join();
}

QByteArray PageWorkers::next()
{
    std::unique_lock lock(mutex_);
    changed_.wait(lock, [&] { return failure_ || made_.contains(handedOut_); });
    const auto made = made_.find(handedOut_);
    if (made == made_.end())
        std::rethrow_exception(failure_);
    QByteArray bytes = std::move(made->second);
    made_.erase(made);
    ++handedOut_;
    lock.unlock();
    changed_.notify_all();
    return bytes;
}

void PageWorkers::work()
{
    try {
        makePages(makeMaker_());
    } catch (...) {
        const std::lock_guard lock(mutex_);
        failure_ = std::current_exception();
        isEnding_ = true;
    }
    changed_.notify_all();
}

void PageWorkers::makePages(const Maker& make)
{
    std::unique_lock lock(mutex_);
    while (true) {
        changed_.wait(lock, [&] {
            return isEnding_ || taken_ == pages_.size() || taken_ < handedOut_ + mostAhead_;
        });
        if (isEnding_ || taken_ == pages_.size())
            return;
        const std::size_t place = taken_++;
        lock.unlock();
        QByteArray bytes = make(pages_[place]);
        lock.lock();
        made_[place] = std::move(bytes);
        changed_.notify_all();
    }
}

} // namespace pelloric::qt
