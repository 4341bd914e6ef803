// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "interruption.h"

#include "command_line.h"
#include "platform/qt/file_names.h"
#include "platform/qt/qt_services.h"

#include <array>
#include <atomic>
#include <chrono>
#include <csignal>
#include <cstdlib>
#include <filesystem>

namespace pelloric::app {

namespace {

#ifdef SIGHUP
constexpr auto Signals = std::to_array({ SIGINT, SIGTERM, SIGHUP });
#else
constexpr auto Signals = std::to_array({ SIGINT, SIGTERM });
#endif

/// Whether the program goes on when its terminal closes, as behind nohup.
bool isKept(int signal, void (*before)(int))
{
#ifdef SIGHUP
    return signal == SIGHUP && before == SIG_IGN;
#else
    return false;
#endif
}

/// Names the folder of temporary files.
constexpr char FolderVariable[] = "TMPDIR";

/// Between two looks at whether a signal has come.
constexpr std::chrono::milliseconds Pause(20);

/// What work that can be asked to end has for it.
constexpr std::chrono::seconds Grace(3);

std::atomic<int> received = 0;
std::atomic<int> endingAtOnce = 0; ///< how many parts of the work
std::atomic<qt::QtMessageLoop*> loopToEnd = nullptr;
static_assert(std::atomic<int>::is_always_lock_free);
static_assert(std::atomic<qt::QtMessageLoop*>::is_always_lock_free);

extern "C" void endWork(int signal)
{
    received = signal;
    if (qt::QtMessageLoop* const loop = loopToEnd)
        loop->cancel();
}

} // namespace

Interruption::Interruption(qt::QtMessageLoop& loop)
    : systemFolder_(qgetenv(FolderVariable))
    , watcher_([this] { watch(); })
{
    // Where no folder can be made, what needs a temporary file says so itself.
    if (folder_.isValid())
        qputenv(FolderVariable, qt::pathOf(folder_.path()).c_str());
    loopToEnd = &loop;
    for (const int signal : Signals) {
        const auto before = std::signal(signal, &endWork);
        if (isKept(signal, before))
            std::signal(signal, before);
    }
}

Interruption::~Interruption()
{
    for (const int signal : Signals) {
        const auto before = std::signal(signal, SIG_DFL);
        if (isKept(signal, before))
            std::signal(signal, before);
    }
    loopToEnd = nullptr;
    {
        const std::lock_guard lock(mutex_);
        isOver_ = true;
    }
    ended_.notify_one();
    watcher_.join();
    if (systemFolder_.isNull())
        qunsetenv(FolderVariable);
    else
        qputenv(FolderVariable, systemFolder_);
}

int Interruption::signal() { return received; }

Interruption::AtOnce::AtOnce() { ++endingAtOnce; }

Interruption::AtOnce::~AtOnce() { --endingAtOnce; }

/// A signal's own handler could not remove files.
void Interruption::watch()
{
    std::unique_lock lock(mutex_);
    const auto isOver = [this] { return isOver_; };
    while (mayGoOn()) {
        if (ended_.wait_for(lock, Pause, isOver))
            return;
    }
    const auto end = std::chrono::steady_clock::now() + Grace;
    while (endingAtOnce == 0 && std::chrono::steady_clock::now() < end) {
        if (ended_.wait_for(lock, Pause, isOver))
            return;
    }
    std::error_code ignored;
    if (folder_.isValid())
        std::filesystem::remove_all(qt::pathOf(folder_.path()), ignored);
    std::_Exit(SignalBase + signal());
}

} // namespace pelloric::app
