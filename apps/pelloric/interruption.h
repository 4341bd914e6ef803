// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QByteArray>
#include <QTemporaryDir>

#include <condition_variable>
#include <mutex>
#include <thread>

namespace pelloric::qt {
class QtMessageLoop;
}

namespace pelloric::app {

/// Lets Ctrl+C end the work that is under way cleanly, as long as the object lives; there is one.
///
/// A layout ends at its next turn of the loop; other work asks now and then whether to go on. What
/// does not ask for some seconds, since it waits for a pipe or a disk, ends all the same. So do
/// SIGTERM, and a terminal that closes, unless the program was started to outlive it.
class Interruption {
public:
    /// @param loop  borrowed
    explicit Interruption(qt::QtMessageLoop& loop);
    ~Interruption();
    Interruption(const Interruption&) = delete;
    Interruption& operator=(const Interruption&) = delete;

    /// The signal that asked to end; 0 when none did.
    static int signal();

    static bool mayGoOn() { return signal() == 0; }

    /// As long as it lives, Ctrl+C ends the program at once: for work that cannot be asked to end,
    /// such as waiting for a pipe or a long query. What lies in the folder of temporary files by
    /// then goes with it.
    class AtOnce {
    public:
        AtOnce();
        ~AtOnce();
        AtOnce(const AtOnce&) = delete;
        AtOnce& operator=(const AtOnce&) = delete;
    };

private:
    void watch();

    QTemporaryDir folder_; ///< all temporary files of this run lie in it
    QByteArray systemFolder_; ///< what named their folder before
    std::mutex mutex_;
    std::condition_variable ended_;
    bool isOver_ = false;
    std::thread watcher_;
};

} // namespace pelloric::app
