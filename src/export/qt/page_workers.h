// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QByteArray>

#include <condition_variable>
#include <cstddef>
#include <exception>
#include <functional>
#include <map>
#include <mutex>
#include <thread>
#include <vector>

namespace pelloric::qt {

/// Makes the bytes of pages on several threads and hands them out in the order of the pages.
///
/// No more than a few pages are made ahead of the one that is waited for, so that memory does not
/// grow with the pages. The end of the object ends the threads, whatever is left to do.
class PageWorkers {
public:
    /// Makes the bytes of one page.
    using Maker = std::function<QByteArray(int page)>;

    /// @param pages      in the order in which they are handed out
    /// @param jobs       threads, 1 or more
    /// @param makeMaker  called once on each thread, before its first page
    PageWorkers(std::vector<int> pages, int jobs, std::function<Maker()> makeMaker);
    ~PageWorkers();
    PageWorkers(const PageWorkers&) = delete;
    PageWorkers& operator=(const PageWorkers&) = delete;

    /// Waits for the bytes of the next page; to be called once for each page.
    /// Throws what the maker of a page has thrown.
    QByteArray next();

private:
    void work();
    void makePages(const Maker& make);

    const std::vector<int> pages_;
    const std::function<Maker()> makeMaker_;
    const std::size_t mostAhead_;
    std::mutex mutex_;
    std::condition_variable changed_;
    std::map<std::size_t, QByteArray> made_; ///< by the place of the page
    std::size_t taken_ = 0; ///< pages that a thread has begun
    std::size_t handedOut_ = 0;
    std::exception_ptr failure_;
    bool isEnding_ = false;
    std::vector<std::thread> threads_;
};

/// As many threads as the machine runs at once, at least 1.
int defaultJobs();

} // namespace pelloric::qt
