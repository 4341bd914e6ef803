// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#if defined(__unix__)

#include <chrono>
#include <csignal>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace pelloric {

/// Runs a step in a process of its own until it is killed.
class Child {
public:
    template <typename Step>
    explicit Child(Step step)
        : id_(::fork())
    {
        if (id_ != 0)
            return;
        try {
            step();
        } catch (...) {
            ::_exit(1);
        }
        ::_exit(0);
    }

    void killAfter(std::chrono::microseconds time) const
    {
        std::this_thread::sleep_for(time);
        ::kill(id_, SIGKILL);
    }

    /// @return  what it ended with; -1: it was killed
    int wait() const
    {
        int status = 0;
        ::waitpid(id_, &status, 0);
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    }

private:
    pid_t id_;
};

} // namespace pelloric

#endif
